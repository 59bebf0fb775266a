// Mesher's files of a million elements, from the page cache, each task in a process of its own, beside Gmsh
// where it is installed (scripts/install-dependencies.sh bench):
//     bench_mesh_file QRXDECK [FOLDER]
// Printed are times, rates, peak memory and ratios; the files stay in FOLDER (a temporary one by default) no
// longer than the run.
#include "mesh_file/msf_Faces.h"
#include "mesh_file/msf_MeshFile.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/model/odiK_Model.h"

#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <functional>
#include <iostream>

namespace {

namespace fs = std::filesystem;

struct Measure {
    double seconds = 0.0;
    double peakMiB = 0.0;
};

double SecondsSince(std::chrono::steady_clock::time_point start) {
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

Measure InChild(const std::function<void()>& task) {
    int ends[2];
    if (pipe(ends) != 0) std::exit(1);
    const pid_t child = fork();
    if (child == 0) {
        const auto start = std::chrono::steady_clock::now();
        task();
        const double seconds = SecondsSince(start);
        if (write(ends[1], &seconds, sizeof seconds) != sizeof seconds) _exit(1);
        _exit(0);
    }
    Measure measure;
    const auto got = read(ends[0], &measure.seconds, sizeof measure.seconds);
    rusage usage{};
    int status = 0;
    wait4(child, &status, 0, &usage);
    measure.peakMiB = static_cast<double>(usage.ru_maxrss) / 1024.0;
    close(ends[0]);
    close(ends[1]);
    if (got != sizeof measure.seconds || status != 0) std::exit(1);
    return measure;
}

Measure Best(const std::function<void()>& task, int runs = 3) {
    Measure best = InChild(task);
    for (int run = 1; run < runs; ++run) {
        const Measure next = InChild(task);
        if (next.seconds < best.seconds) best = next;
    }
    return best;
}

/// Seconds of a shell command, the best of three; negative when it fails.
double Command(const std::string& command) {
    double best = -1.0;
    for (int run = 0; run < 3; ++run) {
        const auto start = std::chrono::steady_clock::now();
        if (std::system((command + " >/dev/null 2>&1").c_str()) != 0) return -1.0;
        const double seconds = SecondsSince(start);
        if (best < 0.0 || seconds < best) best = seconds;
    }
    return best;
}

/// A block of cells on a grid: nodes in rows, cells of `width` nodes as MSH has them, boundary quadrangles.
struct Grid {
    std::vector<std::array<double, 3>> nodes;
    std::vector<std::int64_t> cells;
    std::size_t width = 8;
    int mshType = 5;
    std::size_t NumCells() const { return cells.size() / width; }
};

Grid Bricks(int nx, int ny, int nz) {
    Grid grid;
    const auto node = [&](int i, int j, int k) -> std::int64_t {
        return 1 + i + static_cast<std::int64_t>(nx + 1) * (j + static_cast<std::int64_t>(ny + 1) * k);
    };
    for (int k = 0; k <= nz; ++k) {
        for (int j = 0; j <= ny; ++j) {
            for (int i = 0; i <= nx; ++i) grid.nodes.push_back({0.137 * i, 0.211 * j, 0.173 * k});
        }
    }
    for (int k = 0; k < nz; ++k) {
        for (int j = 0; j < ny; ++j) {
            for (int i = 0; i < nx; ++i) {
                for (const std::int64_t n : {node(i, j, k), node(i + 1, j, k), node(i + 1, j + 1, k),
                                             node(i, j + 1, k), node(i, j, k + 1), node(i + 1, j, k + 1),
                                             node(i + 1, j + 1, k + 1), node(i, j + 1, k + 1)})
                    grid.cells.push_back(n);
            }
        }
    }
    return grid;
}

/// Six quadratic tetrahedra in each cube of a grid of twice the nodes.
Grid Tetrahedra(int n) {
    Grid grid = Bricks(2 * n, 2 * n, 2 * n);
    grid.cells.clear();
    grid.width = 10;
    grid.mshType = 11;
    const std::int64_t row = 2 * n + 1;
    constexpr int kCorners[6][4][3] = {
        {{0, 0, 0}, {1, 0, 0}, {1, 1, 0}, {1, 1, 1}}, {{0, 0, 0}, {1, 1, 0}, {0, 1, 0}, {1, 1, 1}},
        {{0, 0, 0}, {0, 1, 0}, {0, 1, 1}, {1, 1, 1}}, {{0, 0, 0}, {0, 1, 1}, {0, 0, 1}, {1, 1, 1}},
        {{0, 0, 0}, {0, 0, 1}, {1, 0, 1}, {1, 1, 1}}, {{0, 0, 0}, {1, 0, 1}, {1, 0, 0}, {1, 1, 1}}};
    constexpr int kEdges[6][2] = {{0, 1}, {1, 2}, {2, 0}, {0, 3}, {2, 3}, {1, 3}};
    for (int k = 0; k < n; ++k) {
        for (int j = 0; j < n; ++j) {
            for (int i = 0; i < n; ++i) {
                for (const auto& corners : kCorners) {
                    const auto at = [&](int a, int b) {
                        const auto sum = [&](int axis, int cell) {
                            return 2 * cell + corners[a][axis] + corners[b][axis];
                        };
                        return 1 + sum(0, i) + row * (sum(1, j) + row * sum(2, k));
                    };
                    for (int a = 0; a < 4; ++a) grid.cells.push_back(at(a, a));
                    for (const auto& edge : kEdges) grid.cells.push_back(at(edge[0], edge[1]));
                }
            }
        }
    }
    return grid;
}

class Bytes {
public:
    template <class T>
    void Raw(T value) {
        text.append(reinterpret_cast<const char*>(&value), sizeof value);
    }
    std::string text;
};

std::string Msh41(const Grid& grid) {
    Bytes out;
    out.text = "$MeshFormat\n4.1 1 8\n";
    out.Raw<std::int32_t>(1);
    out.text += "\n$EndMeshFormat\n$Nodes\n";
    const std::uint64_t n = grid.nodes.size();
    for (const std::uint64_t head : {std::uint64_t{1}, n, std::uint64_t{1}, n}) out.Raw(head);
    for (const std::int32_t head : {3, 1, 0}) out.Raw(head);
    out.Raw(n);
    for (std::uint64_t i = 1; i <= n; ++i) out.Raw(i);
    for (const auto& point : grid.nodes) out.Raw(point);
    out.text += "\n$EndNodes\n$Elements\n";
    const std::uint64_t cells = grid.NumCells();
    for (const std::uint64_t head : {std::uint64_t{1}, cells, std::uint64_t{1}, cells}) out.Raw(head);
    for (const std::int32_t head : {3, 1, grid.mshType}) out.Raw(head);
    out.Raw(cells);
    for (std::uint64_t i = 0; i < cells; ++i) {
        out.Raw(i + 1);
        out.text.append(reinterpret_cast<const char*>(grid.cells.data() + i * grid.width), 8 * grid.width);
    }
    out.text += "\n$EndElements\n";
    return std::move(out.text);
}

std::string Msh41Text(const Grid& grid) {
    std::string out = "$MeshFormat\n4.1 0 8\n$EndMeshFormat\n$Nodes\n";
    const std::string n = std::to_string(grid.nodes.size());
    out += "1 " + n + " 1 " + n + "\n3 1 0 " + n + "\n";
    for (std::size_t i = 1; i <= grid.nodes.size(); ++i) out += std::to_string(i) + "\n";
    char line[128];
    for (const auto& p : grid.nodes)
        out.append(line, static_cast<std::size_t>(
                             std::snprintf(line, sizeof line, "%.16g %.16g %.16g\n", p[0], p[1], p[2])));
    const std::string cells = std::to_string(grid.NumCells());
    out += "$EndNodes\n$Elements\n1 " + cells + " 1 " + cells + "\n3 1 " + std::to_string(grid.mshType) +
           " " + cells + "\n";
    for (std::size_t i = 0; i < grid.NumCells(); ++i) {
        out += std::to_string(i + 1);
        for (std::size_t j = 0; j < grid.width; ++j)
            out += " " + std::to_string(grid.cells[i * grid.width + j]);
        out += "\n";
    }
    return out + "$EndElements\n";
}

std::string Unv(const Grid& grid) {
    std::string out = "    -1\n  2411\n";
    char line[160];
    const auto put = [&](int length) { out.append(line, static_cast<std::size_t>(length)); };
    for (std::size_t i = 0; i < grid.nodes.size(); ++i) {
        const auto& p = grid.nodes[i];
        put(std::snprintf(line, sizeof line, "%10zu%10d%10d%10d\n%25.16E%25.16E%25.16E\n", i + 1, 1, 1, 11,
                          p[0], p[1], p[2]));
    }
    out += "    -1\n    -1\n  2412\n";
    for (std::size_t i = 0; i < grid.NumCells(); ++i) {
        put(std::snprintf(line, sizeof line, "%10zu%10d%10d%10d%10d%10d\n", i + 1, 115, 1, 1, 7, 8));
        for (std::size_t j = 0; j < 8; ++j)
            put(std::snprintf(line, sizeof line, "%10lld", static_cast<long long>(grid.cells[8 * i + j])));
        out += "\n";
    }
    return out + "    -1\n";
}

std::string Vtu(const Grid& grid) {
    Bytes data;
    std::string arrays[4];
    const auto begin = [&](int array, std::uint64_t bytes) {
        arrays[array] = std::to_string(data.text.size());
        data.Raw(bytes);
    };
    begin(0, 24 * grid.nodes.size());
    for (const auto& point : grid.nodes) data.Raw(point);
    begin(1, 8 * grid.cells.size());
    for (const std::int64_t node : grid.cells) data.Raw(node - 1);
    begin(2, 8 * grid.NumCells());
    for (std::size_t i = 1; i <= grid.NumCells(); ++i)
        data.Raw<std::int64_t>(static_cast<std::int64_t>(8 * i));
    begin(3, grid.NumCells());
    data.text.append(grid.NumCells(), '\x0c');
    const auto array = [&](const char* type, const char* name, int components, int i) {
        return "<DataArray type=\"" + std::string(type) + "\" Name=\"" + name + "\" NumberOfComponents=\"" +
               std::to_string(components) + "\" format=\"appended\" offset=\"" + arrays[i] + "\"/>\n";
    };
    return "<?xml version=\"1.0\"?>\n<VTKFile type=\"UnstructuredGrid\" version=\"1.0\" "
           "byte_order=\"LittleEndian\" header_type=\"UInt64\">\n"
           "<UnstructuredGrid><Piece NumberOfPoints=\"" +
           std::to_string(grid.nodes.size()) + "\" NumberOfCells=\"" + std::to_string(grid.NumCells()) +
           "\">\n<Points>" + array("Float64", "Points", 3, 0) + "</Points><Cells>" +
           array("Int64", "connectivity", 1, 1) + array("Int64", "offsets", 1, 2) +
           array("UInt8", "types", 1, 3) +
           "</Cells></Piece></UnstructuredGrid>\n<AppendedData encoding=\"raw\">\n_" + data.text +
           "\n</AppendedData></VTKFile>\n";
}

void Put(const fs::path& path, const std::string& text) {
    std::ofstream(path, std::ios::binary) << text;
}

std::string Model(const std::string& file) {
    return R"({"format":"qrx-model/1","models":{"Default Model":{"parts":{"P":{"mesh":{"file":")" + file +
           R"("}}},"assembly":{"instances":{"P-1":{"part":"P"}}},"steps":[{"name":"Initial","class":"kprC_InitialStep"}]}}})";
}

double ArraysMiB(const fs::path& path) {
    mdf_Report report;
    const auto store =
        mdf_ReadModelText(Model(path.filename().string()), (path.parent_path() / "m.json").string(), report);
    if (store == nullptr) std::exit(1);
    const odiK_Mesh& mesh = *store->Models().begin()->second->Parts().begin()->second->mesh;
    std::size_t bytes = static_cast<std::size_t>(mesh.Nodes().NumNodes()) * (sizeof(int) + 3 * sizeof(float));
    for (const odiK_ElementClass& elements : mesh.Classes())
        bytes += sizeof(int) * (elements.labels.size() + elements.connectivity.size());
    for (const auto& set : mesh.Sets()) {
        for (const rgnC_SubsetData& subset : set->subsets)
            bytes += sizeof(int) * static_cast<std::size_t>(subset.subset.Length());
    }
    return static_cast<double>(bytes) / 1048576.0;
}

void BenchLoad(const fs::path& path, double wantedRate) {
    const double megabytes = static_cast<double>(fs::file_size(path)) / 1e6;
    const std::string model = Model(path.filename().string());
    const std::string name = (path.parent_path() / "m.json").string();
    const Measure load = Best([&] {
        mdf_Report report;
        if (mdf_ReadModelText(model, name, report) == nullptr) std::exit(1);
    });
    const Measure nothing = InChild([] {});
    double arrays = 0.0;
    const fs::path note = path.parent_path() / "arrays";
    InChild([&] { std::ofstream(note) << ArraysMiB(path); });
    std::ifstream(note) >> arrays;
    std::printf("%-22s %7.1f MB  file to store %6.3f s  %6.0f MB/s (wanted %3.0f)  peak %6.1f MiB beyond the "
                "process; arrays %6.1f + file %6.1f\n",
                path.filename().c_str(), megabytes, load.seconds, megabytes / load.seconds, wantedRate,
                load.peakMiB - nothing.peakMiB, arrays, megabytes / 1.048576);
}

void BenchGmsh(const fs::path& path, const std::string& qrxdeck) {
    const std::string file = path.string();
    const std::string folder = path.parent_path().string();
    const std::string name = (path.parent_path() / "m.json").string();
    const Measure load = Best([&] {
        mdf_Report report;
        if (mdf_ReadModelText(Model(path.filename().string()), name, report) == nullptr) std::exit(1);
    });
    Put(path.parent_path() / "empty.geo", "");
    const double start = Command("gmsh -v 0 " + folder + "/empty.geo -");
    const double open = Command("gmsh -v 0 " + file + " -");
    const double save = Command("gmsh -v 0 " + file + " -save -format msh22 -o " + folder + "/saved.msh");
    Put(name, Model(path.filename().string()));
    const double write = Command(qrxdeck + " write " + name + " --output-dir " + folder);
    std::printf("%-22s qrxdeck write %6.3f s", path.filename().c_str(), write);
    if (open < 0.0 || save < 0.0) {
        std::printf("; gmsh is not there\n");
        return;
    }
    std::printf(
        "; gmsh opens it in %6.3f s (%.3f s of that to start), %.1f times as long as file to store (wanted "
        "5), %.1f times without its start; opens and saves in %6.3f s, %.1f times as long as the write "
        "(wanted 4, better 8)\n",
        open, start, open / load.seconds, (open - start) / load.seconds, save, save / write);
}

void BenchFaces() {
    const int nx = 1000;
    const int ny = 500;
    const Grid grid = Bricks(nx, ny, 1);
    msf_Mesh mesh;
    msf_Block bricks{cel_KindEnm::HEXAHEDRON8, {}, {}};
    for (const std::int64_t node : grid.cells) bricks.nodes.push_back(static_cast<int>(node - 1));
    msf_Block quads{cel_KindEnm::QUAD4, {}, {}};
    for (std::size_t i = 0; i < grid.NumCells(); ++i) {
        bricks.labels.push_back(static_cast<int>(i) + 1);
        const int* row = bricks.nodes.data() + 8 * i;
        quads.nodes.insert(quads.nodes.end(),
                           {row[0], row[1], row[2], row[3], row[4], row[5], row[6], row[7]});
    }
    for (std::size_t i = 0; i < 2 * grid.NumCells(); ++i)
        quads.labels.push_back(static_cast<int>(grid.NumCells() + i) + 1);
    mesh.nodeLabels.resize(grid.nodes.size());
    const int count = quads.NumCells();
    mesh.blocks = {std::move(bricks), std::move(quads)};
    const msf_Run run{1, 0, count};
    const Measure match = Best([&] {
        for (const msf_Face& face : msf_MatchFaces(mesh, 3, {true, false}, {&run, 1})) {
            if (face.behind != 1) std::exit(1);
        }
    });
    std::printf("faces behind %d boundary cells: %.3f s (wanted 0.3)\n", count, match.seconds);
}

} // namespace

int main(int argc, char** argv) {
    if (argc < 2) {
        std::fputs("usage: bench_mesh_file QRXDECK [FOLDER]\n", stderr);
        return 2;
    }
    const fs::path folder = (argc > 2 ? fs::path(argv[2]) : fs::temp_directory_path()) /
                            ("bench_mesh_file-" + std::to_string(getpid()));
    fs::create_directories(folder);
    // In children, so that the arrays that make the files are in no peak.
    InChild([&] { Put(folder / "tets_41b.msh", Msh41(Tetrahedra(55))); });
    InChild([&] {
        const Grid bricks = Bricks(100, 100, 100);
        Put(folder / "bricks_41b.msh", Msh41(bricks));
        Put(folder / "bricks_41.msh", Msh41Text(bricks));
        Put(folder / "bricks.unv", Unv(bricks));
        Put(folder / "bricks.vtu", Vtu(bricks));
    });
    BenchLoad(folder / "tets_41b.msh", 400);
    BenchLoad(folder / "bricks_41b.msh", 400);
    BenchLoad(folder / "bricks_41.msh", 150);
    BenchLoad(folder / "bricks.unv", 150);
    BenchLoad(folder / "bricks.vtu", 400);
    BenchFaces();
    for (const char* file : {"tets_41b.msh", "bricks_41b.msh"}) BenchGmsh(folder / file, argv[1]);
    fs::remove_all(folder);
    return 0;
}
