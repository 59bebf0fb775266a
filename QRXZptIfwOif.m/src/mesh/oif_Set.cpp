#include "mesh/oif_Set.h"

#include "base/oif_KeywordLine.h"
#include "foundation/omi_BlkBitVect.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "store_interface/model/odiK_Mesh.h"

namespace {

constexpr int kLabelsOfLine = 16;

// Facet ids of a shell; the double side has no name.
constexpr int kShellTop = 0;
constexpr int kShellBottom = 1;
constexpr int kShellBothSides = 6;

bool IsAscending(const cow_List<int>& labels) {
    int former = -1;
    for (int i = 0; i < labels.Length();) {
        int length = 0;
        const int* run = labels.ConstRun(i, length);
        for (int k = 0; k < length; ++k) {
            if (run[k] <= former) return false;
            former = run[k];
        }
        i += length;
    }
    return true;
}

// Label by label; -1 drops nothing, entries are checked when sets enter the store.
cow_List<int> LabelsOf(const rgnC_SubsetData& subset, const std::vector<int>& labels) {
    cow_List<int> found{cow_ListConstruct(subset.subset.Length())};
    for (int i = 0; i < subset.subset.Length(); ++i) {
        const int entry = subset.subset.UncheckedConstGet(i);
        if (entry < 0 || entry >= static_cast<int>(labels.size())) {
            cow_RaiseOutOfRange(entry, static_cast<int>(labels.size()));
        }
        found.Append(labels[static_cast<std::size_t>(entry)]);
    }
    return found;
}

cow_List<int> NodeLabelsOf(const rgnC_SubsetData& subset, const cow_List<int>& labels) {
    cow_List<int> found{cow_ListConstruct(subset.subset.Length())};
    for (int i = 0; i < subset.subset.Length(); ++i) {
        const int entry = subset.subset.UncheckedConstGet(i);
        // A node that the mesh doesn't have is dropped silently.
        if (entry >= 0 && entry < labels.Length()) found.Append(labels.UncheckedConstGet(entry));
    }
    return found;
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
        labels_ = resolved->labels;
        faces_ = resolved->faces;
        return;
    }
    const auto kind = static_cast<res_SetTypeEnm>(setData.Kind());
    for (const int i : setData.SubSetsIn(mesh.meshIndex())) {
        const rgnC_SubsetData subset = setData.SubSet(i);
        if (kind == res_SetTypeEnm::NODES) {
            cow_List<int> labels;
            mesh.nodeData().GetUserNodeLabels(labels);
            labels_.Concatenate(NodeLabelsOf(subset, labels));
            continue;
        }
        if (subset.ClassIndex() < 0) continue;
        const odiK_ElementClass& elements =
            mesh.mesh().Classes().at(static_cast<std::size_t>(subset.ClassIndex()));
        if (kind == res_SetTypeEnm::ELEMENTS) {
            labels_.Concatenate(LabelsOf(subset, elements.labels));
        } else {
            AppendFacets(subset, elements);
        }
    }
    if (setData.LiesInOneMesh()) {
        kept.Keep(std::unique_ptr<odiK_Set::Resolved>(new odiK_Set::Resolved{labels_, faces_}));
    }
}

void oif_Set::AppendFacets(const rgnC_SubsetData& subset, const odiK_ElementClass& elements) {
    if (subset.subset.IsEmpty() || subset.facetIds.IsEmpty()) return;
    labels_.Concatenate(LabelsOf(subset, elements.labels));
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

bool oif_Set::CanGenerate() {
    generate_ = true;
    if (!IsAscending(labels_)) {
        omi_BlkBitVect bits;
        for (int i = 0; i < labels_.Length(); ++i) bits.SetBit(labels_.UncheckedConstGet(i));
        cow_List<int> sorted{cow_ListConstruct(bits.Recount())};
        omi_BlkBitVectTrav traversal(bits);
        for (int label = traversal.First(); label >= 0; label = traversal.Next()) sorted.Append(label);
        labels_ = sorted;
    }
    const int count = labels_.Length();
    if (count < 3) {
        generate_ = false;
        return false;
    }
    start_ = labels_[0];
    end_ = labels_.Last();
    increment_ = labels_[1] - start_;
    for (int i = 2; i < count; ++i) {
        if (labels_.UncheckedConstGet(i) - labels_.UncheckedConstGet(i - 1) != increment_) {
            generate_ = false;
            return false;
        }
    }
    return true;
}

void oif_Set::WriteData(utl_Stream& stream) const {
    if (generate_) {
        stream << start_ << ", " << end_ << ", " << increment_ << endl;
        return;
    }
    const int length = labels_.Length();
    for (int count = 1; count <= length; ++count) {
        stream << labels_.UncheckedConstGet(count - 1);
        if (count % kLabelsOfLine == 0) {
            stream << endl;
        } else if (count == length) {
            // A lone label on its line has a comma and a blank behind it.
            if (count % kLabelsOfLine == 1) stream << ", ";
            stream << endl;
        } else {
            stream << ",";
        }
    }
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

oif_Elset::oif_Elset(const cow_List<int>& labels, cow_String name, cow_String instanceName, bool internal) {
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
