#include "deck_reader/drd_LineSource.h"

#include "support/TestFolder.h"

#include <gtest/gtest.h>

namespace {

std::vector<std::string> LinesOf(drd_LineSource& source) {
    std::vector<std::string> lines;
    std::string_view line;
    while (source.Next(line)) {
        EXPECT_TRUE(line.data()[line.size()] == '\n' || line.data()[line.size()] == '\r' ||
                    line.data()[line.size()] == '\0');
        lines.emplace_back(line);
        EXPECT_EQ(source.Line(), static_cast<long>(lines.size()));
    }
    return lines;
}

std::vector<std::string> LinesOfText(std::string_view text) {
    drd_LineSource source(text);
    return LinesOf(source);
}

using Lines = std::vector<std::string>;

} // namespace

TEST(LineSource, AnyLineEnds_GiveTheSameLines) {
    const Lines expected = {"*Node", "1, 2.", "", "last"};
    EXPECT_EQ(LinesOfText("*Node\n1, 2.\n\nlast\n"), expected);
    EXPECT_EQ(LinesOfText("*Node\r\n1, 2.\r\n\r\nlast\r\n"), expected);
    EXPECT_EQ(LinesOfText("*Node\r1, 2.\r\rlast"), expected);
    EXPECT_EQ(LinesOfText("*Node\r\n1, 2.\n\rlast"), expected);
}

TEST(LineSource, EmptyTextAndLoneEnds) {
    EXPECT_EQ(LinesOfText(""), Lines());
    EXPECT_EQ(LinesOfText("\n"), Lines({""}));
    EXPECT_EQ(LinesOfText("\r\n\r\n"), Lines({"", ""}));
    EXPECT_EQ(LinesOfText("a"), Lines({"a"}));
}

TEST(LineSource, AByteOrderMark_IsNoPartOfTheFirstLine) {
    EXPECT_EQ(LinesOfText("\xEF\xBB\xBF*Heading\n"), Lines({"*Heading"}));
}

TEST(LineSource, LoneReturns_AreTold) {
    drd_LineSource unix("a\nb\n");
    LinesOf(unix);
    EXPECT_FALSE(unix.HasLoneReturns());
    drd_LineSource dos("a\r\nb\r\n");
    LinesOf(dos);
    EXPECT_FALSE(dos.HasLoneReturns());
    drd_LineSource old("a\rb\n");
    LinesOf(old);
    EXPECT_TRUE(old.HasLoneReturns());
}

TEST(LineSource, AtAZeroByte_TheSourceEnds) {
    using namespace std::string_view_literals;
    drd_LineSource source("one\ntw\0o\nthree\n"sv);
    EXPECT_EQ(LinesOf(source), Lines({"one", "tw"}));
    EXPECT_TRUE(source.IsBinary());
}

TEST(LineSource, ALineBeyondTheLongest_IsCutThere) {
    const std::string longest(drd_LineSource::kLongestLine, 'x');
    drd_LineSource source(longest + "yy\nnext\n" + longest + "\n");
    std::string_view line;
    ASSERT_TRUE(source.Next(line));
    EXPECT_TRUE(line == longest);
    EXPECT_TRUE(source.WasCut());
    ASSERT_TRUE(source.Next(line));
    EXPECT_TRUE(line == "next");
    EXPECT_FALSE(source.WasCut());
    ASSERT_TRUE(source.Next(line));
    EXPECT_EQ(line.size(), longest.size());
    EXPECT_FALSE(source.WasCut());
    EXPECT_EQ(source.Line(), 3);
}

TEST(LineSource, AFile_GivesTheLinesOfItsText_WhereverItsBufferEnds) {
    const TestFolder folder;
    // Lines of all lengths, ends of all kinds, over several buffers.
    std::string text;
    const char* ends[] = {"\n", "\r\n", "\r"};
    for (std::size_t i = 0; i < 4000; ++i) text += std::string(i % 331, 'a') + ends[i % 3];
    text += std::string(drd_LineSource::kLongestLine + 300, 'z') + "\r\nend";
    folder.Put("file", text);
    drd_LineSource file(std::fopen(folder.Path("file").c_str(), "rb"));
    EXPECT_TRUE(LinesOf(file) == LinesOfText(text));
    EXPECT_FALSE(file.HasFailed());
}
