#include "conditions/oif_Submodel.h"

#include "conditions/ConditionTesting.h"

namespace {

kbcC_SubmodelBC Submodel(double thickness, double absolute, double exterior, const char* elset) {
    kbcC_SubmodelBC bc;
    bc.shellThickness = thickness;
    bc.absoluteExteriorTolerance = absolute;
    bc.exteriorTolerance = exterior;
    bc.globalElset = elset;
    return bc;
}

} // namespace

TEST(Submodel, AllParameters_StandInTheirOrder) {
    oif_Submodel submodel(true, Submodel(0.1, 0.2, 0.3, "GLOBAL SET"), "A.N");
    submodel.AppendRegion("A.N2");
    EXPECT_EQ(Written(submodel),
              "*Submodel, shell to solid, shell thickness=0.1, absolute exterior tolerance=0.2, "
              "exteriorTolerance=0.3, global elset=\"GLOBAL SET\"\nA.N, \nA.N2, \n");
}

TEST(Submodel, ZerosAndAnEmptySet_AreLeftOut) {
    EXPECT_EQ(Written(oif_Submodel(false, Submodel(0, 0, 0, ""), "A.N")), "*Submodel\nA.N, \n");
}

TEST(Submodel, ExteriorToleranceOfItsDefault_IsWrittenAsOneWordWithACapital) {
    EXPECT_EQ(Written(oif_Submodel(false, kbcC_SubmodelBC(), "A.N")),
              "*Submodel, exteriorTolerance=0.05\nA.N, \n");
}

TEST(Submodel, IsEqual_ComparesAllFourExactly) {
    const oif_Submodel submodel(false, Submodel(1, 2, 3, "E"), "A.N");
    EXPECT_TRUE(submodel.IsEqual(Submodel(1, 2, 3, "E")));
    EXPECT_FALSE(submodel.IsEqual(Submodel(1 + 1e-15, 2, 3, "E")));
    EXPECT_FALSE(submodel.IsEqual(Submodel(1, 0, 3, "E")));
    EXPECT_FALSE(submodel.IsEqual(Submodel(1, 2, 0, "E")));
    EXPECT_FALSE(submodel.IsEqual(Submodel(1, 2, 3, "F")));
}

TEST(SubmodelList, BoundariesOfAStep_ShareOneCommentAndTheFirstLine) {
    const ConditionModel model("IGG", R"("boundaryConditions": {
        "B": {"class": "kbcC_SubmodelBC", "states": {"S1": {"dofs": [1], "stepName": "1"}}},
        "C": {"class": "kbcC_SubmodelBC", "states": {"S1": {"dofs": [2], "stepName": "9", "timeScale": true}}}})");
    oif_BoundarySubmodelList list;
    for (const char* name : {"B", "C"}) {
        list.Append("S1", name, oif_Boundary({name, model.Condition(name), "A.N", "S1"}, false, "S0"));
    }
    EXPECT_EQ(WrittenAll(list.Keywords("S1")), "** Name: B, C Type: Submodel\n"
                                               "*Boundary, submodel, step=1\n"
                                               "A.N, 1, 1\n"
                                               "A.N, 2, 2\n");
    EXPECT_TRUE(list.Keywords("S2").IsEmpty());
}
