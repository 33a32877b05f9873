// What a public slot returns for each kind of thing thrown inside it.
#include <gtest/gtest.h>

#include <new>
#include <stdexcept>

#include "tov/sdk/TOVFailureStyle.h"

namespace {

TEST(FailureStyle, ThrownValuesBecomeResultsAndCheckThrowsOnlyFailures) {
    EXPECT_EQ(TOVGuarded([] { return TOV_OK; }), TOV_OK);
    EXPECT_EQ(TOVGuarded([]() -> TOVRESULT { throw static_cast<int>(ZEB_E_NOTREADY); }), ZEB_E_NOTREADY);
    EXPECT_EQ(TOVGuarded([]() -> TOVRESULT { throw "value does not exist"; }), TOV_E_UNEXPECTED);
    EXPECT_EQ(TOVGuarded([]() -> TOVRESULT { throw std::range_error("bad text"); }), TOV_E_UNEXPECTED);
    EXPECT_EQ(TOVGuarded([]() -> TOVRESULT { throw std::bad_alloc(); }), TOV_E_UNEXPECTED);
    EXPECT_EQ(TOVCheck(TOV_OK), TOV_OK);
    EXPECT_EQ(TOVCheck(1), 1);
    EXPECT_THROW(TOVCheck(TOV_E_FAIL), int);
    EXPECT_EQ(TOVGuarded([] { return TOVCheck(ZEB_E_ALREADYSET); }), ZEB_E_ALREADYSET);
}

}  // namespace
