#pragma once
/// A media container: the host's door to one file. The host sets the path
/// once, asks whether the file is supported, and then asks for its clips and
/// its sample map. These first six operations are also all that a container
/// the plug-in redirects to is called by.
#include <cstdint>

#include "tov/IClips.h"
#include "tov/ISampleMapping.h"
#include "tov/ITOVString.h"
#include "tov/ITOVUnknown.h"

inline constexpr _tovUID IID_IMediaContainer = {
    0x51092B47, 0xF81C, 0x46E3, {0xB9, 0xAB, 0x37, 0x67, 0x05, 0xC7, 0x9F, 0x12}};

/// The host's own container for QuickTime movies, which takes a file that a
/// plug-in cannot read. A host need not have one.
inline constexpr _tovUID CompID_QuickTimeContainer = {
    0x781F84B7, 0xB989, 0x4534, {0x8A, 0x07, 0xC5, 0x95, 0xCB, 0x9A, 0x6F, 0xB8}};

class IMediaContainer : public ITOVUnknown {
public:
    /// 1 when this container can describe the file at its path, else 0.
    virtual int32_t IsContainerSupported() = 0;
    /// 1 when the clips come as AAF (`GetAAFMasterClips`), else 0.
    virtual int32_t IsAAFSupported() = 0;
    /// The clips as XML metadata; the caller owns the list.
    virtual TOVRESULT GetMasterClips(ITOVString* path, IClips** out) = 0;
    /// The clips as transient AAF files; the caller owns the list.
    virtual TOVRESULT GetAAFMasterClips(IAAFClips** out) = 0;
    /// The file this container describes; set once.
    virtual TOVRESULT SetFilePath(ITOVString* path) = 0;
    /// Where the file's samples lie; the caller owns the map.
    virtual TOVRESULT GetSampleMapping(ISampleMapping** out) = 0;

protected:
    ~IMediaContainer() = default;
};
