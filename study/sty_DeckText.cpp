#include "study/sty_DeckText.h"

#include "store_interface/model/odb_Odb.h"
#include "study/sty_File.h"

#include <algorithm>
#include <cerrno>

#include <sys/uio.h>

namespace {

constexpr std::size_t kMostMeshes = 16;
constexpr std::size_t kMostBeginnings = 64;
constexpr int kMostVectors = 64;

} // namespace

sty_MeshTexts::Text sty_MeshTexts::Find(const odiK_Mesh& mesh, oif_MeshBlockEnm block) {
    const std::lock_guard<std::mutex> lock(mutex_);
    const auto place = std::ranges::find(entries_, &mesh, [](const Entry& e) { return e.mesh.Referent(); });
    if (place == entries_.end()) return nullptr;
    entries_.splice(entries_.begin(), entries_, place);
    return entries_.front().texts[static_cast<int>(block)];
}

void sty_MeshTexts::Keep(const cow_CountedHld<odiK_Mesh>& mesh, oif_MeshBlockEnm block, const Text& text) {
    const std::lock_guard<std::mutex> lock(mutex_);
    auto place =
        std::ranges::find(entries_, mesh.Referent(), [](const Entry& e) { return e.mesh.Referent(); });
    if (place == entries_.end()) {
        entries_.push_front({mesh, {}});
        place = entries_.begin();
        if (entries_.size() > kMostMeshes) entries_.pop_back();
    }
    place->texts[static_cast<int>(block)] = text;
}

void sty_DeckText::Begin(const odb_Odb& store) {
    store_ = &store;
    own_.clear();
    pieces_.clear();
}

void sty_DeckText::Keep(const odiK_Mesh& mesh, oif_MeshBlockEnm block, const Text& text) {
    const odiK_Model* model = store_->FindModel(odb_Odb::DefaultModelName());
    for (const auto& [name, instance] : model->Instances()) {
        const cow_CountedHld<odiK_Mesh> held = instance->Mesh();
        if (held.Referent() == &mesh) return meshes_.Keep(held, block, text);
    }
}

void sty_DeckText::WriteKept(const Text& text) {
    pieces_.push_back({own_.size(), text});
}

std::string_view sty_DeckText::OwnOf(std::size_t piece) const {
    const std::size_t begin = piece == 0 ? 0 : pieces_[piece - 1].ownEnd;
    return std::string_view(own_).substr(begin, pieces_[piece].ownEnd - begin);
}

std::string_view sty_DeckText::OwnEnd() const {
    return std::string_view(own_).substr(pieces_.empty() ? 0 : pieces_.back().ownEnd);
}

long long sty_DeckText::Bytes() const {
    std::size_t bytes = own_.size();
    for (const Piece& piece : pieces_) bytes += piece.kept->size();
    return static_cast<long long>(bytes);
}

std::string sty_DeckText::Sha256() {
    sty_Sha256 sum;
    int at = -1;
    if (beginnings_.size() + pieces_.size() > kMostBeginnings) beginnings_.clear();
    for (std::size_t i = 0; i < pieces_.size(); ++i) {
        const std::string_view own = OwnOf(i);
        const auto known = std::ranges::find_if(beginnings_, [&](const Beginning& beginning) {
            return beginning.former == at && beginning.kept == pieces_[i].kept && beginning.own == own;
        });
        if (known != beginnings_.end()) {
            sum = known->sum;
            at = static_cast<int>(known - beginnings_.begin());
            continue;
        }
        sum.Add(own);
        sum.Add(*pieces_[i].kept);
        beginnings_.push_back({at, std::string(own), pieces_[i].kept, sum});
        at = static_cast<int>(beginnings_.size()) - 1;
    }
    sum.Add(OwnEnd());
    return sum.Hex();
}

int sty_DeckText::WriteTo(int file) const {
    std::vector<iovec> vectors;
    const auto add = [&](std::string_view text) {
        if (!text.empty()) vectors.push_back({const_cast<char*>(text.data()), text.size()});
    };
    for (std::size_t i = 0; i < pieces_.size(); ++i) {
        add(OwnOf(i));
        add(*pieces_[i].kept);
    }
    add(OwnEnd());
    for (std::size_t first = 0; first < vectors.size();) {
        const int count = static_cast<int>(std::min<std::size_t>(vectors.size() - first, kMostVectors));
        errno = 0;
        const ssize_t taken = ::writev(file, vectors.data() + first, count);
        if (taken <= 0) {
            if (errno == EINTR) continue;
            return errno != 0 ? errno : EIO;
        }
        for (auto left = static_cast<std::size_t>(taken); left > 0;) {
            iovec& vector = vectors[first];
            const std::size_t step = std::min(left, vector.iov_len);
            vector.iov_base = static_cast<char*>(vector.iov_base) + step;
            vector.iov_len -= step;
            left -= step;
            if (vector.iov_len == 0) ++first;
        }
    }
    return 0;
}
