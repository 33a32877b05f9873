#pragma once
/// The host's XML writer over a libxml2 tree (CompID_TOVXmlWriter).
#include <libxml/tree.h>

#include <map>
#include <memory>
#include <string>

#include "tov/ITOVXmlWriter.h"
#include "tov/sdk/CTOVUnknown.h"

inline constexpr _tovUID CLSID_HostXmlWriter = {
    0x5C726B26, 0x68CD, 0x4B2A, {0x8D, 0xAE, 0x97, 0x19, 0xDA, 0x1B, 0xA4, 0x8E}};

class HostXmlWriter : public UTIL::ITOVXmlWriter, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit HostXmlWriter(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN
    TOVRESULT Open(ITOVString* path) override;
    TOVRESULT Close() override;
    TOVRESULT GetText(ITOVString** out) override;
    TOVRESULT WriteAttribute(ITOVString* name, ITOVString* value, ITOVString* elementTag) override;
    TOVRESULT WriteElement(ITOVString* tag, ITOVString* parentTag) override;
    TOVRESULT WriteText(ITOVString* text, ITOVString* elementTag) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

private:
    /// The element last written with `tag`; throws ZEB_E_NOTFOUND, or
    /// ZEB_E_NOTREADY before Open.
    xmlNodePtr LastElement(ITOVString* tag) const;

    std::unique_ptr<xmlDoc, void (*)(xmlDocPtr)> m_Document{nullptr, xmlFreeDoc};
    std::string m_Path;
    std::map<std::string, xmlNodePtr> m_LastByTag;
};
