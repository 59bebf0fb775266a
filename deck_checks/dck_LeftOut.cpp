#include "deck_checks/dck_LeftOut.h"

#include "deck_checks/dck_Checks.h"

#include "deck_checks/dck_DeckCounts.h"
#include "deck_checks/dck_Text.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/interactions/kinC_ActuatorSensor.h"
#include "store_interface/records/interactions/kinC_CyclicSymmetry.h"
#include "store_interface/records/interactions/kinC_WaveInteractions.h"

#include <algorithm>

namespace {

using Found = std::pair<long long, std::vector<std::string>>;

Found Named(std::vector<std::string> names) {
    const auto count = static_cast<long long>(names.size());
    return {count, std::move(names)};
}

struct LeftOutRule {
    const char* what;
    const char* why;
    Found (*find)(const odb_Odb& odb, const odiK_Model& model);
};

Found OtherModels(const odb_Odb& odb, const odiK_Model& model) {
    std::vector<std::string> names;
    for (const auto& [name, other] : odb.Models()) {
        if (other.Referent() != &model) names.push_back(Text(name));
    }
    return Named(std::move(names));
}

Found IdleParts(const odb_Odb&, const odiK_Model& model) {
    const std::set<cow_String> used = UsedParts(model);
    std::vector<std::string> names;
    for (const auto& [name, part] : model.Parts()) {
        if (used.count(name) == 0) names.push_back(Text(name));
    }
    return Named(std::move(names));
}

Found OtherEntries(const odb_Odb&, const odiK_Model& model) {
    std::vector<std::string> names;
    for (const auto& [name, instance] : model.Instances()) {
        if (!instance->isPartInstance) names.push_back(Text(name));
    }
    return Named(std::move(names));
}

Found AssemblyNodes(const odb_Odb&, const odiK_Model& model) {
    const auto& mesh = model.ConstAssemblyMesh();
    return {mesh.IsNull() ? 0 : mesh->Nodes().NumNodes(), {}};
}

Found SurfaceElements(const odb_Odb&, const odiK_Model& model) {
    return {dck_MeshCounts::Of(model).surfaceElements, {}};
}

/// The objects of class T that are not suppressed.
template <class T, auto Member>
Found OfClass(const odb_Odb&, const odiK_Model& model) {
    std::vector<std::string> names;
    for (const auto& [name, record] : model.*Member) {
        if (record.DynTypeId() == T::TypeId() && !IsSuppressed(record)) names.push_back(Text(name));
    }
    return Named(std::move(names));
}

Found Suppressed(const odiK_Model& model) {
    std::vector<std::string> names;
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (!repository.ReachesDeck() || repository.IsInOrder()) continue;
        for (const auto& [name, record] : repository.In(model)) {
            if (IsSuppressed(record)) names.push_back(Text(name));
        }
    }
    return Named(std::move(names));
}

Found IdleOptions(const odiK_Model& model, bool ofGasket) {
    std::vector<std::string> names;
    for (const dck_IdleOption& idle : dck_IdleGasketOptions(model)) {
        if (idle.ofGasket == ofGasket) names.push_back(Text(idle.material) + " " + std::string(idle.option));
    }
    return Named(std::move(names));
}

constexpr LeftOutRule kLeftOutRules[] = {
    {"other models", "a deck is written from one of them", OtherModels},
    {"parts without an instance", "only instances show a mesh", IdleParts},
    {"entries of the assembly", "they are no part instances", OtherEntries},
    {"nodes of the assembly", "there is no node block for the assembly", AssemblyNodes},
    {"surface elements", "their element types are not written", SurfaceElements},
    {"gasket options", "no gasket section names their materials",
     [](const odb_Odb&, const odiK_Model& model) { return IdleOptions(model, false); }},
    {"other options of gasket materials", "a gasket behaviour has no place for them",
     [](const odb_Odb&, const odiK_Model& model) { return IdleOptions(model, true); }},
    {"incident wave properties", "they are not written",
     OfClass<kinC_IncidentWaveProperty, &odiK_Model::interactionProperties>},
    {"elastic foundations", "they have no keyword",
     OfClass<kinC_ElasticFoundation, &odiK_Model::interactions>},
    {"control elements", "they are not written", OfClass<kinC_ActuatorSensor, &odiK_Model::interactions>},
    {"properties of control elements", "they are not written",
     OfClass<kinC_ActuatorSensorProp, &odiK_Model::interactionProperties>},
};

void Add(std::vector<dck_LeftOut>& all, const char* what, const char* why, Found found) {
    if (found.first > 0) all.push_back({what, why, found.first, std::move(found.second)});
}

} // namespace

std::vector<dck_LeftOut> dck_LeftOutOf(const odb_Odb& odb, const odiK_Model& model) {
    std::vector<dck_LeftOut> all;
    for (const LeftOutRule& rule : kLeftOutRules) Add(all, rule.what, rule.why, rule.find(odb, model));
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (repository.ReachesDeck()) continue;
        std::vector<std::string> names;
        for (const auto& [name, record] : repository.In(model)) names.push_back(Text(name));
        Add(all, repository.plural, repository.whyNotInDeck, Named(std::move(names)));
    }
    Add(all, "suppressed objects", "they are suppressed", Suppressed(model));
    return all;
}
