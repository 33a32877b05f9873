// The sample map as the host makes and reads it: frame arithmetic over the
// containers, the answers without media, the callback it holds, and reader
// threads asking at once.
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
                EXPECT_EQ(map->GetEncodedUnitSizeInBytes(track, n, &value), TOV_OK);
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

// One slot, called with `out` as given.
struct Slot {
    const char* name;
    TOVRESULT (*call)(ISampleMapping&, unsigned long long* out);
    bool needsMedia;
    bool testsOut;
    unsigned long long answer;  ///< when it does not need media
};

const Slot kSlots[] = {
    {"GetNumberOfChannels",
     [](ISampleMapping& m, unsigned long long* out) {
         unsigned int channels = 0;
         const TOVRESULT result = m.GetNumberOfChannels(0, out ? &channels : nullptr);
         if (out) *out = channels;
         return result;
     },
     true, true, 0},
    {"GetNumberOfSamples", [](ISampleMapping& m, unsigned long long* out) { return m.GetNumberOfSamples(0, out); },
     true, true, 0},
    {"GetSampleSize", [](ISampleMapping& m, unsigned long long* out) { return m.GetSampleSize(0, 9, out); }, true, true,
     0},
    {"GetSamplePosition", [](ISampleMapping& m, unsigned long long* out) { return m.GetSamplePosition(0, 9, out); },
     true, true, 0},
    {"GetSampleTemporalOffset",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetSampleTemporalOffset(0, 9, out); }, true, true, 0},
    {"GetNumberOfEncodedUnits",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetNumberOfEncodedUnits(0, out); }, true, true, 0},
    {"GetEncodedUnitPosition",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetEncodedUnitPosition(0, 9, out); }, true, true, 0},
    {"GetEncodedUnitSizeInBytes",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetEncodedUnitSizeInBytes(0, 9, out); }, true, true, 0},
    {"GetNumberOfContiguousSamples",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetNumberOfContiguousSamples(0, 9, out); }, true, true,
     0},
    {"GetNumberOfContiguousBytes",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetNumberOfContiguousBytes(0, 9, out); }, true, true, 0},
    {"GetNumberOfContiguousEncodedUnits",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetNumberOfContiguousEncodedUnits(0, 9, out); }, true,
     true, 0},
    {"GetSampleStride", [](ISampleMapping& m, unsigned long long* out) { return m.GetSampleStride(0, out); }, false,
     true, 0},
    {"GetEncodedUnitStride", [](ISampleMapping& m, unsigned long long* out) { return m.GetEncodedUnitStride(0, out); },
     false, true, 0},
    {"GetSampleDependency",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetSampleDependency(0, 17, 5, out); }, false, true, 17},
    {"GetSampleProperties",
     [](ISampleMapping& m, unsigned long long* out) {
         unsigned int second = 7;
         const TOVRESULT result = m.GetSampleProperties(0, 9, out, &second);
         return result == TOV_OK && second != 0 ? TOV_E_FAIL : result;
     },
     false, true, 2},
    // These three write through `out` untested.
    {"GetEncodedUnitSizeInSamples",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetEncodedUnitSizeInSamples(0, 9, out); }, false, false,
     1},
    {"GetEncodedUnitFirstSample",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetEncodedUnitFirstSample(0, 9, out); }, false, false,
     9},
    {"GetEncodedUnitContainingSample",
     [](ISampleMapping& m, unsigned long long* out) { return m.GetEncodedUnitContainingSample(0, 9, out); }, false,
     false, 9},
};

TEST_F(SampleMap, AnswersWithoutMediaWhatNeedsNone) {
    TempFile fmtOnly(AudioFileWriter::Wave().Chunk("fmt ", Payload::FmtChunk(Payload::Fmt())).Bytes());
    TOVPtr<ISampleMapping> fresh = NewMap();
    TOVPtr<ISampleMapping> unread = NewMap();
    EXPECT_FALSE(Concrete(unread).SetFilePath(Text("/nonexistent/orlo/take.wav")));
    TOVPtr<ISampleMapping> thrown = NewMap();
    EXPECT_THROW(Concrete(thrown).SetFilePath(Text(fmtOnly.Path())), std::logic_error);

    for (ISampleMapping* map : {fresh.Get(), unread.Get(), thrown.Get()}) {
        EXPECT_EQ(map->GetNumberOfTracks(), 0u);
        for (const Slot& slot : kSlots) {
            SCOPED_TRACE(slot.name);
            unsigned long long out = 99;
            EXPECT_EQ(slot.call(*map, &out), slot.needsMedia ? ZEB_E_NOTREADY : TOV_OK);
            if (!slot.needsMedia) {
                EXPECT_EQ(out, slot.answer);
            }
        }
        unsigned int handle = 5;
        EXPECT_EQ(map->RegisterSampleRangeHint(0, 0, 10, &handle), TOV_OK);
        EXPECT_EQ(handle, 5u);
        EXPECT_EQ(map->RegisterSampleRangeHint(0, 0, 10, nullptr), TOV_OK);
        EXPECT_EQ(map->UnregisterSampleRangeHint(handle), TOV_OK);
    }

    void* later = &later;
    EXPECT_EQ(fresh->QueryInterface(IID_ISampleMapping3, &later), TOV_E_NOINTERFACE);
    EXPECT_EQ(later, nullptr);
}

TEST_F(SampleMap, RefusesANullOutWithMediaAndAnswersTheRestAsWithout) {
    TempFile file(FileBytes(kFiles[0]));
    TOVPtr<ISampleMapping> map = MapOf(file.Path());
    for (const Slot& slot : kSlots) {
        SCOPED_TRACE(slot.name);
        if (slot.testsOut) {
            EXPECT_EQ(slot.call(*map, nullptr), TOV_E_INVALIDARG);
        }
        unsigned long long out = 99;
        if (!slot.needsMedia) {
            EXPECT_EQ(slot.call(*map, &out), TOV_OK);
            EXPECT_EQ(out, slot.answer);
        }
    }
    unsigned int second = 0;
    EXPECT_EQ(map->GetSampleProperties(0, 0, nullptr, &second), TOV_E_INVALIDARG);
}

TEST_F(SampleMap, HoldsOneReferenceToItsStorageCallback) {
    TempFile file(FileBytes(kFiles[0]));
    auto* callback = new ZEB::Impl::OrloReaderStorageCallback(Text(file.Path()));
    EXPECT_EQ(callback->AddRef(), 1u);
    TOVPtr<ISampleMapping> map = NewMap();
    EXPECT_EQ(map->SetStorageCallback(nullptr), TOV_E_POINTER);
    for (int twice = 0; twice < 2; ++twice) {
        EXPECT_EQ(map->SetStorageCallback(callback), TOV_OK);
        EXPECT_EQ(References(callback), 2u);
    }
    // A file that cannot be read keeps the callback; one that can replaces it.
    EXPECT_FALSE(Concrete(map).SetFilePath(Text("/nonexistent/orlo/take.wav")));
    EXPECT_EQ(References(callback), 2u);
    EXPECT_TRUE(Concrete(map).SetFilePath(Text(file.Path())));
    EXPECT_EQ(References(callback), 1u);
    callback->Release();
}

TEST_F(SampleMap, GivesReaderThreadsTheAnswersOfOne) {
    TempFile file(FileBytes(kFiles[2]));
    TOVPtr<ISampleMapping> map = MapOf(file.Path());
    // Results and values of the reads a host makes per frame, side by side.
    using Answer = std::array<unsigned long long, 10>;
    const auto ask = [&map](unsigned long long n) {
        Answer a{};
        unsigned int channels = 0;
        a[0] = map->GetNumberOfTracks();
        a[1] = static_cast<unsigned int>(map->GetNumberOfChannels(0, &channels));
        a[2] = channels;
        a[3] = static_cast<unsigned int>(map->GetSamplePosition(1, n, &a[4]));
        a[5] = static_cast<unsigned int>(map->GetSampleSize(1, n, &a[6]));
        a[7] = static_cast<unsigned int>(map->GetNumberOfContiguousBytes(1, n, &a[8]));
        map->GetNumberOfSamples(0, &a[9]);
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
