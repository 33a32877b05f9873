#pragma once
/// A started utility library whose UID generator is the fake; every test must
/// give back every component it made, generators included.
#include <gtest/gtest.h>

#include "FakeUIDGenerator.h"
#include "GeneratorFactory.h"
#include "TestHost.h"
#include "startup/ZEBUtilLib.h"
#include "tov/sdk/CTOVUnknown.h"

class IdentityFixture : public ::testing::Test {
protected:
    void SetUp() override {
        TheGeneratorLog() = GeneratorLog{};
        ASSERT_EQ(ZEB::ZEBInitialize(&factory), TOV_OK);
        m_StartObjects = CTOVUnknown::GetActiveObjectCount();
    }
    void TearDown() override {
        EXPECT_EQ(CTOVUnknown::GetActiveObjectCount(), m_StartObjects) << "a component was leaked or over-released";
        EXPECT_EQ(TheGeneratorLog().wrongContexts, 0) << "the generator was handed a context it did not make";
        ZEB::ZEBTerminate();
    }

    GeneratorLog& log() { return TheGeneratorLog(); }

    TestHost host;
    GeneratorFactory factory{host.Get()};

private:
    int32_t m_StartObjects = 0;
};
