#include "foundation/omu_QuorixName.h"

#include "tests/properties/Bytes.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <string>

namespace {

rc::Gen<std::string> Name() {
    const auto plain = rc::gen::container<std::string>(rc::gen::elementOf(std::string("aZ9_-.")));
    return rc::gen::oneOf(
        plain, rc::gen::container<std::string>(rc::gen::elementOf(std::string("aZ19_-.\"\" ,=\x80"))),
        rc::gen::scale(0.1, plain));
}

/// Reads a name as: token ("." token)*, with a token in double quotes or of plain characters.
bool IsDottedWord(const std::string& name) {
    const std::string letters = "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ_";
    const std::string digits = "0123456789";
    std::size_t at = 0;
    for (bool first = true;; first = false) {
        const std::size_t start = at;
        if (name.compare(at, 1, "\"") == 0) {
            const std::size_t close = name.find('"', at + 1);
            if (close == std::string::npos) return false;
            at = close + 1;
        } else {
            if (name.find_first_of(first ? letters : letters + digits, at) != start) return false;
            at = std::min(name.find_first_not_of(letters + digits + "-", at), name.size());
        }
        if (at == name.size()) return true;
        if (name[at++] != '.') return false;
    }
}

RC_GTEST_PROP(omu_QuorixName, AnyName_IsBareOrQuotedByTheGrammar, ()) {
    const std::string name = *Name();
    const bool inQuotes = name.size() >= 2 && name.front() == '"' && name.back() == '"';
    const bool bare = name.empty() || inQuotes || IsDottedWord(name);
    RC_CLASSIFY(bare && !name.empty());
    const std::string expected = bare ? name : "\"" + name + "\"";
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
