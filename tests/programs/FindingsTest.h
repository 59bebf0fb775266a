#ifndef QRX_TESTS_PROGRAMS_FINDINGSTEST_H
#define QRX_TESTS_PROGRAMS_FINDINGSTEST_H

#include "model_file/mdf_ModelFile.h"
#include "tools/ModelChecks.h"

#include <gtest/gtest.h>

using Texts = std::vector<std::string>;

/// "place: text" of what is found under the places that begin so, in a model of an instance I of one shell
/// with the node set N, the element set E and the surface S. `members` are those of the model, its steps too.
inline Texts FindingsIn(const std::string& members, const std::string& place) {
    mdf_Report report;
    const auto odb = mdf_ReadModelText(
        R"({"format": "qrx-model/1", "models": {"Default Model": {
            "parts": {"P": {"mesh": {
                "nodes": {"labels": [1, 2, 3], "coordinates": [[0, 0, 0], [1, 0, 0], [0, 1, 0]]},
                "elements": [{"type": "S3", "labels": [1], "connectivity": [[1, 2, 3]]}],
                "sets": [{"name": "N", "kind": "node", "labels": [1]},
                         {"name": "E", "kind": "element", "labels": [1]},
                         {"name": "S", "kind": "surface", "facets": [[1, "SPOS"]]}]}}},
            "assembly": {"instances": {"I": {"part": "P"}}}, )" +
            members + "}}}",
        "test", report);
    for (const mdf_Message& message : report.messages) {
        EXPECT_FALSE(message.isError) << message.pointer << ": " << message.text;
    }
    Texts found;
    if (odb == nullptr) return found;
    for (const ModelFinding& finding : FindingsOf(*odb->FindModel(odb_Odb::DefaultModelName()))) {
        if (finding.place.starts_with(place)) found.push_back(finding.place + ": " + finding.text);
    }
    return found;
}

/// The steps of a model: the initial one, then "Step-1" and so on of these procedures, each with further
/// members behind a comma: "Static, \"nlgeom\": 1".
inline std::string StepsOf(const std::vector<std::string>& procedures) {
    std::string steps = R"("steps": [{"name": "Initial", "class": "kprC_InitialStep"})";
    int number = 0;
    for (const std::string& procedure : procedures) {
        const std::size_t end = std::min(procedure.find(','), procedure.size());
        steps += R"(, {"name": "Step-)" + std::to_string(++number) + R"(", "class": "kprC_)" +
                 procedure.substr(0, end) + "Step\"" + procedure.substr(end) + "}";
    }
    return steps + "]";
}

#endif
