#include "interactions/InteractionTesting.h"
#include "interactions/oif_InteractionProperty.h"
#include "interactions/oif_InteractionRow.h"
#include "interactions/oif_PropertyChanges.h"
#include "store_interface/records/interactions/kinC_ActuatorSensor.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"
#include "store_interface/records/interactions/kinC_CyclicSymmetry.h"
#include "store_interface/records/interactions/kinC_WaveInteractions.h"

#include <set>

namespace {

TEST(InteractionRows, EveryClassHasOne) {
    std::set<unsigned> ids;
    for (const oif_InteractionRow& row : oif_InteractionRows()) {
        EXPECT_TRUE(ids.insert(row.typeId).second) << cls_Classes().NameOf(row.typeId).View();
        EXPECT_EQ(oif_FindInteractionRow(row.typeId), &row);
    }
    const auto classes = cls_Classes().ConcreteClasses(kinC_Interaction::TypeId());
    for (const cls_ClassEntry* entry : classes)
        EXPECT_EQ(ids.count(entry->info.Id()), 1U) << entry->info.name;
    EXPECT_EQ(ids.size(), classes.size());
    EXPECT_EQ(oif_FindInteractionRow(kinC_Interaction::TypeId()), nullptr);
}

TEST(InteractionRows, AClassHasAHistoryOrIsSaidByStepsOrIsSilent) {
    const std::set<unsigned> silent{kinC_ElasticFoundation::TypeId(), kinC_ActuatorSensor::TypeId(),
                                    kinC_CyclicSymmetry::TypeId()};
    for (const oif_InteractionRow& row : oif_InteractionRows()) {
        const int ways = (row.history != nullptr ? 1 : 0) + (row.make != nullptr ? 1 : 0);
        EXPECT_EQ(ways, silent.count(row.typeId) == 1 ? 0 : 1) << cls_Classes().NameOf(row.typeId).View();
        EXPECT_EQ(row.make != nullptr, row.saying != oif_Saying::NEVER)
            << cls_Classes().NameOf(row.typeId).View();
        EXPECT_EQ(row.solver != oif_ContactSolver::NONE,
                  cls_Classes().InheritanceCheck(row.typeId, kinC_ContactPair::TypeId()))
            << cls_Classes().NameOf(row.typeId).View();
    }
}

TEST(InteractionRows, RegionsAreThoseOfTheRecord) {
    const oif_InteractionRow& row = *oif_FindInteractionRow(kinC_IncidentWave::TypeId());
    const kinC_IncidentWave wave;
    ASSERT_EQ(row.regions.size(), 3U);
    EXPECT_STREQ(row.regions[0].member, "source");
    EXPECT_EQ(&row.regions[0].region(wave), &wave.source);
    EXPECT_EQ(&row.regions[1].region(wave), &wave.standoff);
    EXPECT_EQ(&row.regions[2].region(wave), &wave.surface);
    EXPECT_EQ(row.regions[0].kind, oif_RegionKind::NODES);
    EXPECT_EQ(row.regions[2].kind, oif_RegionKind::SURFACE);
    const kinC_SelfContactXpl contact;
    const oif_InteractionRow& self = *oif_FindInteractionRow(contact.DynTypeId());
    EXPECT_EQ(&self.regions[0].region(contact), &contact.surface);
    EXPECT_EQ(self.regions[0].kind, oif_RegionKind::SURFACE_OR_NODES);
    EXPECT_EQ(oif_SolverOf(contact), oif_ContactSolver::EXPLICIT);
}

TEST(InteractionPropertyRows, EveryClassHasOne) {
    std::set<unsigned> ids;
    for (const oif_InteractionPropertyRow& row : oif_InteractionPropertyRows()) {
        EXPECT_TRUE(ids.insert(row.typeId).second) << cls_Classes().NameOf(row.typeId).View();
    }
    const std::set<unsigned> silent{kinC_IncidentWaveProperty::TypeId(), kinC_ActuatorSensorProp::TypeId()};
    const auto classes = cls_Classes().ConcreteClasses(kinC_InteractionProperty::TypeId());
    for (const cls_ClassEntry* entry : classes) {
        const oif_InteractionPropertyRow* row = oif_FindInteractionPropertyRow(entry->info.Id());
        ASSERT_NE(row, nullptr) << entry->info.name;
        EXPECT_EQ(row->add == nullptr, silent.count(row->typeId) == 1) << entry->info.name;
    }
    EXPECT_EQ(ids.size(), classes.size());
}

TEST(PropertyChanges, OnlyAContactPairHasThem) {
    EXPECT_TRUE(oif_PropertyChanges(kinC_ContactExp(), kprC_StepContainer()).IsEmpty());
    EXPECT_FALSE(oif_ChangesProperty(kinC_SelfContactStd(), kprC_StepContainer()));
}

} // namespace
