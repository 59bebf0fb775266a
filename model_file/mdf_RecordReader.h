#ifndef QRX_MODEL_FILE_MDF_RECORDREADER_H
#define QRX_MODEL_FILE_MDF_RECORDREADER_H

#include "model_file/mdf_Members.h"
#include "model_file/mdf_PairLists.h"
#include "model_file/mdf_PlaceReader.h"
#include "store_interface/records/cls_ClassRegistrar.h"

/// Reads records of any class from JSON objects by their field tables. Parts, instances, sets and datums of
/// the model must be there; the names of other objects are looked up at
/// the end, by References().Check().
class mdf_RecordReader {
public:
    mdf_RecordReader(odiK_Model& model, mdf_Diagnostics& diagnostics)
        : model_(model), diagnostics_(diagnostics), references_(model, diagnostics),
          places_(model, references_, diagnostics) {}

    /// Fills the record from the object's members; members named in `others` are passed over, any other
    /// unknown one is an error.
    void ReadRecord(cls_Record& record, const mdf_Value& object, const fnd_Path& path,
                    const std::vector<std::string>& others = {});
    /// Reads an object of the class `base` or, as its member "class" says, of one derived from it. Null after
    /// an error.
    std::unique_ptr<cls_Record> ReadVariant(unsigned base, const mdf_Value& object, const fnd_Path& path,
                                            const std::vector<std::string>& others = {});
    /// Makes the record that the object's "class" names, without reading its fields. Null after an error.
    std::unique_ptr<cls_Record> NewVariant(unsigned base, const mdf_Value& object, const fnd_Path& path);
    /// Reads the member "states" of a propagating object.
    void ReadStates(kprC_PropagatingObject& object, const mdf_Value& states, const fnd_Path& path);
    /// Reads one field of the record; `json` is null where nothing is given. False when it was refused.
    bool ReadField(cls_Record& record, const cls_Field& field, const mdf_Value* json, const fnd_Path& path);

    mdf_References& References() { return references_; }
    mdf_PlaceReader& Places() { return places_; }

private:
    bool ReadValue(const cls_FieldType& type, void* value, const mdf_Value& json, const fnd_Path& path,
                   const cls_Field& field, bool mayBeUnset);
    bool ReadInt(int& value, const mdf_Value& json, const fnd_Path& path, const cls_Field& field,
                 bool mayBeUnset);
    bool ReadBool(bool& value, const mdf_Value& json, const fnd_Path& path);
    bool ReadDouble(double& value, const mdf_Value& json, const fnd_Path& path, bool mayBeUnset);
    bool ReadString(cow_String& value, const mdf_Value& json, const fnd_Path& path, const cls_Field& field);
    /// A text: a string as it stands, or an array of strings, each a line.
    bool ReadText(cow_String& text, const mdf_Value& value, const fnd_Path& path);
    /// One of the field's words.
    bool ReadWord(cow_String& value, const mdf_Value& json, const fnd_Path& path, const cls_Field& field);
    bool ReadEnum(const cls_EnumType& type, void* value, const mdf_Value& json, const fnd_Path& path,
                  bool wordsOnly);
    bool ReadTable(const cls_TableType& type, void* value, const mdf_Value& json, const fnd_Path& path);
    bool ReadComplex(omi_complex& value, const mdf_Value& json, const fnd_Path& path);
    bool ReadTriple(double (&xyz)[3], const mdf_Value& json, const fnd_Path& path, bool singlePrecision);
    bool ReadSegment(gsl_ModelSegment& segment, const mdf_Value& json, const fnd_Path& path);
    bool ReadList(const cls_ListType& type, void* value, const mdf_Value& json, const fnd_Path& path,
                  const cls_Field& field);
    void CompleteList(const cls_Field& field, cls_Record& record, const fnd_Path& path);
    bool ReadMap(const cls_MapType& type, void* value, const mdf_Value& json, const fnd_Path& path,
                 const cls_Field& field);
    bool ReadHolder(const cls_HolderType& type, void* value, const mdf_Value& json, const fnd_Path& path);
    /// Reads a list that gives pairs of the object and what belongs to them in one.
    bool ReadPairs(kprC_PropagatingObject& object, const mdf_PairList& row, const cls_Field& field,
                   void* list, const mdf_Value& json, const fnd_Path& path);
    mdl_GivenEnm ReadAttribute(const cls_AttributeType& type, void* attribute, const mdf_Value& json,
                               const fnd_Path& path, const cls_Field& field);
    /// Reads one field of a state; marks it as given unless it was refused.
    void ReadStateField(kprC_PropagatingObject& object, mdl_GivenEnm& mark, const cls_Field& field,
                        void* value, const mdf_Value& json, const fnd_Path& path);
    std::vector<const mdf_Member*> InOrder(const kprC_PropagatingObject& object,
                                           const mdf_Value& states) const;
    void ReadState(kprC_PropagatingObject& object, const std::string& stepName, const mdf_Value& json,
                   const fnd_Path& path);

    odiK_Model& model_;
    mdf_Diagnostics& diagnostics_;
    mdf_References references_;
    mdf_PlaceReader places_;
};

#endif
