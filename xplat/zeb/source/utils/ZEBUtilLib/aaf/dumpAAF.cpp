#include "dumpAAF.h"

#include <cstdio>
#include <string>

#include "AAFComPtr.h"
#include "AAFTreeReader.h"

namespace ZEB {

namespace {

std::string JsonString(const std::string& text) {
    std::string out = "\"";
    for (unsigned char c : text) {
        switch (c) {
            case '"':
                out += "\\\"";
                break;
            case '\\':
                out += "\\\\";
                break;
            case '\n':
                out += "\\n";
                break;
            case '\r':
                out += "\\r";
                break;
            case '\t':
                out += "\\t";
                break;
            default:
                if (c < 0x20) {
                    char escaped[8];
                    std::snprintf(escaped, sizeof escaped, "\\u%04x", c);
                    out += escaped;
                } else {
                    out += static_cast<char>(c);
                }
        }
    }
    return out + "\"";
}

void WriteJson(const AAFDumpNode& node, std::ostream& out, int depth) {
    const std::string pad(static_cast<size_t>(depth + 1) * 2, ' ');
    const std::string close(static_cast<size_t>(depth) * 2, ' ');
    switch (node.kind) {
        case AAFDumpNode::Kind::Number:
            out << node.value;
            return;
        case AAFDumpNode::Kind::Text:
            out << JsonString(node.value);
            return;
        case AAFDumpNode::Kind::List:
            if (node.items.empty()) {
                out << "[]";
                return;
            }
            out << "[\n";
            for (size_t i = 0; i < node.items.size(); ++i) {
                out << pad;
                WriteJson(node.items[i], out, depth + 1);
                out << (i + 1 < node.items.size() ? ",\n" : "\n");
            }
            out << close << "]";
            return;
        case AAFDumpNode::Kind::Object:
        case AAFDumpNode::Kind::Record: {
            out << "{\n";
            const bool object = node.kind == AAFDumpNode::Kind::Object;
            if (object) out << pad << "\"@class\": " << JsonString(node.value) << (node.fields.empty() ? "\n" : ",\n");
            for (size_t i = 0; i < node.fields.size(); ++i) {
                out << pad << JsonString(node.fields[i].first) << ": ";
                WriteJson(node.fields[i].second, out, depth + 1);
                out << (i + 1 < node.fields.size() ? ",\n" : "\n");
            }
            out << close << "}";
            return;
        }
    }
}

/// Text: an object is its class name, its properties indented below it;
/// list elements are numbered.
void WriteText(const AAFDumpNode& node, std::ostream& out, int depth) {
    const std::string pad(static_cast<size_t>(depth) * 2, ' ');
    switch (node.kind) {
        case AAFDumpNode::Kind::Number:
            out << node.value << "\n";
            return;
        case AAFDumpNode::Kind::Text:
            out << '"' << node.value << "\"\n";
            return;
        case AAFDumpNode::Kind::Object:
        case AAFDumpNode::Kind::Record:
            out << (node.kind == AAFDumpNode::Kind::Object ? node.value : std::string("record")) << "\n";
            for (const auto& field : node.fields) {
                out << pad << "  " << field.first << ": ";
                WriteText(field.second, out, depth + 1);
            }
            return;
        case AAFDumpNode::Kind::List:
            out << "[" << node.items.size() << "]\n";
            for (size_t i = 0; i < node.items.size(); ++i) {
                out << pad << "  [" << i << "] ";
                WriteText(node.items[i], out, depth + 1);
            }
            return;
    }
}

}  // namespace

AAFRESULT dumpAAF(IAAFObject* root, std::ostream& out, const AAFDumpOptions& options) {
    if (!root) return AAFRESULT_NULL_PARAM;
    try {
        const AAFDumpNode tree = AAFTreeReader(options.omitClock).ReadObject(root);
        if (options.format == AAFDumpOptions::Format::JSON) {
            WriteJson(tree, out, 0);
            out << "\n";
        } else {
            WriteText(tree, out, 0);
        }
        return AAFRESULT_SUCCESS;
    } catch (int result) {
        return result;
    } catch (...) {
        return AAFRESULT_INTERNAL_ERROR;
    }
}

AAFRESULT dumpAAF(IAAFFile* file, std::ostream& out, const AAFDumpOptions& options) {
    if (!file) return AAFRESULT_NULL_PARAM;
    AAFUtils::AAFComPtr<IAAFHeader> header;
    const AAFRESULT result = file->GetHeader(header.out());
    if (AAFRESULT_FAILED(result)) return result;
    auto object = header.As<IAAFObject>();
    return dumpAAF(object.get(), out, options);
}

}  // namespace ZEB
