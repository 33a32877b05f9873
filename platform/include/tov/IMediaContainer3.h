#pragma once
#include "tov/IMediaContainer2.h"

inline constexpr _tovUID IID_IMediaContainer3 = {
    0x13B79A3E, 0x6A3E, 0x45E3, {0xB9, 0xF6, 0xE5, 0x16, 0xCA, 0x4D, 0xF3, 0x72}};

/// A container that describes itself: what it can do and which file name
/// extensions it offers the host's file dialogs.
class IMediaContainer3 : public IMediaContainer2 {
public:
    /// A bit set whose meaning is the host's.
    virtual TOVRESULT GetCapabilities(unsigned int* out) const = 0;
    virtual unsigned int GetFileExtensionCount() const = 0;
    /// Row `index` of the extension table; each non-null out pointer receives
    /// a string the caller owns. TOV_E_OUTOFRANGE past the count.
    virtual TOVRESULT GetFileExtension(unsigned int index, ITOVString** extension, ITOVString** shortName,
                                       ITOVString** description) const = 0;

protected:
    ~IMediaContainer3() = default;
};
