#include "mesh_file/msf_Source.h"

#include <algorithm>
#include <cerrno>
#include <system_error>

namespace {

[[noreturn]] void FailToOpen(std::string why) {
    msf_Problem problem;
    problem.found = std::move(why);
    problem.unreadable = true;
    throw msf_Failure{std::move(problem)};
}

[[noreturn]] void FailWithReason(int error) {
    FailToOpen("the file can't be read: " + std::generic_category().message(error));
}

} // namespace

std::string msf_Problem::Text() const {
    std::string text = place.empty() ? std::string() : place + ": ";
    text += found;
    if (!expected.empty()) text.append(", expected ").append(expected);
    return text;
}

void msf_Fail(std::string place, std::string found, std::string expected) {
    throw msf_Failure{{std::move(place), std::move(found), std::move(expected), false}};
}

std::string msf_Shown(std::string_view text) {
    constexpr std::size_t kLongest = 60;
    constexpr const char* kDigits = "0123456789ABCDEF";
    std::string shown = "'";
    std::size_t length = std::min(text.size(), kLongest);
    // Not in the middle of a character of UTF-8.
    while (length < text.size() && length > 0 && (static_cast<unsigned char>(text[length]) & 0xC0) == 0x80)
        --length;
    for (const char c : text.substr(0, length)) {
        const auto byte = static_cast<unsigned char>(c);
        if (byte >= 0x20 && byte != 0x7F) {
            shown += c;
        } else {
            shown.append("\\x").append({kDigits[byte >> 4], kDigits[byte & 15]});
        }
    }
    return shown + (length < text.size() ? "'..." : "'");
}

std::string msf_Counted(long long count, const char* thing) {
    return std::to_string(count) + " " + thing + (count == 1 ? "" : "s");
}

msf_MappedFile::msf_MappedFile(const std::string& path) : file_(path) {
    switch (file_.Error()) {
    case 0: return;
    case EISDIR: FailToOpen("the file can't be read: it is a directory");
    case ENOTSUP: FailToOpen("the file can't be read: it is no regular file");
    default: FailWithReason(file_.Error());
    }
}
