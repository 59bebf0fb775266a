#include "store_interface/records/part_attributes/bme_MapPropertyArray.h"

namespace {

std::size_t LengthOfCode(std::uint64_t number) {
    std::size_t length = 1;
    while ((number >>= 7) != 0) ++length;
    return length;
}

void AppendCode(std::vector<unsigned char>& code, std::uint64_t number) {
    for (; number >= 0x80; number >>= 7) code.push_back(static_cast<unsigned char>(number | 0x80));
    code.push_back(static_cast<unsigned char>(number));
}

} // namespace

bme_MapPropertyArray::bme_MapPropertyArray(const bme_PropertyArray& properties)
    : keyOfKind_(properties.Kinds().size(), -1) {
    std::vector<Group> groups;
    properties.ForEachRun([&](int first, int count, std::uint32_t kind) {
        int& key = keyOfKind_[kind];
        if (key < 0) {
            key = static_cast<int>(groups.size());
            groups.emplace_back().property = properties.Kinds()[kind];
        }
        Group& group = groups[static_cast<std::size_t>(key)];
        group.numElements += count;
        group.codeLength += LengthOfCode(Head(group, first, count));
        if (count > 1) group.codeLength += LengthOfCode(static_cast<std::uint64_t>(count));
        group.end = first + count;
    });
    for (Group& group : groups) groups_.Append(std::move(group));
}

void bme_MapPropertyArray::KeepElements(const bme_PropertyArray& properties,
                                        const std::vector<bool>& wanted) {
    std::vector<Group*> groups(wanted.size(), nullptr);
    for (std::size_t key = 0; key < wanted.size(); ++key) {
        if (!wanted[key]) continue;
        Group& group = groups_.Get(static_cast<int>(key));
        group.end = 0;
        group.code.clear();
        group.code.reserve(group.codeLength);
        groups[key] = &group;
    }
    properties.ForEachRun([&](int first, int count, std::uint32_t kind) {
        Group* group = groups[static_cast<std::size_t>(keyOfKind_[kind])];
        if (group == nullptr) return;
        AppendCode(group->code, Head(*group, first, count));
        if (count > 1) AppendCode(group->code, static_cast<std::uint64_t>(count));
        group->end = first + count;
    });
}
