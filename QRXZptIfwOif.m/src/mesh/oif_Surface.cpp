#include "mesh/oif_Surface.h"

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_Set.h"

#include <set>

oif_Surface::oif_Surface(const rgnC_SetData& setData, const ddb_PartInstance& instance,
                         const cow_String& instanceName)
    : name_(setData.Name()), instanceName_(instanceName), internal_(setData.Internal()) {
    CreateLabels(setData, instance);
}

oif_Surface::oif_Surface(const rgnC_SetData& setData, const ddb_Assembly& assembly)
    : name_(setData.Name()), internal_(setData.Internal()) {
    std::set<int> meshesDone;
    for (int i = 0; i < setData.NumSubSets(); ++i) {
        const int meshIndex = setData.MeshIndexOfSubSet(i);
        if (!meshesDone.insert(meshIndex).second) continue;
        // Facets in the assembly's own mesh are left out.
        const auto instance = assembly.instance().FindByMeshIndex(meshIndex);
        if (instance) subSurfaces_.Append(oif_Surface(setData, *instance, instance->name()));
    }
}

oif_Surface::oif_Surface(const qkw_ModelInfo&, const cow_String& name, const cow_String& nodeSet)
    : name_(name), nodeSets_(nodeSet) {}

void oif_Surface::CreateLabels(const rgnC_SetData& setData, const ddb_PartInstance& instance) {
    const oif_Set set(setData, instance);
    labels_ = set.Labels().List();
    faces_ = set.FaceList();
}

void oif_Surface::Write(utl_Stream& stream) const {
    if (!labels_.IsEmpty()) {
        const LabelsOfFace faces = GroupByFace();
        WriteSurfaceElsets(stream, faces);
        WriteSurfaceKeyword(stream);
        WriteSurfaceDatalines(stream, faces);
    } else if (!nodeSets_.IsEmpty()) {
        WriteSurfaceFromList(stream);
    } else if (!subSurfaces_.IsEmpty()) {
        WriteSurfaceFromKeywords(stream);
    }
}

oif_Surface::LabelsOfFace oif_Surface::GroupByFace() const {
    LabelsOfFace groups;
    // Facets of one face share its text, so that most look-ups are a comparison of addresses.
    struct Known {
        const char* text;
        cow_List<int>* labels;
    };
    std::vector<Known> known;
    for (int i = 0; i < labels_.Length(); ++i) {
        const cow_String& face = faces_[i];
        cow_List<int>* labels = nullptr;
        for (const Known& k : known) {
            if (k.text == face.CStr()) labels = k.labels;
        }
        if (labels == nullptr) {
            labels = &groups.GetOrInsert(face);
            if (known.size() < 16) known.push_back({face.CStr(), labels});
        }
        labels->Append(labels_.UncheckedConstGet(i));
    }
    return groups;
}

cow_String oif_Surface::FaceSetName(const cow_String& face) const {
    return cow_String("_") + name_ + "_" + face;
}

void oif_Surface::WriteSurfaceElsets(utl_Stream& stream, const LabelsOfFace& faces) const {
    for (const auto& [face, labels] : faces) {
        oif_Set set(labels);
        oif_KeywordLine(stream, "*Elset")
            .Fixed(", elset=", qkw_QuorixName(FaceSetName(face), false))
            .FixedName(", instance=", instanceName_)
            .Fixed(", internal")
            .FixedIf(set.CanGenerate(), ", generate")
            .End();
        set.WriteData(stream);
    }
}

void oif_Surface::WriteSurfaceKeyword(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Surface, type=ELEMENT")
        .Fixed(", name=", qkw_QuorixName(name_, false))
        .FixedIf(internal_, ", internal")
        .End();
}

void oif_Surface::WriteSurfaceDatalines(utl_Stream& stream, const LabelsOfFace& faces) const {
    for (const auto& [face, labels] : faces) {
        stream << qkw_QuorixName(FaceSetName(face), false) << ", " << face << endl;
    }
}

void oif_Surface::WriteSurfaceFromList(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Surface, type=NODE")
        .Fixed(", name=", qkw_QuorixName(name_, false))
        .FixedIf(internal_, ", internal")
        .End();
    for (int i = 0; i < nodeSets_.Length(); ++i) stream << nodeSets_[i] << ", " << 1.0 << endl;
}

void oif_Surface::WriteSurfaceFromKeywords(utl_Stream& stream) const {
    const auto surface = [&](int i) -> const oif_Surface& {
        return static_cast<const oif_Surface&>(subSurfaces_[i].ConstGet());
    };
    std::vector<LabelsOfFace> faces;
    for (int i = 0; i < subSurfaces_.Length(); ++i) {
        faces.push_back(surface(i).GroupByFace());
        surface(i).WriteSurfaceElsets(stream, faces.back());
    }
    WriteSurfaceKeyword(stream);
    for (int i = 0; i < subSurfaces_.Length(); ++i) {
        surface(i).WriteSurfaceDatalines(stream, faces[static_cast<std::size_t>(i)]);
    }
}
