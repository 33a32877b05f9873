// The file helpers under the parsers: exact reads, byte order, the 80-bit rate,
// packed 24-bit samples and the chunk identifier table.
#include <gtest/gtest.h>

#include <cstdio>
#include <functional>

#include "Bytes.h"
#include "TempFile.h"
#include "reader/ByteSwap.h"
#include "reader/ConvertStrToChunkType.h"
#include "reader/ExtendedFloat.h"
#include "reader/OpenForWalk.h"
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

// What a read threw, as text.
std::string Thrown(const std::function<void()>& read) {
    try {
        read();
    } catch (const std::string& message) {
        return message;
    } catch (const char* text) {
        return text;
    }
    return "nothing thrown";
}

TEST(ReadBytes, ReadsExactlyTheCountOrThrows) {
    MemoryFile memory(std::string("ab\0cd\0ef", 8));
    std::string out = "previous contents";
    char buffer[2];
    ReadBytes(out, 6, memory.file, "short");
    EXPECT_EQ(out, std::string("ab\0cd\0", 6));
    ReadBytes(buffer, 2, memory.file, "short");
    EXPECT_EQ(std::string(buffer, 2), "ef");
    // A short read throws the message itself.
    EXPECT_EQ(Thrown([&] { ReadBytes(buffer, 1, memory.file, "Expected chunk header"); }), "Expected chunk header");
    std::rewind(memory.file);
    // A size field of nearly 4 GiB over eight bytes: the read fails as short,
    // without first reserving what the field claims.
    EXPECT_EQ(Thrown([&] { ReadBytes(out, 0xFFFFFFF0u, memory.file, "short"); }), "short");
    const std::string invalid = "ReadBytes() -- invalid number of bytes to read!";
    EXPECT_EQ(Thrown([&] { ReadBytes(buffer, 0, memory.file, "short"); }), invalid);
    EXPECT_EQ(Thrown([&] { ReadBytes(out, 0, memory.file, "short"); }), invalid);
}

// The named swaps are one-line uses of one template: two widths stand for all.
// The walk's stream answers seeks, positions and reads as a plain one, across
// landings, blocks read onward, the end of the file and failing seeks.
TEST(OpenForWalk, ReadsAsAPlainStream) {
    std::string bytes(300000, '\0');
    for (size_t i = 0; i < bytes.size(); ++i) bytes[i] = static_cast<char>(i * 7 + i / 251);
    const TempFile temp(bytes);
    struct Step {
        int whence;
        off_t offset;
        size_t count;
    };
    const Step steps[] = {{SEEK_SET, 0, 4},      {SEEK_SET, 0, 12},        {SEEK_CUR, 600, 32},
                          {SEEK_SET, 4090, 10},  {SEEK_SET, 288698, 1600}, {SEEK_SET, 286000, 5000},
                          {SEEK_CUR, -100, 200}, {SEEK_END, -10, 20},      {SEEK_SET, 1 << 20, 8},
                          {SEEK_SET, 5, 200000}, {SEEK_CUR, -300000, 1},   {SEEK_CUR, 70000, 70000}};
    FILE* walked = OpenForWalk(temp.Path().c_str());
    FILE* plain = std::fopen(temp.Path().c_str(), "rb");
    ASSERT_TRUE(walked && plain);
    for (const Step& step : steps) {
        SCOPED_TRACE(std::to_string(step.offset) + " from " + std::to_string(step.whence));
        EXPECT_EQ(fseeko(walked, step.offset, step.whence), fseeko(plain, step.offset, step.whence));
        EXPECT_EQ(ftello(walked), ftello(plain));
        std::string fromWalked(step.count, '\0');
        std::string fromPlain(step.count, '\0');
        EXPECT_EQ(std::fread(fromWalked.data(), 1, step.count, walked),
                  std::fread(fromPlain.data(), 1, step.count, plain));
        EXPECT_EQ(fromWalked, fromPlain);
        EXPECT_EQ(ftello(walked), ftello(plain));
        EXPECT_EQ(std::feof(walked), std::feof(plain));
    }
    std::fclose(walked);
    std::fclose(plain);
    // Anything but a regular file is opened as before, and a missing one not at all.
    FILE* device = OpenForWalk("/dev/null");
    ASSERT_TRUE(device);
    char byte = 0;
    EXPECT_EQ(std::fread(&byte, 1, 1, device), 0u);
    std::fclose(device);
    EXPECT_EQ(OpenForWalk("/nonexistent/file.wav"), nullptr);
}

TEST(ByteSwap, ReversesEveryByte) {
    int16_t s = 0x1234;
    uint64_t ull = 0xF1F2F3F4F5F6F7F8ull;
    SwapShort(s);
    SwapULongLong(ull);
    EXPECT_EQ(s, 0x3412);
    EXPECT_EQ(ull, 0xF8F7F6F5F4F3F2F1ull);
}

TEST(ExtendedFloat, ReadsTheRatesOfRecordersAndClearsTheSignBit) {
    unsigned char rate44100[10] = {0x40, 0x0E, 0xAC, 0x44, 0, 0, 0, 0, 0, 0};
    EXPECT_EQ(Convert_from_IEEE_754(rate44100), 44100.0);
    for (double rate : {8000.0, 22050.0, 47952.0, 48048.0, 192000.0, 0.5, 44100.0 * 1001 / 1000, 0.0}) {
        std::string bytes = Bytes::Extended80(rate);
        EXPECT_EQ(Convert_from_IEEE_754(reinterpret_cast<unsigned char*>(bytes.data())), rate);
    }
    // A negative value clears the sign bit of the buffer it is read from.
    std::string bytes = Bytes::Extended80(-48000.0);
    auto* raw = reinterpret_cast<unsigned char*>(bytes.data());
    EXPECT_EQ(Convert_from_IEEE_754(raw), -48000.0);
    EXPECT_EQ(Convert_from_IEEE_754(raw), 48000.0);
}

TEST(Int24, KeepsTheLow24BitsSignExtendsAndSwapsOuterBytes) {
    const struct {
        int assigned;
        int32_t value, swapped;
    } rows[] = {{0, 0, 0},
                {-1, -1, -1},
                {0x7FFFFF, 8388607, -129},
                {0x800000, -8388608, 128},
                {0x12345678, 0x345678, 0x785634},
                {-8388609, 8388607, -129},
                {0x0000FF, 255, -0x10000}};
    for (const auto& row : rows) {
        int24 sample;
        sample = row.assigned;
        EXPECT_EQ(sample.Long(), row.value) << row.assigned;
        sample.endianswap();
        EXPECT_EQ(sample.Long(), row.swapped) << row.assigned;
    }
    EXPECT_EQ(int24().Long(), 0);
}

// Every stream test finds the known identifiers; these are the near misses.
// A zero byte in the identifier cuts it: "fmt" is no "fmt ".
TEST(ConvertStrToChunkType, MatchesWholeIdentifiersExactly) {
    using Orlo::OrloStream;
    const struct {
        const char* id;
        unsigned int type;
    } rows[] = {
        {"fmt ", OrloStream::FMT_CHUNK}, {"FMT ", 0}, {"fmt", 0}, {"ixml", 0}, {"DATA", 0}, {"", 0}, {"data ", 0}};
    for (const auto& row : rows) EXPECT_EQ(Orlo::ConvertStrToChunkType(row.id), row.type) << row.id;
}

}  // namespace
