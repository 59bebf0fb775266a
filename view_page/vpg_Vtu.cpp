#include "view_page/vpg_Vtu.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "view_page/vpg_Layout.h"
#include "view_page/vpg_Values.h"

#include <cstdint>

namespace {

/// What the format calls the kinds of cells, in their order.
constexpr std::uint8_t kTypes[cel_kKinds] = {1, 3, 21, 5, 22, 9, 23, 28, 10, 24, 14, 27, 13, 26, 12, 25, 29};
constexpr std::uint8_t kPoints = 2;
/// The format's order where it isn't the deck's: the middles of the faces come before the body's.
constexpr std::int8_t kHexahedron27[7] = {26, 24, 23, 25, 21, 22, 20};

template <class T>
std::string BytesOf(const std::vector<T>& items) {
    return {reinterpret_cast<const char*>(items.data()), items.size() * sizeof(T)};
}

/// One array of the file; its bytes are made when they are written, so that only one array is held at a time.
struct Array {
    std::string type;
    std::string name;
    int components;
    std::uint64_t bytes;
    std::function<std::string()> make;
};

class Grid {
public:
    explicit Grid(const odb_Odb& odb) : layout_(odb, odb.DeckModelName()) {
        for (const vpg_Layout::Shown& shown : layout_.All()) {
            firstPoint_.push_back(points_);
            firstCell_.push_back(cells_);
            points_ += vpg_Index(layout_.MeshOf(shown).NumNodes());
            cells_ += vpg_Index(layout_.MeshOf(shown).Mesh().NumElements());
            for (const odiK_ElementClass& elements : layout_.MeshOf(shown).Mesh().Classes()) {
                ends_ += NodesOf(elements) * vpg_Index(elements.NumElements());
            }
        }
        CollectSets();
    }

    void Write(const std::function<void(std::string_view)>& out) {
        out("<?xml version=\"1.0\"?>\n<VTKFile type=\"UnstructuredGrid\" version=\"1.0\" "
            "byte_order=\"LittleEndian\" header_type=\"UInt64\">\n<UnstructuredGrid>\n");
        out(FieldData());
        out("<Piece NumberOfPoints=\"" + std::to_string(points_) + "\" NumberOfCells=\"" +
            std::to_string(cells_) + "\">\n");
        Section(out, "Points", {{"Float32", "Points", 3, points_ * 12, [this] { return Points(); }}});
        Section(out, "Cells",
                {{"Int32", "connectivity", 1, ends_ * 4, [this] { return Connectivity(); }},
                 {"Int64", "offsets", 1, cells_ * 8, [this] { return Offsets(); }},
                 {"UInt8", "types", 1, cells_, [this] { return Types(); }}});
        std::vector<Array> cells{
            {"Int32", "Element", 1, cells_ * 4, [this] { return ElementLabels(); }},
            {"Int32", "Instance", 1, cells_ * 4, [this] { return Instances(); }},
            {"Int32", "Section", 1, cells_ * 4, [this] { return BytesOf(Sections()); }},
            {"Int32", "Material", 1, cells_ * 4, [this] { return BytesOf(Materials()); }}};
        std::vector<Array> points{{"Int32", "Node", 1, points_ * 4, [this] { return NodeLabels(); }}};
        for (const auto& [name, members] : sets_[0]) points.push_back(FlagsOf(name, members, points_));
        for (const auto& [name, members] : sets_[1]) cells.push_back(FlagsOf(name, members, cells_));
        Section(out, "CellData", std::move(cells));
        Section(out, "PointData", std::move(points));
        out("</Piece>\n</UnstructuredGrid>\n<AppendedData encoding=\"raw\">\n_");
        for (const Array& array : arrays_) {
            out({reinterpret_cast<const char*>(&array.bytes), sizeof array.bytes});
            out(array.make());
        }
        out("\n</AppendedData>\n</VTKFile>\n");
    }

private:
    /// What lies in one of the things shown, of a set of one name.
    struct Members {
        std::size_t shown;
        res_SetTypeEnm type;
        std::vector<rgnC_SubsetData> subsets;
    };
    using Sets = std::map<std::string, std::vector<Members>>;

    static std::size_t NodesOf(const odiK_ElementClass& elements) {
        const cel_Cell* cell = vpg_CellOf(elements);
        return vpg_Index(cell == nullptr ? elements.nodesPerElement : cell->nodes);
    }
    static int PlaceInRow(const cel_Cell* cell, int i) {
        const bool turned = cell != nullptr && cell->kind == cel_KindEnm::HEXAHEDRON27 && i >= 20;
        return turned ? kHexahedron27[i - 20] : i;
    }
    /// Calls `visit(place among all that is shown, elements of a class)`.
    template <class Visit>
    void ForEachClass(const Visit& visit) const {
        for (std::size_t i = 0; i < layout_.All().size(); ++i) {
            for (const odiK_ElementClass& elements : layout_.MeshOf(layout_.All()[i]).Mesh().Classes()) {
                visit(i, elements);
            }
        }
    }

    void CollectSets() {
        const odiK_Model& model = layout_.Model();
        for (std::size_t i = 0; i < layout_.All().size(); ++i) {
            for (const auto& set : layout_.MeshOf(layout_.All()[i]).Mesh().Sets()) {
                SetsOf(*set)[vpg_Text(set->name)].push_back({i, set->type, set->subsets});
            }
        }
        std::map<int, std::size_t> shownOf;
        for (std::size_t i = 0; i < layout_.All().size(); ++i) {
            const odiK_Instance* instance = layout_.All()[i].instance;
            shownOf[instance == nullptr ? 0 : instance->meshIndex] = i;
        }
        for (const auto& set : model.AssemblySets()) {
            for (const rgnC_SubsetData& subset : set->subsets) {
                const auto shown = shownOf.find(subset.meshIndex);
                if (shown == shownOf.end()) continue;
                SetsOf(*set)["Assembly." + vpg_Text(set->name)].push_back(
                    {shown->second, set->type, {subset}});
            }
        }
    }
    Sets& SetsOf(const odiK_Set& set) { return sets_[set.type == res_SetTypeEnm::NODES ? 0 : 1]; }

    void Section(const std::function<void(std::string_view)>& out, const char* name,
                 std::vector<Array> arrays) {
        out(std::string("<") + name + ">\n");
        for (Array& array : arrays) {
            out("<DataArray type=\"" + array.type + "\" Name=\"" + vpg_Escaped(array.name) +
                "\" NumberOfComponents=\"" + std::to_string(array.components) +
                "\" format=\"appended\" offset=\"" + std::to_string(offset_) + "\"/>\n");
            offset_ += array.bytes + sizeof array.bytes;
            arrays_.push_back(std::move(array));
        }
        out(std::string("</") + name + ">\n");
    }

    std::string FieldData() const {
        std::vector<std::string> instances;
        std::vector<std::string> sections;
        std::vector<std::string> materials;
        for (const vpg_Layout::Shown& shown : layout_.All()) instances.push_back(shown.name);
        for (const auto& [name, section] : layout_.Model().sections) sections.push_back(vpg_Text(name));
        for (const auto& [name, material] : layout_.Model().materials) materials.push_back(vpg_Text(name));
        return "<FieldData>\n" + Names("Instances", instances) + Names("Sections", sections) +
               Names("Materials", materials) + "</FieldData>\n";
    }
    /// Texts stand as the numbers of their bytes, each text with a zero behind it.
    static std::string Names(const char* name, const std::vector<std::string>& names) {
        std::string text = std::string("<DataArray type=\"String\" Name=\"") + name + "\" NumberOfTuples=\"" +
                           std::to_string(names.size()) + "\" format=\"ascii\">\n";
        for (const std::string& each : names) {
            for (const char c : each) text += std::to_string(static_cast<unsigned char>(c)) + " ";
            text += "0\n";
        }
        return text + "</DataArray>\n";
    }

    std::string Points() const {
        std::vector<float> points;
        points.reserve(points_ * 3);
        for (const vpg_Layout::Shown& shown : layout_.All()) {
            const vpg_Mesh& mesh = layout_.MeshOf(shown);
            for (int i = 0; i < mesh.NumNodes(); ++i) {
                const std::array<float, 3> xyz = mesh.Place(i);
                const gsl_Point place = shown.placement.Apply(gsl_Point(
                    static_cast<double>(xyz[0]), static_cast<double>(xyz[1]), static_cast<double>(xyz[2])));
                for (const double x : {place.X(), place.Y(), place.Z()})
                    points.push_back(static_cast<float>(x));
            }
        }
        return BytesOf(points);
    }
    std::string Connectivity() const {
        std::vector<std::int32_t> ends;
        ends.reserve(ends_);
        ForEachClass([&](std::size_t shown, const odiK_ElementClass& elements) {
            const cel_Cell* cell = vpg_CellOf(elements);
            const int* row = elements.connectivity.data();
            for (int i = 0; i < elements.NumElements(); ++i, row += elements.nodesPerElement) {
                for (int k = 0; k < static_cast<int>(NodesOf(elements)); ++k) {
                    ends.push_back(static_cast<std::int32_t>(firstPoint_[shown]) + row[PlaceInRow(cell, k)]);
                }
            }
        });
        return BytesOf(ends);
    }
    std::string Offsets() const {
        std::vector<std::int64_t> offsets;
        std::int64_t end = 0;
        ForEachClass([&](std::size_t, const odiK_ElementClass& elements) {
            for (int i = 0; i < elements.NumElements(); ++i) {
                end += static_cast<std::int64_t>(NodesOf(elements));
                offsets.push_back(end);
            }
        });
        return BytesOf(offsets);
    }
    std::string Types() const {
        std::string types;
        ForEachClass([&](std::size_t, const odiK_ElementClass& elements) {
            const cel_Cell* cell = vpg_CellOf(elements);
            const std::uint8_t type = cell == nullptr ? kPoints : kTypes[static_cast<int>(cell->kind)];
            types.append(vpg_Index(elements.NumElements()), static_cast<char>(type));
        });
        return types;
    }
    std::string ElementLabels() const {
        std::string labels;
        ForEachClass(
            [&](std::size_t, const odiK_ElementClass& elements) { labels += BytesOf(elements.labels); });
        return labels;
    }
    std::string Instances() const {
        std::vector<std::int32_t> places;
        ForEachClass([&](std::size_t shown, const odiK_ElementClass& elements) {
            places.insert(places.end(), vpg_Index(elements.NumElements()), static_cast<std::int32_t>(shown));
        });
        return BytesOf(places);
    }
    std::vector<std::int32_t> Sections() const {
        std::vector<std::int32_t> sections;
        sections.reserve(cells_);
        for (const vpg_Layout::Shown& shown : layout_.All()) {
            const std::vector<std::int16_t> ofElements = layout_.SectionsOfElements(shown);
            sections.insert(sections.end(), ofElements.begin(), ofElements.end());
        }
        return sections;
    }
    std::vector<std::int32_t> Materials() const {
        std::map<cow_String, int> placeOf;
        for (const auto& [name, material] : layout_.Model().materials) {
            placeOf.emplace(name, static_cast<int>(placeOf.size()));
        }
        std::vector<std::int32_t> ofSection;
        for (const auto& [name, section] : layout_.Model().sections) {
            const auto material = placeOf.find(section.MaterialName());
            ofSection.push_back(material == placeOf.end() ? -1 : material->second);
        }
        std::vector<std::int32_t> materials = Sections();
        for (std::int32_t& place : materials) {
            if (place >= 0) place = ofSection[vpg_Index(place)];
        }
        return materials;
    }
    std::string NodeLabels() const {
        std::vector<std::int32_t> labels;
        for (const vpg_Layout::Shown& shown : layout_.All()) {
            const vpg_Mesh& mesh = layout_.MeshOf(shown);
            for (int i = 0; i < mesh.NumNodes(); ++i) labels.push_back(mesh.Mesh().Nodes().Label(i));
        }
        return BytesOf(labels);
    }

    Array FlagsOf(const std::string& name, const std::vector<Members>& members, std::size_t size) const {
        return {"UInt8", name, 1, size, [this, &members, size] {
                    std::string flags(size, '\0');
                    for (const Members& each : members) Mark(each, flags);
                    return flags;
                }};
    }
    void Mark(const Members& members, std::string& flags) const {
        const vpg_Mesh& mesh = layout_.MeshOf(layout_.All()[members.shown]);
        if (members.type != res_SetTypeEnm::NODES) {
            vpg_ForEachElement(mesh.Mesh(), members.subsets, [&](int element) {
                flags[firstCell_[members.shown] + vpg_Index(element)] = 1;
            });
            return;
        }
        for (const rgnC_SubsetData& subset : members.subsets) {
            for (int i = 0; i < subset.subset.Length(); ++i) {
                flags[firstPoint_[members.shown] + vpg_Index(subset.subset.UncheckedConstGet(i))] = 1;
            }
        }
    }

    vpg_Layout layout_;
    std::vector<std::size_t> firstPoint_;
    std::vector<std::size_t> firstCell_;
    std::size_t points_ = 0;
    std::size_t cells_ = 0;
    std::size_t ends_ = 0;
    /// Of nodes, and of elements and facets.
    Sets sets_[2];
    std::vector<Array> arrays_;
    std::uint64_t offset_ = 0;
};

} // namespace

void vpg_WriteVtu(const odb_Odb& odb, const std::function<void(std::string_view)>& out) {
    // Completes the model, and raises when that can't be.
    const ddb_Model view = odb.ddb().model(odb.DeckModelName());
    Grid(odb).Write(out);
}
