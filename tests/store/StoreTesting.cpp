#include "store/StoreTesting.h"

void CollectedProblems::Take(fnd_Finding finding) {
    all.push_back((finding.IsError() ? "" : "warning ") + finding.place + ": " + finding.Text());
}

std::vector<std::string> Texts(const cow_List<cow_String>& list) {
    std::vector<std::string> texts;
    for (int i = 0; i < list.Length(); ++i) texts.emplace_back(list[i].View());
    return texts;
}
