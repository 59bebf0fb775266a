#include "foundation/nex_Exception.h"

#include "foundation/cow_String.h"
#include "tests/foundation/RaisedText.h"

#include <gtest/gtest.h>

#include <string>
#include <thread>

namespace {

std::string RaisedContext(void (*action)()) {
    try {
        action();
    } catch (const QRXBasException& failure) {
        return failure.Context();
    }
    return "(nothing raised)";
}

TEST(nex_Raise, Text_ArrivesExactly) {
    EXPECT_EQ(RaisedText([] { nex_Raise("Unknown step \"A\", 100% wrong"); }),
              "Unknown step \"A\", 100% wrong");
    EXPECT_EQ(RaisedText([] { nex_Raise(""); }), "");
}

TEST(nex_Raise, Failure_IsCaughtAsEachOfItsBases) {
    EXPECT_THROW(nex_Raise("x"), QRXBasException);
    EXPECT_THROW(nex_Raise("x"), std::exception);
}

TEST(QRXBasException, Copied_KeepsTextAndContext) {
    const cow_String name("Load-1");
    const nex_Context frame("load", name);
    const nex_PrimException<atr_String, 1> failure("text");
    const nex_PrimException<atr_String, 1> copy(failure);
    EXPECT_STREQ(copy.what(), "text");
    EXPECT_STREQ(copy.Context(), "load 'Load-1'");
}

TEST(nex_Context, NoFrame_IsEmpty) {
    EXPECT_STREQ(nex_Context::Text().CStr(), "");
    EXPECT_EQ(RaisedContext([] { nex_Raise("x"); }), "");
}

TEST(nex_Context, NestedFrames_AreNamedOutermostFirst) {
    EXPECT_EQ(RaisedContext([] {
                  const cow_String step("Step-1");
                  const cow_String load("P1");
                  const nex_Context outer("step", step);
                  const nex_Context inner("load", load);
                  nex_Raise("x");
              }),
              "step 'Step-1', load 'P1'");
}

TEST(nex_Context, FrameLeft_IsForgotten) {
    const cow_String step("Step-1");
    const nex_Context outer("step", step);
    {
        const cow_String load("P1");
        const nex_Context inner("load", load);
        EXPECT_STREQ(nex_Context::Text().CStr(), "step 'Step-1', load 'P1'");
    }
    EXPECT_STREQ(nex_Context::Text().CStr(), "step 'Step-1'");
}

TEST(nex_Context, FrameUnwoundByAnException_IsForgotten) {
    RaisedContext([] {
        const cow_String step("Step-1");
        const nex_Context frame("step", step);
        nex_Raise("x");
    });
    EXPECT_STREQ(nex_Context::Text().CStr(), "");
}

TEST(nex_Context, OtherThread_HasItsOwnFrames) {
    const cow_String step("Step-1");
    const nex_Context frame("step", step);
    std::string seen = "(not run)";
    std::thread([&] { seen = nex_Context::Text().CStr(); }).join();
    EXPECT_EQ(seen, "");
}

TEST(nex_RaiseCastFailure, Failure_NamesFoundExpectedAndPlace) {
    EXPECT_EQ(RaisedText([] {
                  nex_RaiseCastFailure("kmaC_Elastic", "kmaC_Density", {"/a/b/file.cpp", 12});
              }),
              "class check failed: found kmaC_Elastic, expected kmaC_Density (file.cpp:12)");
    EXPECT_EQ(RaisedText([] {
                  nex_RaiseCastFailure("A", "B", {"file.cpp", 1});
              }),
              "class check failed: found A, expected B (file.cpp:1)");
}

} // namespace
