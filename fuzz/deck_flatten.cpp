// Any text as a deck: flattened it reads back, has no parts, instances and assembly, and as many nodes as its
// instances show.

#include "deck_reader/drd_Flatten.h"
#include "deck_reader/drd_Names.h"
#include "deck_reader/drd_Reader.h"

#include <cstdint>
#include <cstdlib>

namespace {

void Require(bool truth) {
    if (!truth) std::abort();
}

/// Nodes of the model and the assembly, and for each instance its own and those of its part.
std::size_t NodesShown(const drd_Deck& deck) {
    const drd_Names names(deck);
    const auto nodesOf = [&deck](int block) {
        const drd_Mesh* mesh =
            block < 0 ? nullptr : deck.MeshOf(deck.blocks[static_cast<std::size_t>(block)]);
        return mesh == nullptr ? 0 : mesh->nodes.Size();
    };
    std::size_t nodes = 0;
    for (std::size_t i = 0; i < deck.blocks.size(); ++i) {
        const int block = static_cast<int>(i);
        if (deck.blocks[i].kind != drd_BlockEnm::PART) nodes += nodesOf(block);
        if (deck.blocks[i].kind == drd_BlockEnm::INSTANCE) nodes += nodesOf(names.PartOf(block));
    }
    return nodes;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    drd_ReadOptions options;
    options.followIncludes = false;
    drd_Findings findings;
    const drd_Deck deck = drd_ReadDeckText(text, "deck", options, findings);
    const bool isRight = !findings.HasErrors();
    qio_StringDevice device;
    drd_Flatten(deck, device, findings);
    drd_Findings ofFlat;
    const drd_Deck flat = drd_ReadDeckText(device.Text(), "flat", options, ofFlat);
    for (const drd_Block& block : flat.blocks) {
        Require(block.kind == drd_BlockEnm::MODEL || block.kind == drd_BlockEnm::STEP ||
                block.kind == drd_BlockEnm::LOAD_CASE);
    }
    if (!isRight || findings.HasErrors()) return 0;
    Require(NodesShown(deck) == NodesShown(flat));
    return 0;
}
