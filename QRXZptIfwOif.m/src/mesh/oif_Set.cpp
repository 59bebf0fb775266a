#include "mesh/oif_Set.h"

#include "base/oif_KeywordLine.h"
#include "foundation/omi_BlkBitVect.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "store_interface/model/odiK_Mesh.h"

namespace {

constexpr std::size_t kLabelsOfLine = 16;

// Facet ids of a shell; the double side has no name.
constexpr int kShellTop = 0;
constexpr int kShellBottom = 1;
constexpr int kShellBothSides = 6;

// Label by label; -1 drops nothing, entries are checked when sets enter the store.
int LabelOf(int entry, const std::vector<int>& labels) {
    if (entry < 0 || entry >= static_cast<int>(labels.size())) {
        cow_RaiseOutOfRange(entry, static_cast<int>(labels.size()));
    }
    return labels[static_cast<std::size_t>(entry)];
}

/// The nodes or elements of a set that lie in one mesh.
class MeshLabels final : public oif_LabelSource {
public:
    MeshLabels(const rgnC_SetData& setData, const ddb_Mesh& mesh) : setData_(setData), mesh_(mesh) {}

    /// How many labels there are at most: nodes that the mesh doesn't have aren't looked for.
    long long Most() const {
        long long most = 0;
        for (const int i : setData_.SubSetsIn(mesh_.meshIndex())) most += setData_.SubSet(i).subset.Length();
        return most;
    }
    void ForEachPiece(const Take& take) const override {
        oif_LabelPieces pieces(take);
        const bool nodes = setData_.Kind() == static_cast<int>(res_SetTypeEnm::NODES);
        for (const int i : setData_.SubSetsIn(mesh_.meshIndex())) {
            const rgnC_SubsetData subset = setData_.SubSet(i);
            if (nodes) {
                AddNodes(subset, pieces);
            } else if (subset.ClassIndex() >= 0) {
                AddElements(subset, pieces);
            }
        }
        pieces.HandOn();
    }

private:
    void AddNodes(const rgnC_SubsetData& subset, oif_LabelPieces& pieces) const {
        cow_List<int> labels;
        mesh_.nodeData().GetUserNodeLabels(labels);
        ForEachEntry(subset, [&](int entry) {
            // A node that the mesh doesn't have is dropped silently.
            if (entry >= 0 && entry < labels.Length()) pieces.Add(labels.UncheckedConstGet(entry));
        });
    }
    void AddElements(const rgnC_SubsetData& subset, oif_LabelPieces& pieces) const {
        const std::vector<int>& labels =
            mesh_.mesh().Classes().at(static_cast<std::size_t>(subset.ClassIndex())).labels;
        ForEachEntry(subset, [&](int entry) { pieces.Add(LabelOf(entry, labels)); });
    }
    template <class Visitor>
    static void ForEachEntry(const rgnC_SubsetData& subset, const Visitor& visit) {
        for (int i = 0; i < subset.subset.Length();) {
            int length = 0;
            const int* run = subset.subset.ConstRun(i, length);
            for (int k = 0; k < length; ++k) visit(run[k]);
            i += length;
        }
    }

    rgnC_SetData setData_;
    ddb_Mesh mesh_;
};

/// Labels in ascending order, each once.
class SortedLabels final : public oif_LabelSource {
public:
    void Add(int label) { bits_.SetBit(label); }
    void ForEachPiece(const Take& take) const override {
        oif_LabelPieces pieces(take);
        omi_BlkBitVectTrav traversal(bits_);
        for (int label = traversal.First(); label >= 0; label = traversal.Next()) pieces.Add(label);
        pieces.HandOn();
    }

private:
    omi_BlkBitVect bits_;
};

/// Sixteen labels a line.
char* WriteLines(std::span<const int> labels, char* out) {
    std::size_t place = 0;
    for (const int label : labels) {
        out = num_WriteInt(out, label, 0);
        const bool last = ++place == labels.size();
        if (place % kLabelsOfLine == 0 || last) {
            // A lone label on its line has a comma and a blank behind it.
            if (place % kLabelsOfLine == 1) {
                *out++ = ',';
                *out++ = ' ';
            }
            *out++ = '\n';
        } else {
            *out++ = ',';
        }
    }
    return out;
}

} // namespace

oif_Set::oif_Set(const rgnC_SetData& setData, const ddb_Assembly& assembly) {
    if (assembly.hasMesh()) ComputeData(setData, assembly.mesh());
}

oif_Set::oif_Set(const rgnC_SetData& setData, const ddb_PartInstance& instance) {
    ComputeData(setData, instance.mesh());
}

void oif_Set::ComputeData(const rgnC_SetData& setData, const ddb_Mesh& mesh) {
    // A set of a shared mesh has the same labels in every instance: they are worked out once.
    const auto& kept = setData.Object().resolved;
    if (const odiK_Set::Resolved* resolved = setData.LiesInOneMesh() ? kept.Get() : nullptr) {
        labels_ = oif_SetLabels(resolved->labels);
        faces_ = resolved->faces;
        return;
    }
    cow_List<int> list;
    if (setData.Kind() == static_cast<int>(res_SetTypeEnm::FACETS)) {
        for (const int i : setData.SubSetsIn(mesh.meshIndex())) {
            const rgnC_SubsetData subset = setData.SubSet(i);
            if (subset.ClassIndex() < 0) continue;
            AppendFacets(list, subset,
                         mesh.mesh().Classes().at(static_cast<std::size_t>(subset.ClassIndex())));
        }
    } else {
        const MeshLabels labels(setData, mesh);
        const long long most = labels.Most();
        if (most > oif_SetLabels::kLongestList) {
            labels_ = oif_SetLabels(std::make_shared<MeshLabels>(labels));
            return;
        }
        list = oif_ListOf(labels, static_cast<int>(most));
    }
    labels_ = oif_SetLabels(list);
    if (setData.LiesInOneMesh()) {
        kept.Keep(std::unique_ptr<odiK_Set::Resolved>(new odiK_Set::Resolved{list, faces_}));
    }
}

void oif_Set::AppendFacets(cow_List<int>& labels, const rgnC_SubsetData& subset,
                           const odiK_ElementClass& elements) {
    if (subset.subset.IsEmpty() || subset.facetIds.IsEmpty()) return;
    for (const int entry : subset.subset) labels.Append(LabelOf(entry, elements.labels));
    const ddb_FaceRule rule = ddb_FaceRuleOf(elements.shape);
    // One text a face, shared by all facets that have it.
    std::vector<cow_String> names;
    const auto numbered = [&](int id) {
        constexpr int most = 64;
        if (id < 0 || id >= most) return cow_String(rule.prefix) + cow_String(id + 1);
        while (static_cast<int>(names.size()) <= id) {
            names.push_back(cow_String(rule.prefix) + cow_String(static_cast<int>(names.size()) + 1));
        }
        return names[static_cast<std::size_t>(id)];
    };
    const cow_String top("SPOS");
    const cow_String bottom("SNEG");
    cow_List<cow_String> faces{cow_ListConstruct(subset.facetIds.Length())};
    for (int j = 0; j < subset.facetIds.Length(); ++j) {
        const int id = subset.facetIds[j];
        if (rule.rule == ddb_FaceRuleEnm::NUMBERED) {
            faces.Append(numbered(id));
        } else if (id == kShellTop || id == kShellBottom) {
            faces.Append(id == kShellTop ? top : bottom);
        } else if (id == kShellBothSides) {
            faces.Append(cow_String());
        }
        // Any other facet of a shell has a label and no face, so that the lists lose step. That stays.
    }
    faces_.Concatenate(faces);
}

bool oif_Set::IsAscending() const {
    bool ascending = true;
    int former = -1;
    labels_.ForEachPiece([&](std::span<const int> labels) {
        for (const int label : labels) {
            ascending = ascending && label > former;
            former = label;
        }
    });
    return ascending;
}

void oif_Set::Sort() {
    auto sorted = std::make_shared<SortedLabels>();
    labels_.ForEachPiece([&](std::span<const int> labels) {
        for (const int label : labels) sorted->Add(label);
    });
    labels_ = oif_SetLabels(std::move(sorted));
}

bool oif_Set::CanGenerate() {
    if (!IsAscending()) Sort();
    int count = 0;
    bool regular = true;
    labels_.ForEachPiece([&](std::span<const int> labels) {
        for (const int label : labels) {
            if (count == 0) start_ = label;
            if (count == 1) increment_ = label - start_;
            if (count > 1) regular = regular && label - end_ == increment_;
            end_ = label;
            ++count;
        }
    });
    generate_ = regular && count >= 3;
    return generate_;
}

void oif_Set::WriteData(utl_Stream& stream) const {
    if (generate_) {
        stream << start_ << ", " << end_ << ", " << increment_ << endl;
        return;
    }
    // Eleven characters and a comma, and the room that the last number wants.
    constexpr std::size_t room = 12 * kLabelsOfLine + 4 + num_IntRoom(0);
    constexpr std::size_t most = kLabelsOfLine << 14;
    std::vector<int> gathered;
    const auto write = [&] {
        stream.PrintItems((gathered.size() + kLabelsOfLine - 1) / kLabelsOfLine, room,
                          [&](std::size_t begin, std::size_t end, char* out) {
                              const std::size_t from = begin * kLabelsOfLine;
                              const std::size_t to = std::min(end * kLabelsOfLine, gathered.size());
                              return WriteLines({gathered.data() + from, to - from}, out);
                          });
        gathered.clear();
    };
    labels_.ForEachPiece([&](std::span<const int> labels) {
        while (!labels.empty()) {
            const std::size_t count = std::min(labels.size(), most - gathered.size());
            gathered.insert(gathered.end(), labels.begin(),
                            labels.begin() + static_cast<std::ptrdiff_t>(count));
            labels = labels.subspan(count);
            if (gathered.size() == most) write();
        }
    });
    if (!gathered.empty()) write();
}

void oif_SetKeyword::WriteMembers(utl_Stream& stream) const {
    for (int i = 0; i < members_.Length(); ++i) stream << qkw_QuorixName(members_[i], false) << ", " << endl;
}

void oif_Nset::Write(utl_Stream& stream) const {
    if (labels_.IsEmpty() && members_.IsEmpty()) return;
    oif_KeywordLine line(stream, "*Nset");
    line.Fixed(", nset=", qkw_QuorixName(setName_, false));
    if (labels_.IsEmpty()) {
        // Unlike an element set, a node set of members never is internal.
        line.End();
        WriteMembers(stream);
        return;
    }
    oif_Set set(labels_);
    line.FixedName(", instance=", instanceName_)
        .FixedIf(internal_, ", internal")
        .FixedIf(set.CanGenerate(), ", generate")
        .End();
    set.WriteData(stream);
}

oif_Elset::oif_Elset(const oif_SetLabels& labels, cow_String name, cow_String instanceName, bool internal) {
    labels_ = labels;
    setName_ = name;
    instanceName_ = instanceName;
    internal_ = internal;
}

void oif_Elset::Write(utl_Stream& stream) const {
    if (labels_.IsEmpty() && members_.IsEmpty()) return;
    oif_KeywordLine line(stream, "*Elset");
    line.Fixed(", elset=", qkw_QuorixName(setName_, false))
        .FixedName(", instance=", instanceName_)
        .FixedIf(internal_, ", internal");
    if (labels_.IsEmpty()) {
        line.End();
        WriteMembers(stream);
        return;
    }
    oif_Set set(labels_);
    line.FixedIf(set.CanGenerate(), ", generate").End();
    set.WriteData(stream);
}
