#include "conditions/ConditionTesting.h"

std::string StepsJson(std::string_view kinds) {
    std::string json;
    int place = 0;
    for (std::size_t i = 0; i < kinds.size();) {
        const char* name = "";
        switch (kinds[i]) {
        case 'I': name = "kprC_InitialStep"; break;
        case 'G': name = "kprC_StaticStep"; break;
        case 'F': name = "kprC_FrequencyStep"; break;
        case 'B': name = "kprC_BuckleStep"; break;
        case 'L': name = "kprC_StaticLinearPerturbationStep"; break;
        case 'D': name = "kprC_SteadyStateDirectStep"; break;
        case 'M': name = "kprC_ModalDynamicsStep"; break;
        case 'S': name = "kprC_SteadyStateModalStep"; break;
        default: ADD_FAILURE() << "no step is called " << kinds[i];
        }
        std::string own;
        std::size_t end = i + 1;
        if (end < kinds.size() && kinds[end] == '{') {
            int depth = 0;
            do {
                depth += kinds[end] == '{' ? 1 : kinds[end] == '}' ? -1 : 0;
            } while (++end < kinds.size() && depth > 0);
            own = ", " + std::string(kinds.substr(i + 2, end - i - 3));
        }
        json += (json.empty() ? "" : ", ") + (R"({"name": "S)" + std::to_string(place++)) +
                R"(", "class": ")" + name + "\"" + own + "}";
        i = end;
    }
    return R"("steps": [)" + json + "]";
}

ConditionModel::ConditionModel(std::string_view steps, const std::string& members) {
    const std::string text = R"({"format": "qrx-model/1", "models": {"Default Model": {
        "parts": {"P": {"mesh": {
            "nodes": {"labels": [1, 2, 3], "coordinates": [[0, 0, 0], [1, 0, 0], [0, 1, 0]]},
            "elements": [{"type": "S3", "labels": [1], "connectivity": [[1, 2, 3]]}],
            "sets": [{"name": "N", "kind": "node", "labels": [1]},
                     {"name": "N2", "kind": "node", "labels": [2]},
                     {"name": "N3", "kind": "node", "labels": [3]},
                     {"name": "E", "kind": "element", "labels": [1]},
                     {"name": "two words", "kind": "element", "labels": [1]},
                     {"name": "F", "kind": "surface", "facets": [[1, "SPOS"]]}]}}},
        "assembly": {"instances": {"A": {"part": "P"}}},
        "amplitudes": {"Ramp": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]},
                       "my amp": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]}},
        )" + StepsJson(steps) +
                             (members.empty() ? "" : ", " + members) + "}}}";
    mdf_Report report;
    odb_ = mdf_ReadModelText(text, "test", report);
    for (const fnd_Finding& finding : report.findings) {
        EXPECT_FALSE(finding.IsError()) << finding.place << ": " << finding.Text() << "\n" << text;
    }
    if (odb_ == nullptr) throw std::logic_error("the model can't be read");
    info_ = std::make_unique<oif_ModelInfo>(odb_->ddb().model(odb_Odb::DefaultModelName()));
}

qkw_BuilderComponent& ConditionModel::Builder() {
    if (builder_ == nullptr) {
        builder_ = std::make_unique<oif_BoundaryConditionBuilder>(*info_);
        builder_->Build();
    }
    return *builder_;
}

std::string ConditionModel::StepText(const char* step, const char* loadCase) {
    return WrittenAll(Builder().StepDefinition(step, loadCase));
}

std::string ConditionModel::AssemblyText() {
    return WrittenAll(Builder().AssemblyDefinition());
}
