// Content identifiers of files: which blocks are read at which offsets, and
// the results and clean-up on every way out. Large files are sparse.
#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <algorithm>
#include <cstdint>
#include <string>
#include <vector>

#include "IdentityFixture.h"
#include "TempFile.h"
#include "identity/GenerateUMIDFromFileContent.h"
#include "strings/ZEBString.h"

namespace {

using namespace ZEB;

constexpr uint64_t kMiB = 1024 * 1024;
constexpr uint64_t kBlock = 4 * kMiB;

const unsigned char* U8(const std::string& text) { return reinterpret_cast<const unsigned char*>(text.c_str()); }
const _aafUID_t kMarked = {0x11111111, 0x2222, 0x3333, {4, 4, 4, 4, 4, 4, 4, 4}};

// Up to 8 bytes of the file from `offset`, as the generator's log keeps them.
std::string HeadAt(const std::string& path, uint64_t offset, uint64_t size) {
    std::string head(std::min<uint64_t>(8, size - offset), '\0');
    const int fd = open(path.c_str(), O_RDONLY);
    EXPECT_EQ(pread(fd, head.data(), head.size(), static_cast<off_t>(offset)), static_cast<ssize_t>(head.size()));
    close(fd);
    return head;
}

class GenerateUMIDFromFileContent : public IdentityFixture {
protected:
    TOVRESULT Generate(const std::string& path, _aafUID_t* out) {
        ZEBString text(U8(path));
        return ZEB::GenerateUMIDFromFileContent(text.InArg(), out);
    }
};

TEST_F(GenerateUMIDFromFileContent, ReadsFirstMiddleAndLastBlockByTheFilesSize) {
    struct Case {
        uint64_t size;
        std::vector<uint64_t> offsets;  // of the blocks added, in order
    };
    const std::vector<Case> cases = {
        {0, {0}},  // nothing read is still one block added
        {1, {0}},
        {kBlock, {0}},
        {kBlock + 1, {0, 1}},
        {2 * kBlock, {0, kBlock}},
        {2 * kBlock + 1, {0, kBlock / 2, kBlock + 1}},
    };
    for (const auto& c : cases) {
        log().added.clear();
        TempFile file("");
        // A marker at each block's start, so a block read at any other place
        // shows as the hole's zeros.
        char letter = 'A';
        for (uint64_t offset : c.offsets)
            file.WriteAt(offset, std::string(std::min<uint64_t>(8, c.size - offset), letter++));
        file.Resize(c.size);

        _aafUID_t out{};
        ASSERT_EQ(Generate(file.Path(), &out), TOV_OK) << c.size;
        EXPECT_EQ(out.Data2, 0xFA) << "written by the generator's finish";
        ASSERT_EQ(log().added.size(), c.offsets.size()) << c.size;
        for (std::size_t i = 0; i < c.offsets.size(); ++i) {
            EXPECT_EQ(log().added[i].count, std::min(kBlock, c.size - c.offsets[i])) << c.size << " block " << i;
            EXPECT_EQ(log().added[i].head, HeadAt(file.Path(), c.offsets[i], c.size)) << c.size << " block " << i;
        }
    }
    EXPECT_EQ(log().begins, static_cast<int>(cases.size()));
    EXPECT_EQ(log().finishes, static_cast<int>(cases.size()));
}

TEST_F(GenerateUMIDFromFileContent, TakesThePathInAnyEncoding) {
    TempFile file("wide");
    const std::string folder = file.Path().substr(0, file.Path().rfind('/') + 1);
    const std::string named = folder + "t\xC3\xA9st-\xE2\x82\xAC.wav";
    ASSERT_EQ(rename(file.Path().c_str(), named.c_str()), 0);
    std::u16string utf16;
    for (unsigned char c : folder) utf16 += static_cast<char16_t>(c);
    utf16 += u"t\u00E9st-\u20AC.wav";
    ZEBString path(reinterpret_cast<const unsigned short*>(utf16.c_str()));
    _aafUID_t out{};
    const TOVRESULT result = ZEB::GenerateUMIDFromFileContent(path.InArg(), &out);
    rename(named.c_str(), file.Path().c_str());
    EXPECT_EQ(result, TOV_OK);
    EXPECT_EQ(out, FakeUIDOf("wide"));
}

TEST_F(GenerateUMIDFromFileContent, RefusesMissingArgumentsAndLeavesOutAlone) {
    _aafUID_t out = kMarked;
    TempFile file("x");
    EXPECT_EQ(ZEB::GenerateUMIDFromFileContent(nullptr, &out), TOV_E_INVALIDARG);
    EXPECT_EQ(ZEB::GenerateUMIDFromFileContent(ZEBString(U8("")).InArg(), &out), TOV_E_INVALIDARG);
    EXPECT_EQ(ZEB::GenerateUMIDFromFileContent(ZEBString(U8(file.Path())).InArg(), nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(out, kMarked);
    EXPECT_EQ(log().begins, 0);
}

TEST_F(GenerateUMIDFromFileContent, FailuresEndTheWorkAndReleaseTheGenerator) {
    const _aafUID_t cleared{};
    const _aafUID_t ofThreeHoles = FakeUIDOf(std::string(3 * kBlock, '\0'));
    TempFile big("");
    big.Resize(2 * kBlock + 1);
    const std::string missing = big.Path() + ".missing";
    struct Case {
        const char* name;
        GeneratorFactory::Generator generator;
        TOVRESULT begin, add, finish;
        std::string path;
        TOVRESULT expected;
        _aafUID_t out;  // after the call
        int begins;
        std::size_t added;
        int finishes;
    };
    using G = GeneratorFactory::Generator;
    const std::vector<Case> cases = {
        {"no generator", G::Missing, TOV_OK, TOV_OK, TOV_OK, big.Path(), TOV_E_UNEXPECTED, kMarked, 0, 0, 0},
        {"null generator", G::NullOnSuccess, TOV_OK, TOV_OK, TOV_OK, big.Path(), TOV_E_UNEXPECTED, cleared, 0, 0, 0},
        {"missing file", G::Fake, TOV_OK, TOV_OK, TOV_OK, missing, TOV_E_FILEOPEN, cleared, 0, 0, 0},
        {"begin fails", G::Fake, TOV_E_FAIL, TOV_OK, TOV_OK, big.Path(), TOV_E_FAIL, cleared, 1, 0, 0},
        {"add fails", G::Fake, TOV_OK, TOV_E_OUTOFMEMORY, TOV_OK, big.Path(), TOV_E_OUTOFMEMORY, cleared, 1, 1, 0},
        {"finish fails", G::Fake, TOV_OK, TOV_OK, TOV_E_FILEIO, big.Path(), TOV_E_FILEIO, ofThreeHoles, 1, 3, 1},
    };
    for (const auto& c : cases) {
        log() = GeneratorLog{};
        log().beginResult = c.begin;
        log().addResult = c.add;
        log().finishResult = c.finish;
        factory.generator = c.generator;
        _aafUID_t out = kMarked;
        EXPECT_EQ(Generate(c.path, &out), c.expected) << c.name;
        EXPECT_EQ(log().begins, c.begins) << c.name;
        EXPECT_EQ(log().added.size(), c.added) << c.name;
        EXPECT_EQ(log().finishes, c.finishes) << c.name;
        EXPECT_EQ(out, c.out) << c.name;
    }
}

TEST(GenerateUMIDFromFileContentBeforeStart, IsNotReady) {
    TestHost host;
    ASSERT_EQ(ZEBInitialize(host.Get()), TOV_OK);
    ZEBString text(U8("/tmp/x"));
    ZEBTerminate();
    _aafUID_t out{};
    EXPECT_EQ(ZEB::GenerateUMIDFromFileContent(text.InArg(), &out), ZEB_E_NOTREADY);
}

}  // namespace
