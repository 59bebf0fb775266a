#include "tools/ModelDescription.h"

#include "deck_checks/dck_Text.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_StepTimes.h"
#include "store_interface/records/steps/kprC_StepWords.h"
#include "tools/JsonMembers.h"
#include "tools/NumberText.h"
#include "tools/TextTable.h"

using nlohmann::ordered_json;

namespace {

std::vector<std::string> NamesIn(const mdl_Repository& repository) {
    std::vector<std::string> names;
    for (const auto& [name, record] : repository) names.push_back(Text(name));
    return names;
}

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
    for (const auto& set : sets) {
        long long members = 0;
        for (const rgnC_SubsetData& subset : set->subsets) members += subset.subset.Length();
        AddMember(kinds[omu_EnumTableOf(set->type).Row(static_cast<int>(set->type))->name], Text(set->name),
                  members);
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

ordered_json DescribeSteps(const kprC_StepContainer& steps) {
    ordered_json list = ordered_json::array();
    for (int i = 0; i < steps.Size(); ++i) {
        const kprC_Step& step = steps.StepAt(i);
        const auto* analysis = dynamic_cast<const kprC_AnalysisStep*>(&step);
        ordered_json entry = {{"name", Text(steps.NameAt(i))},
                              {"class", Text(cls_Classes().ShortNameOf(step.DynTypeId()))},
                              {"procedure", kprC_ProcedureWords(step)},
                              {"perturbation", step.Perturbation()},
                              {"explicit", step.Explicit()},
                              {"suppressed", step.suppressed}};
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

bool IsZero(const ordered_json& triple) {
    return triple[0] == 0.0F && triple[1] == 0.0F && triple[2] == 0.0F;
}

std::string Heading(const char* kind, std::size_t count) {
    return std::string("  ") + kind + " (" + std::to_string(count) + ")\n";
}

std::string Placement(const ordered_json& instance) {
    std::string text;
    if (!IsZero(instance["translation"])) text += "moved by " + PointText(instance["translation"]);
    if (!IsZero(instance["rotation"])) {
        text += (text.empty() ? "" : ", ") + ("turned by " + PointText(instance["rotation"]));
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

ordered_json DescribeModel(const odiK_Model& model) {
    ordered_json root = {{"description", Text(model.description)}};
    ordered_json& parts = root["parts"] = ordered_json::object();
    for (const auto& [name, part] : model.Parts()) {
        ordered_json entry = ordered_json::object();
        if (!part->mesh.IsNull()) {
            entry["mesh"] = DescribeMesh(*part->mesh);
            entry["sets"] = DescribeSets(part->mesh->Sets());
        }
        AddMember(parts, Text(name), std::move(entry));
    }
    ordered_json& instances = root["instances"] = ordered_json::object();
    for (const auto& [name, instance] : model.Instances()) {
        AddMember(instances, Text(name), DescribeInstance(*instance));
    }
    ordered_json& assembly = root["assembly"] = {{"name", Text(model.AssemblyObject().name)}};
    if (!model.ConstAssemblyMesh().IsNull()) assembly["mesh"] = DescribeMesh(*model.ConstAssemblyMesh());
    assembly["sets"] = DescribeSets(model.AssemblySets());
    root["steps"] = DescribeSteps(model.steps);
    ordered_json& named = root["objects"] = ordered_json::object();
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (repository.IsInOrder()) continue;
        ordered_json objects = ordered_json::object();
        for (const auto& [name, record] : repository.In(model))
            AddMember(objects, Text(name), Text(cls_Classes().ShortNameOf(record.DynTypeId())));
        if (!objects.empty()) named[repository.member] = std::move(objects);
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

    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (!model["objects"].contains(repository.member)) continue;
        const ordered_json& objects = model["objects"][repository.member];
        TextTable table;
        for (const auto& [name, className] : objects.items()) table.Row({name, className});
        text += Heading(repository.plural, objects.size()) + table.Text("    ");
    }
    return text;
}
