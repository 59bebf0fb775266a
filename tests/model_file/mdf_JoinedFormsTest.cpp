// What a model file may say in one place where the store has two.
#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Template.h"

#include <gtest/gtest.h>

#include <sstream>

namespace {

using Texts = std::vector<std::string>;

std::string ModelOf(const std::string& members) {
    return R"({"format": "qrx-model/1", "models": {"M": {
        "parts": {"P": {"mesh": {
            "nodes": {"labels": [1, 2, 3, 4], "coordinates": [[0,0,0], [1,0,0], [1,1,0], [0,1,0]]},
            "elements": [{"type": "S4R", "labels": [1], "connectivity": [[1, 2, 3, 4]]}],
            "sets": [{"name": "A", "kind": "node", "labels": [1, 2]}, {"name": "B", "kind": "node", "labels": [3, 2]},
                     {"name": "T", "kind": "surface", "facets": [[1, "SPOS"]]},
                     {"name": "U", "kind": "surface", "facets": [[1, "SNEG"]]}]}}},
        "assembly": {"instances": {"I": {"part": "P"}, "J": {"part": "P", "translation": [0, 0, 5]}}},
        "interactionProperties": {"F": {"class": "ContactProperty"}, "G": {"class": "ContactProperty"}},
        "steps": [{"name": "Initial", "class": "Initial"}, {"name": "One", "class": "ExplicitDynamics"},
                  {"name": "Two", "class": "ExplicitDynamics"}],
        )" +
           members + "}}}";
}

std::unique_ptr<odb_Odb> Read(const std::string& members, mdf_Report& report) {
    return mdf_ReadModelText(ModelOf(members), "m.json", report);
}

std::string Canonical(const std::string& members) {
    mdf_Report report;
    const auto odb = Read(members, report);
    for (const fnd_Finding& finding : report.findings) {
        if (finding.IsError()) ADD_FAILURE() << report.Line(finding);
    }
    if (odb == nullptr) return {};
    std::ostringstream out;
    mdf_WriteModelFile(*odb, out);
    return out.str();
}

/// "place: text" of the errors.
Texts Errors(const std::string& members) {
    mdf_Report report;
    Read(members, report);
    Texts errors;
    for (const fnd_Finding& finding : report.findings) {
        if (finding.IsError()) errors.push_back(finding.place.substr(9) + ": " + finding.Text());
    }
    return errors;
}

std::string Contact(const std::string& members) {
    return R"("interactions": {"C": {"class": "GeneralContact", )" + members + "}}";
}

std::string Force(const std::string& region) {
    return R"("loads": {"F": {"class": "ConcentratedForce", "region": )" + region +
           R"(, "states": {"One": {"component3": 1}}}})";
}

} // namespace

TEST(PairLists, PairsWithWhatBelongsToThem_AreTheParallelLists) {
    EXPECT_EQ(Canonical(Contact(R"("states": {
            "One": {"wholeModelContact": true,
                    "exclusions": [{"first": "I.T", "second": "J.U"}],
                    "propertyAssignments": [{"property": "F"}, {"first": "I.T", "second": "J.T", "property": "G"}],
                    "surfacePropertyAssignments": [{"first": "I.T", "type": "CURR"},
                                                   {"first": "J.T", "type": 1, "value": 0.25, "scale": 0.5}],
                    "formulationAssignments": [{"first": "I.T", "second": "J.T", "masterSlave": "SLAVE"}]},
            "Two": {"propertyAssignments": [{"first": "I.T", "second": "J.T", "property": "F"}],
                    "inclusions": [{"first": "I.U"}]}})")),
              Canonical(Contact(R"("inclusionPairs": [{"first": "I.U"}],
            "exclusionPairs": [{"first": "I.T", "second": "J.U"}],
            "propertyAssignmentPairs": [{}, {"first": "I.T", "second": "J.T"}],
            "surfacePropertyAssignmentPairs": [{"first": "I.T"}, {"first": "J.T"}],
            "formulationAssignmentPairs": [{"first": "I.T", "second": "J.T"}],
            "states": {
            "One": {"wholeModelContact": true, "exclusions": [true], "propertyAssignments": ["F", "G"],
                    "surfacePropertyAssignments": [{"type": "CURR"}, {"type": 1, "value": 0.25, "scale": 0.5}],
                    "formulationAssignments": [{"masterSlave": "SLAVE"}]},
            "Two": {"propertyAssignments": [{"value": "", "state": "NEVER_SET"}, "F"], "inclusions": [true]}})")));
}

TEST(PairLists, StatesInAnyOrder_GiveThePairsInThatOfTheSteps) {
    const std::string one = R"("One": {"inclusions": [{"first": "I.T", "second": "J.T"}]})";
    const std::string two = R"("Two": {"inclusions": [{"first": "I.U", "second": "J.U"}]})";
    EXPECT_EQ(Canonical(Contact("\"states\": {" + two + ", " + one + "}")),
              Canonical(Contact("\"states\": {" + one + ", " + two + "}")));
}

TEST(PairLists, WhatIsWrong_IsToldAtItsPlace) {
    const auto state = [](const std::string& members) {
        return Errors(Contact("\"states\": {\"One\": {" + members + "}}"));
    };
    const std::string place = "/interactions/C/states/One/";
    EXPECT_EQ(
        state(R"("propertyAssignments": [{"first": "I.X", "property": "F"}])"),
        (Texts{place +
               "propertyAssignments/0/first: found set 'X', expected the name of a set of instance 'I'"}));
    EXPECT_EQ(state(R"("propertyAssignments": [{"first": "I.T", "property": "H"}])"),
              (Texts{place + "propertyAssignments/0/property: found 'H', expected the name of an "
                             "interactionProperty; there are 'F', 'G'"}));
    EXPECT_EQ(
        state(R"("propertyAssignments": [{"first": "I.T", "property": "F"}, "G"])"),
        (Texts{place + "propertyAssignments/1: found 'G', expected an object with a pair, as the others of "
                       "this list"}));
    EXPECT_EQ(state(R"("inclusions": [{"first": "I.T", "value": 1}])").size(), 1U);
    EXPECT_EQ(state(R"("propertyAssignments": [{"first": "I.T"}])").size(), 1U);
}

TEST(JoinedRegions, NodeSetsOfAPointLoad_BecomeOneInternalSetWithEachNodeOnce) {
    mdf_Report report;
    const auto odb = Read(Force(R"(["I.A", "I.B", "J.A"])"), report);
    ASSERT_NE(odb, nullptr);
    const odiK_Model& model = *odb->DeckModel();
    ASSERT_EQ(model.AssemblySets().size(), 1U);
    const odiK_Set& set = *model.AssemblySets().front();
    EXPECT_EQ(set.name, "_A_B_A");
    EXPECT_TRUE(set.internal);
    ASSERT_EQ(set.subsets.size(), 2U);
    EXPECT_EQ(set.subsets[0].meshIndex, 1);
    EXPECT_EQ(set.subsets[0].subset, cow_List<int>(0, 1, 2));
    EXPECT_EQ(set.subsets[1].meshIndex, 2);
    EXPECT_EQ(set.subsets[1].subset, cow_List<int>(0, 1));
    EXPECT_EQ(model.loads.ConstGet("F").region.SetName(), "_A_B_A");
}

TEST(JoinedRegions, OneRegion_StandsForItself) {
    EXPECT_EQ(Canonical(Force(R"(["I.A"])")), Canonical(Force(R"("I.A")")));
}

TEST(JoinedRegions, SameNodesAgain_ShareTheSetAndOthersHaveTheirOwn) {
    mdf_Report report;
    const auto odb = Read(R"("loads": {
        "F": {"class": "ConcentratedForce", "region": ["I.A", "I.B"], "states": {"One": {"component3": 1}}},
        "G": {"class": "Moment", "region": ["I.A", "I.B"], "states": {"One": {"component3": 1}}},
        "H": {"class": "Moment", "region": ["J.A", "J.B"], "states": {"One": {"component3": 1}}}})",
                          report);
    ASSERT_NE(odb, nullptr);
    const odiK_Model& model = *odb->DeckModel();
    EXPECT_EQ(model.AssemblySets().size(), 2U);
    EXPECT_EQ(model.loads.ConstGet("F").region.SetName(), "_A_B");
    EXPECT_EQ(model.loads.ConstGet("G").region.SetName(), "_A_B");
    EXPECT_EQ(model.loads.ConstGet("H").region.SetName(), "_A_B-2");
}

TEST(JoinedRegions, WhatIsWrong_IsToldAtItsPlace) {
    EXPECT_EQ(
        Errors(Force(R"(["I.A", "I.T"])")),
        (Texts{"/loads/F/region/1: found 'I.T', expected a node set: only of such can several be given"}));
    EXPECT_EQ(Errors(Force(R"(["I.A", "I.X"])")),
              (Texts{"/loads/F/region/1: found set 'X', expected the name of a set of instance 'I'"}));
    EXPECT_EQ(Errors(Force("[]")),
              (Texts{"/loads/F/region: found an array of 0 items, expected one region or several"}));
    EXPECT_EQ(Errors(R"("loads": {"P": {"class": "Pressure", "region": ["I.T", "I.U"]}})").size(), 1U);
}

TEST(JoinedRegions, InVariantsOfATemplate_AreThoseOfTheFile) {
    const std::string pointer = "/models/M/loads/F/region";
    mdf_Report report;
    const auto places = [&](const std::vector<mdf_Parameter>&) { return Texts{pointer}; };
    const auto base = mdf_Template::OfText(ModelOf(Force(R"(["I.A", "I.B"])")), "m.json", places, report);
    ASSERT_NE(base, nullptr);
    mdf_Value other;
    std::vector<fnd_Finding> problems;
    mdf_Parse(R"(["J.B", "J.A"])", other, problems);
    const mdf_Change change{pointer, other};
    const auto store = base->Variant(std::span(&change, 1), report);
    ASSERT_NE(store, nullptr);
    EXPECT_EQ(store->DeckModel()->loads.ConstGet("F").region.SetName(), "_B_A");
}
