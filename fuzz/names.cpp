// Any text as a name: it prints as one word of the deck, twice printed is once printed, and splits put
// together give the name again.

#include "foundation/omu_QuorixName.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"

#include <cstdint>
#include <cstdlib>
#include <string>

namespace {

void Require(bool truth) {
    if (!truth) std::abort();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string text(reinterpret_cast<const char*>(data), size);
    const cow_String name{std::string_view(text)};

    const cow_String once = omu_QuorixName::QuoteIfNeeded(name);
    Require(omu_QuorixName::QuoteIfNeeded(once) == once);
    Require(once == name || once.View() == "\"" + text + "\"");

    const cow_List<cow_String> tokens = rgx_split(name, "[\\.]");
    std::string joined;
    for (int i = 0; i < tokens.Length(); ++i) joined.append(i == 0 ? "" : ".").append(tokens[i].View());
    Require(joined == text);

    cow_String prefix;
    cow_String last;
    oif_SetName::SplitName(name, prefix, last);
    Require(text.ends_with(last.View()));
    Require(text.starts_with(prefix.View()));

    const cow_String unquoted = oif_SetName::Unquote(name);
    Require(oif_SetName::IsQuoted(name) ? unquoted.View().size() + 2 == size : unquoted == name);
    oif_SetName::QuoteIfNeeded(name);

    for (const bool flag : {false, true}) {
        oif_SetName set(name, flag);
        for (const auto context :
             {oif_SetName::regionContext::INSTANCE, oif_SetName::regionContext::ASSEMBLY}) {
            set.UniqueSetName(context);
            set.UniqueSurfaceName(context);
            set.UniqueSetName(name, context);
        }
    }
    return 0;
}
