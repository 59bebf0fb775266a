#include "fuzz/WholeWay.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

TEST(HostileCorpus, FilesThatOnceDidHarm_GoTheWholeWayOrAreRefusedWithAReason) {
    int files = 0;
    for (const auto& entry : std::filesystem::directory_iterator(QRX_HOSTILE_CORPUS)) {
        SCOPED_TRACE(entry.path().filename().string());
        ++files;
        std::ostringstream text;
        text << std::ifstream(entry.path(), std::ios::binary).rdbuf();
        EXPECT_EQ(WholeWay(text.str()), "");
    }
    EXPECT_GT(files, 0);
}
