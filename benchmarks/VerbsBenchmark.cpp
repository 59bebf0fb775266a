// The verbs that only look at a model file beside reading it into a store: qrxdeck check, info and
// info --history.
//     bench_verbs QRXDECK [SIDE]
// Each in a process of its own, in turn, the best of three; time is that of the processor, so that what else
// the machine does counts less. The exit code is 1 when a bound is missed.
#include "benchmarks/GrowthModels.h"
#include "model_file/mdf_ModelFile.h"

#include <fcntl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <functional>
#include <numeric>
#include <span>
#include <sstream>
#include <vector>

namespace {

constexpr double kAtMost = 1.2;
constexpr const char* kFile = "bench_verbs.json";

double SecondsOf(const timeval& time) {
    return static_cast<double>(time.tv_sec) + 1e-6 * static_cast<double>(time.tv_usec);
}

/// Seconds of the processor that a child takes for the task.
double InChild(const std::function<int()>& task) {
    const pid_t child = fork();
    if (child == 0) _exit(task());
    int status = 0;
    rusage usage{};
    if (wait4(child, &status, 0, &usage) != child || !WIFEXITED(status) || WEXITSTATUS(status) != 0) {
        std::fprintf(stderr, "a child failed\n");
        std::exit(2);
    }
    return SecondsOf(usage.ru_utime) + SecondsOf(usage.ru_stime);
}

int Read() {
    mdf_Report report;
    return mdf_ReadModelFile(kFile, report) == nullptr ? 1 : 0;
}

int Run(const std::vector<const char*>& arguments) {
    const int nowhere = open("/dev/null", O_WRONLY);
    dup2(nowhere, STDOUT_FILENO);
    dup2(nowhere, STDERR_FILENO);
    std::vector<char*> words;
    for (const char* argument : arguments) words.push_back(const_cast<char*>(argument));
    words.push_back(nullptr);
    execv(words[0], words.data());
    return 127;
}

/// A lattice of hexahedra, each with a volume, all under one section.
std::string LatticeText(int side) {
    odb_Odb odb;
    odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
    odiK_Part& part = model.AddPart("P");
    part.mesh.Reset(new odiK_Mesh());
    const int nodes = (side + 1) * (side + 1) * (side + 1);
    std::vector<int> labels(static_cast<std::size_t>(nodes));
    std::iota(labels.begin(), labels.end(), 1);
    std::vector<float> xyz;
    for (int n = 0; n < nodes; ++n) {
        for (const int place : {n % (side + 1), n / (side + 1) % (side + 1), n / (side + 1) / (side + 1)}) {
            xyz.push_back(1.25F * static_cast<float>(place) + 0.37F);
        }
    }
    part.mesh->SetNodes(std::move(labels), std::move(xyz));
    std::vector<int> corners;
    const auto node = [side](int x, int y, int z) { return (z * (side + 1) + y) * (side + 1) + x + 1; };
    for (int z = 0; z < side; ++z) {
        for (int y = 0; y < side; ++y) {
            for (int x = 0; x < side; ++x) {
                for (const int up : {0, 1}) {
                    for (const auto& [dx, dy] : {std::pair(0, 0), {1, 0}, {1, 1}, {0, 1}}) {
                        corners.push_back(node(x + dx, y + dy, z + up));
                    }
                }
            }
        }
    }
    std::vector<int> elements(corners.size() / 8);
    std::iota(elements.begin(), elements.end(), 1);
    part.mesh->AddElements("C3D8", std::move(elements), 8, std::move(corners));
    model.AddInstance("I", "P");
    model.Complete();
    std::ostringstream out;
    mdf_WriteModelFile(odb, out);
    return out.str();
}

bool Compare(const char* name, const std::string& text, const char* program) {
    std::ofstream(kFile, std::ios::binary) << text;
    struct Verb {
        const char* name;
        std::function<int()> run;
        double best = 1e9;
    };
    Verb verbs[] = {{"reading", Read},
                    {"check",
                     [program] {
                         return Run({program, "check", kFile});
                     }},
                    {"info",
                     [program] {
                         return Run({program, "info", kFile});
                     }},
                    {"info --history", [program] {
                         return Run({program, "info", "--history", kFile});
                     }}};
    for (int round = 0; round < 3; ++round) {
        for (Verb& verb : verbs) verb.best = std::min(verb.best, InChild(verb.run));
    }
    std::remove(kFile);
    bool good = true;
    std::printf("%s, %.1f MB: read in %.3f s", name, static_cast<double>(text.size()) / 1e6, verbs[0].best);
    for (const Verb& verb : std::span(verbs).subspan(1)) {
        const double ratio = verb.best / verbs[0].best;
        good = good && ratio <= kAtMost;
        std::printf("; %s %.2f times (at most %.1f%s)", verb.name, ratio, kAtMost,
                    ratio > kAtMost ? ": MISSED" : "");
    }
    std::printf("\n");
    return good;
}

} // namespace

int main(int argc, char** argv) {
    if (argc < 2) {
        std::fprintf(stderr, "usage: bench_verbs QRXDECK [SIDE]\n");
        return 2;
    }
    const int side = argc > 2 ? std::atoi(argv[2]) : 60;
    bool good = Compare("a lattice of hexahedra", LatticeText(side), argv[1]);
    good = Compare("20,000 conditions in five steps", growth::Conditions(20000), argv[1]) && good;
    good = Compare("20,000 sets", growth::Sets(20000), argv[1]) && good;
    return good ? 0 : 1;
}
