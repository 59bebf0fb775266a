#include "model_file/mdf_Parser.h"
#include "model_file/mdf_Writer.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>
#include <rapidcheck.h>

#include <bit>
#include <cmath>
#include <cstdint>
#include <functional>
#include <limits>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace {

using Json = nlohmann::ordered_json;

bool Holds(const std::function<void()>& property) {
    return rc::check(property);
}

double AnyReal() {
    const double value = std::bit_cast<double>(*rc::gen::arbitrary<std::uint64_t>());
    return std::isfinite(value) ? value : 0.5;
}

std::string AnyText() {
    static const std::vector<std::string> pieces = {"a",
                                                    "S1",
                                                    "\n",
                                                    "\"",
                                                    "\\",
                                                    "/",
                                                    "~",
                                                    "\xC3\xA9",
                                                    std::string(1, '\0'),
                                                    "\x1F",
                                                    "\xF0\x9F\x98\x80",
                                                    "name",
                                                    " "};
    std::string text;
    const int length = *rc::gen::inRange(0, 4);
    for (int i = 0; i < length; ++i) text += *rc::gen::elementOf(pieces);
    return text;
}

Json AnyJson(int depth) {
    switch (*rc::gen::inRange(0, depth > 0 ? 12 : 6)) {
    case 0: return nullptr;
    case 1: return *rc::gen::arbitrary<bool>();
    case 2: return *rc::gen::inRange(std::numeric_limits<int>::min(), std::numeric_limits<int>::max());
    case 3: return AnyReal();
    case 4: return *rc::gen::arbitrary<std::int64_t>();
    case 5: return AnyText();
    case 6:
    case 7: {
        Json object = Json::object();
        const int size = *rc::gen::inRange(0, 12);
        for (int i = 0; i < size; ++i) object[AnyText() + std::to_string(i)] = AnyJson(depth - 1);
        return object;
    }
    case 8: {
        Json array = Json::array();
        const int size = *rc::gen::inRange(0, 5);
        for (int i = 0; i < size; ++i) array.push_back(AnyJson(depth - 1));
        return array;
    }
    default: {
        // Rows that mostly fit the compact forms, with an odd item now and then.
        Json rows = Json::array();
        const int size = *rc::gen::inRange(0, 6);
        const bool named = *rc::gen::arbitrary<bool>();
        const int width = *rc::gen::inRange(1, 4);
        for (int i = 0; i < size; ++i) {
            if (*rc::gen::inRange(0, 15) == 0) {
                rows.push_back(AnyJson(depth - 1));
                continue;
            }
            Json row = Json::array();
            for (int k = 0; k < (named ? 2 : width); ++k) {
                const int odd = *rc::gen::inRange(0, 25);
                if (odd == 0)
                    row.push_back(AnyJson(depth - 1));
                else if (named && k == 1 && odd < 15)
                    row.push_back(AnyText());
                else if (!named && odd < 5)
                    row.push_back(AnyReal());
                else
                    row.push_back(*rc::gen::inRange(-5, 5));
            }
            rows.push_back(std::move(row));
        }
        return rows;
    }
    }
}

bool IsIntNumber(const Json& json) {
    if (!json.is_number_integer()) return false;
    const auto value = json.get<std::int64_t>();
    return value >= std::numeric_limits<int>::min() && value <= std::numeric_limits<int>::max();
}

/// The same document, item by item, kind by kind.
void RequireSame(const Json& json, const mdf_Value& value) {
    if (json.is_null()) {
        RC_ASSERT(value.IsNull());
    } else if (json.is_boolean()) {
        RC_ASSERT(value.Bool() == json.get<bool>());
    } else if (json.is_string()) {
        RC_ASSERT(value.String() == json.get<std::string>());
    } else if (IsIntNumber(json)) {
        RC_ASSERT(value.Int() == json.get<int>());
    } else if (json.is_number()) {
        RC_ASSERT(value.Kind() == mdf_Kind::Real);
        RC_ASSERT(value.IsLargeInteger() == json.is_number_integer());
        RC_ASSERT(std::bit_cast<std::uint64_t>(value.Real()) ==
                  std::bit_cast<std::uint64_t>(json.get<double>()));
    } else if (json.is_array()) {
        RC_ASSERT(value.IsArray());
        RC_ASSERT(value.Size() == json.size());
        for (std::size_t i = 0; i < json.size(); ++i) RequireSame(json[i], value.Item(i));
    } else {
        RC_ASSERT(value.Size() == json.size());
        std::size_t i = 0;
        for (const auto& [name, member] : json.items()) {
            RC_ASSERT(value.Members()[i++].name == name);
            RC_ASSERT(value.Find(name) != nullptr);
            RequireSame(member, *value.Find(name));
        }
    }
}

} // namespace

TEST(ModelFileRoundTrip, AnyDocument_ParsedAndWritten_StaysTheSame) {
    EXPECT_TRUE(Holds([] {
        const Json json = AnyJson(4);
        mdf_Value value;
        std::vector<fnd_Finding> errors;
        RC_ASSERT(mdf_Parse(json.dump(*rc::gen::inRange(-1, 3)), value, errors));
        RequireSame(json, value);
        std::ostringstream out;
        mdf_Writer writer(out);
        writer.Value(value);
        RC_ASSERT(writer.Finish());
        RC_ASSERT(Json::parse(out.str()) == json);
        mdf_Value again;
        RC_ASSERT(mdf_Parse(out.str(), again, errors));
        std::ostringstream second;
        mdf_Writer secondWriter(second);
        secondWriter.Value(again);
        RC_ASSERT(secondWriter.Finish());
        RC_ASSERT(second.str() == out.str());
    }));
}

TEST(ModelFileRoundTrip, AnyDocument_CutAnywhere_IsAnErrorOrTheSameAsTheLibrarysReading) {
    EXPECT_TRUE(Holds([] {
        const std::string whole = AnyJson(3).dump();
        std::string text = whole.substr(0, *rc::gen::inRange<std::size_t>(0, whole.size() + 1));
        if (!text.empty() && *rc::gen::arbitrary<bool>())
            text[*rc::gen::inRange<std::size_t>(0, text.size())] = *rc::gen::arbitrary<char>();
        mdf_Value value;
        std::vector<fnd_Finding> errors;
        const bool parsed = mdf_Parse(text, value, errors);
        RC_ASSERT(parsed == errors.empty());
        const Json json = Json::parse(text, nullptr, false, true);
        if (parsed) {
            RC_ASSERT(!json.is_discarded());
            RequireSame(json, value);
        } else if (errors.back().line > 0) {
            RC_ASSERT(errors.back().column >= 1);
            RC_ASSERT(json.is_discarded() || text.find('\0') != std::string::npos);
        }
    }));
}
