// The container as the host drives it through the loaded module: the order of
// calls, the extension table, the clip lists, and the hand-over of a file it
// cannot read to the host's own container.
#include <gtest/gtest.h>
#include <unistd.h>

#include "ExampleTake.h"
#include "LoadedModule.h"
#include "TempFile.h"
#include "tov/sdk/TOVComponent.h"

namespace {

// What the fake QuickTime container answers, so that a forwarded call shows.
constexpr int32_t kFakeSupported = 7;
constexpr TOVRESULT kFakeClips = static_cast<TOVRESULT>(0x80000777u);
constexpr TOVRESULT kFakeMap = static_cast<TOVRESULT>(0x80000778u);
constexpr _tovUID CLSID_FakeQuickTime = {0x1D0C5A3E, 0x2B4F, 0x4C6D, {0x8E, 0x9F, 0x0A, 0x1B, 0x2C, 0x3D, 0x4E, 0x5F}};

class FakeQuickTime : public IMediaContainer, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
        return TOVCreateComponent<FakeQuickTime>(host, outer, iid, out);
    }
    explicit FakeQuickTime(ITOVUnknown* outer) : CTOVUnknown(outer) {}
    TOV_FORWARD_UNKNOWN
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override {
        if (iid == IID_IMediaContainer) return TOVExpose<IMediaContainer>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    }
    int32_t IsContainerSupported() override { return kFakeSupported; }
    int32_t IsAAFSupported() override { return 0; }
    TOVRESULT GetMasterClips(ITOVString*, IClips**) override { return TOV_E_FAIL; }
    TOVRESULT GetAAFMasterClips(IAAFClips**) override { return kFakeClips; }
    TOVRESULT SetFilePath(ITOVString* path) override {
        s_Path = TakeText((path->AddRef(), path));
        return TOV_OK;
    }
    TOVRESULT GetSampleMapping(ISampleMapping**) override { return kFakeMap; }

    static inline std::string s_Path;
};

struct ContainerTest : ::testing::Test {
    void WithQuickTime() {
        ASSERT_EQ(loaded.host->RegisterBuiltin(CompID_QuickTimeContainer, CLSID_FakeQuickTime, L"FakeQuickTime",
                                               FakeQuickTime::TOVCreate),
                  TOV_OK);
    }
    LoadedModule loaded;
    TempFile take{ExampleTake::File()};
    TempFile text{"these are not the samples you are looking for\n"};
};

TEST_F(ContainerTest, LinksAnAudioFileWhateverItsName) {
    auto container = loaded.Container(take.Path());
    EXPECT_EQ(container->SetFilePath(loaded.Text("/elsewhere.wav").Get()), ZEB_E_ALREADYSET);
    EXPECT_EQ(container->IsContainerSupported(), 1);
    EXPECT_EQ(container->IsAAFSupported(), 1);
    unsigned int capabilities = 0;
    EXPECT_EQ(container->GetCapabilities(&capabilities), TOV_OK);
    EXPECT_EQ(capabilities, 0x4003u);
    EXPECT_EQ(container->GetCapabilities(nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(container->GetMasterClips(nullptr, nullptr), TOV_E_NOTSUPPORTED);
    EXPECT_EQ(container->SetAttributeCallback(nullptr), TOV_E_NOTSUPPORTED);

    // Each call builds a new AAF file into a new list; both lists stay valid.
    TOVPtr<IAAFClips> first, second;
    ASSERT_EQ(container->GetAAFMasterClips(first.OutT()), TOV_OK);
    ASSERT_EQ(container->GetAAFMasterClips(second.OutT()), TOV_OK);
    container.Reset();
    IAAFFile* files[2] = {};
    EXPECT_EQ(first->Count(), 1u);
    EXPECT_EQ(first->GetMetadata(0, &files[0]), TOV_OK);
    EXPECT_EQ(second->GetMetadata(0, &files[1]), TOV_OK);
    ASSERT_TRUE(files[0] && files[1]);
    EXPECT_NE(files[0], files[1]);
    for (IAAFFile* file : files) file->Release();
    EXPECT_EQ(first->GetMetadata(1, &files[0]), TOV_E_OUTOFRANGE);
    EXPECT_EQ(first->GetMetadata(0, static_cast<IAAFFile**>(nullptr)), TOV_OK);
    TOVPtr<IClips> xml;
    ASSERT_EQ(first->QueryInterface(IID_IClips, xml.Out()), TOV_OK);
    EXPECT_EQ(xml->Count(), 1u);
    EXPECT_EQ(xml->GetMetadata(0, nullptr), TOV_E_NOTSUPPORTED);
}

TEST_F(ContainerTest, OffersItsExtensionTableWithOrWithoutAPath) {
    auto container = loaded.Container("");
    const char* rows[][3] = {{"WAV", "WAV Files", "Waveform Audio File Format"},
                             {"WAVE", "WAVE Files", "Waveform Audio File Format"},
                             {"BWF", "BWF Files", "Broadcast Wave Format"},
                             {"AIF", "AIF Files", "Audio Interchange File Format"},
                             {"AIFF", "AIFF Files", "Audio Interchange File Format"},
                             {"AIFC", "AIFC Files", "Audio Interchange File Format"},
                             {"CDDA", "CDDA Files", "Compact Disc Digital Audio"}};
    ASSERT_EQ(container->GetFileExtensionCount(), 7u);
    for (unsigned int i = 0; i < 7; ++i) {
        ITOVString* texts[3] = {};
        ASSERT_EQ(container->GetFileExtension(i, &texts[0], &texts[1], &texts[2]), TOV_OK);
        for (int column = 0; column < 3; ++column) EXPECT_EQ(TakeText(texts[column]), rows[i][column]) << i;
    }
    EXPECT_EQ(container->GetFileExtension(3, nullptr, nullptr, nullptr), TOV_OK);
    EXPECT_EQ(container->GetFileExtension(7, nullptr, nullptr, nullptr), TOV_E_OUTOFRANGE);
    // Without a path nothing is parsed and nothing is handed on.
    EXPECT_EQ(container->IsContainerSupported(), 0);
    TOVPtr<IAAFClips> clips;
    EXPECT_EQ(container->GetAAFMasterClips(clips.OutT()), TOV_E_INVALIDARG);
}

TEST_F(ContainerTest, AFileItCannotReadIsRefusedWhenTheHostHasNoOtherContainer) {
    auto container = loaded.Container(text.Path());
    EXPECT_EQ(container->IsContainerSupported(), 0);
    TOVPtr<IAAFClips> clips;
    EXPECT_LT(container->GetAAFMasterClips(clips.OutT()), 0);
    // The map made for it has no media: every answer that needs one says so.
    TOVPtr<ISampleMapping> map;
    ASSERT_EQ(container->GetSampleMapping(map.OutT()), TOV_OK);
    unsigned long long samples = 0;
    EXPECT_EQ(map->GetNumberOfSamples(0, &samples), ZEB_E_NOTREADY);
}

TEST_F(ContainerTest, AFileItCannotReadGoesToTheHostsQuickTimeContainerForGood) {
    WithQuickTime();
    auto container = loaded.Container(text.Path());
    EXPECT_EQ(container->IsContainerSupported(), kFakeSupported);
    EXPECT_EQ(FakeQuickTime::s_Path, text.Path());
    TOVPtr<IAAFClips> clips;
    TOVPtr<ISampleMapping> map;
    EXPECT_EQ(container->GetAAFMasterClips(clips.OutT()), kFakeClips);
    EXPECT_EQ(container->GetSampleMapping(map.OutT()), kFakeMap);
    // What describes the container itself stays the plug-in's.
    EXPECT_EQ(container->IsAAFSupported(), 1);
    EXPECT_EQ(container->GetFileExtensionCount(), 7u);
    unsigned int capabilities = 0;
    EXPECT_EQ(container->GetCapabilities(&capabilities), TOV_OK);
    EXPECT_EQ(capabilities, 0x4003u);
}

TEST_F(ContainerTest, AFileThatVanishesAfterItsPathIsSetFailsCleanly) {
    WithQuickTime();
    TempFile gone{ExampleTake::File()};
    auto container = loaded.Container(gone.Path());
    ASSERT_EQ(unlink(gone.Path().c_str()), 0);
    TOVPtr<IAAFClips> clips;
    EXPECT_LT(container->GetAAFMasterClips(clips.OutT()), 0);
    // The sample map, asked first, finds no audio and hands the file on; the
    // map it made is abandoned, as the container does by design.
    TOVPtr<ISampleMapping> map;
    EXPECT_EQ(container->GetSampleMapping(map.OutT()), kFakeMap);
}

}  // namespace
