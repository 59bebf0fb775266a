#include "store_interface/propagation/mdl_StatusWords.h"

std::string mdl_StatusWords(std::string_view statusName) {
    std::string text;
    for (const char c : statusName) {
        text += c == '_' ? ' ' : static_cast<char>(c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c);
    }
    return text;
}
