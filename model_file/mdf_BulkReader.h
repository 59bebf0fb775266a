#ifndef QRX_MODEL_FILE_MDF_BULKREADER_H
#define QRX_MODEL_FILE_MDF_BULKREADER_H

#include "foundation/thr_Progress.h"
#include "model_file/mdf_ValueData.h"

#include <cstddef>

/// Reads the rest of a large array of numbers, or of rows of numbers that are equally long, into memory of
/// its final size, piece by piece and in several threads. What is no such number or row, a comment among
/// them, is left to the reader of documents: it finds `at` there.
class mdf_BulkReader {
public:
    /// `at` is where the next number or row begins, `end` the end of the document; null for no progress.
    mdf_BulkReader(const char*& at, const char* end, int threads, thr_Progress* progress)
        : at_(at), end_(end), threads_(threads), progress_(progress) {}

    /// True when all was read, up to the bracket that closes the array.
    bool ReadNumbers(mdf_Numbers& numbers);
    bool ReadRows(mdf_Rows& rows);

private:
    struct Piece;
    using Pieces = std::vector<Piece>;

    Pieces NumbersAhead() const;
    Pieces RowsAhead() const;
    template <bool inRows>
    bool Read(mdf_Numbers& numbers, std::size_t length);
    template <bool inRows, class T>
    bool ReadPieces(Pieces& pieces, mdf_Numbers& numbers, std::vector<T>& values, std::size_t length);
    template <bool inRows, class T>
    void ReadPiece(Piece& piece, T* out, std::size_t length) const;

    const char*& at_;
    const char* end_;
    int threads_;
    thr_Progress* progress_;
};

#endif
