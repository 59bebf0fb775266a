#include "view_page/vpg_Html.h"

#include "view_page/vpg_Arrays.h"
#include "view_page/vpg_Objects.h"
#include "view_page/vpg_Values.h"

using nlohmann::ordered_json;

namespace {

constexpr std::string_view kTitleMark = "@TITLE@";
constexpr std::string_view kHeaderMark = "@HEADER@";
constexpr std::string_view kArraysMark = "@ARRAYS@";

/// JSON in which no name can end the element that it stands in.
std::string WithoutTags(std::string json) {
    std::size_t tags = 0;
    for (const char c : json) tags += c == '<' ? 1U : 0U;
    if (tags == 0) return json;
    std::string safe;
    safe.reserve(json.size() + 5 * tags);
    for (const char c : json) {
        if (c == '<') {
            safe += "\\u003c";
        } else {
            safe += c;
        }
    }
    return safe;
}

} // namespace

vpg_PageData vpg_DataOf(const odb_Odb& odb, const std::string& title) {
    const cow_String& name = odb.DeckModelName();
    // Completes the model, and raises when that can't be.
    const ddb_Model view = odb.ddb().model(name);
    vpg_Arrays arrays;
    ordered_json header = {{"format", "qrx-page/1"},
                           {"title", title},
                           {"description", std::string(odb.FindModel(name)->description.View())}};
    vpg_Layout layout(odb, name);
    layout.Describe(header, arrays);
    vpg_DescribeObjects(layout, oif_DeckLines(odb), header);
    header["arrays"] = arrays.Directory();
    return {header.dump(-1, ' ', false, ordered_json::error_handler_t::replace), arrays.Bytes()};
}

std::string vpg_Html(const vpg_PageData& data, const std::string& title) {
    const std::string_view page = vpg_PageText();
    std::string html;
    html.reserve(page.size() + data.header.size() + data.arrays.size() * 4 / 3 + 1000);
    std::size_t place = 0;
    const auto fill = [&](std::string_view mark, const std::string& text) {
        const std::size_t found = page.find(mark, place);
        html.append(page.substr(place, found - place)).append(text);
        place = found + mark.size();
    };
    fill(kTitleMark, vpg_Escaped(title));
    fill(kHeaderMark, WithoutTags(data.header));
    fill(kArraysMark, vpg_Base64(data.arrays));
    html.append(page.substr(place));
    return html;
}
