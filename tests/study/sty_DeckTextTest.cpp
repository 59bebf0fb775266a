#include "study/sty_DeckText.h"

#include <gtest/gtest.h>

#include <random>

namespace {

using Text = sty_DeckText::Text;

std::string SumOf(std::string_view text) {
    sty_Sha256 sum;
    sum.Add(text);
    return sum.Hex();
}

} // namespace

TEST(sty_DeckText, SumsOfDecks_GoOnFromWhereAnotherBeganAlike) {
    sty_MeshTexts meshes;
    sty_DeckText text(meshes);
    std::mt19937 random(7);
    const auto upTo = [&](std::size_t most) {
        return std::uniform_int_distribution<std::size_t>(0, most)(random);
    };
    const Text kept[] = {std::make_shared<const std::string>(5000, 'a'),
                         std::make_shared<const std::string>("short"),
                         std::make_shared<const std::string>(1, 'x')};
    // Pieces of a deck: bytes of its own, each followed by a kept text or none.
    std::vector<std::pair<std::string, int>> pieces = {{std::string(300, '.'), 0},
                                                       {std::string(9000, '.'), -1}};
    for (int deck = 0; deck < 3000; ++deck) {
        switch (upTo(5)) {
        case 0: pieces[upTo(pieces.size() - 1)].second = static_cast<int>(upTo(3)) - 1; break;
        case 1: pieces[upTo(pieces.size() - 1)].first.resize(upTo(6000), '-'); break;
        case 2:
            if (pieces.size() < 5) pieces.insert(pieces.begin() + 1, {std::string(upTo(200), '+'), 2});
            break;
        case 3:
            if (pieces.size() > 2) pieces.erase(pieces.begin() + 1);
            break;
        default: {
            std::string& own = pieces[upTo(pieces.size() - 1)].first;
            if (!own.empty()) own[upTo(own.size() - 1)] = static_cast<char>('A' + upTo(25));
        }
        }
        text.Begin();
        std::string whole;
        for (const auto& [own, which] : pieces) {
            text.Write(own.data(), own.size());
            whole += own;
            if (which < 0) continue;
            text.WriteKept(kept[which]);
            whole += *kept[which];
        }
        ASSERT_EQ(text.Whole(), whole);
        ASSERT_EQ(text.Bytes(), static_cast<long long>(whole.size()));
        ASSERT_EQ(text.Sha256(), SumOf(whole)) << "deck " << deck;
    }
}

TEST(sty_MeshTexts, WhoMakesATextThatAnotherHasMadeMeanwhile_GetsTheOthers) {
    sty_MeshTexts meshes;
    const cow_CountedHld<odiK_Mesh> mesh(new odiK_Mesh());
    const auto first = std::make_shared<const std::string>("text");
    const auto second = std::make_shared<const std::string>("text");
    EXPECT_EQ(meshes.Keep(mesh, oif_MeshBlockEnm::NODES, first), first);
    EXPECT_EQ(meshes.Keep(mesh, oif_MeshBlockEnm::NODES, second), first);
    EXPECT_EQ(meshes.Keep(mesh, oif_MeshBlockEnm::SETS, second), second);
    EXPECT_EQ(meshes.Find(*mesh, oif_MeshBlockEnm::NODES), first);
}

TEST(sty_Sha256, KnownTexts_HaveTheirPublishedSums) {
    EXPECT_EQ(SumOf(""), "e3b0c44298fc1c149afbf4c8996fb92427ae41e4649b934ca495991b7852b855");
    EXPECT_EQ(SumOf("abc"), "ba7816bf8f01cfea414140de5dae2223b00361a396177a9cb410ff61f20015ad");
}
