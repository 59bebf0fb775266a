#include "mesh_file/msf_Source.h"

#include <cerrno>
#include <fcntl.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <system_error>
#include <unistd.h>

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

msf_MappedFile::msf_MappedFile(const std::string& path) {
    // A pipe without a writer would hang an ordinary open.
    const int file = open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
    if (file < 0) FailWithReason(errno);
    struct stat status {};
    if (fstat(file, &status) != 0 || !S_ISREG(status.st_mode)) {
        const bool folder = S_ISDIR(status.st_mode);
        close(file);
        FailToOpen(folder ? "the file can't be read: it is a directory"
                          : "the file can't be read: it is no regular file");
    }
    size_ = static_cast<std::size_t>(status.st_size);
    void* mapped = size_ == 0 ? nullptr : mmap(nullptr, size_, PROT_READ, MAP_PRIVATE, file, 0);
    const int error = errno;
    close(file);
    if (mapped == MAP_FAILED) FailWithReason(error);
    begin_ = static_cast<const char*>(mapped);
    if (mapped != nullptr) madvise(mapped, size_, MADV_SEQUENTIAL);
}

msf_MappedFile::~msf_MappedFile() {
    if (begin_ != nullptr) munmap(const_cast<char*>(begin_), size_);
}
