#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <sstream>

TEST(HostileCorpus, FilesThatOnceDidHarm_AreReadOrRefusedWithAReason) {
    int files = 0;
    for (const auto& entry : std::filesystem::directory_iterator(QRX_HOSTILE_CORPUS)) {
        SCOPED_TRACE(entry.path().filename().string());
        ++files;
        mdf_Report report;
        const auto odb = mdf_ReadModelFile(entry.path().string(), report);
        EXPECT_EQ(odb == nullptr, report.HasErrors());
        if (odb == nullptr) continue;
        std::ostringstream first;
        ASSERT_TRUE(mdf_WriteModelFile(*odb, first));
        mdf_Report again;
        const auto copy = mdf_ReadModelText(first.str(), "copy", again);
        ASSERT_NE(copy, nullptr) << again.Line(again.findings.at(0));
        std::ostringstream second;
        ASSERT_TRUE(mdf_WriteModelFile(*copy, second));
        EXPECT_EQ(first.str(), second.str());
    }
    EXPECT_GT(files, 0);
}
