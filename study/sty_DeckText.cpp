#include "study/sty_DeckText.h"

#include "platform/plt_Files.h"
#include "study/sty_File.h"

#include <algorithm>
#include <cerrno>

namespace {

// Of large meshes the last two are kept whatever they take, so that rows may go to and fro.
constexpr std::size_t kMostMeshes = 16;
constexpr std::size_t kFewMeshes = 2;
constexpr std::size_t kMostMeshBytes = std::size_t{256} << 20;
constexpr std::size_t kMostSummed = 8;
constexpr std::size_t kBytesOfMark = std::size_t{2} * 1024;
constexpr std::size_t kLeastOfMark = 64;

} // namespace

sty_MeshTexts::Text sty_MeshTexts::Find(const odiK_Mesh& mesh, oif_MeshBlockEnm block) {
    const std::lock_guard<std::mutex> lock(mutex_);
    const auto place = std::ranges::find(entries_, &mesh, [](const Entry& e) { return e.mesh.Referent(); });
    if (place == entries_.end()) return nullptr;
    entries_.splice(entries_.begin(), entries_, place);
    return entries_.front().texts[static_cast<int>(block)];
}

sty_MeshTexts::Text sty_MeshTexts::Keep(const cow_CountedHld<odiK_Mesh>& mesh, oif_MeshBlockEnm block,
                                        const Text& text) {
    const std::lock_guard<std::mutex> lock(mutex_);
    auto place =
        std::ranges::find(entries_, mesh.Referent(), [](const Entry& e) { return e.mesh.Referent(); });
    if (place == entries_.end()) {
        entries_.push_front({mesh, {}});
        place = entries_.begin();
    }
    Text& kept = place->texts[static_cast<int>(block)];
    if (kept != nullptr) return kept;
    kept = text;
    const auto bytes = [this] {
        std::size_t all = 0;
        for (const Entry& entry : entries_) {
            for (const Text& each : entry.texts) all += each == nullptr ? 0 : each->size();
        }
        return all;
    };
    while (entries_.size() > kMostMeshes || (entries_.size() > kFewMeshes && bytes() > kMostMeshBytes))
        entries_.pop_back();
    return text;
}

void sty_DeckText::Begin() {
    own_.clear();
    pieces_.clear();
}

void sty_DeckText::WriteKept(const Text& text) {
    pieces_.push_back({own_.size(), text});
}

long long sty_DeckText::Bytes() const {
    std::size_t bytes = own_.size();
    for (const Piece& piece : pieces_) bytes += piece.kept->size();
    return static_cast<long long>(bytes);
}

std::string sty_DeckText::Whole() const {
    std::string whole;
    whole.reserve(static_cast<std::size_t>(Bytes()));
    std::size_t written = 0;
    for (const Piece& piece : pieces_) {
        whole.append(own_, written, piece.ownEnd - written).append(*piece.kept);
        written = piece.ownEnd;
    }
    return whole.append(own_, written);
}

/// The last deck that begins with the same mesh, or none yet.
sty_DeckText::Summed& sty_DeckText::SummedLike() {
    const Text first = pieces_.empty() ? nullptr : pieces_.front().kept;
    const auto place = std::ranges::find(summed_, first, &Summed::first);
    if (place != summed_.end()) {
        summed_.splice(summed_.begin(), summed_, place);
        return summed_.front();
    }
    if (summed_.size() >= kMostSummed) summed_.pop_back();
    summed_.emplace_front();
    summed_.front().first = first;
    summed_.front().marks.push_back({0, 0, sty_Sha256()});
    return summed_.front();
}

/// Where the decks begin to differ, or one of them ends.
sty_DeckText::Place sty_DeckText::CommonEnd(const Summed& former) const {
    Place place = {0, 0};
    for (;; ++place.pieces) {
        const bool atEnd = place.pieces >= pieces_.size() || place.pieces >= former.pieces.size();
        const std::size_t end = place.pieces < pieces_.size() ? pieces_[place.pieces].ownEnd : own_.size();
        const std::size_t formerEnd =
            place.pieces < former.pieces.size() ? former.pieces[place.pieces].ownEnd : former.own.size();
        const std::size_t least = std::min(end, formerEnd);
        const auto begin = own_.begin() + static_cast<std::ptrdiff_t>(place.own);
        const auto differ = std::mismatch(begin, own_.begin() + static_cast<std::ptrdiff_t>(least),
                                          former.own.begin() + static_cast<std::ptrdiff_t>(place.own));
        place.own = static_cast<std::size_t>(differ.first - own_.begin());
        if (atEnd || end != formerEnd || place.own < least ||
            pieces_[place.pieces].kept != former.pieces[place.pieces].kept)
            return place;
    }
}

std::string sty_DeckText::Sha256() {
    Summed& summed = SummedLike();
    const Place common = CommonEnd(summed);
    while (summed.marks.back().pieces > common.pieces || summed.marks.back().own > common.own)
        summed.marks.pop_back();
    Summed::Mark at = summed.marks.back();
    for (;; ++at.pieces) {
        const bool last = at.pieces == pieces_.size();
        const std::size_t end = last ? own_.size() : pieces_[at.pieces].ownEnd;
        while (at.own < end) {
            std::size_t step = std::min(end - at.own, kBytesOfMark);
            // The next deck is likely to differ at the same place.
            const bool reaches = at.pieces == common.pieces && at.own + kLeastOfMark <= common.own;
            if (reaches) step = std::min(step, common.own - at.own);
            at.sum.Add(std::string_view(own_).substr(at.own, step));
            at.own += step;
            if (step == kBytesOfMark || reaches) summed.marks.push_back(at);
        }
        if (last) break;
        at.sum.Add(*pieces_[at.pieces].kept);
        summed.marks.push_back({at.pieces + 1, at.own, at.sum});
    }
    summed.pieces = pieces_;
    summed.own = own_;
    return at.sum.Hex();
}

int sty_DeckText::WriteTo(int file) const {
    std::vector<plt_Piece> left;
    const auto add = [&](std::string_view text) {
        if (!text.empty()) left.push_back({text.data(), text.size()});
    };
    const std::string_view own = own_;
    std::size_t written = 0;
    for (const Piece& piece : pieces_) {
        add(own.substr(written, piece.ownEnd - written));
        add(*piece.kept);
        written = piece.ownEnd;
    }
    add(own.substr(written));
    for (std::size_t first = 0; first < left.size();) {
        errno = 0;
        const ssize_t taken = plt_WritePieces(file, left.data() + first, left.size() - first);
        if (taken <= 0) {
            if (errno == EINTR) continue;
            return errno != 0 ? errno : EIO;
        }
        for (auto bytes = static_cast<std::size_t>(taken); bytes > 0;) {
            plt_Piece& piece = left[first];
            const std::size_t step = std::min(bytes, piece.bytes);
            piece.text += step;
            piece.bytes -= step;
            bytes -= step;
            if (piece.bytes == 0) ++first;
        }
    }
    return 0;
}
