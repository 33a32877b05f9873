#pragma once
/// A fixture that starts the utility library on a test host, for tests that
/// make `ZEBString`s.
#include <gtest/gtest.h>

#include "TestHost.h"
#include "startup/ZEBUtilLib.h"
#include "strings/ZEBString.h"

class StartedLibraryTest : public ::testing::Test {
protected:
    void SetUp() override { ASSERT_EQ(ZEB::ZEBInitialize(host.Get()), TOV_OK); }
    void TearDown() override { ZEB::ZEBTerminate(); }

    /// A string holding `text` in UTF-8.
    static ZEB::ZEBString Text(const char* text) {
        return ZEB::ZEBString(reinterpret_cast<const unsigned char*>(text));
    }

    TestHost host;
};
