#ifndef QRX_OIF_SET_H
#define QRX_OIF_SET_H

#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"
#include "mesh/oif_LabelSource.h"

/// The labels of a set in one mesh, and for facets the face names, as data lines:
///     1,3,17          16 labels a line, no blanks, no comma at the end
///     2, 20, 2        start, end and increment, with generate
class oif_Set {
public:
    explicit oif_Set(const cow_List<int>& labels) : labels_(labels) {}
    explicit oif_Set(const oif_SetLabels& labels) : labels_(labels) {}
    /// The share of the set that lies in the assembly's own mesh.
    oif_Set(const rgnC_SetData& setData, const ddb_Assembly& assembly);
    /// The share that lies in the instance's mesh.
    oif_Set(const rgnC_SetData& setData, const ddb_PartInstance& instance);

    /// Sorts the labels and takes repetitions out; then whether there are three at least, in equal steps.
    bool CanGenerate();
    /// Writes the form that CanGenerate() found, else the list. No labels write nothing.
    void WriteData(utl_Stream& stream) const;
    const oif_SetLabels& Labels() const { return labels_; }
    /// Parallel to the labels, for facets.
    cow_List<cow_String> FaceList() const { return faces_; }

private:
    void ComputeData(const rgnC_SetData& setData, const ddb_Mesh& mesh);
    void AppendFacets(cow_List<int>& labels, const rgnC_SubsetData& subset,
                      const odiK_ElementClass& elements);
    bool IsAscending() const;
    void Sort();

    oif_SetLabels labels_;
    cow_List<cow_String> faces_;
    bool generate_ = false;
    int start_ = 0;
    int end_ = 0;
    int increment_ = 0;
};

/// What node and element sets have in common.
class oif_SetKeyword {
protected:
    oif_SetKeyword() = default;
    oif_SetKeyword(const cow_String& name, const cow_List<cow_String>& members)
        : setName_(name), members_(members) {}
    oif_SetKeyword(const rgnC_SetData& setData, const oif_Set& set, const cow_String& instanceName)
        : setName_(setData.Name()), instanceName_(instanceName), labels_(set.Labels()),
          internal_(setData.Internal()) {}

    void WriteMembers(utl_Stream& stream) const;

    cow_String setName_;
    cow_String instanceName_;
    oif_SetLabels labels_;
    cow_List<cow_String> members_;
    bool internal_ = false;
};

/// A node set:
///     *Nset, nset=NAME, instance=I, internal, generate
/// with its labels, or, made from names, with one member set a line, each with ", " behind it.
class oif_Nset final : public qkw_KeywordOf<oif_Nset>, private oif_SetKeyword {
public:
    oif_Nset(const cow_String& name, const cow_List<cow_String>& members) : oif_SetKeyword(name, members) {}
    oif_Nset(const rgnC_SetData& setData, const ddb_Assembly& assembly)
        : oif_SetKeyword(setData, oif_Set(setData, assembly), cow_String()) {}
    oif_Nset(const rgnC_SetData& setData, const ddb_PartInstance& instance)
        : oif_Nset(setData, instance, cow_String()) {}
    oif_Nset(const rgnC_SetData& setData, const ddb_PartInstance& instance, const cow_String& instanceName)
        : oif_SetKeyword(setData, oif_Set(setData, instance), instanceName) {}
    void Write(utl_Stream& stream) const override;
};

/// An element set, as oif_Nset. One that is made from names is always internal; a node set never is then.
class oif_Elset final : public qkw_KeywordOf<oif_Elset>, private oif_SetKeyword {
public:
    oif_Elset(const oif_SetLabels& labels, cow_String name, cow_String instanceName, bool internal);
    oif_Elset(const cow_List<int>& labels, cow_String name, cow_String instanceName, bool internal)
        : oif_Elset(oif_SetLabels(labels), name, instanceName, internal) {}
    oif_Elset(const cow_String& name, const cow_List<cow_String>& members) : oif_SetKeyword(name, members) {
        internal_ = true;
    }
    oif_Elset(const rgnC_SetData& setData, const ddb_Assembly& assembly)
        : oif_SetKeyword(setData, oif_Set(setData, assembly), cow_String()) {}
    oif_Elset(const rgnC_SetData& setData, const ddb_PartInstance& instance)
        : oif_Elset(setData, instance, cow_String()) {}
    oif_Elset(const rgnC_SetData& setData, const ddb_PartInstance& instance, const cow_String& instanceName)
        : oif_SetKeyword(setData, oif_Set(setData, instance), instanceName) {}
    void Write(utl_Stream& stream) const override;
};

#endif
