#ifndef QRX_TOOLS_NUMBERTEXT_H
#define QRX_TOOLS_NUMBERTEXT_H

#include <cstdio>
#include <nlohmann/json.hpp>
#include <string>

// Numbers of descriptions, for people: six digits.

inline std::string NumberText(double value) {
    char text[32];
    std::snprintf(text, sizeof text, "%.6g", value);
    return text;
}

/// "(1, 2.5, -3)".
inline std::string PointText(const nlohmann::ordered_json& point) {
    std::string text = "(";
    for (std::size_t i = 0; i < 3; ++i) text += (i == 0 ? "" : ", ") + NumberText(point[i]);
    return text + ")";
}

#endif
