#include "study/sty_File.h"

#include "platform/plt_Files.h"

#include <cerrno>
#include <system_error>

namespace {

constexpr std::size_t kPieceBytes = std::size_t{1} << 20;

} // namespace

sty_Descriptor::~sty_Descriptor() {
    if (number_ >= 0) plt_Close(number_);
}

sty_File::sty_File(const std::string& path) : file_(plt_OpenToRead(path.c_str())), buffer_(kPieceBytes) {
    plt_Status found = {};
    if (!file_.IsOpen() || plt_InspectOpen(file_.Number(), &found) != 0) {
        error_ = errno;
    } else if (plt_IsFolder(found)) {
        error_ = EISDIR;
    }
}

std::string_view sty_File::Next() {
    while (error_ == 0) {
        const ssize_t count = plt_Read(file_.Number(), buffer_.data(), buffer_.size());
        if (count >= 0) return {buffer_.data(), static_cast<std::size_t>(count)};
        if (errno != EINTR) error_ = errno;
    }
    return {};
}

std::string sty_ReasonOf(int error) {
    return std::generic_category().message(error == 0 ? EIO : error);
}
