// Content identifiers over data fed piece by piece: the handle's life, the
// refusals, and what happens to the handle when the generator fails.
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "IdentityFixture.h"
#include "identity/GenerateUMIDFromData.h"
#include "identity/UMIDDigest.h"

namespace {

using namespace ZEB;

unsigned char* Bytes(std::string& text) { return reinterpret_cast<unsigned char*>(text.data()); }

class GenerateUMIDFromData : public IdentityFixture {};

TEST_F(GenerateUMIDFromData, FeedsEveryPieceInOrderRefusesMissingArgumentsAndFreesTheHandle) {
    std::string first = "first piece", second = "; second";
    void* handle = nullptr;
    ASSERT_EQ(GenerateUMIDFromData_Begin(&handle), TOV_OK);
    ASSERT_NE(handle, nullptr);
    void* noRecord = nullptr;
    _aafUID_t out{};
    const std::vector<std::pair<const char*, std::function<TOVRESULT()>>> refused = {
        {"Begin without a handle", [] { return GenerateUMIDFromData_Begin(nullptr); }},
        {"AddData without a handle", [&] { return GenerateUMIDFromData_AddData(nullptr, 1, Bytes(first)); }},
        {"AddData of no bytes", [&] { return GenerateUMIDFromData_AddData(&handle, 0, Bytes(first)); }},
        {"AddData without data", [&] { return GenerateUMIDFromData_AddData(&handle, 1, nullptr); }},
        {"AddData on a null record", [&] { return GenerateUMIDFromData_AddData(&noRecord, 1, Bytes(first)); }},
        {"Finish without a handle", [&] { return GenerateUMIDFromData_Finish(nullptr, &out); }},
        {"Finish without out", [&] { return GenerateUMIDFromData_Finish(&handle, nullptr); }},
        {"Finish on a null record", [&] { return GenerateUMIDFromData_Finish(&noRecord, &out); }},
    };
    for (const auto& [name, call] : refused) EXPECT_EQ(call(), TOV_E_INVALIDARG) << name;
    EXPECT_TRUE(log().added.empty());
    EXPECT_EQ(log().finishes, 0);
    ASSERT_NE(handle, nullptr) << "a refused Finish keeps the digest";

    EXPECT_EQ(GenerateUMIDFromData_AddData(&handle, 11, Bytes(first)), TOV_OK);
    EXPECT_EQ(GenerateUMIDFromData_AddData(&handle, 8, Bytes(second)), TOV_OK);
    EXPECT_EQ(GenerateUMIDFromData_Finish(&handle, &out), TOV_OK);
    EXPECT_EQ(handle, nullptr);
    EXPECT_EQ(out, FakeUIDOf(first + second));
}

TEST_F(GenerateUMIDFromData, WithoutAGeneratorTheRecordStaysAndEveryStepFails) {
    for (auto generator : {GeneratorFactory::Generator::Missing, GeneratorFactory::Generator::NullOnSuccess}) {
        factory.generator = generator;
        void* handle = nullptr;
        EXPECT_EQ(GenerateUMIDFromData_Begin(&handle), TOV_E_UNEXPECTED);
        ASSERT_NE(handle, nullptr);
        auto* digest = static_cast<UMIDDigest*>(handle);
        EXPECT_EQ(digest->generator, nullptr);
        std::string data = "x";
        EXPECT_EQ(GenerateUMIDFromData_AddData(&handle, 1, Bytes(data)), TOV_E_UNEXPECTED);
        _aafUID_t out{};
        EXPECT_EQ(GenerateUMIDFromData_Finish(&handle, &out), TOV_E_UNEXPECTED);
        EXPECT_EQ(handle, digest) << "not freed: the caller owns it now";
        delete digest;
    }
}

TEST_F(GenerateUMIDFromData, PassesTheGeneratorsFailuresOn) {
    std::string data = "abc";
    _aafUID_t out{};
    void* handle = nullptr;

    log().beginResult = TOV_E_FAIL;
    EXPECT_EQ(GenerateUMIDFromData_Begin(&handle), TOV_E_FAIL);
    ASSERT_NE(handle, nullptr) << "the record holds the generator, so Finish can free it";
    EXPECT_EQ(GenerateUMIDFromData_Finish(&handle, &out), TOV_OK);
    log().beginResult = TOV_OK;

    ASSERT_EQ(GenerateUMIDFromData_Begin(&handle), TOV_OK);
    log().addResult = TOV_E_OUTOFMEMORY;
    EXPECT_EQ(GenerateUMIDFromData_AddData(&handle, 3, Bytes(data)), TOV_E_OUTOFMEMORY);
    log().finishResult = TOV_E_FILEIO;
    EXPECT_EQ(GenerateUMIDFromData_Finish(&handle, &out), TOV_E_FILEIO);
    EXPECT_EQ(handle, nullptr) << "a failed finish still frees the record and the generator";
}

TEST(GenerateUMIDFromDataBeforeStart, IsNotReady) {
    void* handle = nullptr;
    EXPECT_EQ(GenerateUMIDFromData_Begin(&handle), ZEB_E_NOTREADY);
    EXPECT_EQ(handle, nullptr);
}

}  // namespace
