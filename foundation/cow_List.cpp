#include "foundation/cow_List.h"

#include "foundation/nex_Exception.h"

#include <string>

void cow_RaiseOutOfRange(int index, int count) {
    const std::string text = "cow_List: index " + std::to_string(index) + " is out of range, expected 0 to " +
                             std::to_string(count - 1) + (count == 0 ? " (the list is empty)" : "");
    nex_Raise(atr_String(std::string_view(text)));
}
