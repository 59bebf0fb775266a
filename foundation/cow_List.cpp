#include "foundation/cow_List.h"

#include "foundation/nex_Exception.h"

#include <string>

void cow_RaiseOutOfRange(int index, int count, const char* what) {
    std::string text(what);
    text.append(" ").append(std::to_string(index)).append(" is out of range, ");
    if (count > 0) {
        text.append("expected 0 to ").append(std::to_string(count - 1));
    } else {
        text.append("there are no items");
    }
    nex_Raise(atr_String(std::string_view(text)));
}

void cow_RaiseNegative(int number, const char* what) {
    const std::string text = std::string(what) + " " + std::to_string(number) + " is negative";
    nex_Raise(atr_String(std::string_view(text)));
}
