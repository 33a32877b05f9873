// The host's MD5 UID generator: digests over bytes, fed whole or in pieces.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "TestHost.h"
#include "tov/ITOVUIDGeneratorMD5.h"

namespace {

TOVPtr<ITOVUIDGeneratorMD5> NewGenerator(TOVHost* host) {
    TOVPtr<ITOVUIDGeneratorMD5> generator;
    EXPECT_EQ(host->CreateComponent(TOVCompID_UIDGenerator, nullptr, IID_ITOVUIDGeneratorMD5, generator.Out()), TOV_OK);
    return generator;
}

// The 16 bytes of the record's memory as hex, in memory order.
std::string Hex(const _aafUID_t& uid) {
    static const char digits[] = "0123456789abcdef";
    std::string hex;
    for (size_t i = 0; i < sizeof uid; ++i) {
        const unsigned char b = reinterpret_cast<const unsigned char*>(&uid)[i];
        hex += {digits[b >> 4], digits[b & 15]};
    }
    return hex;
}

unsigned char* Bytes(std::string& text) { return reinterpret_cast<unsigned char*>(text.data()); }

class UIDGenerator : public ::testing::Test {
protected:
    // The digest of `pieces` fed one after the other into one context.
    std::string Digest(const std::vector<std::string>& pieces) {
        void* context = nullptr;
        EXPECT_EQ(generator->Begin(&context), TOV_OK);
        for (std::string piece : pieces)
            EXPECT_EQ(generator->AddData(context, Bytes(piece), static_cast<unsigned int>(piece.size())), TOV_OK);
        _aafUID_t uid{};
        EXPECT_EQ(generator->Finish(&uid, &context), TOV_OK);
        EXPECT_EQ(context, nullptr);
        return Hex(uid);
    }

    TestHost host;
    TOVPtr<ITOVUIDGeneratorMD5> generator = NewGenerator(host.Get());
};

TEST_F(UIDGenerator, CopiesTheDigestBytesInOrderWhateverThePieces) {
    std::string digits;
    for (int i = 0; i < 8; ++i) digits += "1234567890";
    // The test suite of the MD5 definition, and its longest input cut at a block and anywhere.
    const struct {
        std::vector<std::string> pieces;
        const char* md5;
    } cases[] = {
        {{""}, "d41d8cd98f00b204e9800998ecf8427e"},
        {{"", ""}, "d41d8cd98f00b204e9800998ecf8427e"},
        {{"abc"}, "900150983cd24fb0d6963f7d28e17f72"},
        {{"message digest"}, "f96b697d7cb7938d525a2f31aaf161d0"},
        {{digits}, "57edf4a22be3c955ac49da2e2107b67a"},
        {{digits.substr(0, 64), digits.substr(64)}, "57edf4a22be3c955ac49da2e2107b67a"},
        {{"1", "", digits.substr(1, 78), "0", ""}, "57edf4a22be3c955ac49da2e2107b67a"},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(testing::PrintToString(c.pieces));
        EXPECT_EQ(Digest(c.pieces), c.md5);
    }
}

TEST_F(UIDGenerator, InterleavedContextsAreIndependentOfEachOtherAndOfTheObject) {
    void *first = nullptr, *second = nullptr;
    ASSERT_EQ(generator->Begin(&first), TOV_OK);
    TOVPtr<ITOVUIDGeneratorMD5> other = NewGenerator(host.Get());
    ASSERT_EQ(other->Begin(&second), TOV_OK);
    std::string a = "a", b = "b", c = "c", m = "message ", d = "digest";
    ASSERT_EQ(generator->AddData(first, Bytes(a), 1), TOV_OK);
    ASSERT_EQ(other->AddData(second, Bytes(m), 8), TOV_OK);
    ASSERT_EQ(other->AddData(first, Bytes(b), 1), TOV_OK);
    ASSERT_EQ(generator->AddData(second, Bytes(d), 6), TOV_OK);
    ASSERT_EQ(generator->AddData(first, Bytes(c), 1), TOV_OK);
    generator.Reset();  // the contexts do not need the object that began them

    _aafUID_t uid{};
    ASSERT_EQ(other->Finish(&uid, &first), TOV_OK);
    EXPECT_EQ(Hex(uid), "900150983cd24fb0d6963f7d28e17f72");
    ASSERT_EQ(other->Finish(&uid, &second), TOV_OK);
    EXPECT_EQ(Hex(uid), "f96b697d7cb7938d525a2f31aaf161d0");
}

TEST_F(UIDGenerator, RefusedCallsChangeNothing) {
    EXPECT_EQ(generator->Begin(nullptr), TOV_E_INVALIDARG);
    void* context = nullptr;
    ASSERT_EQ(generator->Begin(&context), TOV_OK);
    std::string abc = "abc";
    EXPECT_EQ(generator->AddData(nullptr, Bytes(abc), 3), TOV_E_INVALIDARG);
    EXPECT_EQ(generator->AddData(context, nullptr, 3), TOV_E_INVALIDARG);
    EXPECT_EQ(generator->AddData(context, nullptr, 0), TOV_OK);
    ASSERT_EQ(generator->AddData(context, Bytes(abc), 3), TOV_OK);

    _aafUID_t uid{};
    EXPECT_EQ(generator->Finish(nullptr, &context), TOV_E_INVALIDARG);
    EXPECT_NE(context, nullptr);  // still open, to be finished properly
    EXPECT_EQ(generator->Finish(&uid, nullptr), TOV_E_INVALIDARG);
    ASSERT_EQ(generator->Finish(&uid, &context), TOV_OK);
    EXPECT_EQ(Hex(uid), "900150983cd24fb0d6963f7d28e17f72");
    EXPECT_EQ(generator->Finish(&uid, &context), TOV_E_INVALIDARG);  // finished already: null now
}

}  // namespace
