#ifndef QRX_TESTS_STEPS_PROCEDURECASES_H
#define QRX_TESTS_STEPS_PROCEDURECASES_H

#include "support/DeckTest.h"

#include <utility>
#include <vector>

/// What becomes of a step record with default values when something in it is changed.
template <class R>
struct ProcedureCase {
    const char* situation;
    void (*change)(R&);
    const char* expected;
};

template <class R, class Make>
void ExpectTexts(const std::vector<ProcedureCase<R>>& cases, const Make& make) {
    for (const ProcedureCase<R>& each : cases) {
        R record;
        each.change(record);
        EXPECT_EQ(Written(make(record)), each.expected) << each.situation;
    }
}

/// The same for a keyword whose constructor takes the record alone.
template <class Keyword, class R>
void ExpectTexts(const std::vector<ProcedureCase<R>>& cases) {
    ExpectTexts(cases, [](const R& record) { return Keyword(record); });
}

/// What stands in the stream when writing the keyword raises, and the text that it raises.
inline std::pair<std::string, std::string> WrittenUntilRaised(const qkw_Keyword& keyword) {
    std::string raised;
    const std::string text =
        Streamed([&](utl_Stream& stream) { raised = Raised([&] { keyword.Write(stream); }); });
    return {text, raised};
}

#endif
