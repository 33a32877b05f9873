// The host's MD5 UID generator: digests over bytes, fed whole or in pieces.
#include <gtest/gtest.h>

#include <cstdio>
#include <cstring>
#include <string>

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
    unsigned char bytes[16];
    std::memcpy(bytes, &uid, sizeof bytes);
    std::string hex;
    char digits[3];
    for (unsigned char b : bytes) {
        std::snprintf(digits, sizeof digits, "%02x", b);
        hex += digits;
    }
    return hex;
}

unsigned char* Bytes(std::string& text) { return reinterpret_cast<unsigned char*>(text.data()); }

class UIDGenerator : public ::testing::Test {
protected:
    // The UID of `pieces` fed one after the other into one context.
    _aafUID_t UIDOf(std::initializer_list<std::string> pieces) {
        void* context = nullptr;
        EXPECT_EQ(generator->Begin(&context), TOV_OK);
        for (std::string piece : pieces)
            EXPECT_EQ(generator->AddData(context, Bytes(piece), static_cast<unsigned int>(piece.size())), TOV_OK);
        _aafUID_t uid{};
        EXPECT_EQ(generator->Finish(&uid, &context), TOV_OK);
        EXPECT_EQ(context, nullptr);
        return uid;
    }
    std::string Digest(std::initializer_list<std::string> pieces) { return Hex(UIDOf(pieces)); }

    TestHost host;
    TOVPtr<ITOVUIDGeneratorMD5> generator = NewGenerator(host.Get());
};

struct Vector {
    const char* input;
    const char* md5;
};

// The test suite of the MD5 definition.
const Vector kVectors[] = {
    {"", "d41d8cd98f00b204e9800998ecf8427e"},
    {"abc", "900150983cd24fb0d6963f7d28e17f72"},
    {"message digest", "f96b697d7cb7938d525a2f31aaf161d0"},
    {"12345678901234567890123456789012345678901234567890123456789012345678901234567890",
     "57edf4a22be3c955ac49da2e2107b67a"},
};

TEST_F(UIDGenerator, CopiesTheDigestBytesInOrder) {
    for (const Vector& v : kVectors) {
        SCOPED_TRACE(v.input);
        EXPECT_EQ(Digest({v.input}), v.md5);
    }
}

TEST_F(UIDGenerator, PiecesDigestAsTheWhole) {
    const std::string whole =
        Digest({"12345678901234567890123456789012345678901234567890123456789012345678901234567890"});
    EXPECT_EQ(Digest({"1234567890123456789012345678901234567890123456789012345678901234",  // one MD5 block
                      "5678901234567890"}),
              whole);
    EXPECT_EQ(
        Digest({"1", "", "234567890123456789012345678901234567890123456789012345678901234567890123456789", "0", ""}),
        whole);
    EXPECT_EQ(Digest({"", ""}), kVectors[0].md5);
}

TEST_F(UIDGenerator, InterleavedContextsAreIndependentOfEachOtherAndOfTheObject) {
    void* first = nullptr;
    void* second = nullptr;
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
