#pragma once
/// The host's SAX reader over libxml2 (CompID_TOVXmlSaxReader).
#include <libxml/parser.h>

#include <string>

#include "tov/ITOVXmlSax.h"
#include "tov/sdk/CTOVUnknown.h"
#include "tov/sdk/TOVPtr.h"

inline constexpr _tovUID CLSID_HostXmlSaxParser = {
    0xD3952F8C, 0xC059, 0x4AAF, {0x8B, 0x43, 0x70, 0xAB, 0x30, 0x29, 0xD6, 0x1E}};

class HostXmlSaxParser : public UTIL::ITOVXmlSaxParser, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit HostXmlSaxParser(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN
    TOVRESULT SetDocumentHandler(UTIL::ITOVSaxDocumentHandler* handler) override;
    TOVRESULT SetErrorHandler(UTIL::ITOVSaxErrorHandler* handler) override;
    TOVRESULT Parse(ITOVString* text, ITOVString* path) override;
    TOVRESULT GetLastError(ITOVString** out) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

private:
    TOVRESULT ParseBytes(const std::string& bytes, const char* url, bool isUnicodeText);

    // libxml2 callbacks; the user data is this parser.
    static void OnStartDocument(void* self);
    static void OnEndDocument(void* self);
    static void OnStartElement(void* self, const xmlChar* localName, const xmlChar* prefix, const xmlChar* uri,
                               int namespaceCount, const xmlChar** namespaces, int attributeCount, int defaultedCount,
                               const xmlChar** attributes);
    static void OnEndElement(void* self, const xmlChar*, const xmlChar*, const xmlChar*);
    static void OnCharacters(void* self, const xmlChar* text, int length);
    static void OnEntityDeclaration(void* self, const xmlChar*, int, const xmlChar*, const xmlChar*, xmlChar*);
    static void OnError(void* self, xmlErrorPtr error);

    /// Runs one handler call; a failure stops the parse and is kept.
    template <class Call>
    void Deliver(Call&& call);
    void ReportError(int level, const std::string& message);

    TOVPtr<UTIL::ITOVSaxDocumentHandler> m_DocumentHandler;
    TOVPtr<UTIL::ITOVSaxErrorHandler> m_ErrorHandler;
    xmlParserCtxtPtr m_Context = nullptr;
    TOVRESULT m_HandlerResult = TOV_OK;
    bool m_Reported = false;
    int m_Depth = 0;
    std::string m_LastError;
};
