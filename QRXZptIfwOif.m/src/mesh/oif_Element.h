#ifndef QRX_OIF_ELEMENT_H
#define QRX_OIF_ELEMENT_H

#include "foundation/cow_Map.h"
#include "keyword_layer/qkw_Keyword.h"
#include "keyword_layer/qkw_ModelInfo.h"

#include <optional>

/// Elements of one class, or one element:
///     *Element, type=C3D8R, elset=SET
///      7,  1,  2,  3,  4,  5,  6,  7,  8
/// Element labels are as wide as the longest, node labels one wider than the longest but at most 7. A line
/// holds 16 numbers and ends in a comma when the element goes on; the next line begins with the element
/// label's width and one more in blanks.
class oif_Element final : public qkw_KeywordOf<oif_Element> {
public:
    /// One element of a type with one node, and an element set ("" for none).
    oif_Element(int label, int nodeLabel, const cow_String& type, const cow_String& elset);
    /// A class under a line of its own. It knows no mesh, so its node indices are taken for labels.
    oif_Element(int elementOffset, int nodeOffset, const ddb_ElementClass& elements, const cow_String& elset);
    /// The lines of a class, without the keyword line.
    oif_Element(int elementOffset, int nodeOffset, const ddb_ElementClass& elements, const ddb_Mesh& mesh,
                bool);
    void Write(utl_Stream& stream) const override;

private:
    struct LabelScan;

    void WriteConnectivity(utl_Stream& stream) const;
    template <class LabelOf>
    static LabelScan Scan(int threads, const std::vector<int>& connectivity, const LabelOf& labelOf);
    template <class LabelOf>
    void WriteRows(utl_Stream& stream, const LabelOf& labelOf, const LabelScan& scan) const;

    int firstNumber_;
    int secondNumber_;
    std::optional<ddb_ElementClass> elements_;
    std::optional<ddb_Mesh> mesh_;
    cow_String elset_;
    bool singleForm_;
    bool withHeader_;
    cow_String type_;
};

/// All elements of an instance but surface elements: one keyword line for each type, in the walk order of a
/// cow_Map, with the lines of all classes of the type.
class oif_ElementFromMesh final : public qkw_KeywordOf<oif_ElementFromMesh> {
public:
    oif_ElementFromMesh(const ddb_PartInstance& instance, const qkw_ModelInfo& modelInfo)
        : modelInfo_(&modelInfo), instance_(instance) {}
    void Write(utl_Stream& stream) const override;

private:
    using Types = cow_Map<cow_String, qkw_KeywordList>;
    static void AddKeyword(Types& types, const cow_String& type, const qkw_Keyword& keyword);

    const qkw_ModelInfo* modelInfo_;
    ddb_PartInstance instance_;
};

class oif_ModelInfo;

/// Connector elements of the assembly, whose ends may lie in instances:
///     *Element, type=CONN3D2
///     1, BRACKET-1.12, 5
/// The set's name is kept, but no "elset=" is written.
class oif_AssemblyElement final : public qkw_KeywordOf<oif_AssemblyElement> {
public:
    oif_AssemblyElement(const rgnC_Region& region, cow_String setName, oif_ModelInfo& modelInfo)
        : region_(region), setName_(setName), modelInfo_(&modelInfo) {}
    void Write(utl_Stream& stream) const override;

private:
    rgnC_Region region_;
    [[maybe_unused]] cow_String setName_;
    const oif_ModelInfo* modelInfo_;
};

#endif
