#ifndef QRX_VPG_VALUES_H
#define QRX_VPG_VALUES_H

#include "store_interface/records/cls_FieldTable.h"
#include "store_interface/regions/rgnC_Region.h"

#include <nlohmann/json.hpp>

#include <functional>

/// A value for people to read: words for enumerations and for numbers with a meaning, names for regions.
nlohmann::ordered_json vpg_ValueOf(const cls_Field& field, const cls_Record& record);
/// The fields of a record that say something: {"name", "value", "doc"} of each that differs from what stands
/// there by default, of per-step attributes those in force. Regions are left out.
nlohmann::ordered_json vpg_FieldsOf(const cls_Record& record, const cls_Record& byDefault);
/// Calls `visit(role, region)` for each region with a value in the record and the records in it; the role is
/// the way to it by the names of fields, such as "master" or "inclusionPairs.first".
void vpg_ForEachRegion(const cls_Record& record,
                       const std::function<void(const std::string& role, const rgnC_Region& region)>& visit);

inline std::string vpg_Text(const cow_String& text) {
    return std::string(text.View());
}
/// As it stands between tags, or in double quotes within one.
std::string vpg_Escaped(std::string_view text);

#endif
