#include "output/oif_OutputCollector.h"

#include "store_interface/records/conditions/kloC_BoltLoad.h"
#include "store_interface/records/steps/kprC_Predicates.h"

namespace {

using Table = korC_OdbRequestTable;
using Domain = korC_DomainTypeEnm;

bool Holds(const cow_List<cow_String>& names, const cow_String& name) {
    for (int i = 0; i < names.Length(); ++i) {
        if (names[i] == name) return true;
    }
    return false;
}

/// Time points have another number in a request.
korC_OdbRequest::TypeEnm RequestType(korC_TypeEnm type) {
    return type == korC_TypeEnm::TIME_POINTS ? korC_OdbRequest::TypeEnm::TIME_POINTS
                                             : static_cast<korC_OdbRequest::TypeEnm>(type);
}

void TakeFrequency(korC_TypeEnm type, const korC_OutputState& state, korC_OdbRequest& request) {
    switch (type) {
    case korC_TypeEnm::FREQUENCY: request.frequency = state.frequency.ConstGet(); break;
    case korC_TypeEnm::NUMBER_INTERVAL: request.numberInterval = state.numberInterval.ConstGet(); break;
    case korC_TypeEnm::TIME_INTERVAL: request.timeInterval = state.timeInterval.ConstGet(); break;
    case korC_TypeEnm::MODE_LIST: request.modeList = state.modeList.ConstGet(); break;
    case korC_TypeEnm::TIME_POINTS: request.timePoints = state.timePoints.ConstGet(); break;
    }
}

} // namespace

cow_String oif_FirstInteraction(const cow_List<cow_String>& interactions) {
    return interactions.IsEmpty() ? cow_String() : interactions[0];
}

oif_OutputCollector::oif_OutputCollector(const oif_Model& model) : model_(model) {
    for (const auto& [key, rule] : model_.RemeshingRules()) {
        if (!rule.suppressed && !Holds(remeshingSteps_, rule.stepName)) remeshingSteps_.Append(rule.stepName);
    }
}

bool oif_OutputCollector::RefersToSomething(const korC_Output& output) const {
    if (!output.boltLoad.IsEmpty()) {
        if (!model_.Loads().IsMember(output.boltLoad)) return false;
        const kloC_Load& load = model_.Loads().ConstGet(output.boltLoad);
        return load.DynTypeId() == kloC_BoltLoad::TypeId() && !load.suppressed;
    }
    const cow_String interaction = oif_FirstInteraction(output.interactions);
    return model_.Interactions().IsMember(interaction) &&
           !model_.Interactions().ConstGet(interaction).suppressed;
}

bool oif_OutputCollector::HasField(const cow_String& stepName) const {
    // Requests that end here or are suppressed count: the step has to stop the output of the one before it.
    for (const auto& [key, output] : model_.FieldOutputs()) {
        if (!output.HasStep(stepName)) continue;
        const bool isPlain = output.boltLoad.IsEmpty() && output.interactions.IsEmpty();
        if (isPlain || RefersToSomething(output)) return true;
    }
    return Holds(remeshingSteps_, stepName);
}

bool oif_OutputCollector::HasHistory(const cow_String& stepName) const {
    for (const auto& [key, output] : model_.HistoryOutputs()) {
        if (!output.HasStep(stepName)) continue;
        const bool isPlain = output.boltLoad.IsEmpty() && output.interactions.IsEmpty();
        // Springs alone are no reason for output.
        if (isPlain ? output.springs.IsEmpty() : RefersToSomething(output)) return true;
    }
    return false;
}

bool oif_OutputCollector::IsAllowed(korC_TypeEnm type, const kprC_AnalysisStep& step, bool isField) {
    const unsigned stepType = step.DynTypeId();
    switch (type) {
    case korC_TypeEnm::FREQUENCY: return kprC_OutputFrequencyIsAllowed(stepType, isField);
    case korC_TypeEnm::NUMBER_INTERVAL: return kprC_NumberIntervalIsAllowed(step);
    case korC_TypeEnm::TIME_INTERVAL: return kprC_TimeIntervalIsAllowed(stepType);
    case korC_TypeEnm::TIME_POINTS: return kprC_TimePointIsAllowed(stepType, isField);
    case korC_TypeEnm::MODE_LIST: return kprC_ModesIsAllowed(stepType);
    }
    return false;
}

void oif_OutputCollector::Merge(const Request& request, const cow_String& name, Channel& channel,
                                cow_List<cow_String>& names) {
    for (int i = 0; i < channel.requests.Length(); ++i) {
        if (!(channel.requests[i] == request)) continue;
        names.Get(i) = names[i] + ", " + name;
        return;
    }
    channel.requests.Append(request);
    names.Append(name);
}

template <class State>
void oif_OutputCollector::Collect(const korC_Output& output, const cow_String& name,
                                  const oif_OutputPlace& place, Request request, Channel& channel,
                                  cow_List<cow_String>& names) const {
    const Domain domain = output.DomainType();
    if (output.suppressed || domain == Domain::SPRINGS) return;
    if (!korC_Output::IsActive(output.Status(place.stepName))) return;
    const nex_Context context("output request", name);
    request.region = output.region;
    request.boltLoad = output.boltLoad;
    request.sectionPoints = output.sectionPoints;
    request.interactions = output.interactions;
    request.filter = output.filter;
    if (output.rebar == korC_RebarEnm::INCLUDE || output.rebar == korC_RebarEnm::ONLY) {
        request.rebar = output.rebar;
    }

    State state = nex_canDynamicCastRef<State>(output.ConstGetState(place.stepName), NEX_HERE);
    request.frequency = state.frequency.ConstGet();
    request.numberInterval = state.numberInterval.ConstGet();
    request.timeInterval = state.timeInterval.ConstGet();
    request.modeList = state.modeList.ConstGet();
    request.timeMarks = state.timeMarks.ConstGet();
    request.timePoints = state.timePoints.ConstGet();
    korC_TypeEnm type = state.frequencyType.ConstGet();
    if (!IsAllowed(type, place.step, channel.IsField())) {
        const State usual(place.stepType);
        type = usual.frequencyType.ConstGet();
        TakeFrequency(type, usual, request);
    }
    request.frequencyType = RequestType(type);

    if (!state.variables.ConstGet().IsEmpty()) {
        state.ReconstructVariables(place.stepType);
        state.ConvertVariablesToVariablesSymbol(place.stepType, false);
    }
    request.variables = state.variables.ConstGet();
    if (request.variables.IsEmpty()) {
        // Names that the procedure doesn't know leave it to the type, the preselection by default.
        const Table& table = Table::Instance();
        request.variablesType = state.variablesType.ConstGet();
        if (request.variablesType == korC_VariablesTypeEnm::PRESELECT) {
            request.variables = table.Defaults(channel.Type(), place.stepType, hasSimBasedStep_, domain, 0);
        } else if (request.variablesType == korC_VariablesTypeEnm::ALL) {
            request.variables = table.All(channel.Type(), place.stepType, domain, 0);
        }
        if (request.variables.IsEmpty()) return;
    }
    Merge(request, name, channel, names);
}

korC_OdbChannel oif_OutputCollector::GetField(const oif_OutputPlace& place,
                                              cow_List<cow_String>& names) const {
    Channel channel(true);
    for (const auto& [name, output] : model_.FieldOutputs()) {
        Request request;
        request.directions = output.directions;
        Collect<korC_FieldOutputState>(output, name, place, request, channel, names);
    }
    if (Holds(remeshingSteps_, place.stepName)) CollectRemeshingRules(place, channel, names);
    return channel;
}

korC_OdbChannel oif_OutputCollector::GetHistory(const oif_OutputPlace& place,
                                                cow_List<cow_String>& names) const {
    Channel channel(false);
    for (const auto& [name, output] : model_.HistoryOutputs()) {
        Request request;
        request.section = output.section;
        request.springs = output.springs;
        Collect<korC_HistoryOutputState>(output, name, place, request, channel, names);
    }
    return channel;
}

void oif_OutputCollector::CollectRemeshingRules(const oif_OutputPlace& place, Channel& channel,
                                                cow_List<cow_String>& names) const {
    for (const auto& [name, rule] : model_.RemeshingRules()) {
        if (!(rule.stepName == place.stepName) || rule.suppressed || !rule.fieldOutput) continue;
        Request request;
        request.region = rule.region;
        request.variables = rule.GetFullVariableList();
        request.variables.Append("EVOL");
        request.frequency = rule.EveryIncrement() ? Table::fieldFrequencyDef() : Table::lastIncrementDef();
        request.timeMarks = !kprC_IsExplicit(place.stepType);
        cow_String title = cow_String(" from REMESHING RULE: ") + name;
        if (!rule.description.IsEmpty()) title = title + "\n" + rule.description;
        Merge(request, title, channel, names);
    }
}
