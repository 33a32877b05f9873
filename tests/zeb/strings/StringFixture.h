#pragma once
/// A started utility library on a reference host, for the tests of the
/// string layer; every test must give back every string it made.
#include <gtest/gtest.h>

#include "TestHost.h"
#include "startup/ZEBUtilLib.h"
#include "tov/sdk/CTOVUnknown.h"

class StringFixture : public ::testing::Test {
protected:
    void SetUp() override {
        ASSERT_EQ(ZEB::ZEBInitialize(host.Get()), TOV_OK);
        m_StartObjects = CTOVUnknown::GetActiveObjectCount();
    }
    void TearDown() override {
        EXPECT_EQ(CTOVUnknown::GetActiveObjectCount(), m_StartObjects) << "a string was leaked or over-released";
        ZEB::ZEBTerminate();
    }

    TestHost host;

private:
    int32_t m_StartObjects = 0;
};
