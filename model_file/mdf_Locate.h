#ifndef QRX_MODEL_FILE_MDF_LOCATE_H
#define QRX_MODEL_FILE_MDF_LOCATE_H

#include "store_interface/findings/fnd_Finding.h"

#include <cstddef>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <vector>

/// Line and column, both from 1, the column in bytes and a byte order mark not counted.
void mdf_PutPosition(fnd_Finding& finding, std::string_view text, std::size_t offset);

/// Gives findings that have no line theirs: of the item in an array, or the name of the member, that is their
/// place in the document; of what is around it where the place itself isn't there. The text must be a
/// document without errors of syntax.
void mdf_Locate(std::string_view text, std::span<fnd_Finding> findings);

/// Where the names stand of the members of an object that have the name of an earlier one.
std::vector<std::size_t> mdf_RepeatedMembers(std::string_view text, std::size_t object);

/// A model file, for looking into it once more after it has been read. Files are not kept in memory but read
/// again; what can be read once only is kept.
class mdf_FileText {
public:
    /// To be made ahead of reading.
    explicit mdf_FileText(const std::string& path);
    bool CanBeReadAgain() const { return isFile_; }
    void Keep(std::string text) { kept_ = std::move(text); }

    /// mdf_Locate; without effect when the file has changed meanwhile.
    void Locate(std::span<fnd_Finding> findings) const;

private:
    bool IsUnchanged() const;

    std::string path_;
    bool isFile_ = false;
    long long size_ = -1;
    long long time_ = 0;
    std::string kept_;
};

#endif
