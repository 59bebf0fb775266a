#include "hostile/Findings.h"

#include "model_file/mdf_ModelFile.h"
#include "store_interface/findings/fnd_Text.h"

std::vector<std::string> Findings(std::string_view text) {
    mdf_Report report;
    const auto odb = mdf_ReadModelText(text, "m.json", report);
    EXPECT_EQ(odb == nullptr, report.HasErrors());
    std::vector<std::string> findings;
    for (const fnd_Finding& each : report.findings) {
        const std::string line = report.Line(each);
        // What the program prints begins with the file, the place in it and the kind, and ends with the
        // pointer and the code; here the pointer stands in front.
        const std::string place =
            each.line > 0 ? std::to_string(each.line) + ":" + std::to_string(each.column) + ":" : "";
        const std::string kind = fnd_SeverityWord(each.code->severity);
        const std::string head = "m.json:" + place + " " + kind + ": ";
        EXPECT_EQ(line.substr(0, head.size()), head);
        const std::string pointer = each.place.empty() ? "" : "(" + fnd_Visible(each.place) + ") ";
        const std::string tail = " " + pointer + "[" + std::string(each.code->name) + "]";
        EXPECT_TRUE(line.ends_with(tail)) << line;
        std::string finding = line.substr(head.size(), line.size() - head.size() - tail.size());
        if (!each.place.empty()) finding = fnd_Visible(each.place) + ": " + finding;
        constexpr std::string_view prefix = "/models/Default Model";
        if (finding.starts_with(prefix)) finding.replace(0, prefix.size(), "@");
        if (each.code->name == "syntax") {
            finding.insert(0, place + " ");
        } else if (each.place.empty()) {
            finding.insert(0, ": ");
        }
        EXPECT_TRUE(each.line > 0 || report.unreadable) << finding;
        findings.push_back((each.IsError() ? "" : kind + " ") + finding);
    }
    return findings;
}

std::string Model(std::string_view members) {
    return R"({"format": "qrx-model/1", "models": {"Default Model": {)" + std::string(members) + "}}}";
}

std::string Mesh(std::string_view members) {
    return Model(R"("parts": {"P": {"mesh": {)" + std::string(members) + "}}}");
}

std::string Whole(std::string_view assemblyMembers, std::string_view modelMembers) {
    std::string members = R"("parts": {"Q": {}, "P": {"mesh": {
        "nodes": {"labels": {"from": 1, "to": 8}, "coordinates": [[0, 0, 0], [1, 0, 0], [1, 1, 0], [0, 1, 0],
                                                                  [0, 0, 1], [1, 0, 1], [1, 1, 1], [0, 1, 1]]},
        "elements": [
            {"type": "C3D8", "labels": [1, 2], "connectivity": [[1, 2, 3, 4, 5, 6, 7, 8], [1, 2, 3, 4, 5, 6, 7, 8]]},
            {"type": "S4", "labels": [3], "connectivity": [[1, 2, 3, 4]]},
            {"type": "B31", "labels": [4], "connectivity": [[1, 2]]},
            {"type": "MASS", "labels": [5], "connectivity": [[1]]}],
        "sets": [{"name": "ALL", "kind": "element", "labels": {"from": 1, "to": 5}},
                 {"name": "NODES", "kind": "node", "labels": [1, 2]},
                 {"name": "TOP", "kind": "surface", "facets": [[1, "S2"]]},
                 {"name": "A.B", "kind": "node", "labels": [3]}]}}},
        "assembly": {"instances": {"I": {"part": "P"}, "J": {"part": "P", "translation": [2, 0, 0]},
                                   "E": {"part": "P", "partInstance": false}})";
    if (!assemblyMembers.empty()) members.append(", ").append(assemblyMembers);
    members += "}";
    if (!modelMembers.empty()) members.append(", ").append(modelMembers);
    return Model(members);
}
