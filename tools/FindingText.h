#ifndef QRX_TOOLS_FINDINGTEXT_H
#define QRX_TOOLS_FINDINGTEXT_H

#include "store_interface/regions/rgnC_Region.h"

#include <string>

// Texts that findings about a model are made of.

inline std::string Text(const cow_String& text) {
    return std::string(text.View());
}

inline std::string Quoted(const cow_String& name) {
    return "'" + Text(name) + "'";
}

/// The JSON pointer of an object by its container and name.
inline std::string Place(const char* container, const cow_String& name) {
    std::string place = std::string("/") + container + "/";
    for (const char c : name.View()) {
        if (c == '~') {
            place += "~0";
        } else if (c == '/') {
            place += "~1";
        } else {
            place += c;
        }
    }
    return place;
}

inline const char* KindOf(const rgnC_Region& region) {
    switch (region.FlagWord()) {
    case 1: return "a node set";
    case 2: return "an element set";
    default: return "a surface";
    }
}

#endif
