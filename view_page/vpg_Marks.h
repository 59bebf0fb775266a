#ifndef QRX_VPG_MARKS_H
#define QRX_VPG_MARKS_H

#include "store_interface/records/cls_Record.h"

#include <nlohmann/json.hpp>

#include <span>

/// How the page draws objects of a class.
struct vpg_MarkRow {
    unsigned typeId;
    /// What the page's code goes by: docs/view.md lists the words.
    const char* mark;
};

std::span<const vpg_MarkRow> vpg_MarkRows();
/// "none" for a class without a row.
const char* vpg_MarkOf(unsigned typeId);

class kbcC_BC;
class kloC_Load;
class cow_String;

/// What a mark is drawn with in a step: "components", of a boundary condition six values with null for what
/// is free, of a load its vector, or "magnitude". Empty where there is nothing to draw.
nlohmann::ordered_json vpg_MarkStateOf(const kbcC_BC& bc, const cow_String& step);
nlohmann::ordered_json vpg_MarkStateOf(const kloC_Load& load, const cow_String& step);
/// The same through all steps: "axis" of a turning body by two points, "direction" of a traction, "datum"
/// (its id) of a local system.
nlohmann::ordered_json vpg_MarkFrameOf(const cls_Record& object);

#endif
