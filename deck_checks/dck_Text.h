#ifndef QRX_DCK_TEXT_H
#define QRX_DCK_TEXT_H

#include "store_interface/findings/fnd_Finding.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/regions/rgnC_Region.h"

// Texts that findings about a model are made of.

inline std::string Text(const cow_String& text) {
    return std::string(text.View());
}

inline std::string Quoted(const cow_String& name) {
    return fnd_Quoted(name.View());
}

/// The JSON pointer of an object by its container and name.
inline std::string Place(const char* container, const cow_String& name) {
    std::string place = std::string("/") + container;
    fnd_AppendPointer(place, name.View());
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
