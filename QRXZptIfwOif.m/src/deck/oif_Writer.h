#ifndef QRX_OIF_WRITER_H
#define QRX_OIF_WRITER_H

#include <memory>

class oif_KeptDeck;
class oif_MeshTexts;
class odb_Odb;
class qio_ostream;

/// The way in: writes the model of an open store that decks are written from as a deck. Several threads may
/// write at once, each with a writer of its own, also from one store; nobody may change the store meanwhile.
class oif_Writer {
public:
    /// The store must outlive the writer. Large meshes and sets are laid out by as many threads; 0 stands for
    /// the process's usual number (thr_SetUsualThreads), which is one a core. Devices and the store's own
    /// code meet the calling thread alone, and the deck is the same with any number.
    explicit oif_Writer(const odb_Odb& odb, int threads = 0) : odb_(odb), threads_(threads) {}

    /// Writes `<jobName>.inp`; the name may hold folders, and ".inp" is appended whatever it ends in. An old
    /// file of the name is deleted first. Nothing is reported when the file can't be opened or a write fails:
    /// qio_LastReport() tells. Raises QRXBasException (with a context) when the model can't be told in the
    /// deck's language; the file then stays as far as it was written.
    void WriteInputFile(const char* jobName);
    /// Writes the same text to a device, which knows whether all of it arrived.
    void WriteInput(qio_ostream& device);
    /// The same, where texts of meshes that the device keeps are not made again.
    void WriteInput(oif_MeshTexts& device);
    /// The same, and keeps the deck for those of models that share with this one.
    std::unique_ptr<const oif_KeptDeck> Keep(oif_MeshTexts& device);
    /// As without a kept deck, of which nothing is made again that can't differ.
    void WriteInput(oif_MeshTexts& device, const oif_KeptDeck& kept);

private:
    const odb_Odb& odb_;
    int threads_;
};

#endif
