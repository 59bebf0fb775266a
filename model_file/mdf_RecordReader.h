#ifndef QRX_MODEL_FILE_MDF_RECORDREADER_H
#define QRX_MODEL_FILE_MDF_RECORDREADER_H

#include "model_file/mdf_Diagnostics.h"

#include <set>

/// Reads records of any class from JSON objects by their field tables. Parts, instances, sets and datums of
/// the model must be there; the names of other objects are looked up at the end, by CheckReferences().
class mdf_RecordReader {
public:
    mdf_RecordReader(odiK_Model& model, mdf_Diagnostics& diagnostics)
        : model_(model), diagnostics_(diagnostics) {}

    /// Fills the record from the object's members; members named in `others` are passed over, any other
    /// unknown one is an error.
    void ReadRecord(cls_Record& record, const mdf_Value& object, const mdf_Path& path,
                    const std::vector<std::string>& others = {});
    /// Reads an object of the class `base` or, as its member "class" says, of one derived from it. Null after
    /// an error.
    std::unique_ptr<cls_Record> ReadVariant(unsigned base, const mdf_Value& object, const mdf_Path& path,
                                            const std::vector<std::string>& others = {});
    /// Makes the record that the object's "class" names, without reading its fields. Null after an error.
    std::unique_ptr<cls_Record> NewVariant(unsigned base, const mdf_Value& object, const mdf_Path& path);
    /// Reads the member "states" of a propagating object.
    void ReadStates(kprC_PropagatingObject& object, const mdf_Value& states, const mdf_Path& path);
    /// A text: a string as it stands, or an array of strings, each a line.
    bool ReadText(cow_String& text, const mdf_Value& value, const mdf_Path& path);
    rgnC_Region ReadRegion(const mdf_Value& value, const mdf_Path& path);

    /// Reports members that are none of the known ones.
    void CheckMembers(const mdf_Value& object, const std::vector<std::string>& known, const mdf_Path& path);
    /// Tells that an object of the name is given but wrong: what refers to it is not reported too.
    void NoteWrong(std::string_view name) { wrong_.emplace(name); }
    bool IsWrong(std::string_view name) const { return wrong_.count(name) != 0; }
    /// Reports that there is no instance of the name.
    void ReportNoInstance(const std::string& name, const mdf_Path& path);
    /// Looks up all names that records refer to.
    void CheckReferences();

private:
    struct Reference {
        std::string kind;
        std::string name;
        std::string pointer;
        const cls_ClassInfo* expectedClass; // null: any
    };

    bool ReadValue(const cls_FieldType& type, void* value, const mdf_Value& json, const mdf_Path& path,
                   const cls_Field& field, bool mayBeUnset);
    bool ReadInt(int& value, const mdf_Value& json, const mdf_Path& path, const cls_Field& field,
                 bool mayBeUnset);
    bool ReadEnum(const cls_EnumType& type, void* value, const mdf_Value& json, const mdf_Path& path);
    bool ReadTable(const cls_TableType& type, void* value, const mdf_Value& json, const mdf_Path& path);
    bool ReadComplex(omi_complex& value, const mdf_Value& json, const mdf_Path& path);
    bool ReadTriple(double (&xyz)[3], const mdf_Value& json, const mdf_Path& path);
    bool ReadList(const cls_ListType& type, void* value, const mdf_Value& json, const mdf_Path& path,
                  const cls_Field& field);
    void CompleteList(const cls_Field& field, cls_Record& record, const mdf_Path& path);
    bool ReadMap(const cls_MapType& type, void* value, const mdf_Value& json, const mdf_Path& path,
                 const cls_Field& field);
    bool ReadHolder(const cls_HolderType& type, void* value, const mdf_Value& json, const mdf_Path& path);
    bool ReadDatum(dtmC_DatumRef& datum, const mdf_Value& json, const mdf_Path& path);
    mdl_GivenEnm ReadAttribute(const cls_AttributeType& type, void* attribute, const mdf_Value& json,
                               const mdf_Path& path, const cls_Field& field);
    void ReadState(kprC_PropagatingObject& object, const std::string& stepName, const mdf_Value& json,
                   const mdf_Path& path);
    void Refer(const cls_Field& field, const std::string& name, const mdf_Path& path);
    /// Null where no repository holds the objects of the kind.
    const mdl_Repository* RepositoryOfKind(const std::string& kind) const;
    std::vector<std::string> NamesOfKind(const std::string& kind) const;
    void CheckClass(const Reference& reference);

    odiK_Model& model_;
    mdf_Diagnostics& diagnostics_;
    std::vector<Reference> references_;
    std::set<std::string, std::less<>> wrong_;
};

/// Copies of cow_String as std::string and of lists of names, for messages.
/// The word of a meaning: what stands before "(", "," or ":".
std::string mdf_MeaningWord(const cls_IntMeaning& meaning);
std::vector<std::string> mdf_Names(const cow_List<cow_String>& names);

#endif
