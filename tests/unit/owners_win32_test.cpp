// The RAII owners and the COM text helpers (Windows build only).
#include <gtest/gtest.h>

#include "common/com_win32.h"
#include "common/unique_win32.h"

using namespace checker;

namespace {
int closes = 0;
int lastClosed = 0;
void countClose(int v) noexcept {
    ++closes;
    lastClosed = v;
}
using Owned = UniqueAny<int, countClose, 0>;
} // namespace

TEST(UniqueAny, ClosesExactlyOnceThroughMovesAndResets) {
    closes = 0;
    {
        Owned a(7);
        Owned b(std::move(a));
        EXPECT_FALSE(a);
        EXPECT_EQ(b.get(), 7);
        Owned c;
        c = std::move(b);
        EXPECT_EQ(closes, 0);
        c.reset(9); // closes 7, owns 9
        EXPECT_EQ(closes, 1);
        EXPECT_EQ(lastClosed, 7);
        c = Owned(11); // closes 9
        EXPECT_EQ(lastClosed, 9);
        EXPECT_EQ(Owned(13).release(), 13); // released: not closed
    }
    EXPECT_EQ(closes, 3); // 7, 9, then 11 at scope end
    EXPECT_EQ(lastClosed, 11);
}

TEST(UniqueAny, RealHandleIsClosed) {
    HANDLE event = ::CreateEventA(nullptr, TRUE, FALSE, nullptr);
    ASSERT_NE(event, nullptr);
    { UniqueHandle owner(event); }
    DWORD flags = 0;
    EXPECT_FALSE(::GetHandleInformation(event, &flags)); // already closed
}

TEST(ComText, AnsiRoundTripAndVariantText) {
    const std::string text = "Plans & Advice ~ 10.3";
    EXPECT_EQ(narrow(UniqueBstr(text).get()), text);
    EXPECT_EQ(narrow(UniqueBstr("").get()), "");
    UniqueVariant number(static_cast<long>(-42));
    EXPECT_EQ(variantToText(*number.get(), "t"), "-42");
    UniqueVariant null;
    null.put()->vt = VT_NULL;
    try {
        variantToText(*null.get(), "src");
        FAIL() << "a Null has no text";
    } catch (const CheckerError& e) {
        EXPECT_EQ(e.number(), 94);
        EXPECT_EQ(e.source(), "src");
    }
}

TEST(ComErrors, UnknownProgIdIsError429) {
    ::CoInitialize(nullptr);
    try {
        createByProgId("No.Such.Component");
        FAIL() << "created a component that does not exist";
    } catch (const CheckerError& e) {
        EXPECT_EQ(e.number(), 429);
    }
    ::CoUninitialize();
}
