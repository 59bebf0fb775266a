#ifndef QRX_STY_IDENTITY_H
#define QRX_STY_IDENTITY_H

#include "study/sty_Folder.h"

#include <utility>
#include <vector>

/// What a folder is the study of. It stands in the folder, so that nobody goes on with other decks there.
struct sty_Identity {
    std::string templatePath;
    std::string templateSha256;
    /// The model of the template whose decks they are; empty in folders of earlier versions.
    std::string model;
    std::string tablePath;
    std::string tableSha256;
    /// Mesher's files that the template names.
    std::vector<std::pair<std::string, std::string>> meshes;
    long long rows = 0;

    std::string Text() const;
    /// Nothing for a text that is none.
    static std::optional<sty_Identity> Of(const std::string& text);
    /// How the study that the folder holds differs from this one; empty when it is the same. Where files lie
    /// makes no difference.
    std::string DifferenceFrom(const sty_Identity& held) const;
};

#endif
