#pragma once
/// The host's DOM reader. A document that declares entities, nests deeper than
/// 256 elements, or is larger than 64 MiB is refused: files arrive from
/// anywhere, and nothing outside the text may be reached while reading it.
#include "tov/ITOVString.h"
#include "tov/ITOVUnknown.h"

namespace UTIL {

inline constexpr _tovUID IID_ITOVXmlParser = {
    0x02BAE621, 0x8A36, 0x4C17, {0x87, 0xDD, 0xA5, 0x7F, 0x43, 0xB0, 0xC5, 0x03}};
inline constexpr _tovUID CompID_TOVXmlReader = {
    0x56542293, 0x7981, 0x4D89, {0x83, 0x47, 0x22, 0xAD, 0x21, 0x54, 0x2D, 0xB3}};

class ITOVXmlParser : public ITOVUnknown {
public:
    /// Parses the file at `path`; TOV_E_FILEOPEN when it cannot be read,
    /// TOV_E_FAIL when it is not acceptable XML (GetLastError says why).
    virtual TOVRESULT ParseFile(ITOVString* path) = 0;
    /// Parses a document held in `text`.
    virtual TOVRESULT ParseText(ITOVString* text) = 0;
    /// An object whose ITOVXmlDomNode is the document element; ZEB_E_NOTREADY
    /// before a successful parse.
    virtual TOVRESULT GetRoot(ITOVUnknown** out) = 0;
    /// The reason of the last failed parse, empty after a success.
    virtual TOVRESULT GetLastError(ITOVString** out) = 0;

protected:
    ~ITOVXmlParser() = default;
};

}  // namespace UTIL
