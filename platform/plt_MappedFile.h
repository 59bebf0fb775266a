#ifndef QRX_PLATFORM_PLT_MAPPEDFILE_H
#define QRX_PLATFORM_PLT_MAPPEDFILE_H

#include <cstddef>
#include <string>
#include <string_view>

/// A whole regular file, mapped into memory for reading.
class plt_MappedFile {
public:
    explicit plt_MappedFile(const std::string& path);
    plt_MappedFile(const plt_MappedFile&) = delete;
    plt_MappedFile& operator=(const plt_MappedFile&) = delete;
    ~plt_MappedFile();

    /// The errno value of what failed: EISDIR for a folder, ENOTSUP for what is no regular file, 0 for none.
    int Error() const { return error_; }
    std::string_view Bytes() const { return {begin_, size_}; }

private:
    /// Those of the system. Opening waits for nobody; mapping gives null where it fails. Both set errno then.
    static int Open(const char* path);
    static const char* Map(int file, std::size_t bytes);

    const char* begin_ = nullptr;
    std::size_t size_ = 0;
    int error_ = 0;
};

#endif
