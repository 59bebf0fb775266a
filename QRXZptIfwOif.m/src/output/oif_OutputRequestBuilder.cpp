#include "output/oif_OutputRequestBuilder.h"

#include "base/oif_Comment.h"
#include "interactions/oif_InteractionRow.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"
#include "output/oif_Output.h"
#include "steps/oif_StepControls.h"
#include "steps/oif_StepRequests.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/steps/kprC_Predicates.h"

#include <memory>

namespace {

/// The keyword of the controls if they are of the class Record itself.
template <class Keyword, class Record>
std::unique_ptr<qkw_Keyword> KeywordFor(const kprC_Controls& controls, bool quasiNewton) {
    if (controls.DynTypeId() != Record::TypeId()) return nullptr;
    return std::make_unique<Keyword>(static_cast<const Record&>(controls), quasiNewton);
}

constexpr std::unique_ptr<qkw_Keyword> (*kControlsKeywords[])(const kprC_Controls&, bool) = {
    KeywordFor<oif_TypicalControls, kprC_TypicalControls>,
    KeywordFor<oif_HeatTransferControls, kprC_HeatTransferControls>,
    KeywordFor<oif_MassDiffusionControls, kprC_MassDiffusionControls>,
    KeywordFor<oif_CTEControls, kprC_CTEControls>,
    KeywordFor<oif_CTDControls, kprC_CTDControls>,
    KeywordFor<oif_PoreControls, kprC_PoreControls>,
    KeywordFor<oif_ElectricalControls, kprC_ElectricalControls>,
};

using Table = korC_OdbRequestTable;
using Domain = korC_DomainTypeEnm;
using Print = korC_OdbRequestSpec::PrintEnm;

// Bits of a region's flag word.
constexpr int kNodeContent = 1;
constexpr int kElementContent = 2;
constexpr int kOtherContent = 4;
constexpr int kSurface = 8;

bool IsElementRegion(const rgnC_Region& region) {
    const int flags = region.FlagWord();
    return (flags & kElementContent) != 0 && (flags & (kNodeContent | kOtherContent)) == 0;
}

/// The first name with the suffix, as decks print it; empty for none.
cow_String FirstWith(const cow_List<cow_String>& names, const char* suffix) {
    if (names.IsEmpty()) return {};
    return qkw_QuorixName(names[0] + suffix, false).Printable();
}

} // namespace

void oif_OutputRequestBuilder::Build() {
    oif_OutputCollector requests(Model());
    mdl_ObjCow<kprC_DiagnosticPrint> print;
    kprC_StepContainerIT it(Model().Steps());
    if (it.IsDone()) return;
    for (it.Next(); !it.IsDone(); it.Next()) {
        const cow_String& stepName = it.CurrentKey();
        const nex_Context context("step", stepName);
        const auto& step = nex_canDynamicCastRef<kprC_AnalysisStep>(it.CurrentValue(), NEX_HERE);
        requests.Enter(step);
        AddSolutionControls(step, stepName);
        AddSolverControls(step, stepName);
        const cow_String monitorSet = GetMonitorSetName(step);
        const bool hasField = requests.HasField(stepName);
        // Load cases have no history.
        const bool hasHistory = step.loadCases.IsEmpty() && requests.HasHistory(stepName);
        if (hasField || hasHistory || !step.restart.IsNull() || !step.diagnosticPrint.IsNull() ||
            !monitorSet.IsEmpty()) {
            AddStepDefinition(stepName, oif_Comment("\nOUTPUT REQUESTS\n"));
        }
        if (!step.restart.IsNull()) AddStepDefinition(stepName, oif_Restart(step.restart));
        AddDiagnosticPrint(step, stepName, print);
        if (!monitorSet.IsEmpty()) AddStepDefinition(stepName, oif_Monitor(step.monitor, monitorSet));
        const unsigned stepType = step.DynTypeId();
        const oif_OutputPlace place{step, stepName, stepType,
                                    kprC_IsExplicit(stepType) ? step.TimePeriod() : 0.0};
        if (hasField) {
            cow_List<cow_String> names;
            const Channel channel = requests.GetField(place, names);
            CreateOdbRequests(channel, place, names);
        }
        if (hasHistory) {
            cow_List<cow_String> names;
            const Channel channel = requests.GetHistory(place, names);
            CreateOdbRequests(channel, place, names);
        }
    }
}

void oif_OutputRequestBuilder::AddSolutionControls(const kprC_AnalysisStep& step,
                                                   const cow_String& stepName) {
    if (step.controls.IsNull()) return;
    const kprC_Controls& controls = step.controls.ConstGet();
    if (!controls.HasDefaultValue()) AddStepDefinition(stepName, oif_Comment("\nCONTROLS\n"));
    const bool quasiNewton = step.SolutionTechnique() == kprC_Step::SolutionTechniqueEnm::QUASI_NEWTON;
    for (const auto& keywordFor : kControlsKeywords) {
        const std::unique_ptr<qkw_Keyword> keyword = keywordFor(controls, quasiNewton);
        if (keyword == nullptr) continue;
        AddStepDefinition(stepName, *keyword);
        return;
    }
}

void oif_OutputRequestBuilder::AddSolverControls(const kprC_AnalysisStep& step, const cow_String& stepName) {
    if (step.solverControls.IsNull()) return;
    const kprC_LinearCtrl& controls = step.solverControls.ConstGet();
    if (!controls.useDefault) AddStepDefinition(stepName, oif_Comment("\nSOLVER CONTROLS\n"));
    AddStepDefinition(stepName, oif_SolverControls(controls));
}

void oif_OutputRequestBuilder::AddDiagnosticPrint(const kprC_AnalysisStep& step, const cow_String& stepName,
                                                  mdl_ObjCow<kprC_DiagnosticPrint>& previous) {
    if (previous.IsNull()) {
        previous = step.Explicit() ? mdl_ObjCow<kprC_DiagnosticPrint>(kprC_ExplicitDiagnosticPrint())
                                   : mdl_ObjCow<kprC_DiagnosticPrint>(kprC_StandardDiagnosticPrint());
    }
    if (step.diagnosticPrint.IsNull()) return;
    AddStepDefinition(stepName, oif_DiagnosticPrint(step.diagnosticPrint, previous));
    const auto* perturbation =
        nex_canDynamicCastPtr<kprC_PerturbationDiagnosticPrint>(&step.diagnosticPrint.ConstGet());
    if (perturbation == nullptr) {
        previous = step.diagnosticPrint;
        return;
    }
    // Of a perturbation's print two numbers stay, in a standard one.
    const auto* former = nex_canDynamicCastPtr<kprC_StandardDiagnosticPrint>(&previous.ConstGet());
    kprC_StandardDiagnosticPrint print = former == nullptr ? kprC_StandardDiagnosticPrint() : *former;
    print.frequency = perturbation->frequency;
    print.solve = perturbation->solve;
    previous = mdl_ObjCow<kprC_DiagnosticPrint>(print);
}

cow_String oif_OutputRequestBuilder::GetMonitorSetName(const kprC_AnalysisStep& step) const {
    if (step.monitor.IsNull()) return {};
    const rgnC_Region& region = step.monitor.ConstGet().region;
    if (region.SetName().IsEmpty()) return {};
    return oif_RegionName(region, ModelInfo());
}

bool oif_OutputRequestBuilder::IsScreenedOut(const Request& request, const Channel& channel,
                                             unsigned stepType) {
    const Table& table = Table::Instance();
    const auto onlyOf = [&](Print print, Print other) {
        return table
            .GetInvalidPrintIdentifiers(request.variables, stepType, print, other, channel.Type(),
                                        Domain::ALL_DOMAINS)
            .IsEmpty();
    };
    return (!IsWritableNodeRegion(request.region) && onlyOf(Print::NODE, Print::NODE)) ||
           (!IsWritableElementRegion(request.region) && onlyOf(Print::ELEMENT, Print::ELEMENT_OR_CONTACT));
}

void oif_OutputRequestBuilder::CreateOdbRequests(const Channel& channel, const oif_OutputPlace& place,
                                                 const cow_List<cow_String>& names) {
    cow_List<Request> requests;
    for (int i = 0; i < channel.requests.Length(); ++i) {
        Request request = channel.requests[i];
        request.name = names[i];
        requests.Append(request);
    }
    requests.Sort();
    const cow_List<korC_OdbRequestSpec> defaults =
        Table::Instance().DefaultRequests(channel.Type(), place.stepType, Domain::ALL_DOMAINS);
    if (requests.IsEmpty()) {
        RequestNoOutput(channel, place, defaults.IsEmpty());
        return;
    }
    const cow_String prefix(channel.IsField() ? "\nFIELD OUTPUT: " : "\nHISTORY OUTPUT: ");
    bool first = true;
    Request previous;
    for (int i = 0; i < requests.Length(); ++i) {
        const Request& request = requests[i];
        const nex_Context context("output request", request.name);
        AddStepDefinition(place.stepName, oif_Comment(prefix + request.name + "\n"));
        const Traits traits = TraitsOf(request);
        const bool isSymbol = traits.pre || traits.all;
        const bool wasSymbol = previous.variablesType != korC_VariablesTypeEnm::LISTED;
        const bool sharesLine = !first && !isSymbol && !wasSymbol && request.EqualFrequency(previous) &&
                                request.filter == previous.filter;
        if (!sharesLine) {
            previous = request; // also when nothing of it is written
            const bool onKeywords =
                isSymbol && (!traits.whole || !request.sectionPoints.IsEmpty() || !request.directions);
            if (onKeywords) {
                // The sub-keywords tell the choice of variables.
                AddOutputDefinition(request, channel, place, false, false);
            } else {
                if (IsScreenedOut(request, channel, place.stepType)) {
                    if (first && i + 1 == requests.Length()) RequestNoOutput(channel, place, traits.pre);
                    continue;
                }
                AddOutputDefinition(request, channel, place, traits.pre, traits.all);
            }
            first = false;
        }
        AddOutputSuboptions(request, channel, place, traits);
    }
}

oif_OutputRequestBuilder::Traits oif_OutputRequestBuilder::TraitsOf(const Request& request) const {
    Traits traits;
    traits.domain = request.DomainType();
    traits.pre = request.variablesType == korC_VariablesTypeEnm::PRESELECT;
    traits.all = request.variablesType == korC_VariablesTypeEnm::ALL;
    traits.whole = traits.domain == Domain::WHOLE_MODEL;
    if (traits.domain == Domain::SET) traits.setName = oif_RegionName(request.region, ModelInfo());
    if (traits.domain == Domain::INTERACTION) traits.setName = oif_FirstInteraction(request.interactions);
    traits.hasSurface = traits.domain == Domain::CONTACT_SURFACE && !GetSurfaceName(request.region).IsEmpty();
    return traits;
}

void oif_OutputRequestBuilder::RequestNoOutput(const Channel& channel, const oif_OutputPlace& place,
                                               bool pre) {
    Request none;
    if (channel.IsField() && kprC_ModesIsAllowed(place.stepType)) {
        none.frequencyType = Request::TypeEnm::MODE_LIST;
        AddOutputDefinition(none, channel, place, pre, false);
        AddStepDefinition(place.stepName,
                          oif_NodeOutput(none, place.stepType, cow_String(), false, false, false));
        return;
    }
    if (channel.IsField() && kprC_IsExplicit(place.stepType)) {
        none.frequencyType = Request::TypeEnm::NUMBER_INTERVAL;
    }
    if (!channel.IsField() && kprC_IsFrequencyBuckle(place.stepType)) return;
    AddOutputDefinition(none, channel, place, pre, false);
}

void oif_OutputRequestBuilder::AddOutputDefinition(const Request& request, const Channel& channel,
                                                   const oif_OutputPlace& place, bool pre, bool all) {
    using Type = Request::TypeEnm;
    const Type type = request.frequencyType;
    const unsigned stepType = place.stepType;
    const auto add = [&](const oif_Output& output) { AddStepDefinition(place.stepName, output); };
    switch (type) {
    case Type::FREQUENCY:
        add(oif_Output(channel, type, request.frequency, pre, all, stepType, request.filter));
        break;
    case Type::NUMBER_INTERVAL:
        add(oif_Output(channel, type, request.numberInterval, request.timeMarks, pre, all, place.time,
                       stepType, request.filter));
        break;
    case Type::TIME_INTERVAL:
        add(oif_Output(channel, type, request.timeInterval, request.timeMarks, pre, all, stepType,
                       request.filter));
        break;
    case Type::MODE_LIST:
        add(oif_Output(channel, type, request.modeList, pre, all, stepType, request.filter));
        break;
    case Type::TIME_POINTS:
        add(oif_Output(channel, type, request.timePoints, request.timeMarks, pre, all, stepType,
                       request.filter));
        break;
    }
}

void oif_OutputRequestBuilder::AddOutputSuboptions(const Request& request, const Channel& channel,
                                                   const oif_OutputPlace& place, const Traits& traits) {
    AddIntegratedOutput(request, place, traits);
    if (traits.domain == Domain::INTEGRATED_SECTION) return;
    const bool isContact = traits.domain == Domain::CONTACT_SURFACE || traits.domain == Domain::INTERACTION;
    if (!isContact) {
        AddNodeOutput(request, place, traits);
        AddElementOutput(request, channel, place, traits, cow_String(), false);
        AddModalOutput(request, place, traits);
        AddEnergyOutput(request, place, traits);
        AddIncrementationOutput(request, place, traits);
    }
    AddContactOutput(request, channel, place, traits);
    if (!isContact) AddRadiationOutput(request, place, traits);
}

bool oif_OutputRequestBuilder::IsSilent(const Request& request, const Traits& traits) {
    return request.rebar == korC_RebarEnm::ONLY ||
           (traits.whole && request.directions && (traits.pre || traits.all));
}

void oif_OutputRequestBuilder::AddIntegratedOutput(const Request& request, const oif_OutputPlace& place,
                                                   const Traits& traits) {
    if (request.section.IsEmpty() || IsSilent(request, traits)) return;
    AddStepDefinition(place.stepName, oif_IntegratedOutput(request, place.stepType, traits.pre, traits.all));
}

void oif_OutputRequestBuilder::AddNodeOutput(const Request& request, const oif_OutputPlace& place,
                                             const Traits& traits) {
    if (request.rebar == korC_RebarEnm::ONLY) return;
    // With section points the *Output line didn't say it all.
    if (IsSilent(request, traits) && request.sectionPoints.IsEmpty()) return;
    if (!GetSpringSetName(request.springs).IsEmpty() || !IsWritableNodeRegion(request.region)) return;
    AddStepDefinition(place.stepName,
                      oif_NodeOutput(request, place.stepType, traits.setName, traits.pre, traits.all, true));
}

void oif_OutputRequestBuilder::AddElementOutput(const Request& request, const Channel& channel,
                                                const oif_OutputPlace& place, const Traits& traits,
                                                const cow_String& secondName, bool force) {
    const auto add = [&](const cow_String& setName, bool rebar) {
        AddStepDefinition(place.stepName, oif_ElementOutput(channel, request, place.stepType, setName,
                                                            traits.pre, traits.all, rebar));
    };
    const bool allOfModel = traits.whole && request.sectionPoints.IsEmpty() && (traits.pre || traits.all);
    if (!(allOfModel && request.directions)) {
        const bool goes =
            secondName.IsEmpty() ? IsWritableElementRegion(request.region) || traits.whole : force;
        const cow_String& setName = secondName.IsEmpty() ? traits.setName : secondName;
        if (goes && request.rebar != korC_RebarEnm::ONLY) add(setName, false);
        if (goes && request.rebar != korC_RebarEnm::EXCLUDE) add(setName, true);
    }
    // Once more if it has been written already.
    if (allOfModel && request.rebar != korC_RebarEnm::EXCLUDE) add(traits.setName, true);
}

void oif_OutputRequestBuilder::AddModalOutput(const Request& request, const oif_OutputPlace& place,
                                              const Traits& traits) {
    if (IsSilent(request, traits) || kprC_IsExplicit(place.stepType)) return;
    AddStepDefinition(place.stepName, oif_ModalOutput(request, place.stepType, traits.all));
}

void oif_OutputRequestBuilder::AddEnergyOutput(const Request& request, const oif_OutputPlace& place,
                                               const Traits& traits) {
    if (IsSilent(request, traits) || !IsWritableElementRegion(request.region)) return;
    AddStepDefinition(place.stepName,
                      oif_EnergyOutput(request, place.stepType, traits.setName, traits.pre, traits.all));
}

void oif_OutputRequestBuilder::AddIncrementationOutput(const Request& request, const oif_OutputPlace& place,
                                                       const Traits& traits) {
    if (IsSilent(request, traits) || !kprC_IsExplicit(place.stepType)) return;
    AddStepDefinition(place.stepName,
                      oif_IncrementationOutput(request, place.stepType, traits.pre, traits.all));
}

void oif_OutputRequestBuilder::AddContactOutput(const Request& request, const Channel& channel,
                                                const oif_OutputPlace& place, const Traits& traits) {
    if (IsSilent(request, traits)) return;
    cow_String master;
    cow_String slave;
    cow_String cpset;
    const cow_String first = oif_FirstInteraction(request.interactions);
    if (Model().Interactions().IsMember(first)) {
        const kinC_Interaction& interaction = Model().Interactions().ConstGet(first);
        // A pair that isn't there in the step is not named.
        const bool isThere = !interaction.suppressed && interaction.HasStep(place.stepName);
        switch (isThere ? oif_SolverOf(interaction) : oif_ContactSolver::NONE) {
        case oif_ContactSolver::NONE: break;
        case oif_ContactSolver::IMPLICIT:
            if (const auto* pair = nex_canDynamicCastPtr<kinC_SurfaceToSurfaceContact>(&interaction)) {
                master = GetSurfaceName(pair->master);
                slave = GetSurfaceName(pair->slave);
            } else {
                master =
                    GetSurfaceName(nex_canDynamicCastRef<kinC_SelfContact>(interaction, NEX_HERE).surface);
            }
            break;
        case oif_ContactSolver::EXPLICIT: cpset = first; break;
        }
    }
    if (!traits.hasSurface && traits.domain == Domain::SET) {
        if (request.region.FlagWord() == 0 || IsElementRegion(request.region)) return;
        if (traits.pre && kprC_IsExplicit(place.stepType)) return;
    }
    AddStepDefinition(place.stepName,
                      oif_ContactOutput(request, place.stepType, traits.pre, traits.all, master, slave, cpset,
                                        oif_RegionName(request.region, ModelInfo()), !channel.IsField()));
}

void oif_OutputRequestBuilder::AddRadiationOutput(const Request& request, const oif_OutputPlace& place,
                                                  const Traits& traits) {
    if (IsSilent(request, traits) || kprC_IsExplicit(place.stepType)) return;
    if (traits.domain == Domain::BOLT_LOAD || !IsWritableElementRegion(request.region)) return;
    AddStepDefinition(place.stepName,
                      oif_RadiationOutput(request, place.stepType, traits.setName, traits.all));
}

bool oif_OutputRequestBuilder::IsWritableNodeRegion(const rgnC_Region& region) {
    return (region.FlagWord() & kSurface) == 0 && !IsElementRegion(region);
}

bool oif_OutputRequestBuilder::IsWritableElementRegion(const rgnC_Region& region) {
    const int flags = region.FlagWord();
    return flags == 0 || ((flags & kSurface) == 0 && (flags & kElementContent) != 0);
}

cow_String oif_OutputRequestBuilder::GetSpringSetName(const cow_List<cow_String>& springs) {
    return FirstWith(springs, "-spring");
}

cow_String oif_OutputRequestBuilder::GetDashpotSetName(const cow_List<cow_String>& springs) {
    return FirstWith(springs, "-dashpot");
}

const cls_Record* oif_OutputRequestBuilder::GetSpring(const cow_String&) {
    return nullptr;
}

cow_String oif_OutputRequestBuilder::GetSurfaceName(const rgnC_Region& region) const {
    return oif_SurfaceName(region, ModelInfo());
}
