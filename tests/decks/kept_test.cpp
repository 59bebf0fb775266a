#include "decks/DeckFolder.h"
#include "model_file/mdf_ModelFile.h"
#include "support/KeptVariants.h"

#include <gtest/gtest.h>

namespace {

class KeptDeck : public testing::TestWithParam<std::string> {};

} // namespace

TEST_P(KeptDeck, VariantsOfEachObject_HaveTheDecksAndFindingsThatTheyHaveWithoutIt) {
    mdf_Report report;
    const auto store = mdf_ReadModelFile((ProjectFolder() / (GetParam() + ".json")).string(), report);
    ASSERT_TRUE(store != nullptr);
    KeptVariants variants(*store);
    EXPECT_EQ(variants.ProblemOfBase(), "");
    for (std::size_t i = 0; i < variants.Count(); ++i) EXPECT_EQ(variants.ProblemOf(i), "");
}

INSTANTIATE_TEST_SUITE_P(Golden, KeptDeck, testing::ValuesIn(GoldenPairs()),
                         [](const auto& pair) { return TestNameOfPair(pair.param); });
INSTANTIATE_TEST_SUITE_P(Example, KeptDeck, testing::ValuesIn(ExamplePairs()),
                         [](const auto& pair) { return TestNameOfPair(pair.param); });
