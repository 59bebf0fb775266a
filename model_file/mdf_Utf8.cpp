#include "model_file/mdf_Utf8.h"

#include <algorithm>

namespace {

bool IsInside(char c) {
    return (static_cast<unsigned char>(c) & 0xC0) == 0x80;
}

} // namespace

std::size_t mdf_Utf8Length(std::string_view text) {
    if (text.empty()) return 0;
    const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(text[i]); };
    const unsigned char lead = byte(0);
    if (lead < 0x80) return 1;
    const std::size_t length = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : 2;
    if (lead < 0xC2 || lead > 0xF4 || text.size() < length) return 0;
    for (std::size_t i = 1; i < length; ++i) {
        if ((byte(i) & 0xC0) != 0x80) return 0;
    }
    const bool overlong = (lead == 0xE0 && byte(1) < 0xA0) || (lead == 0xF0 && byte(1) < 0x90);
    const bool surrogate = lead == 0xED && byte(1) > 0x9F;
    const bool beyond = lead == 0xF4 && byte(1) > 0x8F;
    return overlong || surrogate || beyond ? 0 : length;
}

std::string_view mdf_Utf8Beginning(std::string_view text, std::size_t most) {
    std::size_t end = 0;
    while (end < text.size()) {
        const std::size_t length = std::max<std::size_t>(1, mdf_Utf8Length(text.substr(end)));
        if (end + length > most) break;
        end += length;
    }
    return text.substr(0, end);
}

std::string_view mdf_Utf8End(std::string_view text, std::size_t most) {
    std::size_t begin = text.size() > most ? text.size() - most : 0;
    while (begin + 1 < text.size() && IsInside(text[begin])) ++begin;
    return text.substr(begin);
}

std::string mdf_HexOf(unsigned char byte) {
    constexpr const char* digits = "0123456789ABCDEF";
    return {digits[byte >> 4], digits[byte & 15]};
}
