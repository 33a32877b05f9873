#include "tov/host/HostXmlWriter.h"

#include "tov/host/HostText.h"
#include "tov/sdk/TOVComponent.h"

namespace {

const xmlChar* Chars(const std::string& text) { return reinterpret_cast<const xmlChar*>(text.c_str()); }

// A name that would make the output unreadable as XML is refused up front.
std::string CheckedName(ITOVString* name) {
    std::string text = HostText::Read(name);
    if (xmlValidateName(Chars(text), 0) != 0) throw static_cast<int>(TOV_E_INVALIDARG);
    return text;
}

}  // namespace

TOVRESULT HostXmlWriter::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<HostXmlWriter>(host, outer, iid, out);
}

TOVRESULT HostXmlWriter::Open(ITOVString* path) {
    return TOVGuarded([&] {
        m_Path = path ? HostText::Read(path) : std::string();
        if (path && m_Path.empty()) return TOV_E_INVALIDARG;
        m_LastByTag.clear();
        m_Document.reset(xmlNewDoc(BAD_CAST "1.0"));
        return m_Document ? TOV_OK : TOV_E_OUTOFMEMORY;
    });
}

TOVRESULT HostXmlWriter::Close() {
    return TOVGuarded([&] {
        if (!m_Document) return ZEB_E_NOTREADY;
        if (m_Path.empty()) return TOV_OK;  // a document in memory has nothing to finish
        return xmlSaveFormatFileEnc(m_Path.c_str(), m_Document.get(), "UTF-8", 1) < 0 ? TOV_E_FILEIO : TOV_OK;
    });
}

TOVRESULT HostXmlWriter::GetText(ITOVString** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        *out = nullptr;
        if (!m_Document) return ZEB_E_NOTREADY;
        xmlChar* bytes = nullptr;
        int size = 0;
        xmlDocDumpFormatMemoryEnc(m_Document.get(), &bytes, &size, "UTF-8", 1);
        if (!bytes) return TOV_E_OUTOFMEMORY;
        const std::string text(reinterpret_cast<const char*>(bytes), static_cast<size_t>(size));
        xmlFree(bytes);
        return HostText::Make(text, out);
    });
}

xmlNodePtr HostXmlWriter::LastElement(ITOVString* tag) const {
    if (!m_Document) throw static_cast<int>(ZEB_E_NOTREADY);
    const auto found = m_LastByTag.find(HostText::Read(tag));
    if (found == m_LastByTag.end()) throw static_cast<int>(ZEB_E_NOTFOUND);
    return found->second;
}

TOVRESULT HostXmlWriter::WriteElement(ITOVString* tag, ITOVString* parentTag) {
    return TOVGuarded([&] {
        if (!m_Document) return ZEB_E_NOTREADY;
        const std::string name = CheckedName(tag);
        xmlNodePtr element = nullptr;
        if (parentTag) {
            element = xmlNewChild(LastElement(parentTag), nullptr, Chars(name), nullptr);
        } else {
            if (xmlDocGetRootElement(m_Document.get())) return ZEB_E_ALREADYSET;
            element = xmlNewDocNode(m_Document.get(), nullptr, Chars(name), nullptr);
            if (element) xmlDocSetRootElement(m_Document.get(), element);
        }
        if (!element) return TOV_E_OUTOFMEMORY;
        m_LastByTag[name] = element;
        return TOV_OK;
    });
}

TOVRESULT HostXmlWriter::WriteAttribute(ITOVString* name, ITOVString* value, ITOVString* elementTag) {
    return TOVGuarded([&] {
        const std::string attribute = CheckedName(name);
        const std::string text = HostText::Read(value);
        return xmlSetProp(LastElement(elementTag), Chars(attribute), Chars(text)) ? TOV_OK : TOV_E_OUTOFMEMORY;
    });
}

TOVRESULT HostXmlWriter::WriteText(ITOVString* text, ITOVString* elementTag) {
    return TOVGuarded([&] {
        const std::string content = HostText::Read(text);
        xmlNodePtr parent = LastElement(elementTag);
        xmlNodePtr node = xmlNewText(Chars(content));
        if (!node) return TOV_E_OUTOFMEMORY;
        xmlAddChild(parent, node);
        return TOV_OK;
    });
}

TOVRESULT HostXmlWriter::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == UTIL::IID_ITOVXmlWriter) return TOVExpose<UTIL::ITOVXmlWriter>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}
