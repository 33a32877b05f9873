#include "tov/host/HostXmlParser.h"

#include "tov/host/HostText.h"
#include "tov/host/LibXmlSafety.h"
#include "tov/sdk/TOVComponent.h"

TOVRESULT HostXmlParser::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<HostXmlParser>(host, outer, iid, out);
}

TOVRESULT HostXmlParser::ParseFile(ITOVString* path) {
    return TOVGuarded([&] {
        const std::string file = HostText::Read(path);
        std::string bytes;
        if (!LibXmlSafety::ReadFile(file, bytes, m_LastError)) {
            m_Document.reset();
            return TOV_E_FILEOPEN;
        }
        // A file says its own encoding in its declaration.
        return Parse(bytes, file.c_str(), nullptr);
    });
}

TOVRESULT HostXmlParser::ParseText(ITOVString* text) {
    // Text handed over as a string is Unicode already, whatever its declaration says.
    return TOVGuarded([&] { return Parse(HostText::View(text), nullptr, "UTF-8"); });
}

TOVRESULT HostXmlParser::Parse(std::string_view bytes, const char* url, const char* encoding) {
    m_Document.reset();
    m_LastError.clear();
    if (bytes.size() > LibXmlSafety::kMaxDocumentBytes) {
        m_LastError = "the document is larger than an XML document may be";
        return TOV_E_FAIL;
    }
    xmlParserCtxtPtr context = xmlNewParserCtxt();
    if (!context) return TOV_E_OUTOFMEMORY;
    LibXmlSafety::RefuseEntities(*context->sax);
    // The tree is only ever read, so short texts may be kept inside their
    // nodes instead of in allocations of their own.
    xmlDocPtr document = xmlCtxtReadMemory(context, bytes.data(), static_cast<int>(bytes.size()), url, encoding,
                                           LibXmlSafety::kOptions | XML_PARSE_COMPACT);
    if (!document) m_LastError = LibXmlSafety::LastError(context, "the document is not well-formed XML");
    xmlFreeParserCtxt(context);
    if (!document) return TOV_E_FAIL;
    m_Document = HostXmlDocumentRef(document, xmlFreeDoc);
    return TOV_OK;
}

TOVRESULT HostXmlParser::GetRoot(ITOVUnknown** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        *out = nullptr;
        if (!m_Document) return ZEB_E_NOTREADY;
        xmlNodePtr root = xmlDocGetRootElement(m_Document.get());
        if (!root) return ZEB_E_NOTREADY;
        UTIL::ITOVXmlDomNode* node = nullptr;
        TOVCheck(HostXmlNodes::Wrap(m_Document, root, &node));
        *out = node;
        return TOV_OK;
    });
}

TOVRESULT HostXmlParser::GetLastError(ITOVString** out) {
    return TOVGuarded([&] { return HostText::Make(m_LastError, out); });
}

TOVRESULT HostXmlParser::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == UTIL::IID_ITOVXmlParser) return TOVExpose<UTIL::ITOVXmlParser>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}
