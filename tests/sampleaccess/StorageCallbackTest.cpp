// The storage callback: positional reads, a length measured once, and the odd
// senses of a file that cannot be opened.
#include <string>

#include "SampleAccessTest.h"
#include "TempFile.h"
#include "sampleaccess/OrloReaderStorageCallback.h"

namespace {

using ZEB::Impl::OrloReaderStorageCallback;

class StorageCallback : public SampleAccessTest {
protected:
    /// A callback held by the test alone, as a map holds its own.
    TOVPtr<IStorageCallback> CallbackOn(const std::string& path) {
        auto* callback = new OrloReaderStorageCallback(Text(path));
        EXPECT_EQ(callback->AddRef(), 1u);
        return TOVPtr<IStorageCallback>(callback);
    }
};

std::string Content(size_t size) {
    std::string bytes(size, '\0');
    for (size_t i = 0; i < size; ++i) bytes[i] = static_cast<char>(i * 37 + 11);
    return bytes;
}

const char kMissing[] = "/nonexistent/orlo/take.wav";

TEST_F(StorageCallback, TakesAFailedOpenForAnOpenFileAndReportsAtEachUse) {
    TOVPtr<IStorageCallback> callback = CallbackOn(kMissing);
    unsigned long long length = 7;
    EXPECT_EQ(callback->GetLength(&length), TOV_E_FILEIO);
    EXPECT_EQ(LinesWith(kTOVDebugLevelError, "OrloReaderStorageCallback error. stat64 failed. errno = 2 "), 1u);
    unsigned char buffer[16] = {};
    EXPECT_EQ(callback->Read(0, buffer, sizeof buffer), TOV_E_FILEIO);
    EXPECT_EQ(LinesWith(kTOVDebugLevelWarning,
                        "XDCAMSampleMapping error. fread did not read requested bytes. nitemsRead = -1 "),
              1u);
    EXPECT_EQ(LinesWith(~0u, "fopen"), 0u);
    // Each message names the source file and line it comes from.
    EXPECT_EQ(LinesWith(~0u, "sampleaccess/OrloReaderStorageCallback.cpp("), 2u);

    callback.Reset();
    EXPECT_EQ(LinesWith(kTOVDebugLevelError, "OrloReaderStorageCallback error. fclose failed. errno = 9 "), 1u);
}

TEST_F(StorageCallback, RefusesNullsBeforeOpeningAndIsNoRegisteredComponent) {
    TOVPtr<IStorageCallback> callback = CallbackOn(kMissing);
    EXPECT_EQ(callback->Read(0, nullptr, 16), TOV_E_POINTER);
    EXPECT_EQ(callback->GetLength(nullptr), TOV_E_POINTER);
    void* itf = &itf;
    EXPECT_EQ(callback->QueryInterface(IID_IStorageCallback, &itf), TOV_E_NOINTERFACE);
    callback.Reset();
    // Nothing was opened, so nothing is closed.
    EXPECT_TRUE(host.Lines().empty());
}

TEST_F(StorageCallback, ReadsWhatLiesAtAnOffsetUpToTheEnd) {
    const std::string content = Content(1000);
    TempFile file(content);
    TOVPtr<IStorageCallback> callback = CallbackOn(file.Path());
    struct Case {
        unsigned long long offset;
        size_t filled;
    };
    for (const Case& c : {Case{0, 100}, Case{450, 100}, Case{990, 10}, Case{1000, 0}, Case{5000, 0}}) {
        SCOPED_TRACE(c.offset);
        std::string buffer(100, '\xAA');
        EXPECT_EQ(callback->Read(c.offset, reinterpret_cast<unsigned char*>(buffer.data()), 100), TOV_OK);
        EXPECT_EQ(buffer.substr(0, c.filled), content.substr(std::min<size_t>(c.offset, 1000), c.filled));
        EXPECT_EQ(buffer.substr(c.filled), std::string(100 - c.filled, '\xAA'));
    }
    EXPECT_TRUE(host.Lines().empty());
}

TEST_F(StorageCallback, KeepsTheFirstLengthThatIsNotZero) {
    struct Case {
        uint64_t first, grown, secondAnswer;
    };
    for (const Case& c : {Case{1000, 5000, 1000}, Case{0, 5000, 5000}}) {
        SCOPED_TRACE(c.first);
        TempFile file(Content(c.first));
        TOVPtr<IStorageCallback> callback = CallbackOn(file.Path());
        unsigned long long length = 7;
        EXPECT_EQ(callback->GetLength(&length), TOV_OK);
        EXPECT_EQ(length, c.first);
        file.Resize(c.grown);
        EXPECT_EQ(callback->GetLength(&length), TOV_OK);
        EXPECT_EQ(length, c.secondAnswer);
    }
}

}  // namespace
