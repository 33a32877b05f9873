// The loader of the AAF library: load control, the forwarders with libraries
// that lack entry points, and the walk of a folder for libraries. Every test
// starts and ends with nothing loaded.
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <string>
#include <utility>
#include <vector>

#include "AAFTestFile.h"
#include "aaf/AAFDLL.h"
#include "aaf/AAFLoaderPlatform.h"

using namespace aaftest;

namespace {

constexpr AAFRESULT kStubAnswer = 0x00000123;
constexpr AAFRESULT kSymbolMissing = static_cast<AAFRESULT>(0x80120401u);

std::string Stub(const char* name) { return std::string(AAF_TEST_LIB_DIR) + "/lib" + name + ".so"; }

class AAFLoader : public ::testing::Test {
protected:
    void SetUp() override { ASSERT_EQ(AAFUnload(), AAFRESULT_SUCCESS); }
    void TearDown() override { EXPECT_EQ(AAFUnload(), AAFRESULT_SUCCESS); }
};

TEST_F(AAFLoader, FirstForwarderCallLoadsTheDefaultLibraryBesideUs) {
    EXPECT_EQ(AAFDLL::GetAAFDLL(), nullptr);
    TransientFile f(&AAFFileOpenTransient);
    ASSERT_TRUE(f.header);
    EXPECT_NE(AAFDLL::GetAAFDLL(), nullptr);
    EXPECT_EQ(AAFLoad(nullptr), AAFRESULT_ALREADY_INITIALIZED);
    aafProductVersion_t version{};
    EXPECT_EQ(AAFGetLibraryVersion(&version), AAFRESULT_SUCCESS);
    EXPECT_EQ(AAFGetStaticLibraryVersion(&version), AAFRESULT_SUCCESS);
    // Disk files answer not-implemented until the library has a file format.
    IAAFFile* file = nullptr;
    EXPECT_EQ(AAFFileOpenExistingRead(L"/nowhere.aaf", 0, &file), AAFRESULT_NOT_IMPLEMENTED);
}

TEST_F(AAFLoader, ObjectsOutliveAnUnload) {
    TransientFile f(&AAFFileOpenTransient);
    ASSERT_EQ(AAFUnload(), AAFRESULT_SUCCESS);
    EXPECT_EQ(AAFDLL::GetAAFDLL(), nullptr);
    aafUInt32 count = 0;
    EXPECT_EQ(f.header->CountIdentifications(&count), AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 1u);
}

struct LoadCase {
    const char* library;
    AAFRESULT loadResult;
};

// Names the case in test output instead of its bytes.
void PrintTo(const LoadCase& c, std::ostream* out) { *out << c.library; }

class AAFLibraryLoad : public AAFLoader, public ::testing::WithParamInterface<LoadCase> {};

TEST_P(AAFLibraryLoad, RequiredSymbolsDecide) {
    const LoadCase& c = GetParam();
    EXPECT_EQ(AAFLoad(Stub(c.library).c_str()), c.loadResult);
    // A failed load leaves no instance behind.
    EXPECT_EQ(AAFDLL::GetAAFDLL() != nullptr, c.loadResult == AAFRESULT_SUCCESS);
}

INSTANTIATE_TEST_SUITE_P(Libraries, AAFLibraryLoad,
                         ::testing::Values(LoadCase{"aaf_stub_complete", AAFRESULT_SUCCESS},
                                           LoadCase{"aaf_stub_no_transient", kSymbolMissing},
                                           LoadCase{"aaf_stub_no_read", kSymbolMissing},
                                           LoadCase{"aaf_stub_memory_without_disk", kSymbolMissing},
                                           LoadCase{"aaf_stub_no_raw_memory", AAFRESULT_SUCCESS},
                                           LoadCase{"aaf_stub_no_modify_ex", AAFRESULT_SUCCESS},
                                           LoadCase{"aaf_no_such_library", AAFRESULT_DLL_LOAD_FAILED}),
                         [](const auto& info) { return std::string(info.param.library); });

TEST_F(AAFLoader, WithoutRawMemoryTheDiskEntryIsNotLookedUp) {
    ASSERT_EQ(AAFLoad(Stub("aaf_stub_no_raw_memory").c_str()), AAFRESULT_SUCCESS);
    IAAFRawStorage* storage = nullptr;
    EXPECT_EQ(AAFCreateRawStorageDisk(L"x", 0, 0, &storage), kSymbolMissing);
    EXPECT_EQ(AAFCreateRawStorageMemory(0, &storage), kSymbolMissing);
    EXPECT_EQ(AAFFileOpenTransient(nullptr, nullptr), kStubAnswer);
}

TEST_F(AAFLoader, OptionalEntriesForwardOrAnswerMissing) {
    ASSERT_EQ(AAFLoad(Stub("aaf_stub_no_modify_ex").c_str()), AAFRESULT_SUCCESS);
    IAAFFile* file = nullptr;
    IAAFRawStorage* storage = nullptr;
    aafBool is = kAAFFalse;
    EXPECT_EQ(AAFFileOpenNewModifyEx(L"x", nullptr, 0, nullptr, &file), kSymbolMissing);
    EXPECT_EQ(AAFCreateRawStorageDisk(L"x", 0, 0, &storage), kStubAnswer);
    EXPECT_EQ(AAFResultToText(0, nullptr, 0), kSymbolMissing);
    // The one mapping of a result: not implemented becomes a missing symbol.
    EXPECT_EQ(AAFFileIsAAFFile(L"x", nullptr, &is), kSymbolMissing);
    EXPECT_EQ(AAFDLL::GetAAFDLL()->IsAAFFile(L"x", nullptr, &is), kSymbolMissing);
}

TEST_F(AAFLoader, FailedLoadIsRetriedByTheNextForwarder) {
    EXPECT_EQ(AAFLoad(Stub("aaf_stub_no_transient").c_str()), kSymbolMissing);
    EXPECT_EQ(AAFDLL::GetAAFDLL(), nullptr);
    aafProductVersion_t version{};
    EXPECT_EQ(AAFGetLibraryVersion(&version), AAFRESULT_SUCCESS);  // the default library, loaded anew
    EXPECT_NE(AAFDLL::GetAAFDLL(), nullptr);
}

TEST_F(AAFLoader, AnExceptionFromTheLibraryBecomesAResult) {
    ASSERT_EQ(AAFLoad(Stub("aaf_stub_throwing").c_str()), AAFRESULT_SUCCESS);
    aafProductVersion_t version{};
    EXPECT_EQ(AAFGetLibraryVersion(&version), static_cast<AAFRESULT>(0x801201D1u));
}

TEST(AAFLoaderPlatform, NullArguments) {
    EXPECT_EQ(AAFGetStaticLibraryVersion(nullptr), AAFRESULT_NULL_PARAM);
    void *handle = nullptr, *symbol = nullptr;
    EXPECT_EQ(AAFLoadLibrary(nullptr, &handle), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(AAFLoadLibrary("x", nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(AAFUnloadLibrary(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(AAFFindSymbol(nullptr, "x", &symbol), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(AAFFindLibrary(
                  nullptr, [](const char*, const char*, char, void*) { return 0; }, nullptr),
              AAFRESULT_NULL_PARAM);
    EXPECT_EQ(AAFFindLibrary("/", nullptr, nullptr), AAFRESULT_NULL_PARAM);
}

struct Seen {
    std::vector<std::pair<std::string, char>> entries;
    size_t stopAfter = 0;
};

AAFRESULT Record(const char* path, const char* name, char isDirectory, void* userData) {
    auto* seen = static_cast<Seen*>(userData);
    EXPECT_EQ(std::string(path).substr(std::string(path).size() - std::string(name).size()), name);
    seen->entries.emplace_back(name, isDirectory);
    return seen->stopAfter && seen->entries.size() == seen->stopAfter ? 42 : 0;
}

TEST(AAFFindLibrary, ReportsLibrariesAndFoldersUntilTheCallbackStopsIt) {
    char pattern[] = "/tmp/aaf_find_XXXXXX";
    ASSERT_NE(mkdtemp(pattern), nullptr);
    const std::string dir = pattern;
    for (const char* name : {"libgood.so", "lib.so.bak", "so", "notes.txt", "libother.so"})
        std::ofstream(dir + "/" + name) << "x";
    ASSERT_EQ(mkdir((dir + "/sub").c_str(), 0700), 0);

    Seen seen, stopped;
    ASSERT_EQ(AAFFindLibrary(dir.c_str(), &Record, &seen), AAFRESULT_SUCCESS);
    std::sort(seen.entries.begin(), seen.entries.end());
    const std::vector<std::pair<std::string, char>> expected = {{"libgood.so", 0}, {"libother.so", 0}, {"sub", 1}};
    EXPECT_EQ(seen.entries, expected);
    stopped.stopAfter = 1;
    EXPECT_EQ(AAFFindLibrary(dir.c_str(), &Record, &stopped), 42);
    EXPECT_EQ(stopped.entries.size(), 1u);
    EXPECT_EQ(AAFFindLibrary((dir + "/absent").c_str(), &Record, &seen), static_cast<AAFRESULT>(0x80120021u));
    EXPECT_EQ(AAFFindLibrary((dir + std::string(1100, '/')).c_str(), &Record, &seen), AAFRESULT_INVALID_PARAM);
    std::system(("rm -rf '" + dir + "'").c_str());
}

}  // namespace
