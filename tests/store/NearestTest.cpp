#include "store_interface/findings/fnd_Nearest.h"

#include "store_interface/findings/fnd_Text.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>

namespace {

/// The distance by its definition, over whole tables.
std::size_t Distance(const std::string& a, const std::string& b) {
    std::vector<std::vector<std::size_t>> cells(a.size() + 1, std::vector<std::size_t>(b.size() + 1));
    for (std::size_t i = 0; i <= a.size(); ++i) {
        for (std::size_t j = 0; j <= b.size(); ++j) {
            if (i == 0 || j == 0) {
                cells[i][j] = i + j;
                continue;
            }
            const bool same = a[i - 1] == b[j - 1];
            cells[i][j] =
                std::min({cells[i - 1][j] + 1, cells[i][j - 1] + 1, cells[i - 1][j - 1] + (same ? 0 : 1)});
            if (i > 1 && j > 1 && a[i - 1] == b[j - 2] && a[i - 2] == b[j - 1]) {
                cells[i][j] = std::min(cells[i][j], cells[i - 2][j - 2] + 1);
            }
        }
    }
    return cells[a.size()][b.size()];
}

std::string Expected(const std::string& name, const std::vector<std::string>& known) {
    std::size_t least = std::min(std::max<std::size_t>(1, name.size() / 3) + 1, name.size());
    std::string nearest;
    std::string beginning;
    std::size_t rest = 80;
    for (const std::string& candidate : known) {
        const std::size_t common = std::min(name.size(), candidate.size());
        const std::size_t beyond = std::max(name.size(), candidate.size()) - common;
        if (common >= 3 && name.substr(0, common) == candidate.substr(0, common) && beyond < rest) {
            rest = beyond;
            beginning = candidate;
        }
        const std::size_t distance = Distance(name, candidate);
        if (distance >= least || candidate.empty()) continue;
        least = distance;
        nearest = candidate;
    }
    if (nearest.empty()) nearest = beginning;
    return nearest.empty() ? "" : "did you mean '" + nearest + "'?";
}

TEST(Nearest, AnyNames_GiveWhatTheWholeTableOfDistancesGives) {
    std::mt19937 random(3);
    const auto name = [&] {
        std::string text;
        const std::size_t length = random() % 14;
        while (text.size() < length) text += "abc1"[random() % 4];
        return text;
    };
    for (int i = 0; i < 20000; ++i) {
        const std::string wrong = name();
        std::vector<std::string> known;
        for (std::size_t k = random() % 6; k > 0; --k) known.push_back(name());
        std::string listed;
        for (const std::string& each : known) listed += each + " ";
        ASSERT_EQ(fnd_DidYouMean(wrong, known), Expected(wrong, known)) << wrong << " of " << listed;
    }
}

TEST(Nearest, CapitalsAreNotCounted) {
    EXPECT_EQ(fnd_DidYouMean("steel", {"Stool", "STEEL"}), "did you mean 'STEEL'?");
    EXPECT_EQ(fnd_DidYouMean("x", {"y"}), "");
    EXPECT_EQ(fnd_DidYouMean("", {"y"}), "");
    EXPECT_EQ(fnd_DidYouMean(std::string(81, 'x'), {std::string(80, 'x')}), "");
    EXPECT_EQ(fnd_DidYouMean(std::string(80, 'x'), {std::string(79, 'x')}),
              "did you mean '" + std::string(79, 'x') + "'?");
}

TEST(Nearest, WhereNoneIsNear_OneOfTheSameBeginningIsMeant) {
    EXPECT_EQ(fnd_DidYouMean("profile", {"poissonRatio", "profileName"}), "did you mean 'profileName'?");
    EXPECT_EQ(fnd_DidYouMean("MATERIAL", {"materialTable", "materialName"}), "did you mean 'materialName'?");
    EXPECT_EQ(fnd_DidYouMean("densityOfSteel", {"elastic", "density"}), "did you mean 'density'?");
    EXPECT_EQ(fnd_DidYouMean("mass", {"massFlowRate", "mess"}), "did you mean 'mess'?");
    EXPECT_EQ(fnd_DidYouMean("ma", {"materialName"}), "");
    EXPECT_EQ(fnd_DidYouMean("name", {"materialName"}), "");
    EXPECT_EQ(fnd_DidYouMean("TOP", {std::string(81, 'T')}), "");
}

TEST(Nearest, SinkThatHasHadEnough_IsNotSearchedFor) {
    fnd_List list;
    int searches = 0;
    for (int i = 0; i < 1000; ++i) {
        fnd_DidYouMean(list, "name", [&](fnd_Nearest&) { ++searches; });
    }
    EXPECT_EQ(searches, 50);
}

TEST(Lists, UpToTenNames_AreListedAsTheyAre) {
    const std::vector<std::string> names = {"C", "B", "A"};
    EXPECT_EQ(fnd_OneOf(names, "A"), "one of C, B, A");
    EXPECT_EQ(fnd_OneOf({"A"}, "B"), "A");
    EXPECT_EQ(fnd_ThereAre(names, "A"), "there are 'C', 'B', 'A'");
    EXPECT_EQ(fnd_ThereAre({"A"}, "B"), "there is 'A'");
    EXPECT_EQ(fnd_ThereAre({}, "B"), "there is none");
}

TEST(Lists, MoreThanTenNames_AreCutToThoseMostLikeTheGivenOneInTheirOrder) {
    std::vector<std::string> names;
    for (char c = 'a'; c <= 'z'; ++c) names.push_back(std::string(3, c));
    names.insert(names.begin() + 20, "inner");
    names.insert(names.begin() + 5, "INNERMOST");
    // Nine have letters of it; of all others none has any, so the first is taken.
    EXPECT_EQ(fnd_OneOf(names, "innermos"),
              "one of aaa, eee, INNERMOST, iii, mmm, nnn, ooo, rrr, sss, inner, ... (18 more)");
    EXPECT_EQ(fnd_ThereAre(names, "innermos").substr(0, 35), "there are 'aaa', 'eee', 'INNERMOST'");
    EXPECT_EQ(fnd_OneOf(names),
              "one of aaa, bbb, ccc, ddd, eee, INNERMOST, fff, ggg, hhh, iii, ... (18 more)");
}

TEST(FindingText, LongExpectations_StandBehindTheHint) {
    const std::string list =
        "one of first, second, third, fourth, fifth, sixth, seventh, eighth, ninth, the tenth";
    EXPECT_EQ(fnd_Make("wrong-value", {}, "found 'x'", list, "did you mean 'sixth'?").Text(),
              "found 'x'; did you mean 'sixth'? Expected " + list);
    EXPECT_EQ(fnd_Make("wrong-value", {}, "found 'x'", list, "see above").Text(),
              "found 'x'; see above; expected " + list);
    EXPECT_EQ(fnd_Make("wrong-value", {}, "found 'x'", list).Text(), "found 'x', expected " + list);
    EXPECT_EQ(fnd_Make("wrong-value", {}, "found 'x'", "a number", "see above").Text(),
              "found 'x', expected a number; see above");
}

} // namespace
