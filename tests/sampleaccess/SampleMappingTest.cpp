// The sample map as the host makes and reads it: frame arithmetic over the
// containers, the answers without media, the callback it holds, and reader
// threads asking at once.
#include <gmock/gmock.h>

#include <array>
#include <atomic>
#include <stdexcept>
#include <thread>
#include <vector>

#include "AudioFileWriter.h"
#include "ChunkPayloads.h"
#include "SampleAccessTest.h"
#include "TempFile.h"
#include "sampleaccess/OrloReaderStorageCallback.h"

namespace {

using ::testing::Each;
using SampleMap = SampleAccessTest;

enum class Container { Wave, RF64, Aiff };

struct PcmFile {
    const char* name;
    Container container;
    uint16_t channels;
    uint16_t bits;
    uint32_t soundOffset;      ///< AIFF only: bytes between the SSND header and the samples
    unsigned long long start;  ///< where the first frame lies, by the layout
};

constexpr unsigned long long kFrames = 1000;

// Headers: RIFF 12, fmt 8+16, data 8; ds64 8+28; FORM 12, COMM 8+18, SSND 8+8.
const PcmFile kFiles[] = {
    {"Wave16Stereo", Container::Wave, 2, 16, 0, 44},  {"Wave24Mono", Container::Wave, 1, 24, 0, 44},
    {"RF64_24Stereo", Container::RF64, 2, 24, 0, 80}, {"Aiff24MonoWithSoundOffset", Container::Aiff, 1, 24, 4, 58},
    {"Aiff16Stereo", Container::Aiff, 2, 16, 0, 54},
};

unsigned long long FrameBytes(const PcmFile& f) { return f.channels * (f.bits / 8u); }

// No two nearby frames alike, so a frame found at a wrong offset shows.
std::string Samples(const PcmFile& f) {
    std::string samples(kFrames * FrameBytes(f), '\0');
    for (size_t i = 0; i < samples.size(); ++i) samples[i] = static_cast<char>(i * 131 + i / 251);
    return samples;
}

std::string FileBytes(const PcmFile& f) {
    const std::string samples = Samples(f);
    if (f.container == Container::Aiff) {
        Payload::Comm comm;
        comm.channels = f.channels;
        comm.bits = f.bits;
        comm.frames = kFrames;
        return AudioFileWriter::Aiff()
            .Chunk("COMM", Payload::CommChunk(comm))
            .Chunk("SSND", Payload::SsndChunk(f.soundOffset, samples))
            .Bytes();
    }
    Payload::Fmt fmt;
    fmt.channels = f.channels;
    fmt.bits = f.bits;
    if (f.container == Container::RF64) {
        return AudioFileWriter::RF64()
            .Chunk("ds64", Payload::Ds64Chunk(0, samples.size(), kFrames))
            .Chunk("fmt ", Payload::FmtChunk(fmt))
            .ChunkWithSize("data", 0xFFFFFFFF, samples, false)
            .Bytes();
    }
    return AudioFileWriter::Wave().Chunk("fmt ", Payload::FmtChunk(fmt)).Chunk("data", samples).Bytes();
}

TEST_F(SampleMap, PlacesEveryFrameOfEveryContainer) {
    for (const PcmFile& f : kFiles) {
        SCOPED_TRACE(f.name);
        const std::string bytes = FileBytes(f);
        TempFile file(bytes);
        TOVPtr<ISampleMapping> map = MapOf(file.Path());
        const unsigned long long frame = FrameBytes(f);

        EXPECT_EQ(map->GetNumberOfTracks(), f.channels);
        unsigned int channels = 0;
        EXPECT_EQ(map->GetNumberOfChannels(9, &channels), TOV_OK);
        EXPECT_EQ(channels, f.channels);
        unsigned long long value = 0;
        EXPECT_EQ(map->GetNumberOfSamples(0, &value), TOV_OK);
        EXPECT_EQ(value, kFrames);
        EXPECT_EQ(map->GetNumberOfEncodedUnits(0, &value), TOV_OK);
        EXPECT_EQ(value, kFrames);

        // Any track, and frames past the end too, with no range test.
        for (unsigned int track : {0u, 77u}) {
            for (unsigned long long n : {0ull, 1ull, kFrames - 1, kFrames, kFrames + 1, 1000000ull}) {
                EXPECT_EQ(map->GetSamplePosition(track, n, &value), TOV_OK);
                EXPECT_EQ(value, f.start + frame * n) << "frame " << n;
                EXPECT_EQ(map->GetEncodedUnitPosition(track, n, &value), TOV_OK);
                EXPECT_EQ(value, f.start + frame * n) << "unit " << n;
                EXPECT_EQ(map->GetSampleSize(track, n, &value), TOV_OK);
                EXPECT_EQ(value, frame);
            }
        }
        // The last frame holds what was written as the last frame.
        ASSERT_EQ(map->GetSamplePosition(0, kFrames - 1, &value), TOV_OK);
        EXPECT_EQ(bytes.substr(value, frame), Samples(f).substr((kFrames - 1) * frame, frame));

        struct Run {
            unsigned long long from, frames;
            TOVRESULT result;
        };
        for (const Run& r : {Run{0, kFrames, TOV_OK}, Run{kFrames - 1, 1, TOV_OK}, Run{kFrames, 0, TOV_E_OUTOFRANGE},
                             Run{kFrames + 1, 0, TOV_E_OUTOFRANGE}}) {
            SCOPED_TRACE(r.from);
            value = 99;
            EXPECT_EQ(map->GetNumberOfContiguousSamples(3, r.from, &value), r.result);
            EXPECT_EQ(value, r.frames);
            value = 99;
            EXPECT_EQ(map->GetNumberOfContiguousEncodedUnits(3, r.from, &value), r.result);
            EXPECT_EQ(value, r.frames);
            value = 99;
            EXPECT_EQ(map->GetNumberOfContiguousBytes(3, r.from, &value), r.result);
            EXPECT_EQ(value, r.frames * frame);
        }
    }
}

// The results of the slots that answer from the media, `out` null or not.
std::vector<TOVRESULT> MediaSlots(ISampleMapping& map, bool nullOut) {
    unsigned long long value = 0;
    unsigned int channels = 0;
    unsigned long long* v = nullOut ? nullptr : &value;
    return {map.GetNumberOfChannels(0, nullOut ? nullptr : &channels),
            map.GetNumberOfSamples(0, v),
            map.GetSampleSize(0, 9, v),
            map.GetSamplePosition(0, 9, v),
            map.GetSampleTemporalOffset(0, 9, v),
            map.GetNumberOfEncodedUnits(0, v),
            map.GetEncodedUnitPosition(0, 9, v),
            map.GetEncodedUnitSizeInBytes(0, 9, v),
            map.GetNumberOfContiguousSamples(0, 9, v),
            map.GetNumberOfContiguousBytes(0, 9, v),
            map.GetNumberOfContiguousEncodedUnits(0, 9, v)};
}

// The slots that need no media answer alike with media and without; each
// value differs from the one before, so an unwritten one shows.
void ExpectMediaFreeAnswers(ISampleMapping& map) {
    unsigned long long v = 99;
    const auto expect = [&v](TOVRESULT result, unsigned long long value) {
        EXPECT_EQ(result, TOV_OK);
        EXPECT_EQ(v, value);
    };
    expect(map.GetSampleStride(0, &v), 0);
    expect(map.GetSampleDependency(0, 17, 5, &v), 17);
    expect(map.GetEncodedUnitStride(0, &v), 0);
    unsigned int second = 7;
    expect(map.GetSampleProperties(0, 9, &v, &second), 2);
    EXPECT_EQ(second, 0u);
    expect(map.GetEncodedUnitSizeInSamples(0, 9, &v), 1);
    expect(map.GetEncodedUnitFirstSample(0, 9, &v), 9);
    expect(map.GetEncodedUnitContainingSample(0, 8, &v), 8);
    unsigned int handle = 5;
    EXPECT_EQ(map.RegisterSampleRangeHint(0, 0, 10, &handle), TOV_OK);
    EXPECT_EQ(handle, 5u);
    EXPECT_EQ(map.RegisterSampleRangeHint(0, 0, 10, nullptr), TOV_OK);
    EXPECT_EQ(map.UnregisterSampleRangeHint(handle), TOV_OK);
}

TEST_F(SampleMap, AnswersWithoutMediaWhatNeedsNone) {
    TempFile fmtOnly(AudioFileWriter::Wave().Chunk("fmt ", Payload::FmtChunk(Payload::Fmt())).Bytes());
    TOVPtr<ISampleMapping> fresh = NewMap();
    TOVPtr<ISampleMapping> unread = NewMap();
    EXPECT_FALSE(Concrete(unread).SetFilePath(Text("/nonexistent/orlo/take.wav")));
    TOVPtr<ISampleMapping> thrown = NewMap();
    EXPECT_THROW(Concrete(thrown).SetFilePath(Text(fmtOnly.Path())), std::logic_error);
    for (ISampleMapping* map : {fresh.Get(), unread.Get(), thrown.Get()}) {
        EXPECT_EQ(map->GetNumberOfTracks(), 0u);
        EXPECT_THAT(MediaSlots(*map, false), Each(ZEB_E_NOTREADY));
        ExpectMediaFreeAnswers(*map);
    }
    void* later = &later;
    EXPECT_EQ(fresh->QueryInterface(IID_ISampleMapping3, &later), TOV_E_NOINTERFACE);
    EXPECT_EQ(later, nullptr);
}

TEST_F(SampleMap, RefusesANullOutWhereItTestsOne) {
    TempFile file(FileBytes(kFiles[0]));
    TOVPtr<ISampleMapping> map = MapOf(file.Path());
    EXPECT_THAT(MediaSlots(*map, true), Each(TOV_E_INVALIDARG));
    unsigned long long v = 0;
    unsigned int second = 0;
    EXPECT_EQ(map->GetSampleStride(0, nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(map->GetSampleDependency(0, 1, 0, nullptr), TOV_E_INVALIDARG);
    EXPECT_EQ(map->GetSampleProperties(0, 0, nullptr, &second), TOV_E_INVALIDARG);
    EXPECT_EQ(map->GetSampleProperties(0, 0, &v, nullptr), TOV_E_INVALIDARG);
    ExpectMediaFreeAnswers(*map);
}

TEST_F(SampleMap, HoldsOneReferenceToItsStorageCallback) {
    TempFile file(FileBytes(kFiles[0]));
    auto* callback = new ZEB::Impl::OrloReaderStorageCallback(Text(file.Path()));
    EXPECT_EQ(callback->AddRef(), 1u);
    const auto references = [callback] {
        callback->AddRef();
        return callback->Release();
    };
    TOVPtr<ISampleMapping> map = NewMap();
    EXPECT_EQ(map->SetStorageCallback(nullptr), TOV_E_POINTER);
    for (int twice = 0; twice < 2; ++twice) {
        EXPECT_EQ(map->SetStorageCallback(callback), TOV_OK);
        EXPECT_EQ(references(), 2u);
    }
    // A file that cannot be read keeps the callback; one that can replaces it.
    EXPECT_FALSE(Concrete(map).SetFilePath(Text("/nonexistent/orlo/take.wav")));
    EXPECT_EQ(references(), 2u);
    EXPECT_TRUE(Concrete(map).SetFilePath(Text(file.Path())));
    EXPECT_EQ(references(), 1u);
    callback->Release();
}

TEST_F(SampleMap, GivesReaderThreadsTheAnswersOfOne) {
    TempFile file(FileBytes(kFiles[2]));
    TOVPtr<ISampleMapping> map = MapOf(file.Path());
    // Results and values of the reads a host makes per frame, side by side.
    using Answer = std::array<unsigned long long, 7>;
    const auto ask = [&map](unsigned long long n) {
        Answer a{map->GetNumberOfTracks()};
        a[1] = static_cast<unsigned>(map->GetSamplePosition(1, n, &a[2]));
        a[3] = static_cast<unsigned>(map->GetSampleSize(1, n, &a[4]));
        a[5] = static_cast<unsigned>(map->GetNumberOfContiguousBytes(1, n, &a[6]));
        return a;
    };
    const std::vector<unsigned long long> frames = {0, 1, 499, kFrames - 1, kFrames, kFrames + 1, 1ull << 40};
    std::vector<Answer> expected;
    for (unsigned long long n : frames) expected.push_back(ask(n));

    std::atomic<int> mismatches{0};
    std::vector<std::thread> readers;
    for (int t = 0; t < 8; ++t) {
        readers.emplace_back([&] {
            for (int round = 0; round < 2000; ++round)
                for (size_t i = 0; i < frames.size(); ++i)
                    if (ask(frames[i]) != expected[i]) ++mismatches;
        });
    }
    for (std::thread& reader : readers) reader.join();
    EXPECT_EQ(mismatches.load(), 0);
}

}  // namespace
