#include "mesh_file/msf_Apart.h"
#include "mesh_file/msf_Builder.h"
#include "mesh_file/msf_Readers.h"

#ifdef QRX_HAS_HDF5
#include <algorithm>
#include <hdf5.h>

namespace {

/// An identifier of the library, closed at the end.
class Handle {
public:
    Handle(hid_t id, herr_t (*close)(hid_t)) : id_(id), close_(close) {}
    Handle(Handle&& other) noexcept : id_(other.id_), close_(other.close_) { other.id_ = -1; }
    Handle(const Handle&) = delete;
    Handle& operator=(const Handle&) = delete;
    Handle& operator=(Handle&&) = delete;
    ~Handle() {
        if (id_ >= 0) close_(id_);
    }
    hid_t Id() const { return id_; }
    bool IsThere() const { return id_ >= 0; }

private:
    hid_t id_;
    herr_t (*close_)(hid_t);
};

struct CellType {
    const char* name;
    int code;
};
constexpr CellType kMedTypes[] = {{"PO1", 1},   {"SE2", 102}, {"SE3", 103}, {"TR3", 203}, {"TR6", 206},
                                  {"TR7", 207}, {"QU4", 204}, {"QU8", 208}, {"QU9", 209}, {"TE4", 304},
                                  {"T10", 310}, {"PY5", 305}, {"P13", 313}, {"PE6", 306}, {"P15", 315},
                                  {"P18", 318}, {"HE8", 308}, {"H20", 320}, {"H27", 327}};

/// A family: cells or nodes that are in the same groups. Those of cells have negative numbers, those of nodes
/// positive.
using Families = std::map<long long, std::vector<std::string>>;

class MedReader {
public:
    MedReader(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh)
        : input_(input), options_(options), builder_(mesh, options), file_(Open(input)) {}

    void Read();

private:
    static Handle Open(const msf_Input& input);
    Handle Group(const std::string& path) const {
        return {Has(path) ? H5Gopen2(file_.Id(), path.c_str(), H5P_DEFAULT) : -1, H5Gclose};
    }
    bool Has(const std::string& path) const;
    std::vector<std::string> Names(const std::string& path) const;
    long long Attribute(const std::string& path, const char* name, long long byDefault) const;
    std::size_t Length(const Handle& set, const std::string& path, std::size_t bytesEach) const;
    std::vector<long long> Ints(const std::string& path, std::size_t count) const;
    std::string MeshPath();
    void ReadNodes(const std::string& mesh);
    void ReadCells(const std::string& mesh);
    void ReadCellsOf(const std::string& path, const CellType& type);
    void ReadFamilies(const std::string& part);
    std::vector<std::string> GroupNames(const std::string& family) const;
    const std::vector<std::string>* GroupsOf(long long family);

    const msf_Input& input_;
    const msf_Options& options_;
    msf_Builder builder_;
    Handle file_;
    msf_Cursor at_{std::string_view()};
    std::string name_;
    Families families_;
    long long numUnknownFamilies_ = 0;
};

Handle MedReader::Open(const msf_Input& input) {
    // The library's own messages would go to the error stream.
    H5Eset_auto2(H5E_DEFAULT, nullptr, nullptr);
    const Handle access(H5Pcreate(H5P_FILE_ACCESS), H5Pclose);
    hid_t id = -1;
    if (input.path.empty()) {
        H5Pset_fapl_core(access.Id(), 1 << 16, 0);
        H5Pset_file_image(access.Id(), const_cast<char*>(input.bytes.data()), input.bytes.size());
        id = H5Fopen("image", H5F_ACC_RDONLY, access.Id());
    } else {
        id = H5Fopen(input.path.c_str(), H5F_ACC_RDONLY, access.Id());
    }
    if (id < 0) msf_Fail("", "the HDF5 library can't open the file", "a whole MED file");
    return {id, H5Fclose};
}

/// Whether all parts of the path are there.
bool MedReader::Has(const std::string& path) const {
    for (std::size_t end = path.find('/', 1);; end = path.find('/', end + 1)) {
        const std::string part = path.substr(0, end);
        if (H5Lexists(file_.Id(), part.c_str(), H5P_DEFAULT) <= 0) return false;
        if (end == std::string::npos) return H5Oexists_by_name(file_.Id(), path.c_str(), H5P_DEFAULT) > 0;
    }
}

std::vector<std::string> MedReader::Names(const std::string& path) const {
    const Handle group = Group(path);
    std::vector<std::string> names;
    H5G_info_t info;
    if (!group.IsThere() || H5Gget_info(group.Id(), &info) < 0) return names;
    for (hsize_t i = 0; i < info.nlinks; ++i) {
        char name[1024];
        const ssize_t length = H5Lget_name_by_idx(group.Id(), ".", H5_INDEX_NAME, H5_ITER_INC, i, name,
                                                  sizeof name, H5P_DEFAULT);
        if (length > 0) names.emplace_back(name);
    }
    return names;
}

long long MedReader::Attribute(const std::string& path, const char* name, long long byDefault) const {
    if (!Has(path) || H5Aexists_by_name(file_.Id(), path.c_str(), name, H5P_DEFAULT) <= 0) return byDefault;
    const Handle attribute(H5Aopen_by_name(file_.Id(), path.c_str(), name, H5P_DEFAULT, H5P_DEFAULT),
                           H5Aclose);
    if (!attribute.IsThere()) return byDefault;
    const Handle space(H5Aget_space(attribute.Id()), H5Sclose);
    const Handle type(H5Aget_type(attribute.Id()), H5Tclose);
    long long value = byDefault;
    if (H5Sget_simple_extent_npoints(space.Id()) != 1 || H5Tget_class(type.Id()) != H5T_INTEGER)
        return byDefault;
    return H5Aread(attribute.Id(), H5T_NATIVE_LLONG, &value) < 0 ? byDefault : value;
}

std::size_t MedReader::Length(const Handle& set, const std::string& path, std::size_t bytesEach) const {
    const Handle space(set.IsThere() ? H5Dget_space(set.Id()) : -1, H5Sclose);
    const hssize_t points = space.IsThere() ? H5Sget_simple_extent_npoints(space.Id()) : -1;
    if (points < 0) msf_Fail(path, "found no dataset", "one");
    // Compressed data may be a good deal larger than the file, but not without bounds.
    if (static_cast<unsigned long long>(points) > (100ULL * input_.bytes.size() + 4096) / bytesEach) {
        msf_Fail(path, "found " + std::to_string(points) + " numbers", "no more than the file has room for");
    }
    return static_cast<std::size_t>(points);
}

std::vector<long long> MedReader::Ints(const std::string& path, std::size_t count) const {
    const Handle set(Has(path) ? H5Dopen2(file_.Id(), path.c_str(), H5P_DEFAULT) : -1, H5Dclose);
    std::vector<long long> numbers(Length(set, path, 4));
    const Handle type(H5Dget_type(set.Id()), H5Tclose);
    if (H5Tget_class(type.Id()) != H5T_INTEGER) msf_Fail(path, "found no whole numbers", "them");
    if (numbers.size() != count)
        msf_Fail(path, "found " + std::to_string(numbers.size()) + " numbers", std::to_string(count));
    if (count > 0 && H5Dread(set.Id(), H5T_NATIVE_LLONG, H5S_ALL, H5S_ALL, H5P_DEFAULT, numbers.data()) < 0)
        msf_Fail(path, "found data that can't be read", "whole numbers");
    return numbers;
}

/// Where nodes and cells stand: below the mesh in old files, below its last step in newer ones.
std::string MedReader::MeshPath() {
    const std::vector<std::string> meshes = Names("/ENS_MAA");
    std::string known;
    for (const std::string& mesh : meshes) known += (known.empty() ? "" : ", ") + msf_Shown(mesh);
    if (meshes.empty()) msf_Fail("/ENS_MAA", "found no mesh", "one");
    name_ = options_.part.empty() ? meshes.front() : options_.part;
    if (std::find(meshes.begin(), meshes.end(), name_) == meshes.end())
        msf_Fail("/ENS_MAA", "found no mesh " + msf_Shown(name_), "one of " + known);
    if (options_.part.empty() && meshes.size() > 1) {
        msf_Fail("/ENS_MAA", "found " + std::to_string(meshes.size()) + " meshes",
                 "\"part\" with one of " + known);
    }
    const std::string mesh = "/ENS_MAA/" + name_;
    if (Has(mesh + "/NOE")) return mesh;
    const std::vector<std::string> steps = Names(mesh);
    for (auto step = steps.rbegin(); step != steps.rend(); ++step) {
        if (Has(mesh + "/" + *step + "/NOE")) return mesh + "/" + *step;
    }
    msf_Fail(mesh, "found no nodes", "an unstructured mesh");
}

void MedReader::Read() {
    const std::string mesh = MeshPath();
    builder_.Mesh().format = "MED " + std::to_string(Attribute("/INFOS_GENERALES", "MAJ", 0)) + "." +
                             std::to_string(Attribute("/INFOS_GENERALES", "MIN", 0));
    // Old files have the families below the mesh's name, or all in one place.
    for (const std::string& part :
         {"/FAS/" + name_, std::string("/FAS/") + name_ + "/ELEME", std::string("/FAS/") + name_ + "/NOEUD"})
        ReadFamilies(part);
    ReadNodes(mesh);
    ReadCells(mesh);
    if (numUnknownFamilies_ > 0)
        builder_.Note(msf_Counted(numUnknownFamilies_, "node or cell") +
                      " of unknown families are in no group");
}

void MedReader::ReadNodes(const std::string& mesh) {
    const std::string path = mesh + "/NOE/COO";
    const Handle set(Has(path) ? H5Dopen2(file_.Id(), path.c_str(), H5P_DEFAULT) : -1, H5Dclose);
    std::vector<double> numbers(Length(set, path, 4));
    const long long space = Attribute("/ENS_MAA/" + name_, "ESP", Attribute("/ENS_MAA/" + name_, "DIM", 3));
    const long long counted =
        Attribute(path, "NBR", static_cast<long long>(numbers.size()) / std::max(1LL, space));
    if (space < 1 || space > 3 || counted < 0 || counted > 0x7FFFFFFF ||
        static_cast<std::size_t>(counted * space) != numbers.size()) {
        msf_Fail(path, "found " + std::to_string(numbers.size()) + " coordinates",
                 std::to_string(space) + " for each of " + std::to_string(counted) + " nodes");
    }
    if (!numbers.empty() &&
        H5Dread(set.Id(), H5T_NATIVE_DOUBLE, H5S_ALL, H5S_ALL, H5P_DEFAULT, numbers.data()) < 0)
        msf_Fail(path, "found data that can't be read", "coordinates");
    const auto count = static_cast<std::size_t>(counted);
    std::vector<long long> labels(count);
    if (Has(mesh + "/NOE/NUM")) {
        labels = Ints(mesh + "/NOE/NUM", count);
    } else {
        for (std::size_t i = 0; i < count; ++i) labels[i] = static_cast<long long>(i) + 1;
    }
    at_.SayPlace(path);
    builder_.ReserveNodes(count);
    // First all x, then all y, then all z.
    const auto coordinate = [&](std::size_t axis, std::size_t i) {
        return axis < static_cast<std::size_t>(space) ? numbers[axis * count + i] : 0.0;
    };
    for (std::size_t i = 0; i < count; ++i)
        builder_.AddNode(at_, labels[i], coordinate(0, i), coordinate(1, i), coordinate(2, i));
    builder_.FinishNodes(at_);
    if (!Has(mesh + "/NOE/FAM")) return;
    const std::vector<long long> families = Ints(mesh + "/NOE/FAM", count);
    for (std::size_t i = 0; i < count; ++i) {
        const std::vector<std::string>* groups = GroupsOf(families[i]);
        if (groups == nullptr) continue;
        for (const std::string& group : *groups)
            builder_.Group(group, 0).nodes.push_back(static_cast<int>(i));
    }
}

void MedReader::ReadCells(const std::string& mesh) {
    for (const std::string& name : Names(mesh + "/MAI")) {
        const auto type = std::find_if(std::begin(kMedTypes), std::end(kMedTypes),
                                       [&](const CellType& each) { return name == each.name; });
        if (type == std::end(kMedTypes))
            msf_Fail(mesh + "/MAI", "found cells of type " + msf_Shown(name),
                     "points, segments, triangles, quadrangles, tetrahedra, hexahedra, prisms or pyramids of "
                     "first or second order");
        ReadCellsOf(mesh + "/MAI/" + name, *type);
    }
}

void MedReader::ReadCellsOf(const std::string& path, const CellType& type) {
    const msf_NodeOrder& order = *msf_FindNodeOrder(msf_FormatEnm::MED, type.code);
    const auto width = static_cast<std::size_t>(order.nodes);
    const std::string nodesPath = path + "/NOD";
    const Handle set(Has(nodesPath) ? H5Dopen2(file_.Id(), nodesPath.c_str(), H5P_DEFAULT) : -1, H5Dclose);
    const std::size_t numbers = Length(set, nodesPath, 4);
    const std::size_t count = numbers / width;
    if (numbers % width != 0)
        msf_Fail(nodesPath, "found " + std::to_string(numbers) + " numbers",
                 std::to_string(width) + " for each cell");
    const std::vector<long long> nodes = Ints(nodesPath, numbers);
    std::vector<long long> labels;
    if (Has(path + "/NUM")) labels = Ints(path + "/NUM", count);
    std::vector<long long> families;
    if (Has(path + "/FAM")) families = Ints(path + "/FAM", count);
    at_.SayPlace(nodesPath);
    const int known = builder_.Mesh().NumNodes();
    const int block = builder_.BlockOf(order.kind);
    std::vector<int> row(width);
    for (std::size_t cell = 0; cell < count; ++cell) {
        // First the first nodes of all cells, then the second ones; nodes by place, not by label.
        for (std::size_t i = 0; i < width; ++i) {
            const long long node = nodes[i * count + cell];
            if (node < 1 || node > known)
                msf_Fail(nodesPath,
                         "found node " + std::to_string(node) + " of cell " + std::to_string(cell + 1),
                         "one of " + std::to_string(known));
            row[i] = static_cast<int>(node) - 1;
        }
        const long long label = labels.empty() ? static_cast<long long>(cell) + 1 : labels[cell];
        const int place = builder_.AddCell(at_, order, label, row.data());
        const std::vector<std::string>* groups = families.empty() ? nullptr : GroupsOf(families[cell]);
        if (groups == nullptr) continue;
        for (const std::string& group : *groups) builder_.AddToGroup(group, block, place);
    }
}

void MedReader::ReadFamilies(const std::string& part) {
    for (const std::string& family : Names(part)) {
        const std::string path = part + "/" + family;
        const long long number = Attribute(path, "NUM", 0);
        if (number != 0) families_[number] = GroupNames(path + "/GRO/NOM");
    }
}

/// Names of 80 bytes, one behind the other.
std::vector<std::string> MedReader::GroupNames(const std::string& path) const {
    constexpr std::size_t kLength = 80;
    std::vector<std::string> names;
    if (!Has(path)) return names;
    const Handle set(H5Dopen2(file_.Id(), path.c_str(), H5P_DEFAULT), H5Dclose);
    if (!set.IsThere()) return names;
    const Handle type(H5Dget_type(set.Id()), H5Tclose);
    const std::size_t bytes =
        H5Tget_size(type.Id()) * Length(set, path, std::max<std::size_t>(1, H5Tget_size(type.Id())));
    // Of strings, those of variable length are pointers in memory.
    H5T_class_t kind = H5Tget_class(type.Id());
    if (kind == H5T_ARRAY) kind = H5Tget_class(Handle(H5Tget_super(type.Id()), H5Tclose).Id());
    const bool text80 = kind == H5T_INTEGER || (kind == H5T_STRING && H5Tis_variable_str(type.Id()) == 0);
    if (bytes % kLength != 0 || !text80)
        msf_Fail(path, "found " + std::to_string(bytes) + " bytes", "names of 80 bytes each");
    std::string names80(bytes, '\0');
    if (bytes > 0 && H5Dread(set.Id(), type.Id(), H5S_ALL, H5S_ALL, H5P_DEFAULT, names80.data()) < 0)
        msf_Fail(path, "found data that can't be read", "names of groups");
    for (std::size_t i = 0; i < bytes; i += kLength) {
        const std::string name = msf_Builder::NameOf(std::string_view(names80).substr(i, kLength));
        if (!name.empty()) names.push_back(name);
    }
    return names;
}

const std::vector<std::string>* MedReader::GroupsOf(long long family) {
    if (family == 0) return nullptr;
    const auto entry = families_.find(family);
    if (entry != families_.end()) return &entry->second;
    ++numUnknownFamilies_;
    return nullptr;
}

} // namespace

void msf_ReadMed(const msf_Input& input, const msf_Options& options, msf_Mesh& mesh) {
    const auto readHere = [](const msf_Input& file, const msf_Options& asked, msf_Mesh& read) {
        MedReader(file, asked, read).Read();
    };
    msf_ReadApart(readHere, input, options, mesh);
}

#else

void msf_ReadMed(const msf_Input&, const msf_Options&, msf_Mesh&) {
    msf_Fail("", "found an HDF5 file (MED), and this program was built without HDF5",
             "a program built where HDF5 is installed, or the mesh as MSH, VTU, VTK or UNV");
}

#endif

bool msf_IsMed(std::string_view bytes) {
    return bytes.starts_with("\x89HDF\r\n\x1a\n");
}
