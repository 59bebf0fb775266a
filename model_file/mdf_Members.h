#ifndef QRX_MODEL_FILE_MDF_MEMBERS_H
#define QRX_MODEL_FILE_MDF_MEMBERS_H

#include "model_file/mdf_Diagnostics.h"

/// The members that an object of these fields may have.
std::vector<std::string> mdf_MembersOf(const cls_FieldTable& fields,
                                       const std::vector<std::string>& others = {});
/// Reports members that are none of the known ones.
void mdf_CheckMembers(mdf_Diagnostics& diagnostics, const mdf_Value& object,
                      const std::vector<std::string>& known, const fnd_Path& path);
/// The word of a meaning: what stands before "(", "," or ":".
std::string mdf_MeaningWord(const cls_IntMeaning& meaning);
/// The word of a field that a reader takes for the number, or nothing.
std::string mdf_WordOfNumber(const cls_Field& field, int number);

#endif
