#ifndef QRX_OIF_KEPTDECK_H
#define QRX_OIF_KEPTDECK_H

#include "deck/oif_MeshTexts.h"
#include "store_interface/model/odiK_Repositories.h"

#include <array>
#include <string>
#include <vector>

/// The deck of a model, kept for decks of models that share with it (odiK_Model::Share): whatever a component
/// says without having read what differs is taken from here, and the component has no work. `oif_Writer`
/// makes one and goes by it.
class oif_KeptDeck {
public:
    explicit oif_KeptDeck(const odiK_Model& model);
    oif_KeptDeck(const oif_KeptDeck&) = delete;
    oif_KeptDeck& operator=(const oif_KeptDeck&) = delete;

private:
    friend class oif_Builder;
    friend class oif_Writer;

    /// The components, and behind them the driver, which has lines of its own.
    static constexpr std::size_t kSpeakers = 17;
    class Recorder;

    /// Lets a speaker work, and notes what it reads.
    template <class Work>
    void Watch(std::size_t speaker, const Work& work) {
        mdl_ReadNotes notes;
        work();
        read_[speaker] |= odiK_ReadOf(notes);
    }
    /// Ends a slot of the deck: what one speaker says in one section.
    void EndSlot();
    /// Whose slots the deck of another model has too.
    std::array<bool, kSpeakers> SpeakersLike(const odiK_Model& model) const;
    /// Writes the slots from one to before another.
    void Write(std::size_t first, std::size_t end, oif_MeshTexts& device) const;

    struct Place {
        std::size_t own = 0;
        std::size_t texts = 0;
    };
    struct MeshText {
        std::size_t own; ///< where it stands in the deck's own text
        oif_MeshTexts::Text text;
    };

    odiK_Model model_;
    std::array<odiK_Extent, kSpeakers> read_;
    std::string own_;
    std::vector<MeshText> texts_;
    std::vector<Place> ends_; // of the slots
};

/// Keeps what goes through it to a device.
class oif_KeptDeck::Recorder final : public oif_MeshTexts {
public:
    Recorder(oif_KeptDeck& kept, oif_MeshTexts& device) : kept_(kept), device_(device) {}
    void Write(const char* text, std::size_t bytes) override {
        kept_.own_.append(text, bytes);
        device_.Write(text, bytes);
    }
    Text Find(const odiK_Mesh& mesh, oif_MeshBlockEnm block) override { return device_.Find(mesh, block); }
    Text Keep(const cow_CountedHld<odiK_Mesh>& mesh, oif_MeshBlockEnm block, const Text& text) override {
        return device_.Keep(mesh, block, text);
    }
    void WriteKept(const Text& text) override {
        kept_.texts_.push_back({kept_.own_.size(), text});
        device_.WriteKept(text);
    }

private:
    oif_KeptDeck& kept_;
    oif_MeshTexts& device_;
};

#endif
