#pragma once
/// The sample map of one PCM file: where each frame lies, so that the host
/// reads the bytes itself. A sample is one whole frame, an encoded unit is a
/// sample, and every track has the same map (the track number is ignored,
/// also one out of range). After `SetFilePath` the answers come from numbers
/// alone: no file access, no allocation, no lock, so reader threads may ask
/// at once.
#include <cstdint>
#include <memory>

#include "clipmodel/Media.h"
#include "strings/ZEBString.h"
#include "tov/ISampleMapping.h"
#include "tov/IStorageCallback.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/sdk/CTOVUnknown.h"
#include "tov/sdk/TOVPtr.h"

namespace ZEB {
namespace Impl {

class OrloReaderSampleMapping : public ISampleMapping, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit OrloReaderSampleMapping(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN

    /// Reads the file's chunks once and keeps the numbers of the map, with a
    /// storage callback on the path as the default. False when the stream
    /// reports an error: no media then, and the callback held stays. Not
    /// guarded: what it throws (a stream without the chunks of a value) goes
    /// to the caller, which then holds a map without media.
    bool SetFilePath(const ZEBString& path);

    // Without media, the operations that need it answer ZEB_E_NOTREADY and
    // GetNumberOfTracks answers 0; the others answer as with media.
    unsigned int GetNumberOfTracks() const override;
    /// 1 for media not of audio type.
    TOVRESULT GetNumberOfChannels(unsigned int track, unsigned int* out) const override;
    TOVRESULT GetNumberOfSamples(unsigned int track, unsigned long long* out) const override;
    /// 0: no constant stride is offered, though frames are equidistant.
    TOVRESULT GetSampleStride(unsigned int track, unsigned long long* out) const override;
    /// Bytes per frame; 0 for media not of audio type.
    TOVRESULT GetSampleSize(unsigned int track, unsigned long long sample, unsigned long long* out) const override;
    /// Start of the sound data + bytes per frame × `sample`, with no range test.
    TOVRESULT GetSamplePosition(unsigned int track, unsigned long long sample, unsigned long long* out) const override;
    TOVRESULT GetSampleTemporalOffset(unsigned int track, unsigned long long sample,
                                      unsigned long long* out) const override;
    /// The host's flag word 2, and 0.
    TOVRESULT GetSampleProperties(unsigned int track, unsigned long long sample, unsigned long long* first,
                                  unsigned int* second) const override;
    /// Each frame depends on itself only.
    TOVRESULT GetSampleDependency(unsigned int track, unsigned long long sample, unsigned int index,
                                  unsigned long long* out) const override;
    // The encoded-unit forms call the sample forms on this object.
    TOVRESULT GetNumberOfEncodedUnits(unsigned int track, unsigned long long* out) const override;
    TOVRESULT GetEncodedUnitStride(unsigned int track, unsigned long long* out) const override;
    TOVRESULT GetEncodedUnitPosition(unsigned int track, unsigned long long unit,
                                     unsigned long long* out) const override;
    TOVRESULT GetEncodedUnitSizeInBytes(unsigned int track, unsigned long long unit,
                                        unsigned long long* out) const override;
    // These three write through `out` untested.
    TOVRESULT GetEncodedUnitSizeInSamples(unsigned int track, unsigned long long unit,
                                          unsigned long long* out) const override;
    TOVRESULT GetEncodedUnitFirstSample(unsigned int track, unsigned long long unit,
                                        unsigned long long* out) const override;
    TOVRESULT GetEncodedUnitContainingSample(unsigned int track, unsigned long long sample,
                                             unsigned long long* out) const override;
    /// Frames from `sample` to the end; 0 with TOV_E_OUTOFRANGE from the frame
    /// count on.
    TOVRESULT GetNumberOfContiguousSamples(unsigned int track, unsigned long long sample,
                                           unsigned long long* out) const override;
    /// Bytes from `sample` to the end of the sound data, from the positions of
    /// the first and last frame and the last frame's size.
    TOVRESULT GetNumberOfContiguousBytes(unsigned int track, unsigned long long sample,
                                         unsigned long long* out) const override;
    TOVRESULT GetNumberOfContiguousEncodedUnits(unsigned int track, unsigned long long unit,
                                                unsigned long long* out) const override;
    /// Hints are accepted and forgotten; `handle` is not written.
    TOVRESULT RegisterSampleRangeHint(unsigned int track, unsigned long long first, unsigned long long count,
                                      unsigned int* handle) override;
    TOVRESULT UnregisterSampleRangeHint(unsigned int handle) override;
    /// Replaces the callback held; the one held already changes nothing.
    TOVRESULT SetStorageCallback(IStorageCallback* callback) override;

    /// Keeps the host's component factory.
    TOVRESULT InitializeInstance(ITOVUnknown* host) override;
    /// ISampleMapping only: the later forms of the map are not offered.
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

private:
    /// The media, for an operation that writes through `out`: a null `out` is
    /// thrown as TOV_E_INVALIDARG, no media as ZEB_E_NOTREADY.
    const OrloReader::Media& MediaFor(const void* out) const;
    void HoldStorageCallback(IStorageCallback* callback);
    /// The media's offset of frame `n`, from the two numbers read off it once.
    uint64_t PositionOf(uint64_t n) const { return m_FrameBytes * n + m_StartPosition; }

    TOVPtr<ITOVComponentFactory> m_Factory;
    ZEBString m_Path;
    TOVPtr<IStorageCallback> m_StorageCallback;
    /// Null until SetFilePath has read the file; never changed afterwards.
    std::shared_ptr<OrloReader::Media> m_Media;
    // Frame 0's size and offset as the media gives them (0 bytes a frame for
    // media not of audio type), kept plain so that a position is a multiply
    // and an add, with no call into the media.
    uint32_t m_FrameBytes = 0;
    uint64_t m_StartPosition = 0;
};

}  // namespace Impl
}  // namespace ZEB
