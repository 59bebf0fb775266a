#ifndef QRX_MODEL_FILE_MDF_PAIRLISTS_H
#define QRX_MODEL_FILE_MDF_PAIRLISTS_H

#include "model_file/mdf_Value.h"
#include "store_interface/records/cls_FieldTable.h"

class kprC_PropagatingObject;

/// A list of a general contact's states, whose entry i belongs to entry i of a list of pairs. A model file
/// may give both as one, in the state: {"first": ..., "second": ..., "property": ...}.
struct mdf_PairList {
    const char* list;
    const char* pairs;
    /// The member of an object that holds what belongs to the pair; "" where its members stand beside the
    /// pair's; null where the pair alone says it.
    const char* value;
};

/// The row of a field of a state; null for any other field.
const mdf_PairList* mdf_PairListOf(const cls_Field& field);
/// Whether the value gives pairs and what belongs to them in one.
bool mdf_IsOfPairs(const mdf_PairList& row, const mdf_Value& json);
/// Whether any list of the object's states does.
bool mdf_UsesPairs(const kprC_PropagatingObject& object, const mdf_Value& states);

#endif
