#include "foundation/thr_InOrder.h"
#include "mesh_file/MeshTexts.h"

#include <cstdint>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <limits>

namespace {

std::string BytesOf(const std::string& name) {
    std::ifstream file(std::string(QRX_MESHES) + "/" + name, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

std::string RefusedFile(const std::string& path, bool& unreadable) {
    msf_Mesh mesh;
    msf_Problem problem;
    EXPECT_FALSE(msf_ReadMeshFile(path, {}, mesh, problem));
    unreadable = problem.unreadable;
    return problem.Text();
}

const char* const kVtu = "<VTKFile type=\"UnstructuredGrid\" byte_order=\"LittleEndian\"><UnstructuredGrid>"
                         "<Piece NumberOfPoints=\"3\" NumberOfCells=\"1\"><Points><DataArray "
                         "type=\"Float64\" NumberOfComponents=\"3\" format=\"ascii\">"
                         "0 0 0 1 0 0 0 1 0</DataArray></Points><Cells><DataArray type=\"Int32\" "
                         "Name=\"connectivity\" format=\"ascii\">0 1 2</DataArray>"
                         "<DataArray type=\"Int32\" Name=\"offsets\" format=\"ascii\">3</DataArray>"
                         "<DataArray type=\"UInt8\" Name=\"types\" "
                         "format=\"ascii\">5</DataArray></Cells></Piece></UnstructuredGrid></VTKFile>";

/// A chain of lines as binary MSH 4.1, of so many nodes that two threads read it, and the places of its
/// numbers.
struct Chain {
    static constexpr std::int64_t kNodes = 20000;
    std::string bytes;
    std::size_t labels = 0;
    std::size_t coordinates = 0;
    std::size_t cells = 0;

    template <class T>
    void Add(std::initializer_list<T> values) {
        for (const T value : values) bytes.append(reinterpret_cast<const char*>(&value), sizeof value);
    }
    template <class T>
    void Put(std::size_t place, T value) {
        std::memcpy(bytes.data() + place, &value, sizeof value);
    }

    Chain() {
        bytes = "$MeshFormat\n4.1 1 8\n";
        Add<std::int32_t>({1});
        bytes += "\n$EndMeshFormat\n$Nodes\n";
        Add<std::int64_t>({1, kNodes, 1, kNodes});
        Add<std::int32_t>({1, 1, 0});
        Add<std::int64_t>({kNodes});
        labels = bytes.size();
        for (std::int64_t i = 1; i <= kNodes; ++i) Add<std::int64_t>({i});
        coordinates = bytes.size();
        for (std::int64_t i = 1; i <= kNodes; ++i) Add<double>({0.5 * static_cast<double>(i), 0.0, -1.0});
        bytes += "\n$EndNodes\n$Elements\n";
        Add<std::int64_t>({1, kNodes - 1, 1, kNodes - 1});
        Add<std::int32_t>({1, 1, 1});
        Add<std::int64_t>({kNodes - 1});
        cells = bytes.size();
        for (std::int64_t i = 1; i < kNodes; ++i) Add<std::int64_t>({i, i, i + 1});
        bytes += "\n$EndElements\n";
    }
};

std::string At(std::size_t offset) {
    return "offset " + std::to_string(offset) + ": ";
}

} // namespace

TEST(BinaryMsh, ReadByTwoThreads_IsWhatItIsByOne) {
    const Chain chain;
    for (const int threads : {1, 2}) {
        thr_SetUsualThreads(threads);
        const msf_Mesh mesh = MeshOf(chain.bytes);
        ASSERT_EQ(mesh.NumNodes(), Chain::kNodes);
        ASSERT_EQ(mesh.NumCells(), Chain::kNodes - 1);
        for (int i = 0; i < mesh.NumNodes(); ++i) {
            const auto place = static_cast<std::size_t>(i);
            ASSERT_EQ(mesh.nodeLabels[place], i + 1);
            ASSERT_EQ(mesh.coordinates[3 * place], 0.5F * static_cast<float>(i + 1));
            ASSERT_EQ(mesh.coordinates[3 * place + 2], -1.0F);
        }
        for (int i = 0; i < mesh.NumCells(); ++i) {
            ASSERT_EQ(mesh.blocks[0].Row(i)[0], i);
            ASSERT_EQ(mesh.blocks[0].Row(i)[1], i + 1);
        }
    }
    thr_SetUsualThreads(0);
}

TEST(BinaryMsh, OfTwoMistakes_TheFirstOfTheFileIsTold) {
    Chain chain;
    constexpr std::int64_t least = std::numeric_limits<std::int64_t>::min();
    chain.Put(chain.cells + 24 * 7 + 8, least);
    EXPECT_EQ(Refused(chain.bytes), At(chain.cells) + "found node " + std::to_string(least) +
                                        ", expected the label of a node of the file");
    chain.Put(chain.coordinates + 24 * 14999, std::numeric_limits<double>::quiet_NaN());
    EXPECT_EQ(Refused(chain.bytes), At(chain.coordinates) +
                                        "found a coordinate of node 15000 that is no number or too large, "
                                        "expected a number of single precision");
    chain.Put(chain.labels + 8 * 19999, least);
    EXPECT_EQ(Refused(chain.bytes), At(chain.labels) + "found " + std::to_string(least) +
                                        " as the label of a node, expected a number from 1 to 2147483647");
}

TEST(BadInput, FilesThatAreNone_AreRefusedByTheSystemsWords) {
    bool unreadable = false;
    EXPECT_EQ(RefusedFile("/no/such/file.msh", unreadable),
              "the file can't be read: No such file or directory");
    EXPECT_TRUE(unreadable);
    EXPECT_EQ(RefusedFile("/tmp", unreadable), "the file can't be read: it is a directory");
    EXPECT_TRUE(unreadable);
    EXPECT_EQ(RefusedFile("/dev/zero", unreadable), "the file can't be read: it is no regular file");
    EXPECT_TRUE(unreadable);
}

TEST(BadInput, BytesOfNoFormat_AreRefused) {
    EXPECT_EQ(Refused(""), "the file is empty, expected a mesh");
    EXPECT_EQ(Refused("hello\nworld"),
              "the file begins with 'hello', expected a mesh as MSH, VTU, VTK, UNV, STL or MED");
}

TEST(BadInput, EveryBeginningOfAFile_IsRefusedOrReadWithoutHarm) {
    for (const char* name : {"tets_41.msh", "tets_41b.msh", "tets_22.msh", "tets_22b.msh", "prisms.unv",
                             "prisms_a.vtk", "prisms_b.vtk", "tets_ascii.vtu", "tets_base64z.vtu",
                             "tets_rawz.vtu", "tets_appended.vtu", "box_a.stl", "box_b.stl"}) {
        const std::string bytes = BytesOf(name);
        ASSERT_FALSE(bytes.empty()) << name;
        int refused = 0;
        for (std::size_t length = 0; length < bytes.size(); length += 1 + bytes.size() / 500) {
            const std::string why = Refused(bytes.substr(0, length));
            refused += why != "nothing" ? 1 : 0;
        }
        EXPECT_GT(refused, 300) << name;
    }
}

TEST(BadInput, ChangedBytes_NeverDoHarm) {
    std::uint32_t random = 12345;
    const auto next = [&] { return random = random * 1664525u + 1013904223u; };
    std::vector<const char*> names = {"tets_41b.msh",     "tets_22b.msh",  "prisms.unv", "prisms_b.vtk",
                                      "tets_base64z.vtu", "tets_rawz.vtu", "box_a.stl"};
    if (QRX_READS_MED) names.push_back("tets.med");
    for (const char* name : names) {
        const std::string bytes = BytesOf(name);
        for (int round = 0; round < 200; ++round) {
            std::string changed = bytes;
            for (int i = 0; i < 4; ++i) changed[next() % changed.size()] = static_cast<char>(next() >> 24);
            EXPECT_NE(Refused(changed), "") << name;
        }
    }
}

TEST(BadInput, VersionsAndOrdersOfMsh_ThatAreUnknown_AreNamed) {
    EXPECT_EQ(Refused(Replaced(TwoTetrahedra(), "4.1 0 8", "4.0 0 8")),
              "line 2: found version '4.0', expected version 4.1 or 2.2: save the mesh as one of them");
    EXPECT_EQ(Refused(Replaced(TwoTetrahedra(), "4.1 0 8", "4.1 0 4")),
              "line 2: found numbers of 4 bytes, expected 8");
    EXPECT_EQ(
        Refused(std::string("$MeshFormat\n4.1 1 8\n") + std::string("\0\0\0\1", 4) + "\n$EndMeshFormat\n"),
        "offset 20: found numbers in big-endian order, expected little-endian");
}

TEST(BadInput, LabelsOfMsh_ThatAreNone_AreRefused) {
    const std::string good = TwoTetrahedra();
    EXPECT_EQ(Refused(Replaced(good, "\n4\n5\n0 0 0", "\n4\n0\n0 0 0")),
              "line 21: found 0 as the label of a node, expected a number from 1 to 2147483647");
    EXPECT_EQ(Refused(Replaced(good, "\n4\n5\n0 0 0", "\n4\n-3\n0 0 0")),
              "line 21: found -3 as the label of a node, expected a number from 1 to 2147483647");
    EXPECT_EQ(Refused(Replaced(good, "\n4\n5\n0 0 0", "\n4\n4294967297\n0 0 0")),
              "line 21: found 4294967297 as the label of a node, expected a number from 1 to 2147483647");
    EXPECT_EQ(Refused(Replaced(good, "\n4\n5\n0 0 0", "\n4\n4\n0 0 0")),
              "line 26: found node label 4 twice, expected labels that differ");
    EXPECT_EQ(Refused(Replaced(good, "2 1 3 2 5\n", "1 1 3 2 5\n")),
              "line 35: found element label 1 twice, expected labels that differ");
    EXPECT_EQ(Refused(Replaced(good, "1 1 2 3 4\n", "1 1 2 3 9\n")),
              "line 33: found node 9, expected the label of a node of the file");
}

TEST(BadInput, CountsOfMsh_ThatDontFit_AreRefused) {
    const std::string good = TwoTetrahedra();
    EXPECT_EQ(Refused(Replaced(good, "1 5 1 5\n", "1 6 1 5\n")),
              "line 26: found 5 nodes, expected 6, as the section begins");
    EXPECT_EQ(Refused(Replaced(good, "2 3 1 3\n", "2 4 1 3\n")),
              "line 34: found 3 elements, expected 4, as the section begins");
    EXPECT_EQ(Refused(Replaced(good, "1 5 1 5\n", "1 999999999 1 5\n")),
              "line 15: found 999999999 as the number of nodes, expected no more than the file has room for");
    EXPECT_EQ(Refused(Replaced(good, "2 1 3 2 5\n", "2 1 3 2\n")),
              "line 35: found '$EndElements', expected the label of a node");
    EXPECT_EQ(Refused(Replaced(good, "0 1 0\n", "0 x 0\n")), "line 24: found 'x', expected a coordinate");
    EXPECT_EQ(Refused(Replaced(good, "0 1 0\n", "0 nan 0\n"))
                  .find("line 24: found a coordinate of node 3 that is no number"),
              0u);
}

TEST(BadInput, KindsAndPartsOfMsh_ThatNoElementStandsFor_AreRefused) {
    const std::string good = TwoTetrahedra();
    EXPECT_EQ(Refused(Replaced(good, "3 9 4 2\n", "3 9 29 2\n"))
                  .find("line 32: found elements of type 29, expected points, lines"),
              0u);
    EXPECT_EQ(
        Refused(Replaced(good, "$Nodes\n", "$PartitionedEntities\n1\n$EndPartitionedEntities\n$Nodes\n")),
        "line 14: found a section $PartitionedEntities, expected a mesh in one piece, without partitions and "
        "ghost cells");
    EXPECT_EQ(Refused("$MeshFormat\n2.2 0 8\n$EndMeshFormat\n$Nodes\n1\n1 0 0 0\n$EndNodes\n$Elements\n1\n1 "
                      "15 4 1 1 1 3 1\n$EndElements\n"),
              "line 10: found an element in a partition, expected a mesh in one piece, without partitions "
              "and ghost cells");
    EXPECT_EQ(
        Refused("$MeshFormat\n2.2 0 8\n$EndMeshFormat\n$Nodes\n0\n$EndNodes\n$Elements\n0\n$EndElements\n"),
        "the file has no nodes, expected a mesh");
}

TEST(BadInput, ParametricCoordinatesOfMsh_AreLeftOutAndTold) {
    const msf_Mesh mesh = MeshOf(
        Replaced(Replaced(TwoTetrahedra(), "3 9 0 5\n", "2 7 1 5\n"), "0 0 0\n1 0 0\n0 1 0\n0 0 1\n0 0 -1\n",
                 "0 0 0 .1 .2\n1 0 0 .1 .2\n0 1 0 .1 .2\n0 0 1 .1 .2\n0 0 -1 .1 .2\n"));
    EXPECT_EQ(mesh.coordinates, MeshOf(TwoTetrahedra()).coordinates);
    EXPECT_EQ(mesh.notes, (std::vector<std::string>{"the parametric coordinates of 5 nodes were left out"}));
}

TEST(BadInput, Vtu_UnclosedTagsAndWrongSizes_AreRefused) {
    const std::string good = kVtu;
    EXPECT_EQ(MeshOf(good).NumCells(), 1);
    EXPECT_EQ(Refused(Replaced(good, "</Cells>", "")).find("line 1: found XML that can't be read"), 0u);
    EXPECT_EQ(Refused(Replaced(good, "LittleEndian", "BigEndian")),
              "line 1: element VTKFile: found numbers in byte order 'BigEndian', expected 'LittleEndian'");
    EXPECT_EQ(Refused(Replaced(good, "UnstructuredGrid\" byte", "PolyData\" byte")),
              "line 1: element VTKFile: found a file of type 'PolyData', expected 'UnstructuredGrid'");
    EXPECT_EQ(Refused(Replaced(good, "NumberOfPoints=\"3\"", "NumberOfPoints=\"4\"")),
              "line 1: element Piece: found 9 coordinates for 4 points, expected three for each");
    EXPECT_EQ(Refused(Replaced(good, "0 1 2<", "0 1 3<")),
              "cell 0: found point 3, expected one of 3, from 0");
    EXPECT_EQ(Refused(Replaced(good, ">3</DataArray>", ">4</DataArray>")),
              "cell 0: found 4 nodes of a cell of type 5, expected 3 in the list of nodes");
    EXPECT_EQ(Refused(Replaced(good, ">5</DataArray>", ">42</DataArray>"))
                  .find("cell 0: found a cell of type 42, expected a vertex"),
              0u);
    EXPECT_EQ(
        Refused(Replaced(good, "</Piece>", "</Piece><Piece NumberOfPoints=\"1\" NumberOfCells=\"1\"/>")),
        "line 1: element Piece: found a second piece, expected a mesh in one piece, without partitions and "
        "ghost cells");
    EXPECT_EQ(Refused(Replaced(good, "</Piece>",
                               "<CellData><DataArray type=\"UInt8\" Name=\"vtkGhostType\" "
                               "format=\"ascii\">1</DataArray></CellData></Piece>")),
              "cell 0: found a ghost cell, expected a mesh in one piece, without partitions and ghost cells");
    EXPECT_EQ(Refused(Replaced(good, "byte_order", "compressor=\"vtkLZ4DataCompressor\" byte_order"))
                  .find("line 1: element VTKFile: found data compressed by 'vtkLZ4DataCompressor'"),
              0u);
}

TEST(BadInput, Vtu_CompressedBlockThatLiesAboutItsSize_IsRefusedWithoutTheMemory) {
    // One block that is to give two gigabytes, of 8 bytes.
    const auto number = [](std::uint32_t value) {
        return std::string(reinterpret_cast<const char*>(&value), 4);
    };
    const std::string data = number(1) + number(0x7FFFFFFF) + number(0) + number(8) + "abcdefgh";
    std::string text = Replaced(kVtu, "byte_order", "compressor=\"vtkZLibDataCompressor\" byte_order");
    text = Replaced(text, "format=\"ascii\">0 0 0 1 0 0 0 1 0</DataArray>",
                    "format=\"appended\" offset=\"0\"></DataArray>");
    text =
        Replaced(text, "</VTKFile>", "<AppendedData encoding=\"raw\">_" + data + "</AppendedData></VTKFile>");
    EXPECT_EQ(Refused(text), "line 1: element DataArray: found a block of 8 bytes that is to give "
                             "2147483647, expected a size that can be");
}

TEST(BadInput, Universal_WrongNodesTypesAndEnds_AreRefused) {
    const std::string nodes =
        "    -1\n  2411\n         1         1         1        11\n   0.0D+00   0.0D+00   0.0D+00\n    -1\n";
    EXPECT_EQ(Refused(nodes + "    -1\n  2412\n         1       111         1         1         7         "
                              "4\n         1         1         1         2\n    -1\n"),
              "line 9: found node 2, expected the label of a node of the file");
    EXPECT_EQ(
        Refused(nodes + "    -1\n  2412\n         1       117         1         1         7        32\n"),
        "line 9: found the end of the file in dataset 2412, expected -1 at its end");
    EXPECT_EQ(Refused(nodes + "    -1\n  2412\n         1       111         1         1         7         "
                              "5\n         1\n    -1\n"),
              "line 8: found 5 nodes of an element of type 111, expected 4");
    EXPECT_EQ(Refused(nodes + "    -1\n  2412\n         1       114         1         1         7         "
                              "5\n         1\n    -1\n")
                  .find("line 8: found an element of type 114"),
              0u);
    EXPECT_EQ(Refused("    -1\n  2411\n    -1\n"), "the file has no nodes, expected a mesh");
}

TEST(BadInput, Stl_WrongWords_AreRefused) {
    EXPECT_EQ(Refused("solid a\nfacet normal 0 0 1\nouter loop\nvertex 0 0 0\nvertex 1 0 0\nvertex 0 "
                      "1\nendloop\nendfacet\nendsolid\n"),
              "line 7: found 'endloop', expected a coordinate");
    EXPECT_EQ(Refused("solid a\nendsolid a\n"), "the file has no nodes, expected a mesh");
}
