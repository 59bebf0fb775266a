#ifndef QRX_STY_JSON_H
#define QRX_STY_JSON_H

#include <string>
#include <string_view>

/// Appends the text, which is UTF-8, as a JSON string.
inline void sty_AppendQuoted(std::string& json, std::string_view text) {
    constexpr char digits[] = "0123456789abcdef";
    json += '"';
    for (const char c : text) {
        if (c == '"' || c == '\\') {
            json += '\\';
            json += c;
        } else if (static_cast<unsigned char>(c) < 0x20) {
            json += "\\u00";
            json += digits[static_cast<unsigned char>(c) >> 4];
            json += digits[c & 15];
        } else {
            json += c;
        }
    }
    json += '"';
}
inline std::string sty_Quoted(std::string_view text) {
    std::string json;
    sty_AppendQuoted(json, text);
    return json;
}

#endif
