#ifndef QRX_VPG_HTML_H
#define QRX_VPG_HTML_H

#include "store_interface/model/odb_Odb.h"

#include <string>
#include <string_view>

/// What a page shows of a model: a header, which is one JSON object, and binary arrays that it refers to;
/// docs/view.md tells all of both.
struct vpg_PageData {
    std::string header;
    std::string arrays;
};

/// The data of the model named "Default Model"; `title` is what the page is called. Raises what writing the
/// model's deck would raise.
vpg_PageData vpg_DataOf(const odb_Odb& odb, const std::string& title);

/// The page without a model, as it was built in; empty in a build without it.
std::string_view vpg_PageText();
/// The page with the data in it: one HTML file that needs nothing else.
std::string vpg_Html(const vpg_PageData& data, const std::string& title);

#endif
