// The file helpers under the parsers: exact reads, byte order, the 80-bit rate,
// packed 24-bit samples and the chunk identifier table.
#include <gtest/gtest.h>

#include <cstdio>

#include "Bytes.h"
#include "reader/ByteSwap.h"
#include "reader/ConvertStrToChunkType.h"
#include "reader/ExtendedFloat.h"
#include "reader/OrloStream.h"
#include "reader/ReadBytes.h"
#include "reader/int24.h"

namespace {

using namespace HelperFunctions;

struct MemoryFile {
    explicit MemoryFile(std::string bytes) : data(std::move(bytes)) { file = fmemopen(data.data(), data.size(), "rb"); }
    ~MemoryFile() { std::fclose(file); }
    std::string data;
    FILE* file;
};

TEST(ReadBytesTest, ReadsExactlyTheCountWithZeroBytes) {
    MemoryFile memory(std::string("ab\0cd\0ef", 8));
    std::string out = "previous contents";
    ReadBytes(out, 6, memory.file, "short");
    EXPECT_EQ(out, std::string("ab\0cd\0", 6));
    char buffer[2];
    ReadBytes(buffer, 2, memory.file, "short");
    EXPECT_EQ(std::string(buffer, 2), "ef");
}

TEST(ReadBytesTest, ShortReadThrowsTheMessageItself) {
    MemoryFile memory("abc");
    char buffer[4];
    try {
        ReadBytes(buffer, 4, memory.file, "Expected chunk header");
        FAIL();
    } catch (const std::string& message) {
        EXPECT_EQ(message, "Expected chunk header");
    }
    std::string out;
    // A size field of nearly 4 GiB over three bytes: the read fails as short,
    // without first reserving what the field claims.
    std::rewind(memory.file);
    EXPECT_THROW(ReadBytes(out, 0xFFFFFFF0u, memory.file, "short"), std::string);
}

TEST(ReadBytesTest, CountOfZeroThrowsText) {
    MemoryFile memory("abc");
    const std::string expected = "ReadBytes() -- invalid number of bytes to read!";
    std::string out;
    char buffer[1];
    try {
        ReadBytes(buffer, 0, memory.file, "short");
        FAIL();
    } catch (const char* text) {
        EXPECT_EQ(text, expected);
    }
    try {
        ReadBytes(out, 0, memory.file, "short");
        FAIL();
    } catch (const char* text) {
        EXPECT_EQ(text, expected);
    }
}

TEST(ByteSwapTest, ReversesEveryWidth) {
    int16_t s = 0x1234;
    uint16_t us = 0xABCD;
    int32_t l = 0x11223344;
    uint32_t ul = 0xA1B2C3D4;
    int64_t ll = 0x0102030405060708;
    uint64_t ull = 0xF1F2F3F4F5F6F7F8ull;
    SwapShort(s);
    SwapUShort(us);
    SwapLong(l);
    SwapULong(ul);
    SwapLongLong(ll);
    SwapULongLong(ull);
    EXPECT_EQ(s, 0x3412);
    EXPECT_EQ(us, 0xCDAB);
    EXPECT_EQ(l, 0x44332211);
    EXPECT_EQ(ul, 0xD4C3B2A1u);
    EXPECT_EQ(ll, 0x0807060504030201);
    EXPECT_EQ(ull, 0xF8F7F6F5F4F3F2F1ull);
    EXPECT_TRUE(IAmLittleEndian());
}

TEST(ExtendedFloatTest, ReadsTheRatesOfRecorders) {
    unsigned char rate44100[10] = {0x40, 0x0E, 0xAC, 0x44, 0, 0, 0, 0, 0, 0};
    EXPECT_EQ(Convert_from_IEEE_754(rate44100), 44100.0);
    for (double rate : {8000.0, 22050.0, 44100.0, 47952.0, 48000.0, 48048.0, 88200.0, 96000.0, 192000.0, 0.5,
                        44100.0 * 1001 / 1000}) {
        std::string bytes = Bytes::Extended80(rate);
        EXPECT_EQ(Convert_from_IEEE_754(reinterpret_cast<unsigned char*>(bytes.data())), rate);
    }
    unsigned char zero[10] = {};
    EXPECT_EQ(Convert_from_IEEE_754(zero), 0.0);
}

TEST(ExtendedFloatTest, NegativeValueClearsTheSignBitOfTheBuffer) {
    std::string bytes = Bytes::Extended80(-48000.0);
    auto* raw = reinterpret_cast<unsigned char*>(bytes.data());
    EXPECT_EQ(Convert_from_IEEE_754(raw), -48000.0);
    EXPECT_EQ(raw[0] & 0x80, 0);
    EXPECT_EQ(Convert_from_IEEE_754(raw), 48000.0);
}

TEST(Int24Test, KeepsTheLow24BitsAndSignExtends) {
    const struct {
        int assigned;
        int32_t value;
    } rows[] = {{0, 0},
                {1, 1},
                {-1, -1},
                {0x7FFFFF, 8388607},
                {0x800000, -8388608},
                {0x12345678, 0x345678},
                {-8388609, 8388607}};
    for (const auto& row : rows) {
        int24 sample;
        sample = row.assigned;
        EXPECT_EQ(sample.Long(), row.value) << row.assigned;
    }
    EXPECT_EQ(int24().Long(), 0);
}

TEST(Int24Test, EndianSwapExchangesOuterBytes) {
    int24 sample;
    sample = 0x123456;
    sample.endianswap();
    EXPECT_EQ(sample.Long(), 0x563412);
    sample = 0x0000FF;
    sample.endianswap();
    EXPECT_EQ(sample.Long(), -0x10000);
}

TEST(ConvertStrToChunkTypeTest, MatchesWholeIdentifiersExactly) {
    using Orlo::OrloStream;
    const struct {
        const char* id;
        unsigned int type;
    } rows[] = {{"ds64", OrloStream::DS64_CHUNK},
                {"fmt ", OrloStream::FMT_CHUNK},
                {"data", OrloStream::DATA_CHUNK},
                {"bext", OrloStream::BEXT_CHUNK},
                {"iXML", OrloStream::IXML_CHUNK},
                {"umid", OrloStream::UMID_CHUNK},
                {"COMM", OrloStream::COMM_CHUNK},
                {"SSND", OrloStream::SSND_CHUNK},
                {"FMT ", 0},
                {"fmt", 0},  // a zero byte in the identifier cuts it
                {"ixml", 0},
                {"DATA", 0},
                {"", 0},
                {"data ", 0}};
    for (const auto& row : rows) EXPECT_EQ(Orlo::ConvertStrToChunkType(row.id), row.type) << row.id;
}

}  // namespace
