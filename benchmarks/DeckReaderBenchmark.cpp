// Reads and compares decks with big meshes; tells bytes a second, memory beside the flat arrays, and how the
// time grows with the number of keywords, sets, steps and instances.
//
// usage: bench_deck_reader [NODES]

#include "benchmarks/InChild.h"
#include "deck_reader/drd_Check.h"
#include "deck_reader/drd_Diff.h"
#include "deck_reader/drd_Reader.h"

#include <sys/resource.h>

#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <fstream>
#include <functional>
#include <string>

namespace {

/// Memory of the process in kB: now ("VmRSS:") or at most ("VmHWM:").
long MemoryOf(const char* word) {
    std::ifstream status("/proc/self/status");
    std::string key;
    while (status >> key) {
        if (key != word) continue;
        long kilobytes = 0;
        status >> kilobytes;
        return kilobytes;
    }
    return 0;
}

double SecondsOf(const std::function<void()>& run) {
    // Of the processor, so that what else the machine does counts less.
    const std::clock_t start = std::clock();
    run();
    return static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC;
}

std::string Line(const char* format, auto... values) {
    char line[200];
    std::snprintf(line, sizeof line, format, values...);
    return line;
}

void WriteMesh(std::ostream& text, int nodes) {
    text << "*Node\n";
    for (int i = 1; i <= nodes; ++i) {
        text << Line("%7d, %12.7g, %12.7g, %12.7g\n", i, i * 0.5, (i % 1000) * 0.123457, (i % 77) * -1.5e-3);
    }
    text << "*Element, type=C3D8\n";
    for (int i = 1; i <= nodes; ++i) {
        text << Line("%7d,%8d,%8d,%8d,%8d,%8d,%8d,%8d,%8d\n", i, i, i % nodes + 1, (i + 1) % nodes + 1,
                     (i + 2) % nodes + 1, (i + 3) % nodes + 1, (i + 4) % nodes + 1, (i + 5) % nodes + 1,
                     (i + 6) % nodes + 1);
    }
}

bool BigMesh(const std::string& path, int nodes) {
    std::size_t bytes = 0;
    {
        // Not by way of a text in memory: what the process took at most is measured.
        std::ofstream file(path, std::ios::binary);
        file << "*Part, name=P\n";
        WriteMesh(file, nodes);
        file << "*End Part\n*Assembly, name=A\n*Instance, name=I, part=P\n*End Instance\n*End Assembly\n";
        bytes = static_cast<std::size_t>(file.tellp());
    }
    const long before = MemoryOf("VmRSS:");
    double best = 1e9;
    double both = 1e9;
    double ratio = 0.0;
    for (int run = 0; run < 5; ++run) {
        {
            drd_Findings findings;
            drd_Deck deck;
            best = std::min(best, SecondsOf([&] { deck = drd_ReadDeck(path, {}, findings); }));
            if (findings.HasErrors() || deck.meshes.size() != 1) return false;
            if (run == 0) {
                const double arrays = static_cast<double>(deck.meshes[0].Bytes()) / 1024.0;
                ratio = static_cast<double>(MemoryOf("VmHWM:") - before) / arrays;
            }
        }
        // A deck and another with one node moved, as a program would compare them.
        both = std::min(both, SecondsOf([&path] {
                            drd_Findings findings;
                            const drd_Deck first = drd_ReadDeck(path, {}, findings);
                            drd_Deck second = drd_ReadDeck(path, {}, findings);
                            second.meshes[0].coordinates[0] += 1.0;
                            if (drd_Diff(first, second, {}).differences.size() != 1) std::abort();
                        }));
    }
    std::printf(
        "%d nodes and elements, %.0f MB: %.3f s, %.0f MB/s (at least 400), %.2f times the flat arrays "
        "(at most 1.3)\n",
        nodes, static_cast<double>(bytes) / 1e6, best, static_cast<double>(bytes) / 1e6 / best, ratio);
    std::printf("reading two and comparing them: %.3f s, %.2f times the time of reading one (at most 2.5)\n",
                both, both / best);
    return true;
}

std::string Sets(int count) {
    std::string text = "*Node\n1, 0., 0., 0.\n";
    for (int i = 0; i < count; ++i) text += Line("*Nset, nset=SET-%d\n1,\n", i);
    return text;
}
std::string Steps(int count) {
    std::string text = "*Node\n1, 0., 0., 0.\n*Nset, nset=TIP\n1,\n";
    for (int i = 0; i < count; ++i) {
        text += Line("*Step, name=S-%d\n*Static\n1., 1.\n*Cload\nTIP, 1, %d.\n*End Step\n", i, i);
    }
    return text;
}
std::string Instances(int count) {
    std::string text =
        "*Part, name=P\n*Node\n1, 0., 0., 0.\n*Nset, nset=N\n1,\n*End Part\n*Assembly, name=A\n";
    for (int i = 0; i < count; ++i)
        text += Line("*Instance, name=I-%d, part=P\n%d., 0., 0.\n*End Instance\n", i, i);
    return text + "*End Assembly\n";
}
std::string Materials(int count) {
    std::string text;
    for (int i = 0; i < count; ++i)
        text += Line("*Material, name=M-%d\n*Elastic\n%d., 0.3\n*Density\n1.,\n", i, i);
    return text;
}

struct Cost {
    double seconds;
    long pages; // that the system gave
};

Cost CostOf(const std::string& text) {
    return InChild([&text] {
        rusage usage{};
        getrusage(RUSAGE_SELF, &usage);
        const long before = usage.ru_minflt;
        const double seconds = SecondsOf([&text] {
            drd_Findings findings;
            const drd_Deck deck = drd_ReadDeckText(text, "deck", {}, findings);
            drd_CheckDeck(deck, {}, findings);
            drd_Diff(deck, deck, {});
        });
        getrusage(RUSAGE_SELF, &usage);
        return Cost{seconds, usage.ru_minflt - before};
    });
}

void Growth(const char* what, std::string (*make)(int), int count) {
    const std::string texts[2] = {make(count), make(10 * count)};
    Cost best[2] = {{1e9, 0}, {1e9, 0}};
    // The small one more often: it is over before the machine's pace shows.
    for (const int size : {0, 1, 0, 0, 1, 0, 0, 1, 0, 0, 1, 0, 0, 1, 0}) {
        const Cost cost = CostOf(texts[size]);
        if (cost.seconds < best[size].seconds) best[size] = cost;
    }
    const auto bytesOfEach = [&best, count](int size) {
        return static_cast<double>(best[size].pages) * 4096.0 / count / (size == 0 ? 1 : 10);
    };
    std::printf("%-10s %7d: %.4f s; ten times as many: %.4f s, %.1f times (at most 12); memory touched %.0f "
                "and %.0f bytes each\n",
                what, count, best[0].seconds, best[1].seconds, best[1].seconds / best[0].seconds,
                bytesOfEach(0), bytesOfEach(1));
}

} // namespace

int main(int argc, char** argv) {
    const int nodes = argc > 1 ? std::atoi(argv[1]) : 1000000;
    const std::string path = "bench_deck_reader.inp";
    const bool done = BigMesh(path, nodes);
    std::remove(path.c_str());
    Growth("sets", &Sets, 100000);
    Growth("steps", &Steps, 50000);
    Growth("instances", &Instances, 50000);
    Growth("materials", &Materials, 50000);
    return done ? 0 : 1;
}
