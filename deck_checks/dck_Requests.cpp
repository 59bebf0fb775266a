#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Text.h"
#include "output/oif_OutputRequestBuilder.h"
#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"

#include <set>

namespace {

using Print = korC_OdbRequestSpec::PrintEnm;
using Builder = oif_OutputRequestBuilder;

/// What is found of one request, each text once.
class Report {
public:
    Report(std::string place, fnd_Sink& sink) : place_(std::move(place)), sink_(sink) {}
    void Add(fnd_CodeName code, const std::string& text) {
        if (known_.insert(text).second) sink_.Add(code, place_, text);
    }
    /// `text` is said of the first step that it holds in.
    void AddInStep(fnd_CodeName code, const cow_String& step, const std::string& text) {
        if (known_.insert(text).second) sink_.Add(code, place_, "in step " + Quoted(step) + " " + text);
    }

private:
    std::string place_;
    fnd_Sink& sink_;
    std::set<std::string> known_;
};

std::string Frequency(const korC_OutputState& state) {
    switch (state.frequencyType.ConstGet()) {
    case korC_TypeEnm::FREQUENCY: return "a frequency of " + std::to_string(state.frequency.ConstGet());
    case korC_TypeEnm::NUMBER_INTERVAL: return std::to_string(state.numberInterval.ConstGet()) + " intervals";
    case korC_TypeEnm::MODE_LIST: return "all modes";
    default: return Text(omu_PrimEnum<korC_TypeEnm, 1>(state.frequencyType.ConstGet()).GetString());
    }
}

void FindOnFrequency(const korC_OutputState& state, const kprC_AnalysisStep& step, const cow_String& stepName,
                     bool isField, Report& report) {
    const korC_TypeEnm type = state.frequencyType.ConstGet();
    if (oif_OutputCollector::IsAllowed(type, step, isField)) return;
    const std::string usual = isField ? Frequency(korC_FieldOutputState(step.DynTypeId()))
                                      : Frequency(korC_HistoryOutputState(step.DynTypeId()));
    report.AddInStep("output-not-allowed", stepName,
                     "the procedure doesn't allow " + Text(omu_PrimEnum<korC_TypeEnm, 1>(type).GetString()) +
                         " output; the deck gets " + usual);
}

/// Which of the variables the procedure or the region can't give.
template <class State>
void FindOnVariables(State state, const korC_Output& output, unsigned stepType, const cow_String& stepName,
                     Report& report) {
    const cls_xpListString given = state.variables.ConstGet();
    const korC_OdbRequestTable& table = korC_OdbRequestTable::Instance();
    const bool isField = state.Channel() == korC_OdbChannel::TypeEnm::FIELD;
    for (int i = 0; i < given.Length(); ++i) {
        State alone = state;
        alone.variables.Set(cls_xpListString(given[i]));
        alone.ReconstructVariables(stepType);
        if (alone.variables.ConstGet().IsEmpty()) {
            report.AddInStep("no-such-variable", stepName,
                             "the procedure has no " + std::string(isField ? "field" : "history") +
                                 " variable " + Quoted(given[i]));
            continue;
        }
        const cls_xpListString& known = alone.variables.ConstGet();
        const auto isOf = [&](Print print, Print other) {
            return table
                .GetInvalidPrintIdentifiers(known, stepType, print, other, state.Channel(),
                                            korC_DomainTypeEnm::ALL_DOMAINS)
                .IsEmpty();
        };
        const char* const what = KindOf(output.region);
        if (!Builder::IsWritableNodeRegion(output.region) && isOf(Print::NODE, Print::NODE)) {
            report.Add("variable-not-of-region", "asks " + std::string(what) + " for " + Quoted(given[i]) +
                                                     ", a variable of nodes; it won't stand in the deck");
        }
        if (!Builder::IsWritableElementRegion(output.region) &&
            isOf(Print::ELEMENT, Print::ELEMENT_OR_CONTACT)) {
            report.Add("variable-not-of-region", "asks " + std::string(what) + " for " + Quoted(given[i]) +
                                                     ", a variable of elements; it won't stand in the deck");
        }
    }
    state.ReconstructVariables(stepType);
    state.ConvertVariablesToVariablesSymbol(stepType, false);
    if (given.IsEmpty() || !state.variables.ConstGet().IsEmpty()) return;
    const bool wasSymbol = given.Length() == 1 && (given[0] == "PRESELECT" || given[0] == "ALL");
    if (wasSymbol) return;
    switch (state.variablesType.ConstGet()) {
    case korC_VariablesTypeEnm::PRESELECT:
        report.AddInStep("no-variables-left", stepName,
                         "none of its variables is left; the deck gets the preselected ones");
        break;
    case korC_VariablesTypeEnm::ALL:
        report.AddInStep("no-variables-left", stepName,
                         "none of its variables is left; the deck gets all there are");
        break;
    case korC_VariablesTypeEnm::LISTED:
        report.AddInStep("no-variables-left", stepName,
                         "none of its variables is left, so it gives no output");
        break;
    }
}

void FindOnObjects(const odiK_Model& model, const korC_Output& output, Report& report) {
    if (!output.boltLoad.IsEmpty() && model.loads.IsMember(output.boltLoad)) {
        const kloC_Load& load = model.loads.ConstGet(output.boltLoad);
        if (load.DynTypeId() != kloC_BoltLoad::TypeId()) {
            report.Add("request-of-nothing",
                       "boltLoad names " + Quoted(output.boltLoad) + ", which is no bolt load");
        } else if (load.suppressed) {
            report.Add("request-of-nothing",
                       "boltLoad names " + Quoted(output.boltLoad) + ", which is suppressed");
        }
    }
    if (output.interactions.Length() > 1) {
        report.Add("only-first", "names " + std::to_string(output.interactions.Length()) +
                                     " interactions, of which only the first counts");
    }
    if (!output.interactions.IsEmpty() && model.interactions.IsMember(output.interactions[0]) &&
        model.interactions.ConstGet(output.interactions[0]).suppressed) {
        report.Add("request-of-nothing",
                   "names interaction " + Quoted(output.interactions[0]) + ", which is suppressed");
    }
    if (output.DomainType() == korC_DomainTypeEnm::SPRINGS) {
        report.Add("variable-not-of-region",
                   "asks for springs and dashpots, of which decks have none; it gives no output");
    }
}

template <class State, class Container>
void FindOn(const odiK_Model& model, const Container& requests, const char* container, fnd_Sink& sink) {
    for (mdl_RepositoryIT it(requests); !it.IsDone(); it.Next()) {
        const auto& output = static_cast<const korC_Output&>(it.CurrentRecord());
        if (output.suppressed) continue;
        Report report(Place(container, it.CurrentKey()), sink);
        FindOnObjects(model, output, report);
        if (output.DomainType() == korC_DomainTypeEnm::SPRINGS) continue;
        for (int i = 1; i < model.steps.Size(); ++i) {
            const cow_String& stepName = model.steps.NameAt(i);
            if (!korC_Output::IsActive(output.Status(stepName))) continue;
            const auto& step = nex_canDynamicCastRef<kprC_AnalysisStep>(model.steps.StepAt(i), NEX_HERE);
            const auto& state = static_cast<const State&>(output.ConstGetState(stepName));
            const bool isField = state.Channel() == korC_OdbChannel::TypeEnm::FIELD;
            if (!isField && !step.loadCases.IsEmpty()) {
                report.AddInStep("no-output", stepName,
                                 "it gives no output: a step of load cases has no history");
                continue;
            }
            FindOnFrequency(state, step, stepName, isField, report);
            FindOnVariables(state, output, step.DynTypeId(), stepName, report);
        }
    }
}

} // namespace

void dck_CheckRequests(const odiK_Model& model, fnd_Sink& sink) {
    FindOn<korC_FieldOutputState>(model, model.fieldOutputRequests, "fieldOutputRequests", sink);
    FindOn<korC_HistoryOutputState>(model, model.historyOutputRequests, "historyOutputRequests", sink);
}
