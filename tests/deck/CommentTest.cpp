#include "base/oif_BlockHeader.h"
#include "base/oif_Comment.h"
#include "support/DeckTest.h"

TEST(Comment, EmptyText_WritesNothing) {
    EXPECT_EQ(Written(oif_Comment("")), "");
}

TEST(Comment, OneNewline_WritesTheBlankLineTwice) {
    EXPECT_EQ(Written(oif_Comment("\n")), "** \n** \n");
}

TEST(Comment, TwoNewlines_WriteTheBlankLineThreeTimes) {
    EXPECT_EQ(Written(oif_Comment("\n\n")), "** \n** \n** \n");
}

TEST(Comment, TwoWords_WriteOneLineEachAndNoMore) {
    EXPECT_EQ(Written(oif_Comment("one\ntwo")), "** one\n** two\n");
}

TEST(Comment, FinalNewline_WritesOneBlankLineMore) {
    EXPECT_EQ(Written(oif_Comment("one\n")), "** one\n** \n");
}

TEST(Comment, BannerText_WritesThreeLinesWhoseBlanksStay) {
    EXPECT_EQ(Written(oif_Comment("\nLOADS\n")), "** \n** LOADS\n** \n");
}

TEST(Comment, TextWithLeadingBlank_KeepsIt) {
    EXPECT_EQ(Written(oif_Comment("  a")), "**   a\n");
}

TEST(RawKeyword, EmptyText_WritesNothing) {
    EXPECT_EQ(Written(oif_RawKeyword("")), "");
}

TEST(RawKeyword, TextWithoutLineEnd_GetsOne) {
    EXPECT_EQ(Written(oif_RawKeyword("*End Part")), "*End Part\n");
}

TEST(RawKeyword, TextWithLineEnd_GetsNoSecondOne) {
    EXPECT_EQ(Written(oif_RawKeyword("a\nb\n")), "a\nb\n");
}

TEST(FileHeader, TextWithoutLineEnd_LeavesTheLineOpenOnPurpose) {
    EXPECT_EQ(Written(oif_FileHeader("*Heading")), "*Heading");
}

TEST(FileHeader, EmptyText_WritesNothing) {
    EXPECT_EQ(Written(oif_FileHeader("")), "");
}

TEST(Keyword, PlainClasses_AreNeverEmpty) {
    EXPECT_FALSE(oif_Comment("").IsEmpty());
}

TEST(BlockHeader, EachSection_HasItsBannerOnce) {
    oif_BlockHeader header("LOADS");
    const char* const banner = "** \n** LOADS\n** \n";
    EXPECT_EQ(Written(header.ModelHeader().ConstGet()), banner);
    EXPECT_EQ(Written(header.ModelHeader().ConstGet()), "");
    EXPECT_EQ(Written(header.AssyHeader().ConstGet()), banner);
    EXPECT_EQ(Written(header.AssyHeader().ConstGet()), "");
    EXPECT_EQ(Written(header.StepHeader("A").ConstGet()), banner);
    EXPECT_EQ(Written(header.StepHeader("B").ConstGet()), banner);
    EXPECT_EQ(Written(header.StepHeader("A").ConstGet()), "");
    EXPECT_EQ(Written(header.StepHeader("B").ConstGet()), "");
}
