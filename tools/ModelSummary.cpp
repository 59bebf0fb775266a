#include "tools/ModelSummary.h"

#include "model_file/checks/mdf_MaterialChecks.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_StepTimes.h"
#include "tools/TextTable.h"

#include <algorithm>
#include <cstdio>
#include <set>
#include <string_view>

using nlohmann::ordered_json;

namespace {

std::string Text(const cow_String& text) {
    return std::string(text.View());
}

struct NamedKind {
    const char* key;
    const char* name;
    const mdl_Repository& (*in)(const odiK_Model& model);
    bool reachesDeck = true;
};

#define QRX_NAMED_KIND(member, name)                                                                         \
    NamedKind {                                                                                              \
#member, name, [](const odiK_Model& model) -> const mdl_Repository& { return model.member; }         \
    }
#define QRX_IDLE_KIND(member, name)                                                                          \
    NamedKind {                                                                                              \
#member, name, [](const odiK_Model& model) -> const mdl_Repository& { return model.member; }, false  \
    }

const NamedKind kNamedKinds[] = {
    QRX_NAMED_KIND(materials, "materials"),
    QRX_NAMED_KIND(sections, "sections"),
    QRX_NAMED_KIND(beamProfiles, "beam profiles"),
    QRX_NAMED_KIND(amplitudes, "amplitudes"),
    QRX_NAMED_KIND(constraints, "constraints"),
    QRX_NAMED_KIND(contactControls, "contact controls"),
    QRX_NAMED_KIND(contactInitializations, "contact initializations"),
    QRX_NAMED_KIND(interactionProperties, "interaction properties"),
    QRX_IDLE_KIND(timePoints, "time points"),
    QRX_IDLE_KIND(adaptiveMeshControls, "adaptive mesh controls"),
    QRX_NAMED_KIND(boundaryConditions, "boundary conditions"),
    QRX_NAMED_KIND(loads, "loads"),
    QRX_NAMED_KIND(fields, "fields"),
    QRX_NAMED_KIND(interactions, "interactions"),
    QRX_NAMED_KIND(fieldOutputRequests, "field output requests"),
    QRX_NAMED_KIND(historyOutputRequests, "history output requests"),
    QRX_IDLE_KIND(adaptiveMeshConstraints, "adaptive mesh constraints"),
};

#undef QRX_NAMED_KIND
#undef QRX_IDLE_KIND

bool IsSuppressed(const cls_Record& record) {
    const auto* object = dynamic_cast<const kprC_PropagatingObject*>(&record);
    return object != nullptr && object->suppressed;
}

// As when elements are written, capitals count.
bool IsSurfaceElement(const odiK_ElementClass& elements) {
    return elements.type.View().find("SURF") != std::string_view::npos;
}

struct MeshCounts {
    long long nodes = 0;
    long long elements = 0;
    long long surfaceElements = 0;
    long long nodeSets = 0;
    long long elementSets = 0;
    long long surfaces = 0;

    void AddMesh(const odiK_Mesh& mesh) {
        nodes += mesh.Nodes().NumNodes();
        for (const odiK_ElementClass& elements_ : mesh.Classes()) {
            (IsSurfaceElement(elements_) ? surfaceElements : elements) += elements_.NumElements();
        }
        AddSets(mesh.Sets());
    }
    void AddSets(const std::vector<cow_CountedHld<odiK_Set>>& sets) {
        for (const auto& set : sets) {
            switch (set->type) {
            case res_SetTypeEnm::NODES: ++nodeSets; break;
            case res_SetTypeEnm::ELEMENTS: ++elementSets; break;
            case res_SetTypeEnm::FACETS: ++surfaces; break;
            }
        }
    }
};

MeshCounts CountMeshes(const odiK_Model& model) {
    MeshCounts counts;
    for (const auto& [name, instance] : model.Instances()) {
        const auto mesh = instance->Mesh();
        if (instance->isPartInstance && !mesh.IsNull()) counts.AddMesh(*mesh);
    }
    counts.AddSets(model.AssemblySets());
    return counts;
}

std::set<std::string> UsedParts(const odiK_Model& model) {
    std::set<std::string> used;
    for (const auto& [name, instance] : model.Instances()) {
        if (instance->isPartInstance) used.insert(Text(instance->partName));
    }
    return used;
}

std::vector<std::string> NamesIn(const mdl_Repository& repository) {
    std::vector<std::string> names;
    for (mdl_RepositoryIT it(repository); !it.IsDone(); it.Next()) names.push_back(Text(it.CurrentKey()));
    return names;
}

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
    const std::set<std::string> used = UsedParts(model);
    std::vector<std::string> names;
    for (const auto& [name, part] : model.Parts()) {
        if (used.count(Text(name)) == 0) names.push_back(Text(name));
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
    return {CountMeshes(model).surfaceElements, {}};
}

Found IncidentWaveProperties(const odb_Odb&, const odiK_Model& model) {
    std::vector<std::string> names;
    for (mdl_RepositoryIT it(model.interactionProperties); !it.IsDone(); it.Next()) {
        const cow_String className = cls_Classes().NameOf(it.CurrentRecord().DynTypeId());
        if (className == "kinC_IncidentWaveProperty") names.push_back(Text(it.CurrentKey()));
    }
    return Named(std::move(names));
}

Found Suppressed(const odb_Odb&, const odiK_Model& model) {
    std::vector<std::string> names;
    for (const NamedKind& kind : kNamedKinds) {
        if (!kind.reachesDeck) continue;
        for (mdl_RepositoryIT it(kind.in(model)); !it.IsDone(); it.Next()) {
            if (IsSuppressed(it.CurrentRecord())) names.push_back(Text(it.CurrentKey()));
        }
    }
    return Named(std::move(names));
}

Found IdleOptions(const odiK_Model& model, bool ofGasket) {
    std::vector<std::string> names;
    for (const mdf_IdleOption& idle : mdf_IdleGasketOptions(model)) {
        if (idle.ofGasket == ofGasket) names.push_back(Text(idle.material) + " " + idle.option);
    }
    return Named(std::move(names));
}

constexpr LeftOutRule kLeftOutRules[] = {
    {"other models", "a deck is always written from \"Default Model\"", OtherModels},
    {"parts without an instance", "only instances show a mesh", IdleParts},
    {"entries of the assembly", "they are no part instances", OtherEntries},
    {"nodes of the assembly", "there is no node block for the assembly", AssemblyNodes},
    {"surface elements", "their element types are not written", SurfaceElements},
    {"gasket options", "no gasket section names their materials",
     [](const odb_Odb&, const odiK_Model& model) { return IdleOptions(model, false); }},
    {"other options of gasket materials", "a gasket behaviour has no place for them",
     [](const odb_Odb&, const odiK_Model& model) { return IdleOptions(model, true); }},
    {"incident wave properties", "they are not written", IncidentWaveProperties},
    {"time points", "their points are not written",
     [](const odb_Odb&, const odiK_Model& model) { return Named(NamesIn(model.timePoints)); }},
    {"adaptive mesh controls", "they are not written",
     [](const odb_Odb&, const odiK_Model& model) { return Named(NamesIn(model.adaptiveMeshControls)); }},
    {"adaptive mesh constraints", "they are not written",
     [](const odb_Odb&, const odiK_Model& model) { return Named(NamesIn(model.adaptiveMeshConstraints)); }},
    {"suppressed objects", "they are suppressed", Suppressed},
};

ordered_json DescribeMesh(const odiK_Mesh& mesh) {
    std::map<std::string, long long> byType;
    for (const odiK_ElementClass& elements : mesh.Classes()) {
        byType[Text(elements.type)] += elements.NumElements();
    }
    return {{"nodes", mesh.Nodes().NumNodes()}, {"elements", mesh.NumElements()}, {"elementTypes", byType}};
}

ordered_json DescribeSets(const std::vector<cow_CountedHld<odiK_Set>>& sets) {
    ordered_json kinds = {{"node", ordered_json::object()},
                          {"element", ordered_json::object()},
                          {"surface", ordered_json::object()}};
    const char* const words[] = {"node", "element", "surface"};
    for (const auto& set : sets) {
        long long members = 0;
        for (const rgnC_SubsetData& subset : set->subsets) members += subset.subset.Length();
        kinds[words[static_cast<int>(set->type)]][Text(set->name)] = members;
    }
    return kinds;
}

ordered_json Triple(const float (&values)[3]) {
    return {values[0], values[1], values[2]};
}

ordered_json DescribeInstance(const odiK_Instance& instance) {
    ordered_json entry = {{"part", Text(instance.partName)},
                          {"partInstance", instance.isPartInstance},
                          {"translation", Triple(instance.translation)},
                          {"rotation", Triple(instance.rotation)}};
    if (!instance.ownMesh.IsNull()) {
        entry["mesh"] = DescribeMesh(*instance.ownMesh);
        entry["sets"] = DescribeSets(instance.ownMesh->Sets());
    }
    return entry;
}

/// "kprC_StaticLinearPerturbationStep" as "static linear perturbation".
std::string ProcedureOf(const kprC_Step& step) {
    std::string name = Text(cls_Classes().NameOf(step.DynTypeId()));
    if (name.starts_with("kprC_")) name.erase(0, 5);
    if (name.ends_with("Step")) name.erase(name.size() - 4);
    std::string words;
    for (const char c : name) {
        const bool isCapital = c >= 'A' && c <= 'Z';
        if (isCapital && !words.empty()) words += ' ';
        words += isCapital ? static_cast<char>(c - 'A' + 'a') : c;
    }
    return words;
}

ordered_json DescribeSteps(const kprC_StepContainer& steps) {
    ordered_json list = ordered_json::array();
    for (int i = 0; i < steps.Size(); ++i) {
        const kprC_Step& step = steps.StepAt(i);
        const auto* analysis = dynamic_cast<const kprC_AnalysisStep*>(&step);
        ordered_json entry = {
            {"name", Text(steps.NameAt(i))},  {"class", Text(cls_Classes().NameOf(step.DynTypeId()))},
            {"procedure", ProcedureOf(step)}, {"perturbation", step.Perturbation()},
            {"explicit", step.Explicit()},    {"suppressed", step.suppressed}};
        if (analysis != nullptr) {
            const kprC_StepTimes times(step);
            entry["nlgeom"] = step.Nlgeom() == kprC_Step::NlgeomEnm::ON;
            if (times.period.IsSet()) entry["period"] = times.period.value;
            ordered_json& increments = entry["increments"] = ordered_json::object();
            const std::pair<const char*, kprC_TimeField> fields[] = {
                {"initial", times.initial}, {"min", times.least}, {"max", times.most}};
            for (const auto& [key, field] : fields) {
                if (field.IsSet()) increments[key] = field.value;
            }
            entry["loadCases"] = NamesIn(analysis->loadCases);
        }
        list.push_back(std::move(entry));
    }
    return list;
}

std::string NumberText(double value) {
    char text[32];
    std::snprintf(text, sizeof text, "%.6g", value);
    return text;
}

std::string TripleText(const ordered_json& triple) {
    std::string text = "(";
    text.append(NumberText(triple[0])).append(", ").append(NumberText(triple[1])).append(", ");
    return text.append(NumberText(triple[2])).append(")");
}

bool IsZero(const ordered_json& triple) {
    return triple[0] == 0.0F && triple[1] == 0.0F && triple[2] == 0.0F;
}

std::string Heading(const char* kind, std::size_t count) {
    return std::string("  ") + kind + " (" + std::to_string(count) + ")\n";
}

std::string Placement(const ordered_json& instance) {
    std::string text;
    if (!IsZero(instance["translation"])) text += "moved by " + TripleText(instance["translation"]);
    if (!IsZero(instance["rotation"])) {
        text += (text.empty() ? "" : ", ") + ("turned by " + TripleText(instance["rotation"]));
    }
    return text.empty() ? "in place" : text;
}

std::string MeshText(const ordered_json& mesh) {
    std::string text = std::to_string(mesh["nodes"].get<long long>()) + " nodes, " +
                       std::to_string(mesh["elements"].get<long long>()) + " elements";
    const char* separator = ": ";
    for (const auto& [type, count] : mesh["elementTypes"].items()) {
        text += separator + std::to_string(count.get<long long>()) + " " + type;
        separator = ", ";
    }
    return text;
}

void AddSetRow(TextTable& table, const std::string& owner, const ordered_json& sets) {
    const std::size_t node = sets["node"].size();
    const std::size_t element = sets["element"].size();
    const std::size_t surface = sets["surface"].size();
    if (node + element + surface == 0) return;
    table.Row({owner, std::to_string(node) + " node sets", std::to_string(element) + " element sets",
               std::to_string(surface) + " surfaces"});
}

std::string SetsText(const ordered_json& model) {
    TextTable sets;
    for (const auto& [name, part] : model["parts"].items()) {
        if (part.contains("sets")) AddSetRow(sets, "part " + name, part["sets"]);
    }
    for (const auto& [name, instance] : model["instances"].items()) {
        if (instance.contains("sets")) AddSetRow(sets, "instance " + name, instance["sets"]);
    }
    AddSetRow(sets, "assembly", model["assembly"]["sets"]);
    const std::string text = sets.Text("    ");
    return text.empty() ? text : "  sets\n" + text;
}

std::string Joined(const std::vector<std::string>& words) {
    std::string text;
    for (const std::string& word : words) text += (text.empty() ? "" : ", ") + word;
    return text;
}

/// One of the step's numbers, or a dash where its class has none.
std::string NumberIn(const ordered_json& object, const char* key) {
    return object.contains(key) ? NumberText(object[key]) : "-";
}

std::string StepsText(const ordered_json& steps) {
    if (steps.empty()) return Heading("steps", 0);
    TextTable table;
    table.Row({"", "name", "procedure", "nlgeom", "period", "initial", "min", "max", "load cases"});
    std::size_t place = 0;
    for (const ordered_json& step : steps) {
        std::vector<std::string> row = {std::to_string(place++), step["name"], step["procedure"]};
        if (step.contains("increments")) {
            const ordered_json& increments = step["increments"];
            const auto loadCases = step["loadCases"].get<std::vector<std::string>>();
            row.insert(row.end(), {step["nlgeom"].get<bool>() ? "on" : "off", NumberIn(step, "period"),
                                   NumberIn(increments, "initial"), NumberIn(increments, "min"),
                                   NumberIn(increments, "max"), loadCases.empty() ? "-" : Joined(loadCases)});
        }
        table.Row(std::move(row));
    }
    return Heading("steps", steps.size()) + table.Text("    ");
}

} // namespace

std::vector<KindCount> CountsOfDeck(const odiK_Model& model) {
    const MeshCounts mesh = CountMeshes(model);
    const auto instances = std::count_if(model.Instances().begin(), model.Instances().end(),
                                         [](const auto& entry) { return entry.second->isPartInstance; });
    std::vector<KindCount> counts = {
        {"parts", "parts", static_cast<long long>(UsedParts(model).size())},
        {"instances", "instances", instances},
        {"nodes", "nodes", mesh.nodes},
        {"elements", "elements", mesh.elements},
        {"nodeSets", "node sets", mesh.nodeSets},
        {"elementSets", "element sets", mesh.elementSets},
        {"surfaces", "surfaces", mesh.surfaces},
        {"steps", "steps", model.steps.Size()},
    };
    for (const NamedKind& kind : kNamedKinds) {
        if (!kind.reachesDeck) continue;
        long long count = 0;
        for (mdl_RepositoryIT it(kind.in(model)); !it.IsDone(); it.Next()) {
            if (!IsSuppressed(it.CurrentRecord())) ++count;
        }
        counts.push_back({kind.key, kind.name, count});
    }
    std::erase_if(counts, [](const KindCount& count) { return count.count == 0; });
    return counts;
}

std::vector<LeftOut> LeftOutOf(const odb_Odb& odb, const odiK_Model& model) {
    std::vector<LeftOut> all;
    for (const LeftOutRule& rule : kLeftOutRules) {
        auto [count, names] = rule.find(odb, model);
        if (count > 0) all.push_back({rule.what, rule.why, count, std::move(names)});
    }
    return all;
}

ordered_json DescribeModel(const odiK_Model& model) {
    ordered_json root = {{"description", Text(model.description)}};
    ordered_json& parts = root["parts"] = ordered_json::object();
    for (const auto& [name, part] : model.Parts()) {
        ordered_json entry = ordered_json::object();
        if (!part->mesh.IsNull()) {
            entry["mesh"] = DescribeMesh(*part->mesh);
            entry["sets"] = DescribeSets(part->mesh->Sets());
        }
        parts[Text(name)] = std::move(entry);
    }
    ordered_json& instances = root["instances"] = ordered_json::object();
    for (const auto& [name, instance] : model.Instances()) {
        instances[Text(name)] = DescribeInstance(*instance);
    }
    ordered_json& assembly = root["assembly"] = {{"name", Text(model.assemblyName)}};
    if (!model.ConstAssemblyMesh().IsNull()) assembly["mesh"] = DescribeMesh(*model.ConstAssemblyMesh());
    assembly["sets"] = DescribeSets(model.AssemblySets());
    root["steps"] = DescribeSteps(model.steps);
    ordered_json& named = root["objects"] = ordered_json::object();
    for (const NamedKind& kind : kNamedKinds) {
        for (mdl_RepositoryIT it(kind.in(model)); !it.IsDone(); it.Next()) {
            named[kind.key][Text(it.CurrentKey())] =
                Text(cls_Classes().NameOf(it.CurrentRecord().DynTypeId()));
        }
    }
    return root;
}

std::string TextOfDescription(const std::string& modelName, const ordered_json& model) {
    std::string text = "model \"" + modelName + "\"\n";
    const std::string description = model["description"];
    if (!description.empty()) text += "  " + description + "\n";

    TextTable parts;
    for (const auto& [name, part] : model["parts"].items()) {
        parts.Row({name, part.contains("mesh") ? MeshText(part["mesh"]) : "no mesh"});
    }
    text += Heading("parts", model["parts"].size()) + parts.Text("    ");

    TextTable instances;
    for (const auto& [name, instance] : model["instances"].items()) {
        std::string own = instance.contains("mesh") ? "; own mesh: " + MeshText(instance["mesh"]) : "";
        if (!instance["partInstance"].get<bool>()) own += "; no part instance";
        instances.Row({name, "of " + instance["part"].get<std::string>(), Placement(instance) + own});
    }
    text += Heading("instances", model["instances"].size()) + instances.Text("    ");
    if (model["assembly"].contains("mesh")) {
        text += "  mesh of the assembly\n    " + MeshText(model["assembly"]["mesh"]) + "\n";
    }
    text += SetsText(model);
    text += StepsText(model["steps"]);

    for (const NamedKind& kind : kNamedKinds) {
        if (!model["objects"].contains(kind.key)) continue;
        const ordered_json& objects = model["objects"][kind.key];
        TextTable table;
        for (const auto& [name, className] : objects.items()) table.Row({name, className});
        text += Heading(kind.name, objects.size()) + table.Text("    ");
    }
    return text;
}
