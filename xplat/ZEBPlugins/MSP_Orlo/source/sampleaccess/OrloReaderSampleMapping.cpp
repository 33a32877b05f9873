#include "sampleaccess/OrloReaderSampleMapping.h"

#include <cstdint>

#include "reader/ByteSwap.h"
#include "reader/OrloStream.h"
#include "sampleaccess/OrloReaderStorageCallback.h"
#include "tov/sdk/TOVComponent.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

namespace {

// The mask the map has always passed (the fmt and SSND bits); any mask but 0
// reads every chunk.
constexpr unsigned int kMapChunks = 130;

// The map's own media carries no timecode: every field 0, no frame count.
const OrloReader::TimeCodeInfo kNoStart(0, 0, 0, 0, 0, false, -1);

}  // namespace

TOVRESULT OrloReaderSampleMapping::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<OrloReaderSampleMapping>(host, outer, iid, out);
}

TOVRESULT OrloReaderSampleMapping::InitializeInstance(ITOVUnknown* host) {
    return TOVGuarded([&] {
        if (!host) throw static_cast<int>(TOV_E_POINTER);
        TOVCheck(host->QueryInterface(IID_ITOVComponentFactory, m_Factory.Out()));
        return TOV_OK;
    });
}

TOVRESULT OrloReaderSampleMapping::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == IID_ISampleMapping) return TOVExpose<ISampleMapping>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}

bool OrloReaderSampleMapping::SetFilePath(const ZEBString& path) {
    m_Path = path;
    m_Media.reset();
    ZEBString utf8(path);
    utf8.ConvertTo(kTOVUnicodeUTF8);
    const Orlo::OrloStream stream(reinterpret_cast<const char*>(utf8.GetUTF8String()), kMapChunks);
    if (stream.GetError() != nullptr) return false;

    // A stream without the chunks of a value throws here, and no media is kept.
    const double sampleRate = stream.GetSampleRate();
    const uint32_t frameBytes = static_cast<uint32_t>(stream.GetChannelCount()) * stream.GetSampleSize();
    const uint32_t channels = stream.GetChannelCount();
    const uint32_t bits = stream.GetBitsPerSample();
    const bool swapBytes = stream.GetIsDataWrongEndian() && HelperFunctions::IAmLittleEndian();
    const bool floatingPoint = stream.GetIsDataFloatingPoint();
    const uint64_t start = static_cast<uint64_t>(stream.GetStartPosition());
    auto descriptor =
        std::make_shared<OrloReader::AudioMediaDescriptor>(OrloReader::kAudioFormatPCM, sampleRate, frameBytes,
                                                           frameBytes, channels, bits, swapBytes, floatingPoint, start);
    m_Media = std::make_shared<OrloReader::Media>(std::move(descriptor), OrloReader::kMediaTypeAudio, kNoStart,
                                                  stream.GetSampleSize(), stream.GetSampleCount());
    m_FrameBytes = m_Media->GetSampleSize(0);
    m_StartPosition = m_Media->GetSampleOffset(0);

    HoldStorageCallback(new OrloReaderStorageCallback(path));
    return true;
}

const OrloReader::Media& OrloReaderSampleMapping::MediaFor(const void* out) const {
    if (!out) throw static_cast<int>(TOV_E_INVALIDARG);
    if (!m_Media) throw static_cast<int>(ZEB_E_NOTREADY);
    return *m_Media;
}

unsigned int OrloReaderSampleMapping::GetNumberOfTracks() const {
    return m_Media ? m_Media->GetSoundDescriptor()->GetChannelsPerFrame() : 0;
}

TOVRESULT OrloReaderSampleMapping::GetNumberOfChannels(unsigned int, unsigned int* out) const {
    return TOVGuarded([&] {
        const OrloReader::Media& media = MediaFor(out);
        *out = media.GetType() == OrloReader::kMediaTypeAudio ? media.GetSoundDescriptor()->GetChannelsPerFrame() : 1;
        return TOV_OK;
    });
}

TOVRESULT OrloReaderSampleMapping::GetNumberOfSamples(unsigned int, unsigned long long* out) const {
    return TOVGuarded([&] {
        *out = MediaFor(out).GetSampleCount();
        return TOV_OK;
    });
}

TOVRESULT OrloReaderSampleMapping::GetSampleStride(unsigned int, unsigned long long* out) const {
    if (!out) return TOV_E_INVALIDARG;
    *out = 0;
    return TOV_OK;
}

TOVRESULT OrloReaderSampleMapping::GetSampleSize(unsigned int, unsigned long long sample,
                                                 unsigned long long* out) const {
    return TOVGuarded([&] {
        *out = MediaFor(out).GetSampleSize(sample);
        return TOV_OK;
    });
}

TOVRESULT OrloReaderSampleMapping::GetSamplePosition(unsigned int, unsigned long long sample,
                                                     unsigned long long* out) const {
    return TOVGuarded([&] {
        MediaFor(out);
        *out = PositionOf(sample);
        return TOV_OK;
    });
}

TOVRESULT OrloReaderSampleMapping::GetSampleTemporalOffset(unsigned int, unsigned long long,
                                                           unsigned long long* out) const {
    return TOVGuarded([&] {
        MediaFor(out);
        *out = 0;
        return TOV_OK;
    });
}

TOVRESULT OrloReaderSampleMapping::GetSampleProperties(unsigned int, unsigned long long, unsigned long long* first,
                                                       unsigned int* second) const {
    if (!first || !second) return TOV_E_INVALIDARG;
    *first = 2;
    *second = 0;
    return TOV_OK;
}

TOVRESULT OrloReaderSampleMapping::GetSampleDependency(unsigned int, unsigned long long sample, unsigned int,
                                                       unsigned long long* out) const {
    if (!out) return TOV_E_INVALIDARG;
    *out = sample;
    return TOV_OK;
}

TOVRESULT OrloReaderSampleMapping::GetNumberOfEncodedUnits(unsigned int track, unsigned long long* out) const {
    return TOVGuarded([&] { return GetNumberOfSamples(track, out); });
}

TOVRESULT OrloReaderSampleMapping::GetEncodedUnitStride(unsigned int track, unsigned long long* out) const {
    return TOVGuarded([&] { return GetSampleStride(track, out); });
}

TOVRESULT OrloReaderSampleMapping::GetEncodedUnitPosition(unsigned int track, unsigned long long unit,
                                                          unsigned long long* out) const {
    return TOVGuarded([&] { return GetSamplePosition(track, unit, out); });
}

TOVRESULT OrloReaderSampleMapping::GetEncodedUnitSizeInBytes(unsigned int track, unsigned long long unit,
                                                             unsigned long long* out) const {
    return TOVGuarded([&] { return GetSampleSize(track, unit, out); });
}

TOVRESULT OrloReaderSampleMapping::GetEncodedUnitSizeInSamples(unsigned int, unsigned long long,
                                                               unsigned long long* out) const {
    *out = 1;
    return TOV_OK;
}

TOVRESULT OrloReaderSampleMapping::GetEncodedUnitFirstSample(unsigned int, unsigned long long unit,
                                                             unsigned long long* out) const {
    *out = unit;
    return TOV_OK;
}

TOVRESULT OrloReaderSampleMapping::GetEncodedUnitContainingSample(unsigned int, unsigned long long sample,
                                                                  unsigned long long* out) const {
    *out = sample;
    return TOV_OK;
}

TOVRESULT OrloReaderSampleMapping::GetNumberOfContiguousSamples(unsigned int, unsigned long long sample,
                                                                unsigned long long* out) const {
    return TOVGuarded([&] {
        *out = MediaFor(out).GetNumberOfContiguousSamples(sample);
        return *out == 0 ? TOV_E_OUTOFRANGE : TOV_OK;
    });
}

TOVRESULT OrloReaderSampleMapping::GetNumberOfContiguousBytes(unsigned int, unsigned long long sample,
                                                              unsigned long long* out) const {
    return TOVGuarded([&] {
        const OrloReader::Media& media = MediaFor(out);
        const uint64_t count = media.GetNumberOfContiguousSamples(sample);
        if (count == 0) {
            *out = 0;
            return TOV_E_OUTOFRANGE;
        }
        const uint64_t last = sample + count - 1;
        const uint64_t firstPosition = PositionOf(sample);
        const uint64_t lastPosition = PositionOf(last);
        // Only an overflow of the positions runs backwards.
        if (lastPosition < firstPosition) return TOV_E_UNEXPECTED;
        *out = lastPosition - firstPosition + media.GetSampleSize(last);
        return TOV_OK;
    });
}

TOVRESULT OrloReaderSampleMapping::GetNumberOfContiguousEncodedUnits(unsigned int track, unsigned long long unit,
                                                                     unsigned long long* out) const {
    return TOVGuarded([&] { return GetNumberOfContiguousSamples(track, unit, out); });
}

TOVRESULT OrloReaderSampleMapping::RegisterSampleRangeHint(unsigned int, unsigned long long, unsigned long long,
                                                           unsigned int*) {
    return TOV_OK;
}

TOVRESULT OrloReaderSampleMapping::UnregisterSampleRangeHint(unsigned int) { return TOV_OK; }

TOVRESULT OrloReaderSampleMapping::SetStorageCallback(IStorageCallback* callback) {
    if (!callback) return TOV_E_POINTER;
    HoldStorageCallback(callback);
    return TOV_OK;
}

void OrloReaderSampleMapping::HoldStorageCallback(IStorageCallback* callback) {
    if (callback != m_StorageCallback.Get()) m_StorageCallback.Assign(callback);
}

}  // namespace Impl
}  // namespace ZEB
