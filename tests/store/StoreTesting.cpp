#include "store/StoreTesting.h"

void CollectedProblems::Error(const std::string& place, const std::string& text) {
    all.push_back(place + ": " + text);
}

void CollectedProblems::Warning(const std::string& place, const std::string& text) {
    all.push_back("warning " + place + ": " + text);
}

std::vector<std::string> Texts(const cow_List<cow_String>& list) {
    std::vector<std::string> texts;
    for (int i = 0; i < list.Length(); ++i) texts.emplace_back(list[i].View());
    return texts;
}
