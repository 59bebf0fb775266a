#include "foundation/omu_QuorixName.h"

#include "tests/properties/Bytes.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <regex>
#include <string>

namespace {

rc::Gen<std::string> Name() {
    return rc::gen::container<std::string>(rc::gen::elementOf(std::string("aZ19_-.\"\" ,=\x80")));
}

RC_GTEST_PROP(omu_QuorixName, AnyName_IsBareOrQuotedByTheGrammar, ()) {
    static const std::regex bare(
        "|\".*\"|([A-Za-z_][A-Za-z0-9_-]*|\"[^\"]*\")(\\.([A-Za-z0-9_][A-Za-z0-9_-]*|\"[^\"]*\"))*");
    const std::string name = *Name();
    const std::string expected = std::regex_match(name, bare) ? name : "\"" + name + "\"";
    RC_ASSERT(std::string(omu_QuorixName::QuoteIfNeeded(cow_String(name)).View()) == expected);
}

RC_GTEST_PROP(omu_QuorixName, AnyNamePrintedTwice_StaysTheSame, ()) {
    const cow_String once = omu_QuorixName::QuoteIfNeeded(cow_String(*Name()));
    RC_ASSERT(omu_QuorixName::QuoteIfNeeded(once) == once);
}

RC_GTEST_PROP(rgx_split, TokensJoinedWithDots_GiveTheText, ()) {
    const std::string text = *ShortText();
    const cow_List<cow_String> tokens = rgx_split(cow_String(text), "[\\.]");
    std::string joined(tokens[0].View());
    for (int i = 0; i < tokens.Length(); ++i) {
        RC_ASSERT(tokens[i].Find(".") == -1);
        if (i > 0) joined.append(".").append(tokens[i].View());
    }
    RC_ASSERT(joined == text);
}

} // namespace
