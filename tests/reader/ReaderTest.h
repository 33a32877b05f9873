#pragma once
/// A fixture that starts the utility library on a test host, so that the
/// reader's messages reach `host.Lines()`, and opens streams on byte strings.
#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "TestHost.h"
#include "reader/OrloStream.h"

class ReaderFixture : public ::testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    /// A stream over `bytes` written to a temporary file. Also checks that
    /// the stream left no descriptor open.
    std::unique_ptr<Orlo::OrloStream> Open(const std::string& bytes);
    /// The error of a stream over `bytes`, or "" when it is good.
    std::string ErrorOf(const std::string& bytes);

    TestHost host;
};
