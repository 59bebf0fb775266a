#ifndef QRX_STORE_ODIK_IGNORELIST_H
#define QRX_STORE_ODIK_IGNORELIST_H

#include "store_interface/model/odb_Odb.h"

/// What a store's models say is not to be told of them, each of its own findings alone.
class odiK_IgnoreList {
public:
    odiK_IgnoreList() = default;
    explicit odiK_IgnoreList(const odb_Odb& store);

    const std::vector<odiK_IgnoredFinding>& Entries() const { return entries_; }
    /// The first entry that the finding is passed over for; -1 for none. Errors never are.
    int EntryFor(const fnd_Finding& finding) const;
    /// Takes away what is passed over.
    void TakeFrom(std::vector<fnd_Finding>& findings) const;

private:
    std::vector<odiK_IgnoredFinding> entries_;
    std::vector<std::string> models_; // the pointer of the model that the entry is of
};

#endif
