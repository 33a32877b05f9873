#include "tov/host/HostXmlSaxParser.h"

#include <libxml/parserInternals.h>

#include <cstring>

#include "tov/host/HostText.h"
#include "tov/host/LibXmlSafety.h"
#include "tov/sdk/TOVComponent.h"

namespace {

std::string Text(const xmlChar* begin, const xmlChar* end) {
    return std::string(reinterpret_cast<const char*>(begin), reinterpret_cast<const char*>(end));
}

std::string QualifiedName(const xmlChar* prefix, const xmlChar* localName) {
    std::string name = reinterpret_cast<const char*>(localName);
    if (prefix) name = std::string(reinterpret_cast<const char*>(prefix)) + ":" + name;
    return name;
}

}  // namespace

TOVRESULT HostXmlSaxParser::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<HostXmlSaxParser>(host, outer, iid, out);
}

TOVRESULT HostXmlSaxParser::SetDocumentHandler(UTIL::ITOVSaxDocumentHandler* handler) {
    m_DocumentHandler.Assign(handler);
    return TOV_OK;
}

TOVRESULT HostXmlSaxParser::SetErrorHandler(UTIL::ITOVSaxErrorHandler* handler) {
    m_ErrorHandler.Assign(handler);
    return TOV_OK;
}

TOVRESULT HostXmlSaxParser::Parse(ITOVString* text, ITOVString* path) {
    return TOVGuarded([&] {
        m_LastError.clear();
        if (text) return ParseBytes(HostText::Read(text), nullptr, true);
        const std::string file = HostText::Read(path);
        std::string bytes;
        if (!LibXmlSafety::ReadFile(file, bytes, m_LastError)) return TOV_E_FILEOPEN;
        return ParseBytes(bytes, file.c_str(), false);
    });
}

TOVRESULT HostXmlSaxParser::ParseBytes(const std::string& bytes, const char* url, bool isUnicodeText) {
    if (bytes.size() > LibXmlSafety::kMaxDocumentBytes) {
        m_LastError = "the document is larger than an XML document may be";
        return TOV_E_FAIL;
    }
    // Only our callbacks: nothing builds a tree, and only the SAX2 error channel reports.
    xmlSAXHandler sax;
    std::memset(&sax, 0, sizeof sax);
    sax.initialized = XML_SAX2_MAGIC;
    sax.startDocument = OnStartDocument;
    sax.endDocument = OnEndDocument;
    sax.startElementNs = OnStartElement;
    sax.endElementNs = OnEndElement;
    sax.characters = OnCharacters;
    sax.cdataBlock = OnCharacters;
    sax.ignorableWhitespace = OnCharacters;
    sax.entityDecl = OnEntityDeclaration;
    sax.serror = OnError;

    m_Context = xmlCreatePushParserCtxt(&sax, this, nullptr, 0, url);
    if (!m_Context) return TOV_E_OUTOFMEMORY;
    xmlCtxtUseOptions(m_Context, XML_PARSE_NONET);
    if (isUnicodeText) xmlSwitchEncoding(m_Context, XML_CHAR_ENCODING_UTF8);
    m_HandlerResult = TOV_OK;
    m_Reported = false;
    m_Depth = 0;
    xmlParseChunk(m_Context, bytes.data(), static_cast<int>(bytes.size()), 1);
    const bool wellFormed = m_Context->wellFormed != 0;
    if (!wellFormed && m_HandlerResult >= 0) {
        m_LastError = LibXmlSafety::LastError(m_Context, "the document is not well-formed XML");
        if (!m_Reported) ReportError(XML_ERR_FATAL, m_LastError);
    }
    // libxml2 keeps declarations of a DTD in a document of its own even for SAX.
    if (m_Context->myDoc) {
        xmlFreeDoc(m_Context->myDoc);
        m_Context->myDoc = nullptr;
    }
    xmlFreeParserCtxt(m_Context);
    m_Context = nullptr;
    if (m_HandlerResult < 0) return m_HandlerResult;
    return wellFormed ? TOV_OK : TOV_E_FAIL;
}

template <class Call>
void HostXmlSaxParser::Deliver(Call&& call) {
    if (!m_DocumentHandler || m_HandlerResult < 0) return;
    const TOVRESULT result = TOVGuarded(std::forward<Call>(call));
    if (result < 0) {
        m_HandlerResult = result;
        m_LastError = "the document handler stopped the parse";
        xmlStopParser(m_Context);
    }
}

void HostXmlSaxParser::OnStartDocument(void* self) {
    auto* parser = static_cast<HostXmlSaxParser*>(self);
    parser->Deliver([&] { return parser->m_DocumentHandler->Start(); });
}

void HostXmlSaxParser::OnEndDocument(void* self) {
    auto* parser = static_cast<HostXmlSaxParser*>(self);
    parser->Deliver([&] { return parser->m_DocumentHandler->End(); });
}

void HostXmlSaxParser::OnStartElement(void* self, const xmlChar* localName, const xmlChar* prefix, const xmlChar*, int,
                                      const xmlChar**, int attributeCount, int, const xmlChar** attributes) {
    auto* parser = static_cast<HostXmlSaxParser*>(self);
    if (++parser->m_Depth > LibXmlSafety::kMaxDepth && parser->m_HandlerResult >= 0) {
        parser->m_HandlerResult = TOV_E_FAIL;
        parser->m_LastError = "the document nests deeper than " + std::to_string(LibXmlSafety::kMaxDepth) + " elements";
        parser->ReportError(XML_ERR_FATAL, parser->m_LastError);
        xmlStopParser(parser->m_Context);
        return;
    }
    parser->Deliver([&] {
        TOVPtr<ITOVString> name;
        TOVCheck(HostText::Make(QualifiedName(prefix, localName), name.OutT()));
        TOVCheck(parser->m_DocumentHandler->Element(name.Get()));
        // Five pointers per attribute: local name, prefix, URI, value start, value end.
        for (int i = 0; i < attributeCount; ++i) {
            const xmlChar** a = attributes + 5 * i;
            TOVPtr<ITOVString> attributeName;
            TOVPtr<ITOVString> value;
            TOVCheck(HostText::Make(QualifiedName(a[1], a[0]), attributeName.OutT()));
            TOVCheck(HostText::Make(Text(a[3], a[4]), value.OutT()));
            TOVCheck(parser->m_DocumentHandler->Attribute(attributeName.Get(), value.Get()));
        }
        return TOV_OK;
    });
}

void HostXmlSaxParser::OnEndElement(void* self, const xmlChar*, const xmlChar*, const xmlChar*) {
    --static_cast<HostXmlSaxParser*>(self)->m_Depth;
}

void HostXmlSaxParser::OnCharacters(void* self, const xmlChar* text, int length) {
    auto* parser = static_cast<HostXmlSaxParser*>(self);
    parser->Deliver([&] {
        TOVPtr<ITOVString> piece;
        TOVCheck(HostText::Make(Text(text, text + length), piece.OutT()));
        return parser->m_DocumentHandler->Text(piece.Get());
    });
}

void HostXmlSaxParser::OnEntityDeclaration(void* self, const xmlChar*, int, const xmlChar*, const xmlChar*, xmlChar*) {
    LibXmlSafety::StopAtEntity(static_cast<HostXmlSaxParser*>(self)->m_Context);
}

void HostXmlSaxParser::OnError(void* self, xmlErrorPtr error) {
    if (!error) return;
    auto* parser = static_cast<HostXmlSaxParser*>(self);
    std::string message = error->message ? error->message : "unknown error";
    while (!message.empty() && message.back() == '\n') message.pop_back();
    if (error->line > 0) message = "line " + std::to_string(error->line) + ": " + message;
    parser->ReportError(error->level, message);
}

void HostXmlSaxParser::ReportError(int level, const std::string& message) {
    m_Reported = true;
    if (!m_ErrorHandler) return;
    // The handler owns the message it is given.
    ITOVString* text = nullptr;
    if (HostText::Make(message, &text) < 0) return;
    if (level == XML_ERR_WARNING)
        m_ErrorHandler->Warning(text);
    else if (level == XML_ERR_ERROR)
        m_ErrorHandler->Error(text);
    else
        m_ErrorHandler->FatalError(text);
}

TOVRESULT HostXmlSaxParser::GetLastError(ITOVString** out) {
    return TOVGuarded([&] { return HostText::Make(m_LastError, out); });
}

TOVRESULT HostXmlSaxParser::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == UTIL::IID_ITOVXmlSaxParser) return TOVExpose<UTIL::ITOVXmlSaxParser>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}
