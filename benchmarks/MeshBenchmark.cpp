// Mesh blocks as the keywords write them, beside fprintf, {fmt} and a raw write of the same bytes.
#include "base/oif_ModelInfo.h"
#include "foundation/utl_Stream.h"
#include "mesh/oif_Element.h"
#include "mesh/oif_Node.h"
#include "store_interface/model/odb_Odb.h"

#include <benchmark/benchmark.h>
#include <fmt/compile.h>
#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cstdio>
#include <iterator>
#include <map>
#include <memory>
#include <numeric>
#include <random>
#include <string>
#include <vector>

namespace {

constexpr int kNodes = 1000000;
constexpr int kElements = 1000000;
constexpr const char* kNull = "/dev/null";
constexpr const char* kFile = "bench_stream.inp";

struct Closer {
    void operator()(std::FILE* file) const { std::fclose(file); }
};
using File = std::unique_ptr<std::FILE, Closer>;

File Open(const char* path) {
    File file(std::fopen(path, "w"));
    if (file == nullptr) {
        std::perror(path);
        std::exit(1);
    }
    return file;
}

const std::vector<float>& Coordinates() {
    static const std::vector<float> coordinates = [] {
        std::mt19937 random(1);
        std::uniform_real_distribution<float> side(-500.0f, 500.0f);
        std::vector<float> made(3 * static_cast<std::size_t>(kNodes));
        for (std::size_t i = 0; i < made.size(); ++i) made[i] = i % 30 == 29 ? 0.0f : side(random);
        return made;
    }();
    return coordinates;
}

const std::vector<std::array<int, 8>>& Elements() {
    static const std::vector<std::array<int, 8>> elements = [] {
        std::mt19937 random(2);
        std::uniform_int_distribution<int> node(1, kNodes);
        std::vector<std::array<int, 8>> made(kElements);
        for (auto& element : made) {
            for (int& corner : element) corner = node(random);
        }
        return made;
    }();
    return elements;
}

/// A store with one instance that holds the nodes and the hexahedra.
struct Store {
    odb_Odb odb;
    std::unique_ptr<oif_ModelInfo> modelInfo;
    std::unique_ptr<ddb_PartInstance> instance;

    Store() {
        odiK_Model& model = odb.AddModel(odb_Odb::DefaultModelName());
        odiK_Part& part = model.AddPart("P");
        part.mesh.Reset(new odiK_Mesh());
        std::vector<int> nodes(kNodes);
        std::iota(nodes.begin(), nodes.end(), 1);
        part.mesh->SetNodes(nodes, Coordinates());
        std::vector<int> labels(kElements);
        std::iota(labels.begin(), labels.end(), 1);
        std::vector<int> corners;
        for (const auto& element : Elements()) corners.insert(corners.end(), element.begin(), element.end());
        part.mesh->AddElements("C3D8R", labels, 8, corners);
        model.AddInstance("I", "P");
        const ddb_Model view = odb.ddb().model(odb_Odb::DefaultModelName());
        modelInfo = std::make_unique<oif_ModelInfo>(view);
        instance = std::make_unique<ddb_PartInstance>(
            view.rootAssembly().instance().createIterator().currentValue());
    }
};

const Store& TheStore() {
    static const Store store;
    return store;
}

void WriteNodes(utl_Stream& stream) {
    oif_Node(*TheStore().instance, *TheStore().modelInfo).Write(stream);
}

void WriteElements(utl_Stream& stream) {
    oif_ElementFromMesh(*TheStore().instance, *TheStore().modelInfo).Write(stream);
}

template <class Writer>
void ThroughStream(benchmark::State& state, const char* path, int lines, Writer write, int threads = 1) {
    TheStore();
    for (auto _ : state) {
        qio_ios device;
        device.attach(Open(path).release(), true);
        utl_Stream stream(device, 131, 6, 6, static_cast<std::size_t>(state.range(0)));
        stream.SetThreads(threads);
        write(stream);
        stream.Flush();
        state.counters["bytes/line"] = static_cast<double>(device.Bytes()) / lines;
    }
    state.SetItemsProcessed(state.iterations() * lines);
}

void NodesStream(benchmark::State& state) {
    ThroughStream(state, kNull, kNodes, WriteNodes);
}
void NodesStreamToFile(benchmark::State& state) {
    ThroughStream(state, kFile, kNodes, WriteNodes);
    std::remove(kFile);
}
void ElementsStream(benchmark::State& state) {
    ThroughStream(state, kNull, kElements, WriteElements);
}
void NodesTwoThreads(benchmark::State& state) {
    ThroughStream(state, kNull, kNodes, WriteNodes, 2);
}
void NodesTwoThreadsToFile(benchmark::State& state) {
    ThroughStream(state, kFile, kNodes, WriteNodes, 2);
    std::remove(kFile);
}
void ElementsTwoThreads(benchmark::State& state) {
    ThroughStream(state, kNull, kElements, WriteElements, 2);
}

void NodesFprintf(benchmark::State& state) {
    const auto& coordinates = Coordinates();
    for (auto _ : state) {
        const File file = Open(kNull);
        std::setvbuf(file.get(), nullptr, _IOFBF, 256 * 1024);
        const float* xyz = coordinates.data();
        for (int i = 0; i < kNodes; ++i, xyz += 3) {
            std::fprintf(file.get(), "%7d, %12.7g, %12.7g, %12.7g\n", i + 1, static_cast<double>(xyz[0]),
                         static_cast<double>(xyz[1]), static_cast<double>(xyz[2]));
        }
    }
    state.SetItemsProcessed(state.iterations() * kNodes);
}

void NodesFmt(benchmark::State& state) {
    const auto& coordinates = Coordinates();
    std::vector<char> buffer(256 * 1024 + 256);
    for (auto _ : state) {
        const File file = Open(kNull);
        std::setvbuf(file.get(), nullptr, _IONBF, 0);
        const float* xyz = coordinates.data();
        char* out = buffer.data();
        for (int i = 0; i < kNodes; ++i, xyz += 3) {
            out = fmt::format_to(out, FMT_COMPILE("{:7d}, {:12.7g}, {:12.7g}, {:12.7g}\n"), i + 1, xyz[0],
                                 xyz[1], xyz[2]);
            if (out - buffer.data() >= 256 * 1024) {
                std::fwrite(buffer.data(), 1, static_cast<std::size_t>(out - buffer.data()), file.get());
                out = buffer.data();
            }
        }
        std::fwrite(buffer.data(), 1, static_cast<std::size_t>(out - buffer.data()), file.get());
    }
    state.SetItemsProcessed(state.iterations() * kNodes);
}

void ElementsFprintf(benchmark::State& state) {
    const auto& elements = Elements();
    for (auto _ : state) {
        const File file = Open(kNull);
        std::setvbuf(file.get(), nullptr, _IOFBF, 256 * 1024);
        int label = 0;
        for (const auto& e : elements) {
            std::fprintf(file.get(), "%7d,%7d,%7d,%7d,%7d,%7d,%7d,%7d,%7d\n", ++label, e[0], e[1], e[2], e[3],
                         e[4], e[5], e[6], e[7]);
        }
    }
    state.SetItemsProcessed(state.iterations() * kElements);
}

void RawNodes(benchmark::State& state, const char* path) {
    static const std::string bytes = [] {
        qio_StringDevice device;
        utl_Stream stream(device, 131, 6, 6);
        WriteNodes(stream);
        return device.Text();
    }();
    for (auto _ : state) {
        const File file = Open(path);
        std::setvbuf(file.get(), nullptr, _IONBF, 0);
        for (std::size_t at = 0; at < bytes.size(); at += 256 * 1024) {
            std::fwrite(bytes.data() + at, 1, std::min<std::size_t>(256 * 1024, bytes.size() - at),
                        file.get());
        }
    }
    state.SetItemsProcessed(state.iterations() * kNodes);
}
void NodesRaw(benchmark::State& state) {
    RawNodes(state, kNull);
}
void NodesRawToFile(benchmark::State& state) {
    RawNodes(state, kFile);
    std::remove(kFile);
}

BENCHMARK(NodesStream)
    ->Arg(4 << 10)
    ->Arg(64 << 10)
    ->Arg(256 << 10)
    ->Arg(1 << 20)
    ->Arg(4 << 20)
    ->Unit(benchmark::kMillisecond);
BENCHMARK(NodesFprintf)->Unit(benchmark::kMillisecond);
BENCHMARK(NodesFmt)->Unit(benchmark::kMillisecond);
BENCHMARK(NodesRaw)->Unit(benchmark::kMillisecond);
BENCHMARK(NodesStreamToFile)->Arg(64 << 10)->Arg(256 << 10)->Arg(1 << 20)->Unit(benchmark::kMillisecond);
BENCHMARK(NodesRawToFile)->Unit(benchmark::kMillisecond);
BENCHMARK(ElementsStream)->Arg(256 << 10)->Unit(benchmark::kMillisecond);
BENCHMARK(ElementsFprintf)->Unit(benchmark::kMillisecond);
BENCHMARK(NodesTwoThreads)->Arg(256 << 10)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(NodesTwoThreadsToFile)->Arg(256 << 10)->Unit(benchmark::kMillisecond)->UseRealTime();
BENCHMARK(ElementsTwoThreads)->Arg(256 << 10)->Unit(benchmark::kMillisecond)->UseRealTime();

/// The usual table, and behind it the ratios of the best times.
class RatioReporter : public benchmark::ConsoleReporter {
public:
    void ReportRuns(const std::vector<Run>& runs) override {
        ConsoleReporter::ReportRuns(runs);
        for (const Run& run : runs) {
            if (run.run_type != Run::RT_Iteration) continue;
            const double seconds = run.real_accumulated_time / static_cast<double>(run.iterations);
            const auto [found, isNew] = best_.emplace(run.run_name.str(), seconds);
            if (!isNew) found->second = std::min(found->second, seconds);
        }
    }
    void PrintRatios() const {
        std::puts("\nbest times of the run, as ratios:");
        Ratio("NodesFprintf", "NodesStream/262144");
        Ratio("NodesFmt", "NodesStream/262144");
        Ratio("ElementsFprintf", "ElementsStream/262144");
        Ratio("NodesStream/262144", "NodesTwoThreads/262144/real_time");
        Ratio("ElementsStream/262144", "ElementsTwoThreads/262144/real_time");
        Ratio("NodesTwoThreadsToFile/262144/real_time", "NodesRawToFile");
        // To a file: against the text alone plus the bytes alone.
        const auto file = best_.find("NodesStreamToFile/262144");
        const auto null = best_.find("NodesStream/262144");
        const auto raw = best_.find("NodesRawToFile");
        if (file == best_.end() || null == best_.end() || raw == best_.end()) return;
        std::printf("  NodesStreamToFile / (NodesStream + NodesRawToFile) %6.2f\n",
                    file->second / (null->second + raw->second));
    }

private:
    void Ratio(const char* above, const char* below) const {
        const auto a = best_.find(above);
        const auto b = best_.find(below);
        if (a == best_.end() || b == best_.end()) return;
        std::printf("  %-26s / %-24s %6.2f\n", above, below, a->second / b->second);
    }

    std::map<std::string, double> best_;
};

} // namespace

int main(int argc, char** argv) {
    std::vector<char*> arguments(argv, argv + argc);
    std::string defaults[] = {"--benchmark_repetitions=15", "--benchmark_min_time=0.05",
                              "--benchmark_enable_random_interleaving=true"};
    // Those of the command line come later and win.
    for (std::size_t i = 0; i < std::size(defaults); ++i) {
        arguments.insert(arguments.begin() + 1 + static_cast<std::ptrdiff_t>(i), defaults[i].data());
    }
    int count = static_cast<int>(arguments.size());
    benchmark::Initialize(&count, arguments.data());
    if (benchmark::ReportUnrecognizedArguments(count, arguments.data())) return 1;
    RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    reporter.PrintRatios();
}
