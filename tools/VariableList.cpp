#include "tools/VariableList.h"

#include "deck_checks/dck_Text.h"
#include "model_file/mdf_ClassChoice.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/output/korC_OdbRequestTable.h"
#include "store_interface/records/steps/kprC_Step.h"
#include "tools/TextTable.h"

#include <algorithm>
#include <cctype>
#include <cstring>
#include <vector>

using nlohmann::ordered_json;

namespace {

using Spec = korC_OdbRequestSpec;

/// "Static" of "StaticStep".
std::string ProcedureName(const cls_ClassEntry& step) {
    constexpr std::string_view kSuffix = "Step";
    std::string_view name = step.info.Word();
    if (name.ends_with(kSuffix)) name.remove_suffix(kSuffix.size());
    return std::string(name);
}

std::string InSmallLetters(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return text;
}

std::vector<const cls_ClassEntry*> Procedures() {
    return cls_Classes().ConcreteClasses(kprC_AnalysisStep::TypeId());
}

std::string KeywordsOf(Spec::PrintEnm print) {
    switch (print) {
    case Spec::PrintEnm::NODE: return "*Node Output";
    case Spec::PrintEnm::ELEMENT: return "*Element Output";
    case Spec::PrintEnm::MODAL: return "*Modal Output";
    case Spec::PrintEnm::CONTACT: return "*Contact Output";
    case Spec::PrintEnm::RADIATION: return "*Radiation Output";
    case Spec::PrintEnm::INCREMENTATION: return "*Incrementation Output";
    case Spec::PrintEnm::ENERGY: return "*Energy Output";
    case Spec::PrintEnm::ELEMENT_OR_CONTACT: return "*Element Output, *Contact Output";
    case Spec::PrintEnm::INTEGRATED: return "*Integrated Output";
    case Spec::PrintEnm::NONE: break;
    }
    return "";
}

ordered_json Texts(const cls_xpListString& names) {
    ordered_json list = ordered_json::array();
    for (int i = 0; i < names.Length(); ++i) list.push_back(Text(names[i]));
    return list;
}

ordered_json ProceduresIn(unsigned bits) {
    ordered_json list = ordered_json::array();
    for (const cls_ClassEntry* procedure : Procedures()) {
        if ((bits & korC_OdbRequestTable::Bit(procedure->info.Id())) != 0) {
            list.push_back(ProcedureName(*procedure));
        }
    }
    return list;
}

std::string Joined(const ordered_json& texts) {
    std::string joined;
    for (const ordered_json& text : texts) joined += (joined.empty() ? "" : " ") + text.get<std::string>();
    return joined;
}

/// Where a variable can be asked for; "*" where the one procedure preselects it.
std::string ChannelsOf(const ordered_json& variable, std::optional<unsigned> stepType) {
    std::string text;
    for (const char* channel : {"field", "history"}) {
        if (!variable[channel].get<bool>()) continue;
        text += (text.empty() ? "" : ", ") + std::string(channel);
        const char* preselected = std::strcmp(channel, "field") == 0 ? "preselectField" : "preselectHistory";
        if (stepType && !variable[preselected].empty()) text += "*";
    }
    return text;
}

/// Few procedures by their names, many by their number.
std::string ProcedureText(const ordered_json& procedures) {
    constexpr std::size_t few = 3;
    if (procedures.size() == Procedures().size()) return "all";
    return procedures.size() <= few ? Joined(procedures) : std::to_string(procedures.size());
}

} // namespace

std::optional<unsigned> FindStepType(const std::string& name) {
    const mdf_ClassChoice& choice = mdf_ClassChoice::Of(kprC_AnalysisStep::TypeId());
    const cls_ClassEntry* step = choice.Find(name);
    return step == nullptr ? std::nullopt : std::optional(step->info.Id());
}

std::string StepTypeNames() {
    std::string names;
    for (const cls_ClassEntry* procedure : Procedures()) {
        names += (names.empty() ? "" : ", ") + ProcedureName(*procedure);
    }
    return names;
}

ordered_json DescribeVariables(std::optional<unsigned> stepType) {
    const unsigned wanted = stepType ? korC_OdbRequestTable::Bit(*stepType) : ~0U;
    ordered_json variables = ordered_json::array();
    const cow_List<Spec>& specs = korC_OdbRequestTable::Instance().Specs();
    for (int i = 0; i < specs.Length(); ++i) {
        const Spec& spec = specs[i];
        if ((spec.procedures & wanted) == 0) continue;
        ordered_json variable = {
            {"name", Text(spec.name)},
            {"meaning", Text(spec.doc)},
            {"components", Texts(spec.components)},
            {"keyword", KeywordsOf(spec.print)},
            {"location", Text(omu_PrimEnum<Spec::LocationEnm, 1>(spec.location).GetString())},
            {"field", spec.field},
            {"history", spec.history},
            {"procedures", ProceduresIn(spec.procedures & wanted)},
            {"preselectField", ProceduresIn(spec.preselectField & wanted)},
            {"preselectHistory", ProceduresIn(spec.preselectHistory & wanted)}};
        variables.push_back(std::move(variable));
    }
    return variables;
}

std::string TextOfVariables(const ordered_json& variables, std::optional<unsigned> stepType) {
    TextTable table;
    std::vector<std::string> header{"name", "channels", "keyword", "place"};
    if (!stepType) header.emplace_back("procedures");
    header.emplace_back("meaning (components)");
    table.Row(std::move(header));
    for (const ordered_json& variable : variables) {
        std::vector<std::string> row{variable["name"], ChannelsOf(variable, stepType), variable["keyword"],
                                     InSmallLetters(variable["location"])};
        if (!stepType) row.push_back(ProcedureText(variable["procedures"]));
        const std::string components = Joined(variable["components"]);
        row.push_back(variable["meaning"].get<std::string>() +
                      (components.empty() ? "" : " (" + components + ")"));
        table.Row(std::move(row));
    }
    return table.Text("") + (stepType ? "* preselected\n" : "");
}
