// How the time for a model grows with its size: each task at a quarter of its size and at all of it. An
// exponent of 1 is a time that grows as the model does.
#include "benchmarks/GrowthModels.h"
#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "foundation/qio_Device.h"
#include "model_file/mdf_ModelFile.h"

#include <sys/resource.h>

#include <chrono>
#include <cmath>
#include <cstdio>

namespace {

double SecondsOf(const std::string& text) {
    const auto start = std::chrono::steady_clock::now();
    mdf_Report report;
    const auto odb = mdf_ReadModelText(text, "m.json", report);
    if (odb != nullptr) {
        static_cast<void>(dck_Check(*odb));
        qio_StringDevice device;
        oif_Writer(*odb).WriteInput(device);
    }
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

} // namespace

int main() {
    for (const growth::Task& task : growth::kTasks) {
        const double quarter = SecondsOf(task.text(task.count / 4));
        const std::string text = task.text(task.count);
        const double whole = SecondsOf(text);
        rusage usage{};
        getrusage(RUSAGE_SELF, &usage);
        std::printf(
            "%-16s %6d in %6.3f s, a quarter in %6.3f s: exponent %.2f; file %.1f MB, peak so far %.0f MiB\n",
            task.name, task.count, whole, quarter, std::log(whole / quarter) / std::log(4.0),
            static_cast<double>(text.size()) / 1e6, static_cast<double>(usage.ru_maxrss) / 1024.0);
    }
}
