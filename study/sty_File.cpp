#include "study/sty_File.h"

#include <cerrno>
#include <system_error>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

constexpr std::size_t kPieceBytes = std::size_t{1} << 20;

} // namespace

sty_Descriptor::~sty_Descriptor() {
    if (number_ >= 0) ::close(number_);
}

sty_File::sty_File(const std::string& path)
    : file_(::open(path.c_str(), O_RDONLY | O_CLOEXEC)), buffer_(kPieceBytes) {
    struct stat found = {};
    if (!file_.IsOpen() || ::fstat(file_.Number(), &found) != 0) {
        error_ = errno;
    } else if (S_ISDIR(found.st_mode)) {
        error_ = EISDIR;
    }
}

std::string_view sty_File::Next() {
    while (error_ == 0) {
        const ssize_t count = ::read(file_.Number(), buffer_.data(), buffer_.size());
        if (count >= 0) return {buffer_.data(), static_cast<std::size_t>(count)};
        if (errno != EINTR) error_ = errno;
    }
    return {};
}

std::string sty_ReasonOf(int error) {
    return std::generic_category().message(error == 0 ? EIO : error);
}
