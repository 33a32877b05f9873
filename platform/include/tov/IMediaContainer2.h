#pragma once
#include "tov/IMediaContainer.h"

inline constexpr _tovUID IID_IMediaContainer2 = {
    0x5FEB3C83, 0x08DF, 0x4CCC, {0xA9, 0xF4, 0x08, 0x3E, 0xEA, 0x2A, 0x1D, 0xAB}};

/// The host's callback for attributes found while a file is read. Its slots
/// are the host's; no container of this system calls it, so it stays opaque.
class IAttributeCallback;

/// A container that may be told where to report attributes.
class IMediaContainer2 : public IMediaContainer {
public:
    virtual TOVRESULT SetAttributeCallback(IAttributeCallback* callback) = 0;

protected:
    ~IMediaContainer2() = default;
};
