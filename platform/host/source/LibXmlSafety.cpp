#include "tov/host/LibXmlSafety.h"

#include <cerrno>
#include <cstdio>
#include <cstring>

namespace {

constexpr char kEntityRefusal[] = "entity declarations are not accepted";

void RefuseEntityDeclaration(void* context, const xmlChar*, int, const xmlChar*, const xmlChar*, xmlChar*) {
    LibXmlSafety::StopAtEntity(static_cast<xmlParserCtxtPtr>(context));
}

}  // namespace

void LibXmlSafety::StopAtEntity(xmlParserCtxtPtr parser) {
    // A fatal error of our own, so the parse ends as for malformed text.
    xmlStopParser(parser);
    parser->wellFormed = 0;
    xmlResetError(&parser->lastError);
    parser->lastError.domain = XML_FROM_PARSER;
    parser->lastError.code = XML_ERR_ENTITY_BOUNDARY;
    parser->lastError.level = XML_ERR_FATAL;
    parser->lastError.message = reinterpret_cast<char*>(xmlStrdup(BAD_CAST kEntityRefusal));
}

void LibXmlSafety::RefuseEntities(xmlSAXHandler& sax) { sax.entityDecl = RefuseEntityDeclaration; }

bool LibXmlSafety::ReadFile(const std::string& path, std::string& bytes, std::string& error) {
    FILE* file = std::fopen(path.c_str(), "rb");
    if (!file) {
        error = "cannot open " + path + ": " + std::strerror(errno);
        return false;
    }
    bytes.clear();
    char buffer[65536];
    size_t got = 0;
    bool ok = true;
    while ((got = std::fread(buffer, 1, sizeof buffer, file)) > 0) {
        if (bytes.size() + got > kMaxDocumentBytes) {
            error = path + " is larger than an XML document may be";
            ok = false;
            break;
        }
        bytes.append(buffer, got);
    }
    if (ok && std::ferror(file)) {
        error = "cannot read " + path;
        ok = false;
    }
    std::fclose(file);
    return ok;
}

std::string LibXmlSafety::LastError(xmlParserCtxtPtr context, const char* fallback) {
    const xmlError* last = context ? &context->lastError : nullptr;
    if (!last || !last->message) return fallback;
    std::string text = last->message;
    while (!text.empty() && (text.back() == '\n' || text.back() == ' ')) text.pop_back();
    if (last->line > 0) text = "line " + std::to_string(last->line) + ": " + text;
    return text;
}
