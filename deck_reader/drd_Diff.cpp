#include "deck_reader/drd_Diff.h"

#include "deck_reader/drd_Differ.h"
#include "deck_reader/drd_Text.h"

#include <algorithm>
#include <numeric>

namespace {

constexpr drd_BlockEnm kKindsOfBlocks[] = {drd_BlockEnm::PART, drd_BlockEnm::ASSEMBLY, drd_BlockEnm::INSTANCE,
                                           drd_BlockEnm::STEP, drd_BlockEnm::LOAD_CASE};

std::string LowerWord(drd_BlockEnm kind) {
    return drd_FoldCase(drd_WordOf(kind));
}

} // namespace

drd_BlockTree::drd_BlockTree(const drd_Deck& deck)
    : blocks_(deck.blocks.size() - 1), ends_(deck.blocks.size() + 1, 0) {
    // Each parent's end begins as its first place and moves on with every block.
    const auto parentOf = [&deck](std::size_t block) {
        return static_cast<std::size_t>(deck.blocks[block].parent);
    };
    for (std::size_t i = 1; i < deck.blocks.size(); ++i) ++ends_[parentOf(i) + 1];
    std::partial_sum(ends_.begin(), ends_.end(), ends_.begin());
    for (std::size_t i = 1; i < deck.blocks.size(); ++i) blocks_[ends_[parentOf(i)]++] = static_cast<int>(i);
}

std::span<const int> drd_BlockTree::In(int parent) const {
    const auto place = static_cast<std::size_t>(parent);
    const std::size_t begin = place == 0 ? 0 : ends_[place - 1];
    return std::span(blocks_).subspan(begin, ends_[place] - begin);
}

std::string_view drd_WordOf(drd_ChangeEnm change) {
    constexpr std::string_view kWords[] = {"added", "removed", "changed", "moved", "renamed"};
    return kWords[static_cast<std::size_t>(change)];
}

drd_DiffResult drd_Diff(const drd_Deck& first, const drd_Deck& second, const drd_DiffOptions& options) {
    return drd_Differ(first, second, options).Run();
}

std::vector<char> drd_LongestGrowing(const std::vector<int>& values) {
    std::vector<std::size_t> tails; // ends of the best runs by length
    std::vector<std::size_t> before(values.size());
    for (std::size_t i = 0; i < values.size(); ++i) {
        const auto place =
            std::lower_bound(tails.begin(), tails.end(), values[i],
                             [&values](std::size_t tail, int value) { return values[tail] < value; });
        before[i] = place == tails.begin() ? values.size() : *(place - 1);
        if (place == tails.end()) {
            tails.push_back(i);
        } else {
            *place = i;
        }
    }
    std::vector<char> isIn(values.size(), 0);
    for (std::size_t i = tails.empty() ? values.size() : tails.back(); i < values.size(); i = before[i])
        isIn[i] = 1;
    return isIn;
}

drd_Differ::drd_Differ(const drd_Deck& first, const drd_Deck& second, const drd_DiffOptions& options)
    : options_(options), first_(first, options.ignoreTitles), second_(second, options.ignoreTitles),
      blocksOfFirst_(first), blocksOfSecond_(second), partners_(first.blocks.size(), -1) {}

drd_DiffResult drd_Differ::Run() {
    first_.Sign(renames_);
    second_.Sign({});
    if (options_.ignoreNames) {
        FindRenames({0, 0});
        RenamesOfSets();
        first_.Sign(renames_);
    }
    std::fill(partners_.begin(), partners_.end(), -1);
    Block({0, 0}, "");
    CompareSets();
    if (!options_.ignoreComments) Comments();
    return std::move(result_);
}

void drd_Differ::Tell(drd_ChangeEnm change, std::string kind, std::string text, drd_Place first,
                      drd_Place second) {
    ++result_.summary[kind][change];
    result_.differences.push_back({change, std::move(kind), std::move(text), first, second});
}

std::optional<int> drd_Differ::PartnerOf(int block) const {
    const int partner = partners_[static_cast<std::size_t>(block)];
    return partner < 0 ? std::nullopt : std::optional<int>(partner);
}

drd_Differ::Context drd_Differ::ContextOf(const Context& outer, const drd_Block& block) {
    if (block.kind == drd_BlockEnm::ASSEMBLY) return outer + "assembly: ";
    return outer + LowerWord(block.kind) + (block.name.empty() ? "" : " " + block.name) + ": ";
}

drd_Differ::Items drd_Differ::BlocksOfKind(const drd_Deck& deck, ItemView blocks, drd_BlockEnm kind) {
    Items ofKind;
    for (const int block : blocks) {
        if (deck.blocks[static_cast<std::size_t>(block)].kind == kind) ofKind.push_back(block);
    }
    return ofKind;
}

drd_Differ::Match drd_Differ::MatchBlocks(drd_BlockEnm kind, Pair parents) const {
    const auto nameOf = [this, kind](const drd_Canonical& deck, int index) {
        // There is one assembly, whatever it is called.
        if (kind == drd_BlockEnm::ASSEMBLY) return std::string();
        std::string name = drd_FoldCase(deck.Deck().blocks[static_cast<std::size_t>(index)].name);
        const auto renamed = &deck == &first_ ? renames_.find(name) : renames_.end();
        return renamed != renames_.end() ? renamed->second : name;
    };
    return MatchByKey(BlocksOfKind(First(), blocksOfFirst_.In(parents.first), kind),
                      BlocksOfKind(Second(), blocksOfSecond_.In(parents.second), kind), nameOf);
}

void drd_Differ::Blocks(Pair parents, const Context& context) {
    if (blocksOfFirst_.In(parents.first).empty() && blocksOfSecond_.In(parents.second).empty()) return;
    for (const drd_BlockEnm kind : kKindsOfBlocks) {
        const Match match = MatchBlocks(kind, parents);
        for (const int block : match.onlyFirst) {
            const drd_Block& only = First().blocks[static_cast<std::size_t>(block)];
            Tell(drd_ChangeEnm::REMOVED, LowerWord(kind), ContextOf(context, only) + "removed",
                 FirstKeyword(only.begin).Place(), drd_Nowhere);
        }
        for (const int block : match.onlySecond) {
            const drd_Block& only = Second().blocks[static_cast<std::size_t>(block)];
            Tell(drd_ChangeEnm::ADDED, LowerWord(kind), ContextOf(context, only) + "added", drd_Nowhere,
                 SecondKeyword(only.begin).Place());
        }
        if (kind == drd_BlockEnm::STEP) StepOrder(match, context);
        for (const Pair& pair : match.pairs) {
            Block(pair, ContextOf(context, First().blocks[static_cast<std::size_t>(pair.first)]));
        }
    }
}

void drd_Differ::StepOrder(const Match& steps, const Context& context) {
    if (options_.ignoreOrder) return;
    std::vector<int> places;
    for (const Pair& pair : steps.pairs) places.push_back(pair.second);
    const std::vector<char> stays = drd_LongestGrowing(places);
    for (std::size_t i = 0; i < stays.size(); ++i) {
        if (stays[i] != 0) continue;
        const drd_Block& first = First().blocks[static_cast<std::size_t>(steps.pairs[i].first)];
        const drd_Block& second = Second().blocks[static_cast<std::size_t>(steps.pairs[i].second)];
        Tell(drd_ChangeEnm::MOVED, "step",
             ContextOf(context, first) + "stands in another place among the steps",
             FirstKeyword(first.begin).Place(), SecondKeyword(second.begin).Place());
    }
}

void drd_Differ::Block(Pair blocks, const Context& context) {
    partners_[static_cast<std::size_t>(blocks.first)] = blocks.second;
    if (blocks.first != 0) OpeningLine(blocks, context);
    CompareMeshes(blocks, context);
    CompareItems(first_.ItemsOf(blocks.first), second_.ItemsOf(blocks.second), context);
    Blocks(blocks, context);
}

void drd_Differ::OpeningLine(Pair blocks, const Context& context) {
    const drd_Block& first = First().blocks[static_cast<std::size_t>(blocks.first)];
    const drd_Block& second = Second().blocks[static_cast<std::size_t>(blocks.second)];
    if (first_.Signature(first.begin) == second_.Signature(second.begin)) return;
    drd_Placement a;
    drd_Placement b;
    if (first.kind == drd_BlockEnm::INSTANCE) {
        // A line of zeros says as little as no line.
        const bool known = drd_PlacementOf(First(), first, a) && drd_PlacementOf(Second(), second, b);
        CompareParameters({first.begin, second.begin}, context);
        if (known && a.IsNone() && b.IsNone()) return;
        CompareLines({first.begin, second.begin}, context);
        return;
    }
    CompareKeyword({first.begin, second.begin}, context);
}

void drd_Differ::Comments() {
    const auto textsOf = [](const drd_Deck& deck) {
        std::vector<std::string> texts;
        for (const drd_Comment& comment : deck.comments) {
            std::string_view text = deck.Text(comment.text);
            text.remove_prefix(std::min<std::size_t>(2, text.size()));
            text = drd_Trim(text);
            if (!text.empty()) texts.emplace_back(text);
        }
        std::sort(texts.begin(), texts.end());
        return texts;
    };
    const std::vector<std::string> first = textsOf(First());
    const std::vector<std::string> second = textsOf(Second());
    std::set_difference(first.begin(), first.end(), second.begin(), second.end(),
                        std::back_inserter(result_.commentsRemoved));
    std::set_difference(second.begin(), second.end(), first.begin(), first.end(),
                        std::back_inserter(result_.commentsAdded));
}

/// Adds the things of the first deck that the second has under another name.
void drd_Differ::FindRenames(Pair blocks) {
    RenamesOfBlock(blocks);
    for (const drd_BlockEnm kind : kKindsOfBlocks) {
        for (const Pair& pair : MatchBlocks(kind, blocks).pairs) FindRenames(pair);
    }
}

void drd_Differ::RenamesOfBlock(Pair blocks) {
    partners_[static_cast<std::size_t>(blocks.first)] = blocks.second;
    const auto named = [](const drd_Canonical& deck, int block) {
        Items items;
        for (const int item : deck.ItemsOf(block)) {
            const drd_Keyword& keyword = deck.Deck().keywords[static_cast<std::size_t>(item)];
            if (keyword.Row() != nullptr && keyword.Row()->defines != drd_KindEnm::NONE)
                items.push_back(item);
        }
        return items;
    };
    const Match match = MatchByName(named(first_, blocks.first), named(second_, blocks.second));
    drd_Waiting bySignature;
    for (const int item : match.onlySecond) bySignature.Put(second_.NamelessSignature(item), item);
    for (const int item : match.onlyFirst) {
        const int partner = bySignature.Take(first_.NamelessSignature(item));
        if (partner < 0) continue;
        const drd_Keyword& keyword = FirstKeyword(item);
        const std::string_view parameter = drd_NameParameter(*keyword.Row());
        std::string before = drd_FoldName(keyword.Value(parameter));
        std::string after = drd_FoldName(SecondKeyword(partner).Value(parameter));
        const drd_Block& block = First().blocks[static_cast<std::size_t>(blocks.first)];
        if (block.kind == drd_BlockEnm::INSTANCE) {
            const std::string instance = drd_FoldCase(block.name) + ".";
            renames_.emplace(instance + before, instance + after);
        }
        renames_.emplace(std::move(before), std::move(after));
    }
}
