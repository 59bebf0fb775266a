#include "model_file/mdf_Parser.h"

#include <gtest/gtest.h>

#include <bit>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

mdf_Value Parsed(std::string_view text) {
    mdf_Value root;
    std::vector<fnd_Finding> errors;
    EXPECT_TRUE(mdf_Parse(text, root, errors)) << text;
    for (const fnd_Finding& error : errors) ADD_FAILURE() << error.place << " " << error.Text();
    return root;
}

std::vector<int> Copy(std::span<const int> numbers) {
    return {numbers.begin(), numbers.end()};
}

std::vector<double> Copy(std::span<const double> numbers) {
    return {numbers.begin(), numbers.end()};
}

using Ints = std::vector<int>;
using Reals = std::vector<double>;

} // namespace

TEST(ModelFileValue, Size_Always_AtMostTwoWords) {
    EXPECT_LE(sizeof(mdf_Value), 16u);
}

TEST(ModelFileValue, Accessors_OfAnotherKind_Raise) {
    const mdf_Value number(3);
    EXPECT_THROW(number.String(), std::logic_error);
    EXPECT_THROW(number.Bool(), std::logic_error);
    EXPECT_THROW(number.Find("a"), std::logic_error);
    EXPECT_THROW(number.Members(), std::logic_error);
    EXPECT_THROW(number.Item(0), std::logic_error);
    EXPECT_THROW(number.Ints(), std::logic_error);
    EXPECT_THROW(number.UniformRowLength(), std::logic_error);
    EXPECT_THROW(number.FacetLabel(0), std::logic_error);
    EXPECT_THROW(mdf_Value("a").Real(), std::logic_error);
    EXPECT_THROW(mdf_Value(1.5).Int(), std::logic_error);
    EXPECT_THROW(Parsed("[1]").Item(1), std::logic_error);
    EXPECT_THROW(Parsed("[1]").Items(), std::logic_error);
    EXPECT_THROW(Parsed("[1]").Reals(), std::logic_error);
    EXPECT_THROW(Parsed("[1.5]").Ints(), std::logic_error);
    EXPECT_THROW(Parsed("[[1], [2, 3]]").RowLength(2), std::logic_error);
    EXPECT_THROW(Parsed("[[1], [2]]").RowBegin(2), std::logic_error);
    EXPECT_THROW(Parsed("[[1, \"A\"], [2, 5]]").FacetName(1), std::logic_error);
    EXPECT_THROW(Parsed("[[1, \"A\"], [2, 5]]").FacetId(0), std::logic_error);
    EXPECT_THROW(Parsed("[[1, \"A\"], [2, 5]]").FacetLabel(2), std::logic_error);
}

TEST(ModelFileValue, Copy_OfEveryKind_IsDeep) {
    mdf_Value original = Parsed(
        R"({"a": [null, true, 1, 1.5, "s"], "i": [1], "r": [1, 3000000000, 2], "m": [[1], [2, 3]], "f": [[1, "A"]]})");
    const mdf_Value copy = original;
    original = mdf_Value();
    ASSERT_TRUE(copy.IsObject());
    EXPECT_EQ(copy.Find("a")->Items()[4].String(), "s");
    EXPECT_EQ(Copy(copy.Find("i")->Ints()), Ints{1});
    EXPECT_TRUE(copy.Find("r")->Item(1).IsLargeInteger());
    EXPECT_TRUE(copy.Find("r")->Item(2).IsInt());
    EXPECT_EQ(copy.Find("m")->RowLength(1), 2u);
    EXPECT_EQ(copy.Find("f")->FacetName(0), "A");
}

TEST(ModelFileValue, MoveAssignment_FromOwnItem_KeepsTheItem) {
    mdf_Value value = Parsed(R"(["a", ["b"]])");
    value = std::move(value.Items()[1]);
    ASSERT_EQ(value.Size(), 1u);
    EXPECT_EQ(value.Item(0).String(), "b");
}

TEST(ModelFileParser, Scalars_AsRoot_HaveTheirKinds) {
    EXPECT_TRUE(Parsed("null").IsNull());
    EXPECT_TRUE(Parsed("true").Bool());
    EXPECT_FALSE(Parsed("false").Bool());
    EXPECT_EQ(Parsed("\"a\\n\\u00e9\"").String(), "a\n\xC3\xA9");
    EXPECT_EQ(Parsed("-12").Int(), -12);
    EXPECT_EQ(Parsed("1.5").Real(), 1.5);
    EXPECT_EQ(Parsed("7").Real(), 7.0);
}

TEST(ModelFileParser, Integers_AtTheLimitsOf32Bits_AreInt) {
    EXPECT_EQ(Parsed("2147483647").Int(), 2147483647);
    EXPECT_EQ(Parsed("-2147483648").Int(), -2147483647 - 1);
}

TEST(ModelFileParser, Integers_Beyond32Bits_AreRealsThatSayTheyWereIntegers) {
    for (const char* text : {"2147483648", "-2147483649", "18446744073709551615", "-9223372036854775808",
                             "123456789012345678901234567890"}) {
        const mdf_Value value = Parsed(text);
        EXPECT_EQ(value.Kind(), mdf_Kind::Real) << text;
        EXPECT_TRUE(value.IsLargeInteger()) << text;
        EXPECT_EQ(value.Real(), std::strtod(text, nullptr)) << text;
    }
    EXPECT_FALSE(Parsed("2147483648.0").IsLargeInteger());
    EXPECT_FALSE(Parsed("1e3").IsLargeInteger());
}

TEST(ModelFileParser, NumbersWithFractionOrExponent_OfWholeValue_AreReal) {
    for (const char* text : {"1.0", "1e0", "1E2", "0.0", "0e0"})
        EXPECT_EQ(Parsed(text).Kind(), mdf_Kind::Real);
}

TEST(ModelFileParser, NegativeZero_AsIntegerAndAsReal_IsIntZeroAndKeepsItsSign) {
    EXPECT_EQ(Parsed("-0").Int(), 0);
    const mdf_Value real = Parsed("-0.0");
    EXPECT_EQ(real.Kind(), mdf_Kind::Real);
    EXPECT_TRUE(std::signbit(real.Real()));
    EXPECT_TRUE(std::signbit(Parsed("[1, -0.0]").Reals()[1]));
}

TEST(ModelFileParser, Reals_HardToRound_AreThoseOfStrtod) {
    for (const char* text :
         {"0.1", "2.2250738585072011e-308", "4.9406564584124654e-324", "1e-400", "1.7976931348623157e308",
          "9007199254740993.0", "0.500000000000000166533453693773481063544750213623046875",
          "179769313486231580793728971405301e276", "8.41e21", "5e-324", "6929495644600919.5"}) {
        EXPECT_EQ(std::bit_cast<std::uint64_t>(Parsed(text).Real()),
                  std::bit_cast<std::uint64_t>(std::strtod(text, nullptr)))
            << text;
    }
}

TEST(ModelFileParser, Array_WithoutItems_IsAnIntArrayAndTakenAsAnything) {
    EXPECT_EQ(Parsed("[]").Kind(), mdf_Kind::IntArray);
    EXPECT_TRUE(Parsed("[]").TakeInts().empty());
    EXPECT_TRUE(Parsed("[]").TakeReals().empty());
    EXPECT_EQ(Parsed("[]").TakeMatrix().rows, 0u);
}

TEST(ModelFileParser, Array_OfIntegers_IsAnIntArray) {
    mdf_Value value = Parsed("[1, -2, 3]");
    ASSERT_EQ(value.Kind(), mdf_Kind::IntArray);
    EXPECT_TRUE(value.IsArray());
    EXPECT_EQ(value.Size(), 3u);
    EXPECT_EQ(value.Item(1).Int(), -2);
    EXPECT_EQ(value.FirstReal(), 3u);
    EXPECT_EQ(value.TakeInts(), (Ints{1, -2, 3}));
    EXPECT_TRUE(value.IsNull());
    EXPECT_EQ(Parsed("[1, 2]").TakeReals(), (Reals{1.0, 2.0}));
}

TEST(ModelFileParser, Array_OfIntegersAndReals_IsARealArrayThatKnowsWhichIsWhich) {
    mdf_Value value = Parsed("[1, 2.0, 3, 4000000000, 5.5]");
    ASSERT_EQ(value.Kind(), mdf_Kind::RealArray);
    EXPECT_EQ(value.FirstReal(), 1u);
    EXPECT_TRUE(value.Item(0).IsInt());
    EXPECT_EQ(value.Item(1).Kind(), mdf_Kind::Real);
    EXPECT_TRUE(value.Item(2).IsInt());
    EXPECT_TRUE(value.Item(3).IsLargeInteger());
    EXPECT_FALSE(value.Item(4).IsLargeInteger());
    EXPECT_EQ(Copy(value.Reals()), (Reals{1.0, 2.0, 3.0, 4e9, 5.5}));
    EXPECT_EQ(value.TakeReals(), (Reals{1.0, 2.0, 3.0, 4e9, 5.5}));
    EXPECT_THROW(Parsed("[1.5]").TakeInts(), std::logic_error);
}

TEST(ModelFileParser, Array_OfNumbersThenAnything_BecomesGeneralWithoutLoss) {
    for (const char* odd : {"null", "true", "\"s\"", "{}", "[]", "[1]"}) {
        const mdf_Value value = Parsed("[1, 2.0, 3, 4000000000, " + std::string(odd) + ", 6]");
        ASSERT_EQ(value.Kind(), mdf_Kind::Array) << odd;
        ASSERT_EQ(value.Size(), 6u);
        EXPECT_EQ(value.Items()[0].Int(), 1);
        EXPECT_EQ(value.Items()[1].Kind(), mdf_Kind::Real);
        EXPECT_EQ(value.Items()[2].Int(), 3);
        EXPECT_TRUE(value.Items()[3].IsLargeInteger());
        EXPECT_FALSE(value.Items()[4].IsNumber());
        EXPECT_EQ(value.Items()[5].Int(), 6);
    }
    EXPECT_EQ(Parsed("[1, \"s\"]").Item(0).Int(), 1);
}

TEST(ModelFileParser, Array_OfRowsOfIntegers_IsAMatrixOfInts) {
    mdf_Value value = Parsed("[[1, 2], [3, 4], [5, 6]]");
    ASSERT_EQ(value.Kind(), mdf_Kind::Matrix);
    EXPECT_TRUE(value.AllInts());
    EXPECT_EQ(value.Size(), 3u);
    EXPECT_EQ(value.UniformRowLength(), 2);
    EXPECT_EQ(value.RowBegin(2), 4u);
    EXPECT_EQ(value.Item(1).Kind(), mdf_Kind::IntArray);
    EXPECT_EQ(Copy(value.Item(1).Ints()), (Ints{3, 4}));
    const mdf_MatrixData data = value.TakeMatrix();
    EXPECT_EQ(data.rows, 3u);
    EXPECT_EQ(data.rowLength, 2);
    EXPECT_TRUE(data.rowLengths.empty());
    EXPECT_EQ(data.ints, (Ints{1, 2, 3, 4, 5, 6}));
    EXPECT_TRUE(data.reals.empty());
    EXPECT_TRUE(value.IsNull());
}

TEST(ModelFileParser, Array_OfRowsWithAReal_IsAMatrixOfReals) {
    mdf_Value value = Parsed("[[0, 0, 0], [1, 2.0, 3], [4, 5, 3000000000]]");
    ASSERT_EQ(value.Kind(), mdf_Kind::Matrix);
    EXPECT_FALSE(value.AllInts());
    EXPECT_EQ(value.FirstReal(), 4u);
    EXPECT_EQ(value.Item(0).Kind(), mdf_Kind::IntArray);
    EXPECT_EQ(value.Item(1).Kind(), mdf_Kind::RealArray);
    EXPECT_EQ(value.Item(1).FirstReal(), 1u);
    EXPECT_TRUE(value.Item(1).Item(2).IsInt());
    EXPECT_TRUE(value.Item(2).Item(2).IsLargeInteger());
    const mdf_MatrixData data = value.TakeMatrix();
    EXPECT_TRUE(data.ints.empty());
    EXPECT_EQ(data.reals, (Reals{0, 0, 0, 1, 2, 3, 4, 5, 3e9}));
}

TEST(ModelFileParser, Array_OfRowsThatDiffer_IsAMatrixWithRowLengths) {
    mdf_Value value = Parsed("[[1, 2], [3, 4], [], [5, 6, 7], [8, 9]]");
    ASSERT_EQ(value.Kind(), mdf_Kind::Matrix);
    EXPECT_EQ(value.UniformRowLength(), -1);
    EXPECT_EQ(value.Size(), 5u);
    EXPECT_EQ(value.RowLength(2), 0u);
    EXPECT_EQ(value.RowLength(3), 3u);
    EXPECT_EQ(value.RowBegin(3), 4u);
    EXPECT_EQ(Copy(value.Item(4).Ints()), (Ints{8, 9}));
    const mdf_MatrixData data = value.TakeMatrix();
    EXPECT_EQ(data.rowLength, -1);
    EXPECT_EQ(data.rowLengths, (Ints{2, 2, 0, 3, 2}));
    EXPECT_EQ(data.ints, (Ints{1, 2, 3, 4, 5, 6, 7, 8, 9}));
}

TEST(ModelFileParser, Array_OfEmptyRows_IsAMatrix) {
    const mdf_Value value = Parsed("[[], []]");
    ASSERT_EQ(value.Kind(), mdf_Kind::Matrix);
    EXPECT_EQ(value.UniformRowLength(), 0);
    EXPECT_EQ(value.Size(), 2u);
    EXPECT_TRUE(value.Item(1).Empty());
    EXPECT_EQ(Parsed("[[], [1]]").RowLength(1), 1u);
}

TEST(ModelFileParser, Matrix_ThatMeetsAnythingElse_BecomesGeneralWithoutLoss) {
    for (const char* odd : {"7", "7.5", "null", "false", "\"s\"", "{\"a\": 1}"}) {
        const mdf_Value value = Parsed("[[1, 2], [3.0, 4], " + std::string(odd) + ", [5]]");
        ASSERT_EQ(value.Kind(), mdf_Kind::Array) << odd;
        ASSERT_EQ(value.Size(), 4u);
        EXPECT_EQ(Copy(value.Items()[0].Ints()), (Ints{1, 2}));
        EXPECT_EQ(value.Items()[1].FirstReal(), 0u);
        EXPECT_TRUE(value.Items()[1].Item(1).IsInt());
        EXPECT_FALSE(value.Items()[2].IsArray());
        EXPECT_EQ(Copy(value.Items()[3].Ints()), Ints{5});
    }
}

TEST(ModelFileParser, MatrixRow_ThatMeetsAnythingElse_BecomesAnArrayOfItsOwn) {
    for (const char* odd : {"null", "true", "\"s\"", "{\"a\": 1}", "[8]"}) {
        const mdf_Value value = Parsed("[[1, 2, 3], [4.0, 5, " + std::string(odd) + ", 6], [7]]");
        ASSERT_EQ(value.Kind(), mdf_Kind::Array) << odd;
        ASSERT_EQ(value.Size(), 3u);
        EXPECT_EQ(Copy(value.Items()[0].Ints()), (Ints{1, 2, 3}));
        const mdf_Value& row = value.Items()[1];
        ASSERT_EQ(row.Kind(), mdf_Kind::Array);
        ASSERT_EQ(row.Size(), 4u);
        EXPECT_EQ(row.Items()[0].Kind(), mdf_Kind::Real);
        EXPECT_EQ(row.Items()[1].Int(), 5);
        EXPECT_EQ(row.Items()[3].Int(), 6);
        EXPECT_EQ(Copy(value.Items()[2].Ints()), Ints{7});
    }
}

TEST(ModelFileParser, MatrixOfReals_CutBackAmongItsReals_KeepsWhichIsWhich) {
    const mdf_Value value = Parsed("[[1.0, 2, 5000000000], [3, 6000000000, null]]");
    ASSERT_EQ(value.Kind(), mdf_Kind::Array);
    const mdf_Value& first = value.Items()[0];
    EXPECT_EQ(first.Item(0).Kind(), mdf_Kind::Real);
    EXPECT_TRUE(first.Item(1).IsInt());
    EXPECT_TRUE(first.Item(2).IsLargeInteger());
    EXPECT_TRUE(value.Items()[1].Items()[1].IsLargeInteger());
}

TEST(ModelFileParser, Arrays_NestedThreeDeep_AreArraysOfMatrices) {
    const mdf_Value value = Parsed("[[[1, 2], [3, 4]], [[5, 6]]]");
    ASSERT_EQ(value.Kind(), mdf_Kind::Array);
    ASSERT_EQ(value.Size(), 2u);
    EXPECT_EQ(value.Items()[0].Kind(), mdf_Kind::Matrix);
    EXPECT_EQ(Copy(value.Items()[1].Ints()), (Ints{5, 6}));
}

TEST(ModelFileParser, Array_OfLabelsWithFaces_IsAFacetArray) {
    const mdf_Value value = Parsed(R"([[5, 0], [1, "S1"], [2, "S2"], [3, "S1"], [4, -6]])");
    ASSERT_EQ(value.Kind(), mdf_Kind::FacetArray);
    ASSERT_EQ(value.Size(), 5u);
    EXPECT_FALSE(value.FacetHasName(0));
    EXPECT_EQ(value.FacetLabel(0), 5);
    EXPECT_EQ(value.FacetId(0), 0);
    EXPECT_EQ(value.FacetNameIndex(0), -1);
    EXPECT_EQ(value.FacetLabel(3), 3);
    EXPECT_TRUE(value.FacetHasName(3));
    EXPECT_EQ(value.FacetName(3), "S1");
    EXPECT_EQ(value.FacetNameIndex(2), 1);
    EXPECT_EQ(value.FacetId(4), -6);
    EXPECT_EQ(value.FacetNames(), (std::vector<std::string>{"S1", "S2"}));
    EXPECT_EQ(Copy(value.Item(0).Ints()), (Ints{5, 0}));
    EXPECT_EQ(value.Item(1).Items()[0].Int(), 1);
    EXPECT_EQ(value.Item(1).Items()[1].String(), "S1");
}

TEST(ModelFileParser, Pairs_WithoutAName_AreAMatrix) {
    EXPECT_EQ(Parsed("[[1, 0], [2, 3]]").Kind(), mdf_Kind::Matrix);
}

TEST(ModelFileParser, FacetArray_ThatMeetsAnotherRow_BecomesGeneralWithoutLoss) {
    for (const char* odd :
         {"[]", "[9]", "[9, 1, 2]", "[9, \"S3\", 2]", "[9, \"S3\", \"x\"]", "[\"S3\", 9]", "[9.0, \"S3\"]",
          "[9, 1.5]", "[9, null]", "[9, []]", "[{}, 1]", "[9, 1, {}]", "[9, 1, [2]]", "7", "\"s\"", "{}"}) {
        const mdf_Value value = Parsed("[[1, \"S1\"], [2, 4], " + std::string(odd) + ", [3, \"S2\"]]");
        ASSERT_EQ(value.Kind(), mdf_Kind::Array) << odd;
        ASSERT_EQ(value.Size(), 4u) << odd;
        EXPECT_EQ(value.Items()[0].Items()[1].String(), "S1") << odd;
        EXPECT_EQ(Copy(value.Items()[1].Ints()), (Ints{2, 4})) << odd;
        EXPECT_EQ(value.Items()[3].Items()[1].String(), "S2") << odd;
    }
    const mdf_Value row = Parsed(R"([[1, "S1"], [9, "S3", 2.5]])").Item(1);
    ASSERT_EQ(row.Size(), 3u);
    EXPECT_EQ(row.Items()[1].String(), "S3");
    EXPECT_EQ(row.Items()[2].Real(), 2.5);
}

TEST(ModelFileParser, Rows_ThatCannotTurnIntoFacets_BecomeGeneral) {
    for (const char* text :
         {R"([[1, 2, 3], [4, "S1"]])", R"([[1.0, 2], [4, "S1"]])", R"([[1], [1, 2], [4, "S1"]])",
          R"([["S1", 4]])", R"([[1.5, "S1"]])", R"([[1, 2, "S1"]])"}) {
        EXPECT_EQ(Parsed(text).Kind(), mdf_Kind::Array) << text;
    }
}

TEST(ModelFileParser, LongArrays_OfNumbersRowsAndFacets_AreComplete) {
    constexpr int count = 20000;
    std::string ints = "[";
    std::string rows = "[";
    std::string commented = "[";
    std::string facets = "[";
    for (int i = 0; i < count; ++i) {
        const std::string comma = i + 1 < count ? "," : "]";
        const std::string label = std::to_string(i);
        ints += label + comma;
        rows += "[" + label + (i == 15000 ? ".5" : "") + ", 7]" + comma;
        commented += label + (i % 1000 == 0 ? "/* , ] */" : "") + comma;
        facets += "[" + label + ", \"S" + std::to_string(i % 6) + "\"]" + comma;
    }
    Ints expected;
    for (int i = 0; i < count; ++i) expected.push_back(i);
    EXPECT_EQ(Parsed(ints).TakeInts(), expected);
    EXPECT_EQ(Parsed(commented).TakeInts(), expected);
    const mdf_Value matrix = Parsed(rows);
    ASSERT_EQ(matrix.Reals().size(), 2u * count);
    EXPECT_EQ(matrix.FirstReal(), 30000u);
    EXPECT_EQ(matrix.Reals()[30000], 15000.5);
    EXPECT_EQ(matrix.Reals()[2u * count - 2], count - 1);
    const mdf_Value surface = Parsed(facets);
    ASSERT_EQ(surface.Size(), static_cast<std::size_t>(count));
    EXPECT_EQ(surface.FacetName(19999), "S1");
    EXPECT_EQ(surface.FacetNames().size(), 6u);
}

TEST(ModelFileParser, Object_Members_StandInFileOrderAndAreFoundByName) {
    mdf_Value value = Parsed(R"({"b": 1, "a": [1, 2], "": null})");
    ASSERT_EQ(value.Size(), 3u);
    EXPECT_EQ(value.Members()[0].name, "b");
    EXPECT_EQ(value.Members()[1].name, "a");
    EXPECT_EQ(value.Find("b")->Int(), 1);
    EXPECT_TRUE(value.Find("")->IsNull());
    EXPECT_EQ(value.Find("c"), nullptr);
    EXPECT_EQ(value.Find("a")->TakeInts(), (Ints{1, 2}));
    EXPECT_TRUE(Parsed("{}").IsObject());
    EXPECT_EQ(Parsed("{}").Find("a"), nullptr);
}

TEST(ModelFileParser, Object_OfManyMembers_FindsEachAndKeepsTheirOrder) {
    constexpr int count = 10000;
    std::string text = "{";
    for (int i = 0; i < count; ++i)
        text += (i == 0 ? "\"n" : ", \"n") + std::to_string((i * 7919) % count) + "\": " + std::to_string(i);
    const mdf_Value value = Parsed(text + "}");
    ASSERT_EQ(value.Size(), static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i) {
        const std::string name = "n" + std::to_string((i * 7919) % count);
        EXPECT_EQ(value.Members()[static_cast<std::size_t>(i)].name, name);
        ASSERT_NE(value.Find(name), nullptr);
        EXPECT_EQ(value.Find(name)->Int(), i);
    }
    EXPECT_EQ(value.Find("n"), nullptr);
    EXPECT_EQ(value.Find("z"), nullptr);
}

TEST(ModelFileParser, Comments_OfBothKinds_AreSkipped) {
    const mdf_Value value = Parsed("// head\n{ /* a */ \"a\" /* b */ : // c\n [1, /* ] */ 2] } // tail");
    EXPECT_EQ(Copy(value.Find("a")->Ints()), (Ints{1, 2}));
}

TEST(ModelFileParser, ByteOrderMark_AtTheBeginning_IsAccepted) {
    EXPECT_EQ(Parsed("\xEF\xBB\xBF[1]").Size(), 1u);
}

TEST(ModelFileParser, NulEscape_InAString_IsKept) {
    EXPECT_EQ(Parsed(R"("a\u0000b")").String(), std::string("a\0b", 3));
}

TEST(ModelFileParser, Nesting_OfTwoHundredLevels_IsAccepted) {
    const std::string deep = std::string(200, '[') + "null" + std::string(200, ']');
    EXPECT_EQ(Parsed(deep).Size(), 1u);
    const std::string rows = std::string(200, '[') + "1" + std::string(200, ']');
    EXPECT_EQ(Parsed(rows).Size(), 1u);
}

namespace {

std::string Joined(int count, const std::string& separator, const auto& item) {
    std::string text = "[";
    for (int i = 0; i < count; ++i) text.append(i == 0 ? "" : separator).append(item(i));
    return text + "]";
}

} // namespace

// Of more than some thousand numbers the rest is read in pieces.
TEST(ModelFileParser, LargeArrays_WithOddItemsAnywhere_AreReadAsSmallOnesAre) {
    constexpr int count = 100000;
    for (const int odd : {-1, 4095, 4096, 5000, 77777, count - 1}) {
        for (const std::string item : {"null", "2.5", "/* c */ 7", "3000000000", "[1]", "\"s\"", "-0.0"}) {
            const mdf_Value value = Parsed(
                Joined(count, ", ", [&](int i) { return i == odd ? item : std::to_string(i % 1000); }));
            ASSERT_EQ(value.Size(), static_cast<std::size_t>(count));
            for (int i = 0; i < count; i += 1237) {
                if (i != odd) {
                    ASSERT_EQ(value.Item(static_cast<std::size_t>(i)).Int(), i % 1000);
                }
            }
            if (odd < 0) continue;
            const mdf_Value found = value.Item(static_cast<std::size_t>(odd));
            const mdf_Value expected = Parsed(item);
            EXPECT_EQ(found.Kind(), expected.Kind()) << item;
            EXPECT_EQ(found.IsLargeInteger(), expected.IsLargeInteger()) << item;
            EXPECT_EQ(value.Item(count - 1).IsNumber(), odd != count - 1 || expected.IsNumber());
        }
    }
}

TEST(ModelFileParser, LargeMatrices_WithOddRowsAnywhere_AreReadAsSmallOnesAre) {
    constexpr int count = 60000;
    for (const int odd : {-1, 2000, 2050, 44444, count - 1}) {
        for (const std::string row :
             {"[1, 2.5]", "[1, 2, 3]", "[]", "[1, null]", "[1 , // ]\n 2]", "7", "[[1], 2]"}) {
            const mdf_Value value = Parsed(Joined(count, ",\n  ", [&](int i) {
                return i == odd ? row : "[" + std::to_string(i) + ", " + std::to_string(-i) + "]";
            }));
            ASSERT_EQ(value.Size(), static_cast<std::size_t>(count));
            for (int i = 0; i < count; i += 997) {
                if (i == odd) continue;
                const mdf_Value item = value.Item(static_cast<std::size_t>(i));
                ASSERT_EQ(item.Item(0).Int(), i) << row << odd;
                ASSERT_EQ(item.Item(1).Int(), -i) << row << odd;
            }
            if (odd < 0) continue;
            const mdf_Value expected = Parsed(row);
            const mdf_Value found = value.Item(static_cast<std::size_t>(odd));
            EXPECT_EQ(found.Kind(), expected.Kind()) << row;
            EXPECT_EQ(found.Size(), expected.Size()) << row;
        }
    }
}

TEST(ModelFileParser, LargeArrays_ThatBreakOff_AreErrorsWhereTheyDo) {
    const auto message = [](const std::string& end) {
        mdf_Value root;
        std::vector<fnd_Finding> errors;
        const std::string text = Joined(50000, ",\n", [](int) { return std::string("[1, 2]"); });
        EXPECT_FALSE(mdf_Parse(text.substr(0, text.size() - 1) + end, root, errors));
        return std::to_string(errors.back().line) + ":" + std::to_string(errors.back().column) + " " +
               errors.back().Text();
    };
    EXPECT_EQ(message(""), "50000:7 found the end of the file, expected ',' or ']'");
    EXPECT_EQ(message(",]"), "50000:8 found ']', expected no comma behind the last one");
    EXPECT_EQ(message(", [1, ]]"), "50000:13 found ']', expected no comma behind the last one");
    EXPECT_EQ(message(", [1, 1e999]]"),
              "50000:13 the number '1e999' is beyond the range of double precision");
}
