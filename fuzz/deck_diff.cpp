// Any text as a deck: it is equal to itself, and to itself in another form.

#include "deck_reader/drd_Diff.h"
#include "deck_reader/drd_Emitter.h"
#include "deck_reader/drd_Reader.h"

#include <cstdint>
#include <cstdio>
#include <cstdlib>

namespace {

void RequireEqual(const drd_Deck& first, const drd_Deck& second, const drd_DiffOptions& options) {
    const drd_DiffResult result = drd_Diff(first, second, options);
    for (const drd_Difference& difference : result.differences)
        std::fprintf(stderr, "%s\n", difference.text.c_str());
    if (!result.IsEqual()) std::abort();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    drd_ReadOptions options;
    options.followIncludes = false;
    drd_Findings findings;
    const drd_Deck deck = drd_ReadDeckText(text, "deck", options, findings);
    drd_DiffOptions diff;
    RequireEqual(deck, deck, diff);
    diff.tolerance = 1e-6;
    diff.ignoreNames = true;
    RequireEqual(deck, deck, diff);
    // What is no deck has no other form.
    if (findings.HasErrors()) return 0;
    qio_StringDevice device;
    drd_Reformat(deck, device);
    drd_Findings again;
    RequireEqual(deck, drd_ReadDeckText(device.Text(), "again", options, again), {});
    return 0;
}
