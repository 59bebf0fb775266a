#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>

TEST(MaterialExample, Model_HasThirtyMaterials) {
    mdf_Report report;
    const auto odb = mdf_ReadModelFile(QRX_MATERIAL_EXAMPLE "/materials.json", report);
    ASSERT_NE(odb, nullptr);
    EXPECT_EQ(odb->FindModel(odb_Odb::DefaultModelName())->materials.Size(), 30);
}
