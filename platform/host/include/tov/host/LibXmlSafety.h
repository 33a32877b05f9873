#pragma once
/// How the host reads XML that arrives from anywhere: no network, no external
/// entities or DTDs loaded, no entity declarations at all (which rules out
/// entity expansion attacks), libxml2's default nesting limit of 256, and a
/// bound on the document's size.
#include <libxml/parser.h>

#include <cstddef>
#include <string>

class LibXmlSafety {
public:
    static constexpr size_t kMaxDocumentBytes = size_t(64) << 20;
    /// libxml2 enforces this depth while it builds a tree; a SAX reader counts itself.
    static constexpr int kMaxDepth = 256;
    /// Parser options: never XML_PARSE_NOENT, XML_PARSE_DTDLOAD or XML_PARSE_HUGE.
    /// Whitespace-only text between elements is indentation, not content, and
    /// is left out of the tree; text of a leaf element and mixed content stay whole.
    static constexpr int kOptions = XML_PARSE_NONET | XML_PARSE_NOERROR | XML_PARSE_NOWARNING | XML_PARSE_NOBLANKS;

    /// Makes `sax` refuse entity declarations by stopping the parse. The
    /// handler's user data must be the parser context.
    static void RefuseEntities(xmlSAXHandler& sax);
    /// Ends the parse of `context` as refused, for handlers whose user data is
    /// not their context.
    static void StopAtEntity(xmlParserCtxtPtr context);

    /// Reads a whole file, refusing one larger than kMaxDocumentBytes. On
    /// failure returns false and says why in `error`.
    static bool ReadFile(const std::string& path, std::string& bytes, std::string& error);
    /// The last error of `context` as one line, or `fallback`.
    static std::string LastError(xmlParserCtxtPtr context, const char* fallback);
};
