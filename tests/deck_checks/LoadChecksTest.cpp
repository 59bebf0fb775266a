#include "base/oif_ModelInfo.h"
#include "deck_checks/FindingsTest.h"
#include "store_interface/model/odb_Odb.h"

namespace {

void CheckLoadsOf(const odb_Odb& odb, fnd_Sink& sink) {
    dck_CheckLoads(oif_ModelInfo(odb.ddb().model(odb_Odb::DefaultModelName())), sink);
}

/// "place: text" of each finding in a model with these loads or fields, on an instance A with a node set N,
/// an element set E and a surface F; S1 and S2 are static steps.
Texts Found(const std::string& container, const std::string& members, const std::string& stepMembers = "") {
    return FindingsBy(CheckLoadsOf,
                      R"(
        "parts": {"P": {"mesh": {
            "nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [1, 0, 0]]},
            "elements": [{"type": "T3D2", "labels": [1], "connectivity": [[1, 2]]}],
            "sets": [{"name": "N", "kind": "node", "labels": [1]},
                     {"name": "E", "kind": "element", "labels": [1]},
                     {"name": "F", "kind": "surface", "facets": [[1, "END1"]]}]}}},
        "assembly": {"instances": {"A": {"part": "P"}}},
        "steps": [{"name": "S0", "class": "kprC_InitialStep"}, {"name": "S1", "class": "kprC_StaticStep"},
                  {"name": "S2", "class": "kprC_StaticLinearPerturbationStep")" +
                          stepMembers + "}], \"" + container + "\": " + members,
                      "/" + container);
}

Texts OfLoad(const std::string& className, const std::string& members, const std::string& stepMembers = "") {
    return Found("loads", R"({"L": {"class": "kloC_)" + className + "\", " + members + "}}", stepMembers);
}
Texts OfField(const std::string& className, const std::string& members, const std::string& stepMembers = "") {
    return Found("fields", R"({"F": {"class": "kpfC_)" + className + "\", " + members + "}}", stepMembers);
}

const std::string kInStep = R"(, "states": {"S1": {}})";
const char kFails[] = "/loads/L: no deck can carry the load: writing fails with ";

} // namespace

TEST(LoadChecks, LoadOnASetOfItsKind_HasNothingToSay) {
    EXPECT_EQ(OfLoad("Moment", R"("region": "A.N")" + kInStep), Texts{});
    EXPECT_EQ(OfLoad("Gravity", R"("region": "A.E")" + kInStep), Texts{});
    EXPECT_EQ(OfLoad("BodyForce", R"("region": "A.E")" + kInStep), Texts{});
    EXPECT_EQ(OfLoad("Pressure", R"("region": "A.F")" + kInStep), Texts{});
    EXPECT_EQ(OfLoad("BoltLoad", R"("region": "A.F")" + kInStep), Texts{});
}

TEST(LoadChecks, LoadOnASetOfAnotherKind_IsNamed) {
    EXPECT_EQ(OfLoad("Moment", R"("region": "A.E")" + kInStep),
              Texts{"/loads/L/region: found 'E', which is an element set; the load acts on nodes"});
    EXPECT_EQ(OfLoad("BodyHeatFlux", R"("region": "A.F")" + kInStep),
              Texts{"/loads/L/region: found 'F', which is a surface; the load acts on elements"});
    EXPECT_EQ(OfLoad("ShellEdgeLoad", R"("region": "A.N")" + kInStep),
              Texts{"/loads/L/region: found 'N', which is a node set; the load acts on a surface"});
}

TEST(LoadChecks, LoadWithoutARegion_IsNamedWhereItsLinesNeedOne) {
    EXPECT_EQ(OfLoad("Moment", R"("region": null)" + kInStep),
              Texts{"/loads/L: the load has no region, so its lines name no set"});
    // Gravity acts on the whole model then.
    EXPECT_EQ(OfLoad("Gravity", R"("region": null)" + kInStep), Texts{});
    const Texts pressure{"/loads/L: the load has no region, so its lines name no set",
                         std::string(kFails) + "\"! setName.Empty()\""};
    EXPECT_EQ(OfLoad("Pressure", R"("region": null)" + kInStep), pressure);
}

TEST(LoadChecks, LoadThatNoStepWrites_IsNamed) {
    const Texts none{"/loads/L: no step writes the load"};
    EXPECT_EQ(OfLoad("Moment", R"("region": "A.N")"), none);
    EXPECT_EQ(OfLoad("Moment", R"("region": "A.N", "states": {"S0": {"component1": 1}})"), none);
    EXPECT_EQ(OfLoad("Moment", R"("region": "A.N", "states": {"S2": {}})", R"(, "loadCases": {"c": {}})"),
              none);
    EXPECT_EQ(OfLoad("Moment", R"("region": "A.N", "states": {"S2": {}})",
                     R"(, "loadCases": {"c": {"loads": {"L": 2}}})"),
              Texts{});
    EXPECT_EQ(OfLoad("Moment", R"("region": "A.E", "suppressed": true)"), Texts{});
}

TEST(LoadChecks, LoadsThatOverlap_AreWrittenFromTheInitialStepOn) {
    EXPECT_EQ(Found("loads", R"({"L": {"class": "kloC_Moment", "region": "A.N", "states": {"S0": {}}},
                                 "M": {"class": "kloC_Moment", "region": "A.N", "states": {"S1": {}}}})"),
              Texts{});
}

TEST(LoadChecks, LoadThatADeckOnlyMentions_IsNamed) {
    EXPECT_EQ(OfLoad("InertiaRelief", R"("region": null)" + kInStep),
              Texts{"/loads/L: decks tell of inertia relief in a comment only"});
    EXPECT_EQ(OfLoad("Pressure", R"("region": "A.F", "distributionType": "FIELD")" + kInStep),
              Texts{"/loads/L: decks tell of a load from a field in a comment only"});
    EXPECT_EQ(OfLoad("SurfaceTraction", R"("region": "A.F", "distributionType": "FIELD")" + kInStep),
              Texts{"/loads/L: decks tell of a load from a field in a comment only"});
    EXPECT_EQ(OfLoad("BodyHeatFlux", R"("region": "A.E", "distributionType": "FIELD")" + kInStep), Texts{});
    EXPECT_EQ(OfLoad("BoltLoad", R"("region": "A.F", "states": {"S1": {"boltMethod": "FIX_LENGTH"}})"),
              Texts{"/loads/L: decks tell of a bolt that is held by its length in a comment only"});
}

TEST(LoadChecks, FailureOfWriting_IsForetold) {
    EXPECT_EQ(OfLoad("UnwrittenLoad", R"("region": "A.N")" + kInStep),
              Texts{std::string(kFails) + "\"Unimplemented load type conversion\""});
    EXPECT_EQ(OfLoad("UnwrittenLoad", R"("region": "A.N")"), Texts{"/loads/L: no step writes the load"});
    EXPECT_EQ(OfLoad("SubmodelStressBased", R"("region": "A.F")"),
              Texts{std::string(kFails) + "\"Unimplemented load->statusKey conversion\""});
    EXPECT_EQ(OfLoad("SubmodelStressBased", R"("suppressed": true)"), Texts{});
    EXPECT_EQ(OfLoad("ConcentratedPoreFluid", R"("region": "A.N", "complex": true)" + kInStep),
              Texts{std::string(kFails) + "\"\"Concentrated pore fluid load cannot be complex\" == 0\""});
}

TEST(LoadChecks, FieldOnASetOfAnotherKind_IsNamed) {
    EXPECT_EQ(OfField("Temperature", R"("region": "A.N")" + kInStep), Texts{});
    EXPECT_EQ(OfField("Temperature", R"("region": "A.E")" + kInStep),
              Texts{"/fields/F/region: found 'E', which is an element set; the field acts on nodes"});
    EXPECT_EQ(OfField("Stress", R"("region": "A.N")" + kInStep),
              Texts{"/fields/F/region: found 'N', which is a node set; the field acts on elements"});
    EXPECT_EQ(OfField("Hardening", R"("region": "A.E")" + kInStep), Texts{});
    // The lines of a field from a file name no set.
    EXPECT_EQ(OfField("Temperature", R"("region": null, "distributionType": "FROM_FILE")" + kInStep),
              Texts{});
}

TEST(LoadChecks, FieldThatNoStepWrites_IsNamed) {
    const Texts none{"/fields/F: no step writes the field"};
    EXPECT_EQ(OfField("Velocity", R"("region": "A.N")"), none);
    EXPECT_EQ(OfField("Temperature", R"("region": "A.N", "states": {"S0": {"values": [1]}})"), Texts{});
    EXPECT_EQ(OfField("Temperature", R"("region": "A.N", "states": {"S2": {"values": [1]}})",
                      R"(, "loadCases": {"c": {}})"),
              none);
}
