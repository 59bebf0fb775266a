#ifndef QRX_TESTS_STREAM_REALTEXTREFERENCE_H
#define QRX_TESTS_STREAM_REALTEXTREFERENCE_H

#include "foundation/num_RealText.h"

#include <cstdio>
#include <string>
#include <vector>

namespace reference {

/// The C library's text for the four format cases, in the normal form written out here a second time.
inline std::string RealText(double value, int width, int precision) {
    char printed[512];
    if (width != 0 && precision != 0) {
        std::snprintf(printed, sizeof printed, "%*.*lg", width, precision, value);
    } else if (width != 0) {
        std::snprintf(printed, sizeof printed, "%*.lg", width, value);
    } else if (precision != 0) {
        std::snprintf(printed, sizeof printed, "%.*lg", precision, value);
    } else {
        std::snprintf(printed, sizeof printed, "%lg", value);
    }
    std::string text(printed);
    text.erase(0, text.find_first_not_of(' '));
    bool real = false;
    for (const char c : text) {
        real = real || c == '.' || c == 'e' || c == 'E' || c == 'n' || c == 'N' || c == 'i' || c == 'I';
    }
    if (!real) text += '.';
    const auto field = static_cast<std::size_t>(width);
    return text.size() < field ? std::string(field - text.size(), ' ').append(text) : text;
}

/// What num_WriteReal makes, checked against the room that it asks for.
inline std::string WrittenText(double value, int width, int precision) {
    const std::size_t room = num_RealRoom(width, precision);
    std::vector<char> memory(room + 16, '\x7f');
    const char* end = num_WriteReal(memory.data(), value, width, precision);
    for (std::size_t i = room; i < memory.size(); ++i) {
        if (memory[i] != '\x7f') return "room overrun";
    }
    return {static_cast<const char*>(memory.data()), end};
}

inline bool Agrees(double value, int width, int precision) {
    char text[128];
    const char* end = num_WriteReal(text, value, width, precision);
    return std::string_view(text, static_cast<std::size_t>(end - text)) == RealText(value, width, precision);
}

} // namespace reference

#endif
