#pragma once
/// Where each sample of a file lies, so that the host reads the bytes itself.
/// A sample is one whole frame (one value per channel, interleaved); for PCM
/// an encoded unit is the same thing as a sample.
#include "tov/IStorageCallback.h"
#include "tov/ITOVUnknown.h"

inline constexpr _tovUID IID_ISampleMapping = {
    0xE0D63190, 0x0469, 0x4807, {0x92, 0xCE, 0x5C, 0x22, 0x15, 0x2F, 0x84, 0xEB}};
/// A later form of the map that the host knows; not offered here.
inline constexpr _tovUID IID_ISampleMapping3 = {
    0xD9F6B5D8, 0x2B7B, 0x4F1E, {0x90, 0xF5, 0x09, 0xA4, 0xF4, 0x4B, 0xA8, 0xEE}};

class ISampleMapping : public ITOVUnknown {
public:
    virtual unsigned int GetNumberOfTracks() const = 0;
    virtual TOVRESULT GetNumberOfChannels(unsigned int track, unsigned int* out) const = 0;
    virtual TOVRESULT GetNumberOfSamples(unsigned int track, unsigned long long* out) const = 0;
    virtual TOVRESULT GetSampleStride(unsigned int track, unsigned long long* out) const = 0;
    virtual TOVRESULT GetSampleSize(unsigned int track, unsigned long long sample, unsigned long long* out) const = 0;
    /// The byte offset of `sample` in the file.
    virtual TOVRESULT GetSamplePosition(unsigned int track, unsigned long long sample,
                                        unsigned long long* out) const = 0;
    virtual TOVRESULT GetSampleTemporalOffset(unsigned int track, unsigned long long sample,
                                              unsigned long long* out) const = 0;
    /// A flag word of the host's in `first`, and a second value.
    virtual TOVRESULT GetSampleProperties(unsigned int track, unsigned long long sample, unsigned long long* first,
                                          unsigned int* second) const = 0;
    virtual TOVRESULT GetSampleDependency(unsigned int track, unsigned long long sample, unsigned int index,
                                          unsigned long long* out) const = 0;
    virtual TOVRESULT GetNumberOfEncodedUnits(unsigned int track, unsigned long long* out) const = 0;
    virtual TOVRESULT GetEncodedUnitStride(unsigned int track, unsigned long long* out) const = 0;
    virtual TOVRESULT GetEncodedUnitPosition(unsigned int track, unsigned long long unit,
                                             unsigned long long* out) const = 0;
    virtual TOVRESULT GetEncodedUnitSizeInBytes(unsigned int track, unsigned long long unit,
                                                unsigned long long* out) const = 0;
    virtual TOVRESULT GetEncodedUnitSizeInSamples(unsigned int track, unsigned long long unit,
                                                  unsigned long long* out) const = 0;
    virtual TOVRESULT GetEncodedUnitFirstSample(unsigned int track, unsigned long long unit,
                                                unsigned long long* out) const = 0;
    virtual TOVRESULT GetEncodedUnitContainingSample(unsigned int track, unsigned long long sample,
                                                     unsigned long long* out) const = 0;
    /// How many samples from `sample` on lie one after another in the file.
    virtual TOVRESULT GetNumberOfContiguousSamples(unsigned int track, unsigned long long sample,
                                                   unsigned long long* out) const = 0;
    /// How many bytes from `sample` on can be read in one go.
    virtual TOVRESULT GetNumberOfContiguousBytes(unsigned int track, unsigned long long sample,
                                                 unsigned long long* out) const = 0;
    virtual TOVRESULT GetNumberOfContiguousEncodedUnits(unsigned int track, unsigned long long unit,
                                                        unsigned long long* out) const = 0;
    virtual TOVRESULT RegisterSampleRangeHint(unsigned int track, unsigned long long first, unsigned long long count,
                                              unsigned int* handle) = 0;
    virtual TOVRESULT UnregisterSampleRangeHint(unsigned int handle) = 0;
    /// Replaces the callback through which the file's bytes are reached.
    virtual TOVRESULT SetStorageCallback(IStorageCallback* callback) = 0;

protected:
    ~ISampleMapping() = default;
};
