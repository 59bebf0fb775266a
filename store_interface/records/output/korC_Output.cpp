#include "store_interface/records/output/korC_Output.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/output/karC_RemeshingRule.h"
#include "store_interface/records/output/korC_OdbRequestTable.h"
#include "store_interface/records/steps/kprC_Predicates.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"

#include <set>
#include <string_view>

using Table = korC_OdbRequestTable;

namespace {

/// The name without blanks around it.
cow_String Trimmed(const cow_String& name) {
    std::string_view text = name.View();
    while (!text.empty() && text.front() == ' ') text.remove_prefix(1);
    while (!text.empty() && text.back() == ' ') text.remove_suffix(1);
    return cow_String(text);
}

bool IsSymbol(const cow_String& name) {
    return name == "PRESELECT" || name == "ALL";
}

std::set<cow_String> AsSet(const cls_xpListString& names) {
    std::set<cow_String> set;
    for (int i = 0; i < names.Length(); ++i) set.insert(names[i]);
    return set;
}

/// A state as nobody has given anything of it.
template <class S>
cls_Record* NewUntouched(unsigned procedureType) {
    auto* state = procedureType == 0 ? new S() : new S(procedureType);
    for (const cls_Field& field : state->DynFields().All()) {
        static_cast<const cls_AttributeType&>(*field.type).SetState(field.In(*state), 0);
    }
    return state;
}

} // namespace

korC_OutputState::korC_OutputState(unsigned stepType, bool isField) {
    frequency.Set(kprC_IsImplicitModal(stepType) ? Table::implicitFrequencyDef()
                  : isField                      ? Table::fieldFrequencyDef()
                                                 : Table::historyFrequencyDef());
    numberInterval.Set(isField ? Table::fieldNumberIntervalDef() : Table::historyNumberIntervalDef());
    timeInterval.Set(0.0);
    modeList.Set({});
    timeMarks.Set(!kprC_IsExplicit(stepType));
    timePoints.Set({});
    frequencyType.Set(korC_DefaultOutputType(stepType, isField));
    variablesType.Set(korC_VariablesTypeEnm::PRESELECT);
    variables.Set({});
}

korC_FieldOutputState::korC_FieldOutputState() : korC_FieldOutputState(kprC_StaticStep::TypeId()) {}

korC_HistoryOutputState::korC_HistoryOutputState() : korC_HistoryOutputState(kprC_StaticStep::TypeId()) {}

void korC_OutputState::ReconstructVariables(unsigned stepType) {
    const Table& table = Table::Instance();
    const bool isField = Channel() == korC_OdbChannel::TypeEnm::FIELD;
    const auto isAllowed = [&](const korC_OdbRequestSpec& spec) {
        return isField ? spec.field : spec.history;
    };
    cls_xpListString result;
    std::set<cow_String> known;
    const cls_xpListString& given = variables.ConstGet();
    for (int i = 0; i < given.Length(); ++i) {
        cow_String name = Trimmed(given[i]);
        if (!IsSymbol(name) &&
            !(table.IsParentRequest(name, stepType) && isAllowed(table.Request(name, stepType)))) {
            const korC_OdbRequestSpec& whole =
                table.Request(table.RequestFromComponent(name, stepType), stepType);
            if (whole.name.IsEmpty() || !isAllowed(whole)) continue;
            if (isField && !whole.componentInField) name = whole.name;
        }
        if (known.insert(name).second) result.Append(name);
    }
    variables.WritableValue() = result;
}

void korC_OutputState::ConvertVariablesToVariablesSymbol(unsigned stepType, bool compare) {
    const auto become = [this](korC_VariablesTypeEnm type) {
        variablesType.WritableValue() = type;
        variables.WritableValue() = {};
    };
    const auto symbol = [](const cow_String& name) {
        return name == "ALL" ? korC_VariablesTypeEnm::ALL : korC_VariablesTypeEnm::PRESELECT;
    };
    const cls_xpListString given = variables.ConstGet();
    if (given.Length() == 1 && IsSymbol(given[0])) return become(symbol(given[0]));
    cls_xpListString names;
    for (int i = 0; i < given.Length(); ++i) {
        if (!IsSymbol(given[i])) names.Append(given[i]);
    }
    variables.WritableValue() = names;
    if (!compare || names.IsEmpty()) return;
    const Table& table = Table::Instance();
    constexpr auto everywhere = korC_DomainTypeEnm::ALL_DOMAINS;
    if (AsSet(names) == AsSet(table.Defaults(Channel(), stepType, false, everywhere, 0))) {
        become(korC_VariablesTypeEnm::PRESELECT);
    } else if (AsSet(names) == AsSet(table.All(Channel(), stepType, everywhere, 0))) {
        become(korC_VariablesTypeEnm::ALL);
    }
}

const cls_FieldTable& korC_OutputState::Fields() {
    using R = korC_OutputState;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::frequency>("frequency",
                                  "output every so many increments; zero for none, 99999 for the last only")
            .Field<&R::numberInterval>("numberInterval", "number of equal intervals of the step's time")
            .Field<&R::timeInterval>("timeInterval", "time between two outputs")
            .Unit("time")
            .Field<&R::modeList>("modeList", "numbers of modes, from 1; none for all of them")
            .Field<&R::timeMarks>("timeMarks", "whether output falls exactly on the times asked for")
            .Field<&R::timePoints>("timePoints", "name of a set of time points")
            .RefersTo("timePoints")
            .Field<&R::frequencyType>("frequencyType", "which of the kinds above counts")
            .Field<&R::variablesType>("variablesType", "which variables, if none are listed")
            .Field<&R::variables>("variables", "names of variables and of single components, in capitals; or "
                                               "the one word PRESELECT or ALL")
            .Example(R"({"frequency": 1, "variables": ["U", "RF"]})");
    return fields;
}

cls_Record* korC_FieldOutput::NewState(unsigned procedureType) const {
    return NewUntouched<korC_FieldOutputState>(procedureType);
}

cls_Record* korC_HistoryOutput::NewState(unsigned procedureType) const {
    return NewUntouched<korC_HistoryOutputState>(procedureType);
}

korC_DomainTypeEnm korC_Output::DomainType() const {
    korC_OdbRequest request;
    request.region = region;
    request.boltLoad = boltLoad;
    request.interactions = interactions;
    return request.DomainType();
}

korC_DomainTypeEnm korC_HistoryOutput::DomainType() const {
    if (!section.IsEmpty()) return korC_DomainTypeEnm::INTEGRATED_SECTION;
    return springs.IsEmpty() ? korC_Output::DomainType() : korC_DomainTypeEnm::SPRINGS;
}

const cls_FieldTable& korC_Output::Fields() {
    using R = korC_Output;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_PropagatingObject::Fields())
            .Field<&R::region>("region", "a set or a surface; none for the whole model")
            .Field<&R::boltLoad>("boltLoad", "name of a bolt load whose pretension node is asked about")
            .RefersTo("load")
            .Field<&R::sectionPoints>("sectionPoints",
                                      "numbers of section points, from 1; none for the solver's own")
            .Field<&R::interactions>("interactions",
                                     "names of interactions whose contact is asked about; the first counts")
            .RefersTo("interaction")
            .Field<&R::rebar>("rebar", "whether element output is for rebar too, or only")
            .Field<&R::filter>("filter", "name of a filter of time, written as it stands")
            .RefersTo("filter")
            .Field<&R::layupLocation>("layupLocation", "place of section points in the plies of a layup")
            .NotInDeck("sectionPoints say where");
    return fields;
}

const cls_FieldTable& korC_FieldOutput::Fields() {
    using R = korC_FieldOutput;
    static const cls_FieldTable fields =
        cls_Describe<R>(korC_Output::Fields())
            .Field<&R::directions>("directions", "whether element results come with their local directions");
    return fields;
}

const cls_FieldTable& korC_HistoryOutput::Fields() {
    using R = korC_HistoryOutput;
    static const cls_FieldTable fields =
        cls_Describe<R>(korC_Output::Fields())
            .Field<&R::section>("section", "name of a section of integrated output, written as it stands")
            .Field<&R::springs>("springs",
                                "names of springs and dashpots; a request for these is passed over")
            .Field<&R::sensor>("sensor", "whether the request defines a sensor (any number but zero)");
    return fields;
}

const cls_FieldTable& korC_IntegratedOutputSection::Fields() {
    using R = korC_IntegratedOutputSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::surface>("surface", "the surface over which is summed")
            .Field<&R::orientation>("orientation", "axes of the result; none for the global ones")
            .Field<&R::refNode>("refNode",
                                "a set of the one node about which moments are taken; none for the "
                                "centre of the surface")
            .Field<&R::description>("description", "free text")
            .FreeText()
            .Example(R"({"surface": "PART-1.TOP"})");
    return fields;
}

bool korC_Output::HasStep(const cow_String& stepName) const {
    const mdl_PropagationStatusEnm status = Status(stepName);
    return IsActive(status) || status == mdl_PropagationStatusEnm::DEACTIVATED ||
           status == mdl_PropagationStatusEnm::DEACTIVATED_FROM_BASE_STATE;
}

const cls_FieldTable& kprC_TimePoint::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kprC_TimePoint>(cls_Record::Fields())
            .Field<&kprC_TimePoint::generate>("generate", "rows of points are begin, end and increment")
            .Field<&kprC_TimePoint::points>("points",
                                            "rows of one time, or of begin, end and increment (time)")
            .Example(R"({"points": [[0.1], [0.5], [1]]})");
    return fields;
}

const cls_FieldTable& kadC_AdptMeshCtrl::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<kadC_AdptMeshCtrl>(cls_Record::Fields())
            .Field<&kadC_AdptMeshCtrl::description>("description", "free text")
            .FreeText()
            .Example(R"({"description": "the usual"})");
    return fields;
}

void cls_RegisterOutputRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<korC_OutputState>();
    registrar.Add<korC_FieldOutputState>();
    registrar.Add<korC_HistoryOutputState>();
    registrar.Add<korC_Output>();
    registrar.Add<korC_FieldOutput>();
    registrar.Add<korC_HistoryOutput>();
    registrar.Add<korC_IntegratedOutputSection>();
    registrar.Add<karC_RemeshingRule>();
    registrar.Add<kprC_TimePoint>();
    registrar.Add<kadC_AdptMeshCtrl>();
    registrar.Add<kprC_AdptMeshConsState>();
    registrar.Add<kprC_AdptMeshCons>();
}
