#ifndef QRX_VPG_ARRAYS_H
#define QRX_VPG_ARRAYS_H

#include <nlohmann/json.hpp>

#include <string>
#include <vector>

/// The binary arrays of a page, one behind the other, little-endian, each at a multiple of four bytes. The
/// header names an array by its place in Directory().
class vpg_Arrays {
public:
    /// Whole numbers, in the shortest type that holds them all: "u8", "u16" or "i32", "i16" with negative
    /// ones.
    int Add(const std::vector<int>& values);
    /// "f32".
    int Add(const std::vector<float>& values);
    /// Ascending whole numbers as runs: first, length, first, length, ...
    int AddRuns(const std::vector<int>& ascending);

    /// {"type", "offset" in bytes, "length" in items} of each array.
    const nlohmann::ordered_json& Directory() const { return directory_; }
    const std::string& Bytes() const { return bytes_; }

private:
    template <class Item, class Value>
    int Append(const char* type, const std::vector<Value>& values);

    nlohmann::ordered_json directory_ = nlohmann::ordered_json::array();
    std::string bytes_;
};

/// Bytes as base64 text, without line breaks.
std::string vpg_Base64(std::string_view bytes);

#endif
