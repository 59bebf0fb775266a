// What small files may take. The limits are far above what it takes and far below what it took when something
// was searched for once for each of its kind.
#include "benchmarks/GrowthModels.h"
#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "foundation/qio_Device.h"
#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>

#include <ctime>

namespace {

class Growth : public testing::TestWithParam<growth::Task> {};

double CpuSeconds() {
    return static_cast<double>(std::clock()) / CLOCKS_PER_SEC;
}

} // namespace

TEST_P(Growth, ModelOfManyOfOneKind_TakesSeconds) {
    const growth::Task& task = GetParam();
    const std::string text = task.text(task.count);
    const double start = CpuSeconds();
    mdf_Report report;
    const auto odb = mdf_ReadModelText(text, "m.json", report);
    if (odb != nullptr) {
        dck_Check(*odb);
        qio_StringDevice device;
        oif_Writer(*odb).WriteInput(device);
        EXPECT_GT(device.Text().size(), text.size() / 20);
    } else {
        EXPECT_EQ(report.findings.size(), 50U);
    }
    EXPECT_LT(CpuSeconds() - start, 8.0);
}

INSTANTIATE_TEST_SUITE_P(Tasks, Growth, testing::ValuesIn(growth::kTasks),
                         [](const auto& param) { return std::string(param.param.name); });
