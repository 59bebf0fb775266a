// Small files of many objects of one kind, which took minutes or gigabytes when something was searched for
// once for each of them. How the time grows is measured by bench_growth.
#include "benchmarks/GrowthModels.h"
#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "foundation/qio_Device.h"
#include "model_file/mdf_ModelFile.h"

#include <gtest/gtest.h>

#include <cstdlib>

namespace {

/// A quarter of what the benchmark takes is many; of what a sanitizer finds in them it finds all in fewer.
int CountOf(const growth::Task& task) {
    return task.count / (std::getenv("QRX_SANITIZED") != nullptr ? 16 : 4);
}

class Growth : public testing::TestWithParam<growth::Task> {};

} // namespace

TEST_P(Growth, ModelOfManyOfOneKind_IsReadCheckedAndWritten) {
    const growth::Task& task = GetParam();
    const std::string text = task.text(CountOf(task));
    mdf_Report report;
    const auto odb = mdf_ReadModelText(text, "m.json", report);
    if (odb != nullptr) {
        dck_Check(*odb);
        qio_StringDevice device;
        oif_Writer(*odb).WriteInput(device);
        EXPECT_GT(device.Text().size(), text.size() / 20);
    } else {
        EXPECT_GE(report.findings.size(), 50U);
    }
}

INSTANTIATE_TEST_SUITE_P(Tasks, Growth, testing::ValuesIn(growth::kTasks),
                         [](const auto& param) { return std::string(param.param.name); });
