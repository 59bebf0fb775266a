#ifndef QRX_OIF_SURFACE_H
#define QRX_OIF_SURFACE_H

#include "foundation/cow_Map.h"
#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"

#include <vector>

/// A surface on element faces: an internal element set for each face name, then the surface made of them,
///     *Elset, elset=_NAME_S1, internal
///     1,2,3
///     *Surface, type=ELEMENT, name=NAME
///     _NAME_S1, S1
/// or one on a node set:
///     *Surface, type=NODE, name=NAME
///     SET, 1.
/// A surface of the assembly has the element sets of all its instances before its one keyword.
class oif_Surface final : public qkw_KeywordOf<oif_Surface> {
public:
    oif_Surface(const rgnC_SetData& setData, const ddb_PartInstance& instance)
        : oif_Surface(setData, instance, cow_String()) {}
    oif_Surface(const rgnC_SetData& setData, const ddb_Assembly& assembly);
    /// On one node set, whose name is in its printable form.
    oif_Surface(const qkw_ModelInfo& modelInfo, const cow_String& name, const cow_String& nodeSet);
    void Write(utl_Stream& stream) const override;

private:
    using LabelsOfFace = cow_Map<cow_String, cow_List<int>>;

    oif_Surface(const rgnC_SetData& setData, const ddb_PartInstance& instance,
                const cow_String& instanceName);
    void CreateLabels(const rgnC_SetData& setData, const ddb_PartInstance& instance);
    LabelsOfFace GroupByFace() const;
    cow_String FaceSetName(const cow_String& face) const;
    void WriteSurfaceElsets(utl_Stream& stream, const LabelsOfFace& faces) const;
    void WriteSurfaceKeyword(utl_Stream& stream) const;
    void WriteSurfaceDatalines(utl_Stream& stream, const LabelsOfFace& faces) const;
    void WriteSurfaceFromList(utl_Stream& stream) const;
    void WriteSurfaceFromKeywords(utl_Stream& stream) const;

    cow_String name_;
    cow_String instanceName_;
    cow_List<int> labels_;
    cow_List<cow_String> faces_;
    bool internal_ = false;
    cow_List<cow_String> nodeSets_;
    qkw_KeywordList subSurfaces_;
};

#endif
