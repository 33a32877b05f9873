#pragma once
/// Lists of clips that a container hands out: as XML metadata (`IClips`) or as
/// transient AAF files (`IAAFClips`). The two stand side by side.
#include "aaf/IAAFFile.h"
#include "tov/ITOVUnknown.h"
#include "tov/ITOVXmlParser.h"

inline constexpr _tovUID IID_IClips = {0x90E02BBB, 0x891A, 0x4A05, {0x86, 0x64, 0x8A, 0x3A, 0xE5, 0x4F, 0x46, 0x5A}};
inline constexpr _tovUID IID_IAAFClips = {0xCC4FD2EB, 0xC226, 0x48B5, {0xBA, 0xAF, 0xE3, 0xFB, 0xF9, 0x9C, 0xB7, 0x97}};

class IClips : public ITOVUnknown {
public:
    virtual unsigned int Count() = 0;
    /// Clip `index` as a parsed XML document; the caller owns the reference.
    virtual TOVRESULT GetMetadata(unsigned int index, UTIL::ITOVXmlParser** out) = 0;

protected:
    ~IClips() = default;
};

class IAAFClips : public ITOVUnknown {
public:
    virtual unsigned int Count() = 0;
    /// Clip `index` as a transient AAF file; the caller owns the reference.
    virtual TOVRESULT GetMetadata(unsigned int index, IAAFFile** out) = 0;

protected:
    ~IAAFClips() = default;
};
