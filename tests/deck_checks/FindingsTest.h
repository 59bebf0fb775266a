#ifndef QRX_TESTS_DECK_CHECKS_FINDINGSTEST_H
#define QRX_TESTS_DECK_CHECKS_FINDINGSTEST_H

#include "deck_checks/dck_Check.h"
#include "deck_checks/dck_Checks.h"
#include "deck_checks/dck_Kept.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/model/odiK_Model.h"

#include <gtest/gtest.h>

using Texts = std::vector<std::string>;

/// Which findings of a store are wanted.
using Finder = void (*)(const odb_Odb& odb, fnd_Sink& sink);

/// "place: text" of what a check finds, for the places that begin so. `members` are those of the model;
/// places are below it.
inline Texts FindingsBy(Finder find, const std::string& members, const std::string& place = {}) {
    mdf_Report report;
    const auto odb = mdf_ReadModelText(
        R"({"format": "qrx-model/1", "models": {"Default Model": {)" + members + "}}}", "test", report);
    for (const fnd_Finding& finding : report.findings) {
        EXPECT_FALSE(finding.IsError()) << finding.place << ": " << finding.Text();
    }
    Texts found;
    if (odb == nullptr) return found;
    fnd_List list;
    find(*odb, list);
    for (const fnd_Finding& finding : list.findings) {
        if (finding.place.starts_with(place)) found.push_back(finding.place + ": " + finding.Text());
    }
    return found;
}

/// The findings of one family of checks.
template <auto Check>
Texts FindingsOf(const std::string& members, const std::string& place = {}) {
    return FindingsBy(
        [](const odb_Odb& odb, fnd_Sink& sink) { Check(*odb.FindModel(odb_Odb::DefaultModelName()), sink); },
        members, place);
}

/// What the deck of a model can't say, by all checks.
inline Texts DeckFindings(const std::string& members, const std::string& place = {}) {
    return FindingsBy(
        [](const odb_Odb& odb, fnd_Sink& sink) {
            fnd_List list;
            dck_CheckDeck(odb, odb_Odb::DefaultModelName(), list);
            const std::string root = "/models/Default Model";
            for (fnd_Finding& finding : list.findings) {
                EXPECT_EQ(finding.place.substr(0, root.size()), root);
                finding.place.erase(0, root.size());
                sink.Take(std::move(finding));
            }
        },
        members, place);
}

/// The members of a model with an instance I of one shell, the node set N, the element set E and the surface
/// S; its steps are among the members.
inline std::string ShellModel(const std::string& members) {
    return R"(
        "parts": {"P": {"mesh": {
            "nodes": {"labels": [1, 2, 3], "coordinates": [[0, 0, 0], [1, 0, 0], [0, 1, 0]]},
            "elements": [{"type": "S3", "labels": [1], "connectivity": [[1, 2, 3]]}],
            "sets": [{"name": "N", "kind": "node", "labels": [1]},
                     {"name": "E", "kind": "element", "labels": [1]},
                     {"name": "S", "kind": "surface", "facets": [[1, "SPOS"]]}]}}},
        "assembly": {"instances": {"I": {"part": "P"}}}, )" +
           members;
}

/// What all checks find in it.
inline Texts FindingsIn(const std::string& members, const std::string& place) {
    return DeckFindings(ShellModel(members), place);
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
