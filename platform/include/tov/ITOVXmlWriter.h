#pragma once
/// The host's XML writer: elements are placed by the tag of their parent, so
/// no end operation is needed.
#include "tov/ITOVString.h"
#include "tov/ITOVUnknown.h"

namespace UTIL {

inline constexpr _tovUID IID_ITOVXmlWriter = {
    0x93B7F857, 0x263B, 0x463E, {0x9E, 0xF9, 0x9C, 0x66, 0xAC, 0x80, 0xC5, 0x1C}};
inline constexpr _tovUID CompID_TOVXmlWriter = {
    0xB2DF3638, 0x109F, 0x4C00, {0x8B, 0xD5, 0xF3, 0x11, 0x7B, 0x79, 0xB5, 0x83}};

class ITOVXmlWriter : public ITOVUnknown {
public:
    /// Starts a document, written to `path` at Close, or kept in memory when null.
    virtual TOVRESULT Open(ITOVString* path) = 0;
    /// Writes the document to its file; TOV_E_FILEIO when that fails.
    virtual TOVRESULT Close() = 0;
    /// The document as UTF-8 text with a declaration, indented.
    virtual TOVRESULT GetText(ITOVString** out) = 0;
    /// Adds an attribute to the element last written with tag `elementTag`;
    /// ZEB_E_NOTFOUND when there is none.
    virtual TOVRESULT WriteAttribute(ITOVString* name, ITOVString* value, ITOVString* elementTag) = 0;
    /// Adds an element under the element last written with `parentTag`, or as
    /// the root when `parentTag` is null (ZEB_E_ALREADYSET for a second root).
    virtual TOVRESULT WriteElement(ITOVString* tag, ITOVString* parentTag) = 0;
    virtual TOVRESULT WriteText(ITOVString* text, ITOVString* elementTag) = 0;

protected:
    ~ITOVXmlWriter() = default;
};

}  // namespace UTIL
