#include "deck_reader/drd_FlatNames.h"

#include "deck_reader/drd_Text.h"

#include <algorithm>
#include <limits>

namespace {

int GreatestOf(const drd_Flat<int>& labels) {
    return labels.IsEmpty() ? 0 : *std::max_element(labels.begin(), labels.end());
}

/// A step for the labels of so many instances that leaves them readable: the next power of ten.
std::int64_t StepFor(int greatest) {
    std::int64_t step = 1;
    while (step <= greatest) step *= 10;
    return step;
}

} // namespace

drd_FlatNames::drd_FlatNames(const drd_Deck& deck, const drd_Names& names)
    : deck_(deck), names_(names), nodeOffsets_(deck.blocks.size(), 0),
      elementOffsets_(deck.blocks.size(), 0) {
    Offsets();
    TakeNames();
}

void drd_FlatNames::Offsets() {
    std::vector<int> users; // the model keeps its labels, instances come next, the assembly last
    int nodes = 0;
    int elements = 0;
    // Of an instance, what its part has too.
    const auto greatestOf = [this](int block, drd_Flat<int> drd_Mesh::*labels) {
        int greatest = 0;
        for (const int owner : {block, names_.PartOf(block)}) {
            const drd_Mesh* mesh =
                owner < 0 ? nullptr : deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(owner)]);
            if (mesh != nullptr) greatest = std::max(greatest, GreatestOf(mesh->*labels));
        }
        return greatest;
    };
    const auto add = [&](int block) {
        if (deck_.MeshOf(deck_.blocks[static_cast<std::size_t>(names_.MeshBlock(block))]) == nullptr) return;
        users.push_back(block);
        nodes = std::max(nodes, greatestOf(block, &drd_Mesh::nodes));
        elements = std::max(elements, greatestOf(block, &drd_Mesh::elements));
    };
    add(0);
    for (const drd_BlockEnm kind : {drd_BlockEnm::INSTANCE, drd_BlockEnm::ASSEMBLY}) {
        for (std::size_t i = 0; i < deck_.blocks.size(); ++i) {
            if (deck_.blocks[i].kind == kind) add(static_cast<int>(i));
        }
    }
    const auto spread = [&](int greatest, std::vector<int>& offsets, drd_Flat<int> drd_Mesh::*labels) {
        constexpr std::int64_t kMost = std::numeric_limits<std::int32_t>::max();
        const std::int64_t step = StepFor(greatest);
        const bool isWide = step * static_cast<std::int64_t>(users.size()) <= kMost;
        std::int64_t offset = 0;
        for (const int block : users) {
            offsets[static_cast<std::size_t>(block)] = static_cast<int>(offset);
            offset += isWide ? step : greatestOf(block, labels);
            if (offset > kMost) hasRoom_ = false;
            if (!hasRoom_) return;
        }
    };
    spread(nodes, nodeOffsets_, &drd_Mesh::nodes);
    spread(elements, elementOffsets_, &drd_Mesh::elements);
}

void drd_FlatNames::TakeNames() {
    // Names that stay as they are.
    const auto stays = [this](int block) {
        const drd_BlockEnm kind = deck_.blocks[static_cast<std::size_t>(block)].kind;
        return kind != drd_BlockEnm::PART && kind != drd_BlockEnm::INSTANCE;
    };
    for (const drd_Set& set : names_.Sets()) {
        if (stays(set.block)) taken_.insert(drd_FoldCase(set.name));
    }
    for (const drd_Keyword& keyword : deck_.keywords) {
        if (keyword.Row() == nullptr || keyword.Row()->defines == drd_KindEnm::NONE || !stays(keyword.block))
            continue;
        taken_.insert(drd_FoldName(keyword.Value(drd_NameParameter(*keyword.Row()))));
    }
}

std::string drd_FlatNames::NameIn(int instance, std::string_view name) {
    const std::string& owner = deck_.blocks[static_cast<std::size_t>(instance)].name;
    const auto [place, isNew] = known_.try_emplace(std::to_string(instance) + "/" + drd_FoldCase(name));
    if (!isNew) return place->second;
    std::string joined = owner + "_" + std::string(name);
    std::replace(joined.begin(), joined.end(), '.', '_');
    std::string flat = joined.substr(0, kLongestName);
    // A shorter name with a number where the joined one is too long or there already.
    constexpr std::size_t kRoomForNumber = 12;
    const std::string beginning = joined.substr(0, kLongestName - kRoomForNumber);
    while (joined.size() > kLongestName || taken_.contains(drd_FoldCase(flat))) {
        flat = beginning + "_" + std::to_string(++shortened_[drd_FoldCase(beginning)]);
        if (!taken_.contains(drd_FoldCase(flat))) break;
    }
    taken_.insert(drd_FoldCase(flat));
    table_.push_back({instance, owner + "." + std::string(name), flat});
    place->second = drd_QuotedName(flat);
    return place->second;
}
