#include "DrawmereErrHandler.h"

#include "tests/support/Utf8.h"

#include <stdexcept>

#include <gtest/gtest.h>

using namespace DrawmereNS;
using DrawmereTest::utf8;

namespace {

MoxError makeError() { return MoxError(16414, u"text", UnicodeString(), -1, -1, UnicodeString()); }

/// Remembers what it was told, and returns.
class CountingHandler : public DrawmereErrHandler {
public:
    void handleError(const MoxError& error) override { lastCode = error.getCode(); }

    void handleError() override { ++otherCount; }

    int lastCode = 0;
    int otherCount = 0;
};

void handleInCatch(DrawmereErrHandler& handler) {
    try {
        throw std::out_of_range("far");
    } catch (...) {
        handler.handleError();
    }
}

/// Asks for the default handler while static objects are still made.
DrawmereErrHandler* const askedBeforeMain = DrawmereErrHandler::getDefault();

} // namespace

TEST(DrawmereErrHandler, DefaultThrowsACopyOfTheError) {
    const MoxError original = makeError();
    try {
        DrawmereErrHandler::getDefault()->handleError(original);
        FAIL() << "the handler returned";
    } catch (const MoxError& error) {
        EXPECT_NE(&error, &original);
        EXPECT_EQ(error.getCode(), 16414);
        EXPECT_EQ(utf8(error.getMessage()), "text");
    }
}

TEST(DrawmereErrHandler, DefaultRethrowsTheExceptionInFlight) {
    EXPECT_THROW(handleInCatch(*DrawmereErrHandler::getDefault()), std::out_of_range);
}

TEST(DrawmereErrHandler, WithNoExceptionInFlightNothingIsRethrown) {
    EXPECT_NO_THROW(DrawmereErrHandler::getDefault()->handleError());
}

TEST(DrawmereErrHandler, OneDefaultServesEverybody) {
    EXPECT_EQ(askedBeforeMain, DrawmereErrHandler::getDefault());
    EXPECT_NE(dynamic_cast<DrawmereDefaultErrHandler*>(askedBeforeMain), nullptr);
}

TEST(DrawmereErrHandler, BaseBehavesAsTheDefault) {
    DrawmereErrHandler handler;
    EXPECT_THROW(handler.handleError(makeError()), MoxError);
    EXPECT_THROW(handleInCatch(handler), std::out_of_range);
}

TEST(DrawmereErrHandler, DerivedHandlerMayReturn) {
    CountingHandler handler;
    DrawmereErrHandler& base = handler;
    base.handleError(makeError());
    handleInCatch(base);
    EXPECT_EQ(handler.lastCode, 16414);
    EXPECT_EQ(handler.otherCount, 1);
}
