#include "foundation/cow_Map.h"

#include "foundation/nex_Exception.h"

#include <string>

void cow_RaiseNoSuchKey(const char* container, const cow_String& key) {
    std::string text(container);
    text.append(": no entry named '").append(key.View()).append("'");
    nex_Raise(atr_String(std::string_view(text)));
}
