#include "deck/oif_KeptDeck.h"

oif_KeptDeck::oif_KeptDeck(const odiK_Model& model) : model_(model.Name()) {
    model_.Share(model);
}

void oif_KeptDeck::EndSlot() {
    ends_.push_back({own_.size(), texts_.size()});
    // Where a line goes on, what follows may depend on how much of it there is.
    const bool endsLine = own_.empty() ? texts_.empty() : own_.back() == '\n';
    const bool endsInText = !texts_.empty() && texts_.back().own == own_.size();
    if (endsLine && !endsInText) return;
    for (odiK_Extent& read : read_) read.set();
}

std::array<bool, oif_KeptDeck::kSpeakers> oif_KeptDeck::SpeakersLike(const odiK_Model& model) const {
    const odiK_Extent differences = odiK_Differences(model_, model);
    std::array<bool, kSpeakers> like;
    for (std::size_t i = 0; i < kSpeakers; ++i) like[i] = (read_[i] & differences).none();
    return like;
}

void oif_KeptDeck::Write(std::size_t first, std::size_t end, oif_MeshTexts& device) const {
    if (first == end) return;
    Place place = first == 0 ? Place() : ends_[first - 1];
    const Place last = ends_[end - 1];
    const auto writeUpTo = [&](std::size_t own) {
        if (own > place.own) device.Write(own_.data() + place.own, own - place.own);
        place.own = own;
    };
    for (; place.texts < last.texts; ++place.texts) {
        const MeshText& kept = texts_[place.texts];
        writeUpTo(kept.own);
        device.WriteKept(kept.text);
    }
    writeUpTo(last.own);
}
