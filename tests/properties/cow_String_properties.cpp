#include "foundation/cow_String.h"

#include "tests/properties/Bytes.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <array>
#include <bit>
#include <cstdint>
#include <cstdio>
#include <string>
#include <utility>

namespace {

std::string Plain(const cow_String& text) {
    RC_ASSERT(text.CStr()[text.Length()] == '\0');
    return std::string(text.View());
}

// Three texts that are assigned to and appended to each other at random, beside three std::strings.
RC_GTEST_PROP(cow_String, RandomOperations_MatchStdString, ()) {
    constexpr std::size_t kTexts = 3;
    std::array<cow_String, kTexts> texts;
    std::array<std::string, kTexts> models;
    const int steps = *rc::gen::inRange(0, 60);
    for (int step = 0; step < steps; ++step) {
        const auto a = *rc::gen::inRange<std::size_t>(0, kTexts);
        const auto b = *rc::gen::inRange<std::size_t>(0, kTexts);
        switch (*rc::gen::inRange(0, 7)) {
        case 0:
            texts[a] = texts[b];
            models[a] = std::string(models[b]);
            break;
        case 1: {
            const std::string piece = *ShortText();
            texts[a] = cow_String(piece);
            models[a] = piece;
            break;
        }
        case 2:
            if (models[a].size() + models[b].size() > 5000) break;
            texts[a].Append(texts[b]);
            models[a].append(std::string(models[b]));
            break;
        case 3: {
            // The C form ends at the first zero byte.
            const std::string piece = *ShortText();
            texts[a] += piece.c_str();
            models[a] += piece.c_str();
            break;
        }
        case 4: {
            const auto offset = *rc::gen::inRange<std::size_t>(0, models[b].size() + 1);
            const auto length = *rc::gen::inRange<std::size_t>(0, 8);
            if (models[a].size() > 5000) break;
            texts[a].Append(texts[b], static_cast<int>(offset), static_cast<int>(length));
            models[a] += models[b].substr(offset, length);
            break;
        }
        case 5: {
            const cow_String& alias = texts[b];
            if (models[a].size() + models[b].size() > 5000) break;
            texts[a] = alias + texts[a];
            models[a] = models[b] + models[a];
            break;
        }
        default: {
            cow_String taken(std::move(texts[a]));
            texts[a] = cow_String();
            texts[a] = std::move(taken);
            break;
        }
        }
        for (std::size_t i = 0; i < kTexts; ++i) RC_ASSERT(Plain(texts[i]) == models[i]);
        RC_ASSERT((texts[a] == texts[b]) == (models[a] == models[b]));
        RC_ASSERT((texts[a] < texts[b]) == (models[a] < models[b]));
    }
}

RC_GTEST_PROP(cow_String, Find_MatchesStdString, ()) {
    const std::string text = *ShortText();
    const std::string piece = *ShortText();
    const int from = *rc::gen::inRange(0, static_cast<int>(text.size()) + 3);
    const auto place = text.find(piece.c_str(), static_cast<std::size_t>(from));
    const int expected = place == std::string::npos ? -1 : static_cast<int>(place);
    RC_ASSERT(cow_String(text).Find(piece.c_str(), from) == expected);
}

RC_GTEST_PROP(cow_String, Int_MatchesPrintf, (int value)) {
    RC_ASSERT(cow_String(value) == std::to_string(value).c_str());
}

RC_GTEST_PROP(cow_String, Real_MatchesPrintf, ()) {
    const auto bits = *rc::gen::arbitrary<std::uint64_t>();
    const auto small = *rc::gen::inRange(-100000, 100000);
    for (const double value : {std::bit_cast<double>(bits), static_cast<double>(small) / 64.0}) {
        char expected[64];
        std::snprintf(expected, sizeof expected, "%g", value);
        RC_ASSERT(cow_String(value) == expected);
    }
}

} // namespace
