#ifndef QRX_STY_DECKTEXT_H
#define QRX_STY_DECKTEXT_H

#include "deck/oif_MeshTexts.h"
#include "store_interface/model/odiK_Mesh.h"
#include "study/sty_Sha256.h"

#include <list>
#include <map>
#include <mutex>
#include <optional>
#include <span>
#include <vector>

/// The texts of the last meshes, which all threads of a study share.
class sty_MeshTexts {
public:
    using Text = oif_MeshTexts::Text;

    Text Find(const odiK_Mesh& mesh, oif_MeshBlockEnm block);
    /// Gives the text that is kept, which another thread may have made.
    Text Keep(const cow_CountedHld<odiK_Mesh>& mesh, oif_MeshBlockEnm block, const Text& text);

private:
    struct Entry {
        cow_CountedHld<odiK_Mesh> mesh; // so that no other mesh gets its address
        Text texts[oif_kMeshBlocks];
    };
    std::mutex mutex_;
    std::list<Entry> entries_; // the last one used is the first
};

/// The text of one deck after the other, as pieces: bytes of its own, and texts of meshes that it shares. Its
/// sum goes on from where another deck with the same beginning stood.
class sty_DeckText final : public oif_MeshTexts {
public:
    explicit sty_DeckText(sty_MeshTexts& meshes) : meshes_(meshes) {}

    /// Begins the next deck.
    void Begin();
    void Write(const char* text, std::size_t bytes) override { own_.append(text, bytes); }
    Text Find(const odiK_Mesh& mesh, oif_MeshBlockEnm block) override { return meshes_.Find(mesh, block); }
    Text Keep(const cow_CountedHld<odiK_Mesh>& mesh, oif_MeshBlockEnm block, const Text& text) override {
        return meshes_.Keep(mesh, block, text);
    }
    void WriteKept(const Text& text) override;

    long long Bytes() const;
    std::string Whole() const;
    /// The SHA-256 of the deck.
    std::string Sha256();
    /// Writes the deck to an open file; the errno value of a failure, 0 for none.
    int WriteTo(int file) const;

private:
    struct Piece {
        std::size_t ownEnd; ///< where the bytes of its own end that stand before the kept text
        Text kept;
    };
    /// A deck that was summed up, and its sum at some places.
    struct Summed {
        struct Mark {
            std::size_t pieces; ///< kept texts that stand before it
            std::size_t own;    ///< bytes of its own that stand before it
            sty_Sha256 sum;
        };
        Text first; // the first kept text; null for none
        std::vector<Piece> pieces;
        std::string own;
        std::vector<Mark> marks;
    };

    /// A place in a deck.
    struct Place {
        std::size_t pieces;
        std::size_t own;
    };
    Summed& SummedLike();
    Place CommonEnd(const Summed& former) const;

    sty_MeshTexts& meshes_;
    std::string own_;
    std::vector<Piece> pieces_;
    std::list<Summed> summed_; // the last one used is the first
};

#endif
