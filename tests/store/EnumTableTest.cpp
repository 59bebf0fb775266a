#include "store_interface/model/odiK_Model.h"
#include "store_interface/records/output/korC_OdbRequestTable.h"

#include "store/StoreTesting.h"

#include <gtest/gtest.h>

namespace {

struct Row {
    int number;
    const char* name;
    const char* text;
    const char* deck;
    Row(int aNumber, const char* aName) : Row(aNumber, aName, aName) {}
    Row(int aNumber, const char* aName, const char* aText, const char* aDeck = "")
        : number(aNumber), name(aName), text(aText), deck(aDeck) {}
};

void ExpectTable(const omu_EnumTable& table, const char* typeName, const std::vector<Row>& rows) {
    SCOPED_TRACE(typeName);
    EXPECT_STREQ(table.typeName, typeName);
    ASSERT_EQ(table.rows.size(), rows.size());
    for (std::size_t i = 0; i < rows.size(); ++i) {
        SCOPED_TRACE(rows[i].name);
        EXPECT_EQ(table.rows[i].value, rows[i].number);
        EXPECT_STREQ(table.rows[i].name, rows[i].name);
        EXPECT_STREQ(table.rows[i].text, rows[i].text);
        EXPECT_STREQ(table.rows[i].deck == nullptr ? "" : table.rows[i].deck, rows[i].deck);
    }
}

TEST(EnumTable, Propagation_HasItsNumbersAndWords) {
    ExpectTable(omu_EnumTableOf(mdl_PropAttributeStateEnm()), "mdl_PropAttributeStateEnm",
                {{0, "NEVER_SET"}, {1, "SET"}, {2, "CARRIED"}, {3, "CLEARED"}});
    ExpectTable(omu_EnumTableOf(mdl_PropagationStatusEnm()), "mdl_PropagationStatusEnm",
                {{0, "NOT_YET_ACTIVE"},
                 {1, "CREATED"},
                 {2, "PROPAGATED"},
                 {3, "MODIFIED"},
                 {4, "DEACTIVATED"},
                 {5, "NO_LONGER_ACTIVE"},
                 {6, "TYPE_NOT_APPLICABLE"},
                 {7, "INSTANCE_NOT_APPLICABLE"},
                 {8, "BUILT_INTO_BASE_STATE"},
                 {9, "PROPAGATED_FROM_BASE_STATE"},
                 {10, "MODIFIED_FROM_BASE_STATE"},
                 {11, "DEACTIVATED_FROM_BASE_STATE"},
                 {12, "BUILT_INTO_MODES"},
                 {13, "NOT_APPLICABLE"},
                 {14, "FIELD_PROPAGATED"},
                 {15, "FIELD_RESET"}});
}

TEST(EnumTable, RequestsOnTheirWayToTheDeck_HaveTheirNumbersAndWords) {
    // Time points have another number than in the model.
    ExpectTable(omu_EnumTableOf(korC_OdbRequest::TypeEnm()), "korC_OdbRequest::TypeEnm",
                {{0, "FREQUENCY"},
                 {1, "NUMBER_INTERVAL", "NUMBER INTERVAL"},
                 {2, "TIME_INTERVAL", "TIME INTERVAL"},
                 {3, "MODE_LIST", "MODE LIST"},
                 {4, "TIME_POINTS", "TIME POINTS"}});
    ExpectTable(omu_EnumTableOf(korC_DomainTypeEnm()), "korC_DomainTypeEnm",
                {{0, "WHOLE_MODEL", "WHOLE MODEL"},
                 {1, "SET"},
                 {2, "BOLT_LOAD", "BOLT LOAD"},
                 {3, "LAYUP"},
                 {4, "SPRINGS"},
                 {5, "FASTENER"},
                 {6, "CONTACT_SURFACE", "CONTACT SURFACE"},
                 {7, "INTEGRATED_SECTION", "INTEGRATED SECTION"},
                 {8, "INTERACTION"},
                 {14, "ALL_DOMAINS", "ALL DOMAINS"}});
    ExpectTable(omu_EnumTableOf(korC_OdbChannel::TypeEnm()), "korC_OdbChannel::TypeEnm",
                {{1, "FIELD"}, {2, "HISTORY"}});
    ExpectTable(omu_EnumTableOf(korC_OdbRequestSpec::PrintEnm()), "korC_OdbRequestSpec::PrintEnm",
                {{-1, "NONE"},
                 {0, "NODE"},
                 {1, "ELEMENT"},
                 {2, "MODAL"},
                 {4, "CONTACT"},
                 {5, "RADIATION"},
                 {6, "INCREMENTATION"},
                 {7, "ENERGY"},
                 {8, "ELEMENT_OR_CONTACT", "ELEMENT OR CONTACT"},
                 {9, "INTEGRATED"}});
}

TEST(EnumTable, StepsAndJobs_HaveTheirNumbersAndWords) {
    ExpectTable(omu_EnumTableOf(kprC_Step::MatrixStorageEnm()), "kprC_Step::MatrixStorageEnm",
                {{0, "SOLVER_DEFAULT"}, {1, "SYMMETRIC"}, {2, "UNSYMMETRIC"}});
    ExpectTable(omu_EnumTableOf(kprC_AnalysisProductEnm()), "kprC_AnalysisProductEnm",
                {{0, "IMPLICIT", "IMPLICIT", "STANDARD"}, {1, "EXPLICIT"}, {2, "OTHER"}});
}

TEST(EnumTable, Distributions_HaveTheirNumbersAndWords) {
    ExpectTable(omu_EnumTableOf(kbcC_BC::DistribTypeEnum()), "kbcC_BC::DistribTypeEnum",
                {{0, "UNIFORM"}, {1, "USER_DEFINED"}, {2, "FIELD"}});
    ExpectTable(omu_EnumTableOf(kpfC_Field::DistribTypeEnm()), "kpfC_Field::DistribTypeEnm",
                {{0, "UNIFORM"},
                 {1, "USER_DEFINED"},
                 {2, "FIELD"},
                 {3, "FROM_FILE"},
                 {4, "FROM_FILE_AND_USER_DEFINED"},
                 {5, "GEOSTATIC"}});
}

TEST(EnumTable, AssembledConnections_HaveTextsWithGapsWhereTheDeckWordHasNone) {
    ExpectTable(omu_EnumTableOf(kseC_ConnectorSection::AssembledTypeEnm()),
                "kseC_ConnectorSection::AssembledTypeEnm",
                {{0, "NONE", ""},
                 {1, "BEAM", "Beam"},
                 {2, "BUSHING", "Bushing"},
                 {3, "CVJOINT", "CVJ Joint", "CVJoint"},
                 {4, "CYLINDRICAL", "Cylindrical"},
                 {5, "HINGE", "Hinge"},
                 {6, "PLANAR", "Planar"},
                 {7, "RETRACTOR", "Retractor"},
                 {8, "SLIPRING", "SlipR Ring", "SlipRing"},
                 {9, "TRANSLATOR", "Translator"},
                 {10, "UJOINT", "UJ Joint", "UJoint"},
                 {11, "WELD", "Weld"}});
}

TEST(EnumTable, BasicConnections_HaveShortTextsForProjections) {
    ExpectTable(omu_EnumTableOf(kseC_ConnectorSection::TranslationalTypeEnm()),
                "kseC_ConnectorSection::TranslationalTypeEnm",
                {{0, "NONE", ""},
                 {1, "ACCELEROMETER", "Accelerometer"},
                 {2, "AXIAL", "Axial"},
                 {3, "CARTESIAN", "Cartesian"},
                 {4, "JOIN", "Join"},
                 {5, "LINK", "Link"},
                 {6, "PROJECTION_CARTESIAN", "Proj Cartesian", "Projection Cartesian"},
                 {7, "RADIAL_THRUST", "Radial-Thrust"},
                 {8, "SLIDE_PLANE", "Slide-Plane"},
                 {9, "SLOT", "Slot"}});
    ExpectTable(omu_EnumTableOf(kseC_ConnectorSection::RotationalTypeEnm()),
                "kseC_ConnectorSection::RotationalTypeEnm",
                {{0, "NONE", ""},
                 {1, "ALIGN", "Align"},
                 {2, "CARDAN", "Cardan"},
                 {3, "CONSTANT_VELOCITY", "Constant Velocity"},
                 {4, "EULER", "Euler"},
                 {5, "FLEXION_TORSION", "Flexion-Torsion"},
                 {6, "FLOW_CONVERTER", "Flow-Converter"},
                 {7, "PROJECTION_FLEXION_TORSION", "Proj Flex-Tors", "Projection Flexion-Torsion"},
                 {8, "REVOLUTE", "Revolute"},
                 {9, "ROTATION", "Rotation"},
                 {10, "ROTATION_ACCELEROMETER", "Rotation-Accelerometer"},
                 {11, "UNIVERSAL", "Universal"}});
}

TEST(EnumTable, ElementControls_HaveTheirNumbersAndWords) {
    ExpectTable(omu_EnumTableOf(bme_ElemLibrary()), "bme_ElemLibrary",
                {{0, "NONE"}, {1, "STANDARD"}, {2, "EXPLICIT"}});
    using P = bme_ElemCtrlParams;
    ExpectTable(omu_EnumTableOf(P::DistortionControlEnm()), "bme_ElemCtrlParams::DistortionControlEnm",
                {{0, "DEFAULT"}, {1, "YES"}, {2, "NO"}});
    ExpectTable(
        omu_EnumTableOf(P::KinematicSplitEnm()), "bme_ElemCtrlParams::KinematicSplitEnm",
        {{0, "DEFAULT"}, {1, "AVERAGE_STRAIN", "AVERAGE STRAIN"}, {2, "ORTHOGONAL"}, {3, "CENTROID"}});
    ExpectTable(omu_EnumTableOf(P::HourglassEnm()), "bme_ElemCtrlParams::HourglassEnm",
                {{0, "DEFAULT"},
                 {1, "RELAX_STIFFNESS", "RELAX STIFFNESS"},
                 {2, "STIFFNESS"},
                 {3, "VISCOUS"},
                 {4, "COMBINED"},
                 {5, "ENHANCED"}});
    ExpectTable(omu_EnumTableOf(P::SecondOrderAccuracyEnm()), "bme_ElemCtrlParams::SecondOrderAccuracyEnm",
                {{0, "DEFAULT"}, {1, "YES"}, {2, "NO"}});
    ExpectTable(omu_EnumTableOf(P::StressRateEnm()), "bme_ElemCtrlParams::StressRateEnm",
                {{0, "DEFAULT"}, {1, "JAUMANN"}, {2, "SPIN"}});
}

TEST(EnumTable, AxesAndSymmetry_HaveTheirNumbersAndWords) {
    ExpectTable(omu_EnumTableOf(ptoC_MaterialOrientation::axisEnm()), "ptoC_MaterialOrientation::axisEnm",
                {{0, "AXIS_1", "1"}, {1, "AXIS_2", "2"}, {2, "AXIS_3", "3"}});
    ExpectTable(omu_EnumTableOf(calC_SymmetryTypeEnm()), "calC_SymmetryTypeEnm",
                {{0, "NONE"}, {1, "CYCLIC"}});
}

TEST(EnumTable, NumbersOfTheModelTree_AreFixed) {
    EXPECT_EQ(static_cast<int>(res_SetTypeEnm::NODES), 0);
    EXPECT_EQ(static_cast<int>(res_SetTypeEnm::ELEMENTS), 1);
    EXPECT_EQ(static_cast<int>(res_SetTypeEnm::FACETS), 2);
    EXPECT_EQ(static_cast<int>(dtu_DatumType::CSYS), 4);
    EXPECT_EQ(static_cast<int>(dtu_DatumCsysType::RECTANGULAR), 1);
    EXPECT_EQ(static_cast<int>(dtu_DatumCsysType::CYLINDRICAL), 2);
    EXPECT_EQ(static_cast<int>(dtu_DatumCsysType::SPHERICAL), 3);
}

} // namespace
