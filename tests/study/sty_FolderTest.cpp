#include "study/sty_Folder.h"
#include "study/sty_DeckText.h"
#include "study/sty_Ledger.h"
#include "study/sty_Study.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <numeric>

#include <unistd.h>

namespace {

class Scratch {
public:
    Scratch() {
        char name[] = "/tmp/qrx-study-XXXXXX";
        path_ = ::mkdtemp(name);
    }
    ~Scratch() { std::filesystem::remove_all(path_); }
    std::string Path(const std::string& name = "") const { return path_ + (name.empty() ? "" : "/" + name); }

private:
    std::string path_;
};

int WriteOne(int file) {
    return whf_WriteAll(file, "one");
}

} // namespace

TEST(sty_Layout, OfUpToAThousandRows_HasNoFolders) {
    EXPECT_EQ(sty_Layout(9).PathOf(9, ""), "9.inp");
    EXPECT_EQ(sty_Layout(1000).PathOf(7, ""), "0007.inp");
    EXPECT_EQ(sty_Layout(1000).PathOf(1000, "A"), "A.inp");
}

TEST(sty_Layout, OfMoreRows_HasAThousandInAFolderAndAThousandFoldersInOne) {
    EXPECT_EQ(sty_Layout(1001).PathOf(1000, ""), "000/1000.inp");
    EXPECT_EQ(sty_Layout(1001).PathOf(1001, ""), "001/1001.inp");
    EXPECT_EQ(sty_Layout(1'000'000).PathOf(1'000'000, ""), "999/1000000.inp");
    EXPECT_EQ(sty_Layout(1'000'001).PathOf(1'000'001, ""), "001/000/1000001.inp");
    EXPECT_EQ(sty_Layout(10'000'000).PathOf(1'234'567, ""), "001/234/01234567.inp");
    EXPECT_EQ(sty_Layout(10'000'000).PathOf(10'000'000, "last"), "009/999/last.inp");
}

TEST(sty_RowsOf, Shards_ShareTheRowsEvenlyAndInOrder) {
    for (const long long rows : {1LL, 5LL, 39LL, 40LL, 2000LL, 10'000'000'000LL}) {
        long long next = 1;
        long long least = rows;
        long long most = 0;
        for (int shard = 1; shard <= 40; ++shard) {
            const sty_Rows part = sty_RowsOf(rows, shard, 40);
            EXPECT_EQ(part.first, next);
            next = part.last + 1;
            least = std::min(least, part.last - part.first + 1);
            most = std::max(most, part.last - part.first + 1);
        }
        EXPECT_EQ(next, rows + 1);
        EXPECT_LE(most - least, 1);
    }
}

TEST(sty_Placer, WhereAForeignFileStands_LeavesIt) {
    const Scratch scratch;
    sty_Folder folder(scratch.Path());
    folder.Prepare();
    std::filesystem::create_directory(scratch.Path("000"));
    std::ofstream(scratch.Path("000/1.inp")) << "mine";
    {
        sty_Placer placer(folder, "job");
        const auto no = [](const std::string&) { return false; };
        EXPECT_EQ(placer.Place("000/1.inp", WriteOne, false, no), sty_Placer::Result::FOREIGN);
        EXPECT_EQ(folder.SizeOf("000/1.inp"), 4);
        EXPECT_EQ(placer.Place("000/1.inp", WriteOne, true, no), sty_Placer::Result::PLACED);
        EXPECT_EQ(folder.SizeOf("000/1.inp"), 3);
        EXPECT_EQ(placer.Place("001/002/3.inp", WriteOne, false, no), sty_Placer::Result::PLACED);
        const auto yes = [](const std::string& path) { return path.ends_with("001/002/3.inp"); };
        EXPECT_EQ(placer.Place("001/002/3.inp", WriteOne, false, yes), sty_Placer::Result::PLACED);
    }
    EXPECT_FALSE(std::filesystem::exists(scratch.Path("000/.study-job")));
}

TEST(sty_Folder, WhatAKilledRunLeft_IsRemoved) {
    const Scratch scratch;
    const sty_Folder folder(scratch.Path());
    std::filesystem::create_directory(scratch.Path("000"));
    for (const char* name :
         {"000/.study-2-of-4.0", "000/.study-2-of-4.1", "000/.study-2-of-40.1", "000/1.inp"})
        std::ofstream(scratch.Path(name)) << "half";
    folder.RemoveUnplaced("000", "2-of-4.");
    folder.RemoveUnplaced("001", "2-of-4.");
    EXPECT_FALSE(std::filesystem::exists(scratch.Path("000/.study-2-of-4.0")));
    EXPECT_FALSE(std::filesystem::exists(scratch.Path("000/.study-2-of-4.1")));
    EXPECT_TRUE(std::filesystem::exists(scratch.Path("000/.study-2-of-40.1")));
    EXPECT_TRUE(std::filesystem::exists(scratch.Path("000/1.inp")));
}

TEST(sty_Placer, WhenWritingFails_NothingStandsThere) {
    const Scratch scratch;
    sty_Folder folder(scratch.Path());
    folder.Prepare();
    sty_Placer placer(folder, "job");
    const auto fail = [](int file) {
        whf_WriteAll(file, "half");
        return ENOSPC;
    };
    EXPECT_THROW(placer.Place("1.inp", fail, false, [](const std::string&) { return false; }), sty_Refused);
    EXPECT_EQ(folder.SizeOf("1.inp"), -1);
}

TEST(sty_Ledger, LinesOfResults_AreReadBack) {
    sty_Result done;
    done.row = 17;
    done.deck = "000/017.inp";
    done.bytes = 12345678901;
    done.sha256 = std::string(64, 'a');
    done.parameters = "{\"a\": \"]}\"}";
    std::string line = sty_LineOf(done);
    EXPECT_EQ(line.back(), '\n');
    line.pop_back();
    const auto entry = sty_EntryOf(line);
    ASSERT_TRUE(entry);
    EXPECT_EQ(entry->row, 17);
    EXPECT_EQ(entry->deck, "000/017.inp");
    EXPECT_EQ(entry->bytes, 12345678901);
    for (std::size_t length = 0; length < line.find("aaa"); ++length)
        EXPECT_FALSE(sty_EntryOf(std::string_view(line).substr(0, length))) << length;

    // Names of meshes that look like the end of their list.
    done.meshes = {{"a\"}]b", std::string(64, 'c')}, {"\\", std::string(64, 'd')}};
    line = sty_LineOf(done);
    line.pop_back();
    ASSERT_TRUE(sty_EntryOf(line));
    EXPECT_EQ(sty_EntryOf(line)->meshes, R"([{"file": "a\"}]b", "sha256": ")" + std::string(64, 'c') +
                                             R"("}, {"file": "\\", "sha256": ")" + std::string(64, 'd') +
                                             R"("}])");
    done.meshes.clear();
    line = sty_LineOf(done);
    EXPECT_EQ(sty_EntryOf(std::string_view(line).substr(0, line.size() - 1))->meshes, "");

    sty_Result failed;
    failed.row = 3;
    failed.parameters = "{}";
    failed.errors = {{"column", "/a", "found \"x\", expected\na number"}};
    line = sty_LineOf(failed);
    line.pop_back();
    ASSERT_TRUE(sty_EntryOf(line));
    EXPECT_TRUE(sty_EntryOf(line)->deck.empty());
    EXPECT_TRUE(sty_ReasonIn(line).starts_with("found \"x\", expected"));
}

TEST(sty_DeckText, PiecesOfDecks_AreOneTextWithItsSum) {
    const Scratch scratch;
    sty_MeshTexts meshes;
    sty_DeckText deck(meshes);
    // Texts that are long against the distance of the places from which sums go on, and differ early, late,
    // in length and in what is kept.
    const auto kept = [](char c) { return std::make_shared<const std::string>(std::string(70'000, c)); };
    const auto nodes = kept('n');
    const auto elements = kept('e');
    const auto others = kept('o');
    const std::string text(100'000, 't');
    const auto changed = [&](std::size_t at) { return text.substr(0, at) + "x" + text.substr(at + 1); };
    const auto longer = [&](std::size_t at) { return text.substr(0, at) + "x" + text.substr(at); };
    struct Deck {
        std::string begin;
        sty_MeshTexts::Text first;
        std::string middle;
        sty_MeshTexts::Text second;
        std::string end;
    };
    const Deck decks[] = {{text, nodes, "", elements, text},
                          {text, nodes, "", elements, changed(99'999)},
                          {text, nodes, "", elements, text},
                          {text, nodes, "", elements, longer(50'000)},
                          {text, nodes, "m", elements, text},
                          {text, nodes, "", elements, ""},
                          {changed(0), nodes, "", elements, text},
                          {longer(16'384), nodes, "", elements, text},
                          {text, nodes, text, elements, text},
                          {text, nodes, changed(20'000), elements, text},
                          {text, nodes, "", others, text},
                          {text, others, "", elements, text},
                          {text, nodes, "", nullptr, text},
                          {text, nodes, "", elements, text},
                          {text, nullptr, "", nullptr, changed(7)},
                          {"", nullptr, "", nullptr, ""},
                          {text, nullptr, text, nullptr, ""},
                          {text, elements, "", nodes, text.substr(0, 16'384)},
                          {text, elements, "", nodes, text.substr(0, 16'383)}};
    for (const Deck& each : decks) {
        deck.Begin();
        std::string whole;
        const auto own = [&](const std::string& piece) {
            deck.Write(piece.data(), piece.size());
            whole += piece;
        };
        const auto shared = [&](const sty_MeshTexts::Text& piece) {
            if (piece == nullptr) return;
            deck.WriteKept(piece);
            whole += *piece;
        };
        own(each.begin);
        shared(each.first);
        own(each.middle);
        shared(each.second);
        own(each.end);
        sty_Sha256 sum;
        sum.Add(whole);
        EXPECT_EQ(deck.Bytes(), static_cast<long long>(whole.size()));
        EXPECT_EQ(deck.Sha256(), sum.Hex()) << &each - decks;
        const std::string path = scratch.Path("deck");
        std::FILE* file = std::fopen(path.c_str(), "w");
        EXPECT_EQ(deck.WriteTo(::fileno(file)), 0);
        std::fclose(file);
        std::ifstream in(path);
        EXPECT_TRUE(std::string(std::istreambuf_iterator<char>(in), {}) == whole);
    }
}
