#ifndef QRX_VPG_OBJECTS_H
#define QRX_VPG_OBJECTS_H

#include "deck/oif_DeckLines.h"
#include "view_page/vpg_Layout.h"

/// "statuses", "steps", "datums" and "objects" of a page's header: what boundary conditions, loads, fields,
/// interactions and constraints are in each step, how they are drawn, and the lines that they become in a
/// deck.
void vpg_DescribeObjects(const vpg_Layout& layout, const oif_DeckLines& lines,
                         nlohmann::ordered_json& header);

#endif
