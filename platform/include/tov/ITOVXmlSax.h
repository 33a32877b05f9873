#pragma once
/// The host's SAX reader and the two handlers it reports to. It refuses
/// documents as the DOM reader does.
#include "tov/ITOVString.h"
#include "tov/ITOVUnknown.h"

namespace UTIL {

inline constexpr _tovUID IID_ITOVSaxDocumentHandler = {
    0x76573EBA, 0x0E3A, 0x4EBA, {0xB9, 0xB5, 0xC8, 0xA5, 0x94, 0xAC, 0xD9, 0xE1}};
inline constexpr _tovUID IID_ITOVSaxErrorHandler = {
    0x66A7051E, 0x3559, 0x41B9, {0x94, 0xF5, 0x5B, 0xD4, 0x54, 0x1B, 0xA3, 0x66}};
inline constexpr _tovUID IID_ITOVXmlSaxParser = {
    0x8D0C6B2E, 0x53F1, 0x4A97, {0xB2, 0x4E, 0x1C, 0x6F, 0x90, 0x3A, 0x7D, 0x25}};
inline constexpr _tovUID CompID_TOVXmlSaxReader = {
    0x3C9E5A71, 0xD48B, 0x4F26, {0x8E, 0x0A, 0x67, 0xB3, 0x2C, 0x59, 0xF1, 0x84}};

/// Called in document order. Strings are lent for the call only.
class ITOVSaxDocumentHandler : public ITOVUnknown {
public:
    virtual TOVRESULT Start() = 0;
    virtual TOVRESULT End() = 0;
    /// An element opens; its attributes follow, one call each.
    virtual TOVRESULT Element(ITOVString* name) = 0;
    virtual TOVRESULT Attribute(ITOVString* name, ITOVString* value) = 0;
    /// Character data of the current element, possibly in several pieces.
    virtual TOVRESULT Text(ITOVString* text) = 0;

protected:
    ~ITOVSaxDocumentHandler() = default;
};

/// Each operation owns its message: it releases it.
class ITOVSaxErrorHandler : public ITOVUnknown {
public:
    virtual TOVRESULT Warning(ITOVString* message) = 0;
    virtual TOVRESULT Error(ITOVString* message) = 0;
    virtual TOVRESULT FatalError(ITOVString* message) = 0;

protected:
    ~ITOVSaxErrorHandler() = default;
};

class ITOVXmlSaxParser : public ITOVUnknown {
public:
    /// The parser keeps a reference to each handler until it is replaced or dies.
    virtual TOVRESULT SetDocumentHandler(ITOVSaxDocumentHandler* handler) = 0;
    virtual TOVRESULT SetErrorHandler(ITOVSaxErrorHandler* handler) = 0;
    /// Parses `text` when it is given, else the file at `path`. A failing
    /// result of a document handler stops the parse and is returned; a
    /// malformed document is TOV_E_FAIL, an unreadable file TOV_E_FILEOPEN.
    virtual TOVRESULT Parse(ITOVString* text, ITOVString* path) = 0;
    /// The reason of the last failed parse, empty after a success.
    virtual TOVRESULT GetLastError(ITOVString** out) = 0;

protected:
    ~ITOVXmlSaxParser() = default;
};

}  // namespace UTIL
