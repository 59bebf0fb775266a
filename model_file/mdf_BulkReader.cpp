#include "model_file/mdf_BulkReader.h"

#include "foundation/thr_InOrder.h"
#include "model_file/mdf_Number.h"
#include "model_file/mdf_Token.h"

#include <algorithm>
#include <cstring>
#include <new>
#include <type_traits>
#if defined(__SSE2__)
#include <emmintrin.h>
#endif

struct mdf_BulkReader::Piece {
    const char* begin;
    /// Where the next piece begins, or the bracket that closes the array.
    const char* end;
    /// Of the numbers or rows ahead.
    std::size_t first;
    std::size_t count;
    bool isLast = false;
    /// How many could be read, and where the next one begins.
    std::size_t done = 0;
    const char* at = nullptr;
    mdf_Numbers::Marks marks{};
};

namespace {

constexpr std::ptrdiff_t kPieceBytes = 256 * 1024;

/// Where the next bracket is, or the end.
inline const char* FindBracket(const char* at, const char* end) {
#if defined(__SSE2__)
    const __m128i opening = _mm_set1_epi8('[');
    const __m128i closing = _mm_set1_epi8(']');
    for (; end - at >= 16; at += 16) {
        const __m128i text = _mm_loadu_si128(reinterpret_cast<const __m128i*>(at));
        const int found =
            _mm_movemask_epi8(_mm_or_si128(_mm_cmpeq_epi8(text, opening), _mm_cmpeq_epi8(text, closing)));
        if (found != 0) return at + std::countr_zero(static_cast<unsigned>(found));
    }
#endif
    while (at != end && *at != '[' && *at != ']') ++at;
    return at;
}

std::size_t CountCommas(const char* at, const char* end) {
    std::size_t count = 0;
#if defined(__SSE2__)
    const __m128i comma = _mm_set1_epi8(',');
    while (end - at >= 16) {
        // Bytes hold up to 255 each before they are added up.
        __m128i sums = _mm_setzero_si128();
        for (int i = 0; i < 255 && end - at >= 16; ++i, at += 16) {
            const __m128i text = _mm_loadu_si128(reinterpret_cast<const __m128i*>(at));
            sums = _mm_sub_epi8(sums, _mm_cmpeq_epi8(text, comma));
        }
        const __m128i halves = _mm_sad_epu8(sums, _mm_setzero_si128());
        count += static_cast<std::size_t>(_mm_cvtsi128_si32(halves)) +
                 static_cast<std::size_t>(_mm_cvtsi128_si32(_mm_srli_si128(halves, 8)));
    }
#endif
    return count + static_cast<std::size_t>(std::count(at, end, ','));
}

inline const char* PassBlanks(const char* at, const char* end) {
    if (at != end && *at == ' ') ++at;
    while (at != end && mdf_IsBlank(*at)) ++at;
    return at;
}

inline bool Passes(const char*& at, const char* end, char sign) {
    if (at == end || *at != sign) return false;
    at = PassBlanks(at + 1, end);
    return true;
}

} // namespace

mdf_BulkReader::Pieces mdf_BulkReader::NumbersAhead() const {
    Pieces pieces;
    const void* const found = std::memchr(at_, ']', static_cast<std::size_t>(end_ - at_));
    if (found == nullptr) return pieces;
    const auto* const close = static_cast<const char*>(found);
    std::size_t first = 0;
    for (const char* begin = at_; begin != close;) {
        const char* next = close;
        if (close - begin > kPieceBytes) {
            next = std::find(begin + kPieceBytes, close, ',');
            if (next != close) next = PassBlanks(next + 1, close);
        }
        const std::size_t count = CountCommas(begin, next) + (next == close ? 1 : 0);
        pieces.push_back({begin, next, first, count});
        first += count;
        begin = next;
    }
    return pieces;
}

mdf_BulkReader::Pieces mdf_BulkReader::RowsAhead() const {
    Pieces pieces;
    Piece piece{at_, at_, 0, 0};
    for (const char* at = at_; at != end_; ++at) {
        at = FindBracket(at, end_);
        if (at == end_) return {};
        if (*at == ']') {
            piece.end = at;
            if (piece.count > 0) pieces.push_back(piece);
            return pieces;
        }
        if (at - piece.begin > kPieceBytes) {
            piece.end = at;
            pieces.push_back(piece);
            piece = {at, at, piece.first + piece.count, 0};
        }
        ++piece.count;
        at = FindBracket(at + 1, end_);
        if (at == end_ || *at == '[') return {};
    }
    return {};
}

template <bool inRows, class T>
void mdf_BulkReader::ReadPiece(Piece& piece, T* out, std::size_t length) const {
    const char* at = piece.begin;
    std::size_t place = 0;
    for (; piece.done < piece.count; ++piece.done) {
        piece.at = at;
        if (inRows && !Passes(at, end_, '[')) return;
        for (std::size_t j = 0; j < length; ++j, ++place) {
            if (j > 0 && !Passes(at, end_, ',')) return;
            if (at == end_ || !mdf_BeginsNumber(*at)) return;
            const mdf_Number number = mdf_ReadNumber(at, end_);
            if constexpr (std::is_same_v<T, int>) {
                if (number.kind != mdf_Number::Kind::INT) return;
                out[place] = number.whole;
            } else {
                if (number.kind >= mdf_Number::Kind::BROKEN) return;
                out[place] = number.kind == mdf_Number::Kind::INT ? number.whole : number.value;
                if (number.kind == mdf_Number::Kind::INT) piece.marks.isInt.Mark(place);
                if (number.kind == mdf_Number::Kind::LARGE) piece.marks.isLarge.Mark(place);
            }
            at = PassBlanks(number.end, end_);
        }
        if (inRows && !Passes(at, end_, ']')) return;
        const bool last = piece.done + 1 == piece.count;
        if (!(last && piece.isLast) && !Passes(at, end_, ',')) return;
        if (last ? at != piece.end : at >= piece.end) return;
    }
}

template <bool inRows, class T>
bool mdf_BulkReader::ReadPieces(Pieces& pieces, mdf_Numbers& numbers, std::vector<T>& values,
                                std::size_t length) {
    const std::size_t before = values.size();
    values.resize(before + (pieces.back().first + pieces.back().count) * length);
    thr_ForEach(threads_, pieces.size(), [&](std::size_t i) {
        Piece& piece = pieces[i];
        try {
            ReadPiece<inRows>(piece, values.data() + before + piece.first * length, length);
        } catch (const std::bad_alloc&) {
            piece.done = 0;
            piece.at = piece.begin;
        }
        if (progress_ != nullptr) progress_->Add(piece.end - piece.begin);
    });
    for (const Piece& piece : pieces) {
        numbers.AddMarks(piece.marks, before + piece.first * length);
        if (piece.done == piece.count) continue;
        at_ = piece.at;
        numbers.Truncate(before + (piece.first + piece.done) * length);
        return false;
    }
    at_ = pieces.back().end;
    return true;
}

template <bool inRows>
bool mdf_BulkReader::Read(mdf_Numbers& numbers, std::size_t length) {
    Pieces pieces = inRows ? RowsAhead() : NumbersAhead();
    if (pieces.empty()) return false;
    // A number and its comma take two bytes, so rows that can't all be that long are not.
    const auto bytes = static_cast<std::size_t>(pieces.back().end - at_);
    if (pieces.back().first + pieces.back().count > (bytes + 1) / 2 / length) return false;
    pieces.back().isLast = true;
    return numbers.allInts ? ReadPieces<inRows>(pieces, numbers, numbers.ints, length)
                           : ReadPieces<inRows>(pieces, numbers, numbers.reals, length);
}

bool mdf_BulkReader::ReadNumbers(mdf_Numbers& numbers) {
    return Read<false>(numbers, 1);
}

bool mdf_BulkReader::ReadRows(mdf_Rows& rows) {
    const bool whole = Read<true>(rows.numbers, rows.length);
    rows.count = rows.numbers.Size() / rows.length;
    return whole;
}
