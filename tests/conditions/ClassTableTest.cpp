#include "conditions/oif_BCTable.h"
#include "conditions/oif_FieldTable.h"
#include "conditions/oif_LoadTable.h"
#include "conditions/oif_OpStatus.h"
#include "connectors/oif_ConnectorBehaviorRow.h"
#include "constraints/oif_ConstraintRow.h"
#include "interactions/oif_InteractionProperty.h"
#include "interactions/oif_InteractionRow.h"
#include "steps/oif_ProcedureRow.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <gtest/gtest.h>

#include <map>
#include <set>

namespace {

using Names = std::set<std::string>;

std::string NameOf(unsigned typeId) {
    return std::string(cls_Classes().NameOf(typeId).View());
}

/// The classes of T's family that a model can hold and that have no row.
template <class T, class Row>
Names WithoutRow(std::span<const Row> rows) {
    Names names;
    for (const cls_ClassEntry* entry : cls_Classes().ConcreteClasses(T::TypeId())) {
        if (oif_FindRow(rows, entry->info.Id()) == nullptr) names.insert(entry->info.name);
    }
    return names;
}

/// The classes of each family by its number.
template <class Row>
std::map<int, Names> Families(std::span<const Row> rows) {
    std::map<int, Names> families;
    for (const Row& row : rows) families[static_cast<int>(row.family)].insert(NameOf(row.typeId));
    return families;
}

template <class Row>
void ExpectEachClassOnce(std::span<const Row> rows) {
    for (const Row& row : rows) {
        EXPECT_EQ(oif_FindRow(rows, row.typeId), &row) << NameOf(row.typeId);
        EXPECT_NE(cls_Classes().Find(row.typeId), nullptr) << row.typeId;
        if constexpr (requires { row.label; }) {
            EXPECT_STRNE(row.label, "") << NameOf(row.typeId);
        }
    }
}

template <class Row>
Names OnRegion(std::span<const Row> rows, oif_RegionKind kind) {
    Names names;
    for (const Row& row : rows) {
        if (row.region == kind) names.insert(NameOf(row.typeId));
    }
    return names;
}

} // namespace

TEST(ClassTable, EveryClassOfAModel_HasARowUnlessNoDeckTellsOfIt) {
    EXPECT_EQ(WithoutRow<kbcC_BC>(oif_BCRows()), Names());
    EXPECT_EQ(WithoutRow<kloC_Load>(oif_LoadRows()), Names{"kloC_SubmodelStressBased"});
    EXPECT_EQ(WithoutRow<kpfC_Field>(oif_FieldRows()), Names());
    EXPECT_EQ(WithoutRow<kinC_Interaction>(oif_InteractionRows()), Names());
    EXPECT_EQ(WithoutRow<kinC_InteractionProperty>(oif_InteractionPropertyRows()), Names());
    // Its records answer with odiK_Tie.
    EXPECT_EQ(WithoutRow<kcoC_Constraint>(oif_ConstraintRows()), Names{"kcoC_Tie"});
    EXPECT_EQ(WithoutRow<kbeC_ConnectorBehaviorOption>(oif_ConnectorBehaviorRows()), Names());
    EXPECT_EQ(WithoutRow<kprC_AnalysisStep>(oif_ProcedureRows()), Names());
}

TEST(ClassTable, Row_IsTheOnlyOneOfItsClassAndHasALabel) {
    ExpectEachClassOnce(oif_BCRows());
    ExpectEachClassOnce(oif_LoadRows());
    ExpectEachClassOnce(oif_FieldRows());
    ExpectEachClassOnce(oif_InteractionRows());
    ExpectEachClassOnce(oif_InteractionPropertyRows());
    ExpectEachClassOnce(oif_ConstraintRows());
    ExpectEachClassOnce(oif_ConnectorBehaviorRows());
    ExpectEachClassOnce(oif_ProcedureRows());
}

TEST(ClassTable, Row_WritesUnlessItsClassIsAComment) {
    for (const oif_BCRow& row : oif_BCRows()) EXPECT_NE(row.write, nullptr) << NameOf(row.typeId);
    for (const oif_FieldRow& row : oif_FieldRows()) {
        EXPECT_NE(row.makeInitial, nullptr) << NameOf(row.typeId);
        EXPECT_NE(row.make, nullptr) << NameOf(row.typeId);
        EXPECT_EQ(row.inEveryStep, NameOf(row.typeId) == "kpfC_GeneralField");
    }
    Names without;
    for (const oif_LoadRow& row : oif_LoadRows()) {
        if (row.make == nullptr) without.insert(NameOf(row.typeId));
        EXPECT_EQ(row.CannotBeWritten(), NameOf(row.typeId) == "kloC_UnwrittenLoad");
    }
    EXPECT_EQ(without, (Names{"kloC_InertiaRelief", "kloC_UnwrittenLoad"}));
}

TEST(ClassTable, BoundaryConditions_AreOfTwoFamilies) {
    const std::map<int, Names> expected = {
        {0,
         {"kbcC_DisplacementBC", "kbcC_VelocityBC", "kbcC_AccelerationBC", "kbcC_TypeBC", "kbcC_SymmetryBC",
          "kbcC_TemperatureBC", "kbcC_PorePressureBC", "kbcC_AcousticPressureBC", "kbcC_FluidPressureBC",
          "kbcC_ElectricPotentialBC", "kbcC_ConcentrationBC", "kbcC_SubmodelBC",
          "kbcC_FluidCavityPressureBC"}},
        {1, {"kbcC_ConnDisplacementBC", "kbcC_ConnVelocityBC", "kbcC_ConnAccelerationBC"}},
    };
    EXPECT_EQ(Families(oif_BCRows()), expected);
    EXPECT_EQ(oif_NumberOfFamilies(oif_BCRows()), 2);
}

TEST(ClassTable, Loads_AreOfSeventeenFamilies) {
    const std::map<int, Names> expected = {
        {0,
         {"kloC_Moment", "kloC_PEGLoad", "kloC_BoltLoad", "kloC_ConcentratedPoreFluid", "kloC_InwardVolAccel",
          "kloC_ConcentratedForce"}},
        {1,
         {"kloC_RotationalBodyForce", "kloC_LineLoad", "kloC_PipePressure", "kloC_BodyForce",
          "kloC_Gravity"}},
        {2, {"kloC_Pressure", "kloC_SurfaceTraction", "kloC_ShellEdgeLoad"}},
        {3, {"kloC_ConcentratedHeatFlux", "kloC_ConcentratedConcentrationFlux"}},
        {4, {"kloC_BodyHeatFlux", "kloC_BodyConcentrationFlux"}},
        {5, {"kloC_SurfaceConcentrationFlux", "kloC_SurfaceHeatFlux"}},
        {6, {"kloC_SurfacePoreFluid"}},
        {7, {"kloC_HydroFluidFlow"}},
        {8, {"kloC_UnwrittenLoad"}},
        {9, {"kloC_ConcentratedCharge"}},
        {10, {"kloC_BodyCharge"}},
        {11, {"kloC_SurfaceCharge"}},
        {12, {"kloC_ConcentratedCurrent"}},
        {13, {"kloC_BodyCurrent"}},
        {14, {"kloC_SurfaceCurrent"}},
        {15, {"kloC_ConnectorForce", "kloC_ConnectorMoment"}},
        {16, {"kloC_InertiaRelief"}},
    };
    EXPECT_EQ(Families(oif_LoadRows()), expected);
    EXPECT_EQ(oif_NumberOfFamilies(oif_LoadRows()), 17);
}

TEST(ClassTable, Fields_AreAFamilyEach) {
    const std::map<int, Names> expected = {
        {0, {"kpfC_Temperature"}},  {1, {"kpfC_PressureStress"}}, {2, {"kpfC_MassFlowRate"}},
        {3, {"kpfC_GeneralField"}}, {4, {"kpfC_Velocity"}},       {5, {"kpfC_Stress"}},
        {6, {"kpfC_Hardening"}},
    };
    EXPECT_EQ(Families(oif_FieldRows()), expected);
    EXPECT_EQ(oif_NumberOfFamilies(oif_FieldRows()), 7);
}

TEST(ClassTable, FourClassesOfInteractions_HaveAFamily) {
    std::map<int, Names> families;
    for (const cls_ClassEntry* entry : cls_Classes().ConcreteClasses(kinC_Interaction::TypeId())) {
        if (const auto* family = oif_FindInteractionFamily(entry->info.Id())) {
            families[static_cast<int>(*family)].insert(entry->info.name);
        }
    }
    const std::map<int, Names> expected = {{0, {"kinC_FilmCondition"}},
                                           {1, {"kinC_RadiationToAmbient"}},
                                           {2, {"kinC_ContactExp"}},
                                           {3, {"kinC_ConcRadiationToAmbient"}}};
    EXPECT_EQ(families, expected);
}

TEST(ClassTable, Conditions_ActOnNodesAndThoseOfConnectorsOnElements) {
    EXPECT_EQ(OnRegion(oif_BCRows(), oif_RegionKind::ELEMENTS),
              (Names{"kbcC_ConnDisplacementBC", "kbcC_ConnVelocityBC", "kbcC_ConnAccelerationBC"}));
    EXPECT_EQ(OnRegion(oif_BCRows(), oif_RegionKind::NODES).size(), 13U);
}

TEST(ClassTable, Loads_ActOnTheRegionOfTheirKeyword) {
    EXPECT_EQ(
        OnRegion(oif_LoadRows(), oif_RegionKind::ANY),
        (Names{"kloC_PEGLoad", "kloC_BoltLoad", "kloC_Gravity", "kloC_InertiaRelief", "kloC_UnwrittenLoad"}));
    EXPECT_EQ(OnRegion(oif_LoadRows(), oif_RegionKind::NODES),
              (Names{"kloC_ConcentratedForce", "kloC_Moment", "kloC_ConcentratedPoreFluid",
                     "kloC_InwardVolAccel", "kloC_ConcentratedHeatFlux", "kloC_ConcentratedConcentrationFlux",
                     "kloC_HydroFluidFlow", "kloC_ConcentratedCharge", "kloC_ConcentratedCurrent"}));
    EXPECT_EQ(OnRegion(oif_LoadRows(), oif_RegionKind::ELEMENTS),
              (Names{"kloC_ConnectorForce", "kloC_ConnectorMoment", "kloC_RotationalBodyForce",
                     "kloC_LineLoad", "kloC_PipePressure", "kloC_BodyForce", "kloC_BodyHeatFlux",
                     "kloC_BodyConcentrationFlux", "kloC_BodyCharge", "kloC_BodyCurrent"}));
    EXPECT_EQ(OnRegion(oif_LoadRows(), oif_RegionKind::SURFACE),
              (Names{"kloC_Pressure", "kloC_SurfaceTraction", "kloC_ShellEdgeLoad", "kloC_SurfaceHeatFlux",
                     "kloC_SurfaceConcentrationFlux", "kloC_SurfacePoreFluid", "kloC_SurfaceCharge",
                     "kloC_SurfaceCurrent"}));
}

TEST(ClassTable, Label_IsTheWordThatPeopleUse) {
    EXPECT_STREQ(oif_FindBCRow(0x2980005)->label, "Displacement/Rotation");
    EXPECT_STREQ(oif_FindLoadRow(0x2880024)->label, "Bolt load");
    EXPECT_STREQ(oif_FindLoadRow(0x2880008)->label, "Pressure");
    EXPECT_STREQ(oif_FindFieldRow(0x2EC001F)->label, "Hardening");
}

TEST(ClassTable, ClassOfAnotherFamily_HasNoRow) {
    EXPECT_EQ(oif_FindBCRow(0x2880024), nullptr);
    EXPECT_EQ(oif_FindLoadRow(0x2980005), nullptr);
    EXPECT_EQ(oif_FindFieldRow(0x2980005), nullptr);
}
