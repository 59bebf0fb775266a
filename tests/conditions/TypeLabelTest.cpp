#include "foundation/omi_Singleton.h"
#include "store_interface/records/conditions/uti_TranslationMap.h"

#include <gtest/gtest.h>

TEST(TypeLabel, OfAClass_IsTheWordThatPeopleUse) {
    EXPECT_EQ(omi_Singleton<kbcC_BCTypeLabelMap>::Instance().LabelString(0x2980005, 1),
              cow_String("Displacement/Rotation"));
    EXPECT_EQ(omi_Singleton<kloC_LoadTypeLabelMap>::Instance().LabelString(0x2880024, 1),
              cow_String("Bolt load"));
    EXPECT_EQ(omi_Singleton<kpfC_FieldTypeLabelMap>::Instance().LabelString(0x2EC001F, 1),
              cow_String("Hardening"));
}

TEST(TypeLabel, OfAClassOfAnotherFamily_IsEmpty) {
    EXPECT_TRUE(omi_Singleton<kbcC_BCTypeLabelMap>::Instance().LabelString(0x2880024, 1).IsEmpty());
}

TEST(TypeLabel, SecondArgument_IsNotLookedAt) {
    EXPECT_EQ(omi_Singleton<kloC_LoadTypeLabelMap>::Instance().LabelString(0x2880008, 7),
              cow_String("Pressure"));
}
