#include "deck_reader/drd_Keywords.h"

#include "deck_reader/drd_Reader.h"
#include "deck_reader/drd_Text.h"
#include "decks/DeckFolder.h"

#include <gtest/gtest.h>

#include <regex>
#include <set>

namespace fs = std::filesystem;

namespace {

/// Keywords that golden decks have in texts of the user's own.
const std::set<std::string> kUsersOwn = {"Part Text",  "Instance Text", "Assembly Text",
                                         "Model Text", "Step Text",     "Text of the body",
                                         "Preprint",   "File Output",   "Heading**"};

} // namespace

TEST(KeywordTable, HasEachKeywordOnce_InOrder) {
    std::set<std::string> folded;
    std::string former;
    for (const drd_KeywordRow& row : drd_KeywordRows()) {
        EXPECT_TRUE(folded.insert(drd_FoldKey(row.name)).second || row.name == "ShearRetention") << row.name;
        EXPECT_NE(row.places, 0) << row.name;
        const std::string lower = drd_FoldCase(row.name);
        EXPECT_LT(former, lower);
        former = lower;
    }
}

TEST(KeywordTable, HasEveryKeywordThatTheWriterCanWrite) {
    const std::regex keyword("\"\\*([A-Z][A-Za-z0-9 -]*)");
    std::size_t found = 0;
    for (const auto& entry : fs::recursive_directory_iterator(ProjectFolder() / "QRXZptIfwOif.m/src")) {
        if (entry.path().extension() != ".cpp" && entry.path().extension() != ".h") continue;
        const std::string text = ReadBytes(entry.path());
        for (auto match = std::sregex_iterator(text.begin(), text.end(), keyword);
             match != std::sregex_iterator(); ++match) {
            ++found;
            EXPECT_NE(drd_FindKeyword(drd_FoldKey((*match)[1].str())), nullptr)
                << (*match)[1] << " in " << entry.path().filename();
        }
    }
    EXPECT_GT(found, 250U);
}

TEST(KeywordTable, HasEveryKeywordOfTheGoldenDecks_InItsPlaces) {
    std::vector<std::string> pairs = GoldenPairs();
    const std::vector<std::string> examples = ExamplePairs();
    pairs.insert(pairs.end(), examples.begin(), examples.end());
    for (const std::string& pair : pairs) {
        drd_Findings findings;
        const drd_Deck deck = drd_ReadDeck((ProjectFolder() / (pair + ".inp")).string(), {}, findings);
        for (const drd_Keyword& keyword : deck.keywords) {
            if (keyword.Row() == nullptr) {
                EXPECT_TRUE(kUsersOwn.contains(keyword.Name())) << keyword.Name() << " in " << pair;
            }
        }
    }
}

TEST(KeywordTable, ReferencesAreOfKnownKeywords) {
    for (const drd_ParameterRef& ref : drd_ParameterRefs()) {
        EXPECT_TRUE(ref.keyword.empty() || drd_FindKeyword(ref.keyword) != nullptr) << ref.keyword;
        EXPECT_EQ(drd_FoldKey(ref.parameter), ref.parameter);
    }
    for (const drd_KeywordRow& row : drd_KeywordRows()) {
        for (const drd_DataRef& ref : drd_DataRefs(drd_FoldKey(row.name))) {
            EXPECT_EQ(ref.keyword, drd_FoldKey(row.name));
        }
    }
}
