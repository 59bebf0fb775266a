#ifndef QRX_OIF_WRITER_H
#define QRX_OIF_WRITER_H

class odb_Odb;
class qio_ostream;

/// The way in: writes the model named "Default Model" of an open store as a deck.
class oif_Writer {
public:
    /// The store must outlive the writer.
    explicit oif_Writer(const odb_Odb& odb) : odb_(odb) {}

    /// Writes `<jobName>.inp`; the name may hold folders, and ".inp" is appended whatever it ends in. An old
    /// file of the name is deleted first. Nothing is reported when the file can't be opened or a write fails:
    /// qio_LastReport() tells. Raises QRXBasException (with a context) when the model can't be told in the
    /// deck's language; the file then stays as far as it was written.
    void WriteInputFile(const char* jobName);
    /// The same text, handed to a device of the caller's piece by piece. Raises likewise.
    void WriteTo(qio_ostream& device);

private:
    const odb_Odb& odb_;
};

#endif
