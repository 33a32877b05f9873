#pragma once
/// The host's DOM reader over libxml2 (CompID_TOVXmlReader).
#include <string>
#include <string_view>

#include "tov/ITOVXmlParser.h"
#include "tov/host/HostXmlNodeBase.h"

inline constexpr _tovUID CLSID_HostXmlParser = {
    0xEE6F3910, 0x8BC8, 0x4982, {0xA6, 0xDA, 0x8F, 0x34, 0xDE, 0x54, 0x45, 0x49}};

class HostXmlParser : public UTIL::ITOVXmlParser, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit HostXmlParser(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN
    TOVRESULT ParseFile(ITOVString* path) override;
    TOVRESULT ParseText(ITOVString* text) override;
    TOVRESULT GetRoot(ITOVUnknown** out) override;
    TOVRESULT GetLastError(ITOVString** out) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

private:
    /// `encoding` overrides the document's declaration when not null.
    TOVRESULT Parse(std::string_view bytes, const char* url, const char* encoding);

    HostXmlDocumentRef m_Document;
    std::string m_LastError;
};
