#include "model_file/mdf_Writer.h"

#include "model_file/mdf_Parser.h"

#include <gtest/gtest.h>

#include <clocale>
#include <cmath>
#include <functional>
#include <limits>
#include <sstream>
#include <stdexcept>
#include <string>

namespace {

std::string Written(const std::function<void(mdf_Writer&)>& calls) {
    std::ostringstream out;
    mdf_Writer writer(out);
    calls(writer);
    EXPECT_TRUE(writer.Finish());
    return out.str();
}

std::string RealText(double value) {
    return Written([&](mdf_Writer& w) { w.Real(value); });
}

std::string StringText(std::string_view value) {
    return Written([&](mdf_Writer& w) { w.String(value); });
}

} // namespace

TEST(ModelFileWriter, Document_InLines_IsIndented) {
    EXPECT_EQ(
        Written([](mdf_Writer& w) {
            w.BeginObject();
            w.Key("a");
            w.Int(-1);
            w.Key("b");
            w.BeginArray();
            w.Bool(true);
            w.Null();
            w.BeginObject();
            w.EndObject();
            w.BeginArray();
            w.EndArray();
            w.EndArray();
            w.Key("c");
            w.String("x");
            w.EndObject();
        }),
        "{\n  \"a\": -1,\n  \"b\": [\n    true,\n    null,\n    {},\n    []\n  ],\n  \"c\": \"x\"\n}\n");
}

TEST(ModelFileWriter, Rows_OfNumbers_StandOnOneLineEach) {
    EXPECT_EQ(Written([](mdf_Writer& w) {
                  w.BeginArray();
                  w.Row(std::vector<int>{1, 2, 3});
                  w.Row(std::vector<double>{0.0, 1.5, -2.0});
                  w.BeginArray(mdf_Layout::OneLine);
                  w.Int(7);
                  w.String("S1");
                  w.BeginArray();
                  w.Int(8);
                  w.EndArray();
                  w.EndArray();
                  w.BeginObject(mdf_Layout::OneLine);
                  w.Key("from");
                  w.Int(1);
                  w.Key("to");
                  w.Int(9);
                  w.EndObject();
                  w.EndArray();
              }),
              "[\n  [1, 2, 3],\n  [0.0, 1.5, -2.0],\n  [7, \"S1\", [8]],\n  {\"from\": 1, \"to\": 9}\n]\n");
}

TEST(ModelFileWriter, LongLists_Wrapped_FillLinesUpToAHundredColumns) {
    const std::string text = Written([](mdf_Writer& w) {
        w.BeginObject();
        w.Key("labels");
        w.BeginArray(mdf_Layout::Wrapped);
        for (int i = 1000; i < 1100; ++i) w.Int(i);
        w.EndArray();
        w.EndObject();
    });
    std::istringstream lines(text);
    std::string line;
    std::vector<std::string> all;
    while (std::getline(lines, line)) all.push_back(line);
    ASSERT_EQ(all.size(), 9u);
    EXPECT_EQ(all[1].substr(0, 25), "  \"labels\": [1000, 1001, ");
    EXPECT_EQ(all[2].substr(0, 10), "    1014, ");
    for (const std::string& l : all) EXPECT_LE(l.size(), 100u);
    EXPECT_EQ(all[7].back(), ']');
}

TEST(ModelFileWriter, Reals_Always_HaveAFractionOrAnExponentAndReadBack) {
    EXPECT_EQ(RealText(1.0), "1.0\n");
    EXPECT_EQ(RealText(-0.0), "-0.0\n");
    EXPECT_EQ(RealText(0.1), "0.1\n");
    EXPECT_EQ(RealText(210000.0), "210000.0\n");
    EXPECT_EQ(RealText(1e22), "1e+22\n");
    EXPECT_EQ(RealText(1e-5), "1e-05\n");
    EXPECT_EQ(RealText(1.0 / 3.0), "0.3333333333333333\n");
    EXPECT_EQ(RealText(-std::numeric_limits<double>::max()), "-1.7976931348623157e+308\n");
    EXPECT_EQ(RealText(std::numeric_limits<double>::denorm_min()), "5e-324\n");
    for (const double value : {9007199254740993.0, 4e9, 123456789012345680.0, 2.2250738585072014e-308}) {
        mdf_Value back;
        std::vector<fnd_Finding> errors;
        ASSERT_TRUE(mdf_Parse(RealText(value), back, errors));
        EXPECT_EQ(back.Kind(), mdf_Kind::Real);
        EXPECT_FALSE(back.IsLargeInteger());
        EXPECT_EQ(back.Real(), value);
    }
}

TEST(ModelFileWriter, Reals_NotFinite_Raise) {
    std::ostringstream out;
    mdf_Writer writer(out);
    EXPECT_THROW(writer.Real(std::numeric_limits<double>::infinity()), std::invalid_argument);
    EXPECT_THROW(writer.Real(std::nan("")), std::invalid_argument);
}

TEST(ModelFileWriter, Strings_WithSpecialCharacters_AreEscaped) {
    EXPECT_EQ(StringText("a\"b\\c/d"), "\"a\\\"b\\\\c/d\"\n");
    EXPECT_EQ(StringText(std::string_view("\n\r\t\b\f\x01\x1f\0", 8)),
              "\"\\n\\r\\t\\b\\f\\u0001\\u001f\\u0000\"\n");
    EXPECT_EQ(StringText("Tr\xC3\xA4ger \xF0\x9F\x98\x80"), "\"Tr\xC3\xA4ger \xF0\x9F\x98\x80\"\n");
}

TEST(ModelFileWriter, Strings_NotUtf8_Raise) {
    for (const char* text : {"\xFF", "\xC3", "\xC0\x80", "\xED\xA0\x80", "\xE0\x80\x80", "\xF4\x90\x80\x80",
                             "\xF0\x80\x80\x80", "\xC3(", "\x80"}) {
        std::ostringstream out;
        mdf_Writer writer(out);
        EXPECT_THROW(writer.String(text), std::invalid_argument) << testing::PrintToString(text);
    }
}

TEST(ModelFileWriter, Calls_ThatMakeNoDocument_Raise) {
    const auto raises = [](const std::function<void(mdf_Writer&)>& calls) {
        std::ostringstream out;
        mdf_Writer writer(out);
        EXPECT_THROW(calls(writer), std::logic_error);
    };
    raises([](mdf_Writer& w) { w.Key("a"); });
    raises([](mdf_Writer& w) { w.BeginArray(), w.Key("a"); });
    raises([](mdf_Writer& w) { w.BeginObject(), w.Int(1); });
    raises([](mdf_Writer& w) { w.BeginObject(), w.Key("a"), w.Key("b"); });
    raises([](mdf_Writer& w) { w.BeginObject(), w.Key("a"), w.EndObject(); });
    raises([](mdf_Writer& w) { w.BeginObject(), w.EndArray(); });
    raises([](mdf_Writer& w) { w.EndArray(); });
    raises([](mdf_Writer& w) { w.Int(1), w.Int(2); });
    raises([](mdf_Writer& w) { w.BeginArray(), w.Finish(); });
    raises([](mdf_Writer& w) { w.Finish(); });
}

TEST(ModelFileWriter, Finish_OnAStreamThatFails_IsFalse) {
    std::ostringstream out;
    out.setstate(std::ios::badbit);
    mdf_Writer writer(out);
    writer.Int(1);
    EXPECT_FALSE(writer.Finish());
}

TEST(ModelFileWriter, Value_OfEveryForm_KeepsKindsAndRows) {
    const std::string text = "{\n"
                             "  \"r\": [1, 2.0, 3],\n"
                             "  \"m\": [\n    [1, 2.5],\n    [3, 4]\n  ],\n"
                             "  \"f\": [\n    [1, \"S1\"],\n    [2, 6]\n  ],\n"
                             "  \"a\": [\n    null,\n    false\n  ]\n"
                             "}\n";
    mdf_Value value;
    std::vector<fnd_Finding> errors;
    ASSERT_TRUE(mdf_Parse(text, value, errors));
    EXPECT_EQ(Written([&](mdf_Writer& w) { w.Value(value); }), text);
}

TEST(ModelFileLocale, NumbersReadAndWritten_UnderACommaLocale_HavePoints) {
    const char* set = nullptr;
    for (const char* name : {"de_DE.UTF-8", "de_DE.utf8", "fr_FR.UTF-8", "nl_NL.UTF-8"}) {
        if (set == nullptr) set = std::setlocale(LC_ALL, name);
    }
    if (set == nullptr) GTEST_SKIP() << "no locale with a decimal comma is installed";
    mdf_Value value;
    std::vector<fnd_Finding> errors;
    const bool parsed = mdf_Parse("[1.5, 4000000000]", value, errors);
    const std::string written = parsed ? Written([&](mdf_Writer& w) { w.Value(value); }) : "";
    std::setlocale(LC_ALL, "C");
    ASSERT_TRUE(parsed);
    EXPECT_EQ(value.Item(0).Real(), 1.5);
    EXPECT_FALSE(value.Item(0).IsLargeInteger());
    EXPECT_TRUE(value.Item(1).IsLargeInteger());
    EXPECT_EQ(written, "[1.5, 4e+09]\n");
}
