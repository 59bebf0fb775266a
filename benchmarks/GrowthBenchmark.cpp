// How the time for a model grows with its size: each task at a quarter of its size and at all of it, in turn,
// each run in a process of its own, the best of three. An exponent of 1 is a time that grows as the model
// does.
//     bench_growth [TASK ...]
#include "benchmarks/GrowthModels.h"
#include "benchmarks/InChild.h"
#include "deck/oif_Writer.h"
#include "deck_checks/dck_Check.h"
#include "foundation/qio_Device.h"
#include "model_file/mdf_ModelFile.h"

#include <sys/resource.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <ctime>

namespace {

/// Of the processor, so that what else the machine does counts less.
struct Times {
    double reading = 1e9;
    double checking = 1e9;
    double writing = 1e9;
    long peak = 0; // in kB

    double Whole() const { return reading + checking + writing; }
};

template <class Work>
double SecondsOf(const Work& work) {
    const std::clock_t start = std::clock();
    work();
    return static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC;
}

Times Measure(const std::string& text) {
    Times times;
    mdf_Report report;
    std::unique_ptr<odb_Odb> odb;
    times.reading = SecondsOf([&] { odb = mdf_ReadModelText(text, "m.json", report); });
    times.checking = odb == nullptr ? 0.0 : SecondsOf([&] { static_cast<void>(dck_Check(*odb)); });
    times.writing = odb == nullptr ? 0.0 : SecondsOf([&] {
        qio_StringDevice device;
        oif_Writer(*odb).WriteInput(device);
    });
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    times.peak = usage.ru_maxrss;
    return times;
}

void KeepBest(Times& best, const Times& run) {
    best.reading = std::min(best.reading, run.reading);
    best.checking = std::min(best.checking, run.checking);
    best.writing = std::min(best.writing, run.writing);
    best.peak = run.peak;
}

double Exponent(double whole, double quarter) {
    return quarter > 0.0 ? std::log(whole / quarter) / std::log(4.0) : 0.0;
}

} // namespace

int main(int argc, char** argv) {
    for (const growth::Task& task : growth::kTasks) {
        const auto isTask = [&task](const char* name) { return std::string(name) == task.name; };
        if (argc > 1 && std::none_of(argv + 1, argv + argc, isTask)) continue;
        Times quarter;
        Times whole;
        const std::string small = task.text(task.count / 4);
        const std::string large = task.text(task.count);
        for (int run = 0; run < 3; ++run) {
            KeepBest(quarter, InChild([&small] { return Measure(small); }));
            KeepBest(whole, InChild([&large] { return Measure(large); }));
        }
        std::printf("%-16s %6d in %6.3f s, exponent %.2f; read in %6.3f s, %.2f; checked in %6.3f s, %.2f; "
                    "written in %6.3f s, %.2f; file %.1f MB, peak %.0f MiB\n",
                    task.name, task.count, whole.Whole(), Exponent(whole.Whole(), quarter.Whole()),
                    whole.reading, Exponent(whole.reading, quarter.reading), whole.checking,
                    Exponent(whole.checking, quarter.checking), whole.writing,
                    Exponent(whole.writing, quarter.writing), static_cast<double>(large.size()) / 1e6,
                    static_cast<double>(whole.peak) / 1024.0);
    }
}
