// Any text as a deck: it is read and checked without harm, and each label that was read has its coordinates,
// its nodes and its place.

#include "deck_reader/drd_Check.h"
#include "deck_reader/drd_Reader.h"

#include <cstdint>
#include <cstdlib>

namespace {

void Require(bool truth) {
    if (!truth) std::abort();
}

drd_TypeInfo InfoOf(std::string_view type) {
    return type.size() % 2 == 0 ? drd_TypeInfo() : drd_TypeInfo{2, 8, true};
}

void Hold(const drd_Deck& deck, const drd_Mesh& mesh) {
    Require(mesh.coordinates.Size() == 3 * mesh.nodes.Size());
    Require(mesh.owners.IsEmpty() || mesh.owners.Size() == mesh.connectivity.Size());
    std::size_t elements = 0;
    std::size_t nodes = 0;
    for (const drd_ElementRun& run : mesh.elementRuns) {
        Require(run.first == elements && run.firstNode == nodes);
        elements += run.count;
        nodes += run.count * static_cast<std::size_t>(run.nodes);
    }
    Require(elements == mesh.elements.Size() && nodes == mesh.connectivity.Size());
    long former = 0;
    for (std::size_t i = 0; i < mesh.nodes.Size(); ++i) {
        const drd_Place place = drd_PlaceOf(mesh.nodePlaces, i);
        Require(place.line > former && place.file < static_cast<int>(deck.files.size()));
        former = place.line;
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    drd_ReadOptions options;
    options.followIncludes = false;
    options.typeInfo = size % 2 == 0 ? &InfoOf : nullptr;
    drd_Findings findings;
    const drd_Deck deck = drd_ReadDeckText(text, "deck", options, findings);
    for (const drd_Mesh& mesh : deck.meshes) Hold(deck, mesh);
    for (std::size_t i = 1; i < deck.blocks.size(); ++i) {
        const drd_Block& block = deck.blocks[i];
        Require(block.parent >= 0 && block.begin >= 0 && block.begin < block.last);
        Require(block.last <= static_cast<int>(deck.keywords.size()));
    }
    drd_CheckDeck(deck, options, findings);
    for (const drd_Finding& finding : findings.List()) Require(!finding.found.empty());
    return 0;
}
