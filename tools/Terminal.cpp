#include "tools/Terminal.h"

#include "tools/StandardStreams.h"

#include <algorithm>
#include <cstdlib>
#include <string_view>

namespace {

std::string_view Variable(const char* name) {
    const char* value = std::getenv(name);
    return value == nullptr ? std::string_view() : std::string_view(value);
}

} // namespace

std::optional<ColourWhenEnm> ColourWhenOf(const std::string& word) {
    if (word == "auto") return ColourWhenEnm::AUTO;
    if (word == "always") return ColourWhenEnm::ALWAYS;
    if (word == "never") return ColourWhenEnm::NEVER;
    return std::nullopt;
}

bool IsLiveTerminal(StreamEnm stream) {
    return ColumnsOfTerminal(stream == StreamEnm::ERRORS) >= 0 && Variable("TERM") != "dumb";
}

bool HasColours(StreamEnm stream, ColourWhenEnm when) {
    if (when != ColourWhenEnm::AUTO) return when == ColourWhenEnm::ALWAYS;
    return Variable("NO_COLOR").empty() && IsLiveTerminal(stream);
}

std::size_t TextWidth() {
    constexpr int least = 40;
    constexpr int most = 100;
    constexpr std::size_t usual = 80;
    const int columns = ColumnsOfTerminal(false);
    return columns <= 0 ? usual : static_cast<std::size_t>(std::clamp(columns, least, most));
}
