#ifndef QRX_MODEL_FILE_MDF_RECORDWRITER_H
#define QRX_MODEL_FILE_MDF_RECORDWRITER_H

#include "model_file/mdf_Writer.h"
#include "store_interface/model/odiK_Model.h"

/// What a file gets that says nothing of the field, signs of zeros included.
bool mdf_IsDefault(const cls_Field& field, const cls_Record& record, const cls_Record& byDefault);

/// Writes records of any class by their field tables. Fields that have their default are left out.
class mdf_RecordWriter {
public:
    /// The model tells the names of datums.
    mdf_RecordWriter(mdf_Writer& out, const odiK_Model& model) : out_(out), model_(model) {}

    /// The members of an object that is open, of a registered class.
    void WriteFields(const cls_Record& record, std::string_view passedOver = {});
    /// One of them, unless it is what the default record has.
    void WriteField(const cls_Field& field, const cls_Record& record, const cls_Record& byDefault);
    /// The field with its name, whatever its value.
    void WriteMember(const cls_Field& field, const cls_Record& record);
    /// An object; with its class when `base` is another.
    void WriteRecord(const cls_Record& record, unsigned base);
    /// The member "states", if there are any.
    void WriteStates(const kprC_PropagatingObject& object);
    /// The member "class".
    void WriteClass(const cls_Record& record);

private:
    void WriteText(std::string_view text);
    void WriteState(const mdl_GivenState& given);
    void WriteGiven(const cls_FieldType& type, const void* value, mdl_GivenEnm mark);
    void WriteValue(const cls_FieldType& type, const void* value);
    void WriteEnum(const cls_EnumType& type, int number);
    void WriteComplex(const omi_complex& number);
    void WriteTable(const cow_2DArray<double>& cells);
    void WriteList(const cls_ListType& type, const void* value);
    void WriteMap(const cls_MapType& type, const void* value);
    void WriteHolder(const cls_HolderType& type, const void* value);
    void WriteRegion(const rgnC_Region& region);
    void WriteDatum(const dtmC_DatumRef& datum);

    mdf_Writer& out_;
    const odiK_Model& model_;
};

#endif
