#ifndef QRX_STORE_FND_TEXTRULES_H
#define QRX_STORE_FND_TEXTRULES_H

#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/records/cls_FieldTable.h"

/// False, and says so, for a text that can't stand in a deck as a name.
bool fnd_CheckName(std::string_view name, const fnd_Path& place, fnd_Sink& sink);
/// False, and says so, for a text that can't stand in the field: a name that is none, or a text that would
/// begin a line of its own. Texts that are meant to (`verbatim`, `freeText`) may hold anything.
bool fnd_CheckText(const cls_Field& field, std::string_view text, const fnd_Path& place, fnd_Sink& sink);

#endif
