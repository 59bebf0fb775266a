#include "view_page/vpg_Arrays.h"

#include <algorithm>
#include <bit>
#include <cstdint>

template <class Item, class Value>
int vpg_Arrays::Append(const char* type, const std::vector<Value>& values) {
    static_assert(std::endian::native == std::endian::little);
    bytes_.resize((bytes_.size() + 3) / 4 * 4, '\0');
    directory_.push_back({{"type", type}, {"offset", bytes_.size()}, {"length", values.size()}});
    std::vector<Item> items;
    items.reserve(values.size());
    for (const Value value : values) items.push_back(static_cast<Item>(value));
    if (!items.empty()) {
        bytes_.append(reinterpret_cast<const char*>(items.data()), items.size() * sizeof(Item));
    }
    return static_cast<int>(directory_.size()) - 1;
}

int vpg_Arrays::Add(const std::vector<int>& values) {
    const auto [least, most] = std::ranges::minmax_element(values);
    if (values.empty() || (*least >= 0 && *most <= UINT8_MAX)) return Append<std::uint8_t>("u8", values);
    if (*least >= 0 && *most <= UINT16_MAX) return Append<std::uint16_t>("u16", values);
    if (*least >= INT16_MIN && *most <= INT16_MAX) return Append<std::int16_t>("i16", values);
    return Append<std::int32_t>("i32", values);
}

int vpg_Arrays::Add(const std::vector<float>& values) {
    return Append<float>("f32", values);
}

int vpg_Arrays::AddRuns(const std::vector<int>& ascending) {
    std::vector<int> runs;
    for (const int value : ascending) {
        if (!runs.empty() && value == runs[runs.size() - 2] + runs.back()) {
            ++runs.back();
        } else {
            runs.insert(runs.end(), {value, 1});
        }
    }
    return Add(runs);
}

std::string vpg_Base64(std::string_view bytes) {
    static constexpr char kDigits[] = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
    std::string text;
    text.reserve((bytes.size() + 2) / 3 * 4);
    for (std::size_t i = 0; i < bytes.size(); i += 3) {
        unsigned group = 0;
        const std::size_t taken = std::min<std::size_t>(3, bytes.size() - i);
        for (std::size_t k = 0; k < 3; ++k) {
            group = group << 8 | (k < taken ? static_cast<unsigned char>(bytes[i + k]) : 0U);
        }
        for (std::size_t k = 0; k < 4; ++k) {
            text += k <= taken ? kDigits[group >> (18 - 6 * k) & 63U] : '=';
        }
    }
    return text;
}
