#ifndef QRX_STORE_MDL_READNOTES_H
#define QRX_STORE_MDL_READNOTES_H

#include <vector>

/// While it lives, notes which repositories its thread reads, by the classes of their records: what is worked
/// out meanwhile holds for every model in which these, and all that is no repository, are the same.
class mdl_ReadNotes {
public:
    mdl_ReadNotes();
    mdl_ReadNotes(const mdl_ReadNotes&) = delete;
    mdl_ReadNotes& operator=(const mdl_ReadNotes&) = delete;
    /// What it has noted, those around it note too.
    ~mdl_ReadNotes();

    static void Note(unsigned itemTypeId);
    /// Something was used that no repository tells of, and that may be another one in another model.
    static void NoteUntold();

    bool HasRead(unsigned itemTypeId) const;

private:
    mdl_ReadNotes* outer_;
    std::vector<unsigned> read_;
    bool untold_ = false;
};

#endif
