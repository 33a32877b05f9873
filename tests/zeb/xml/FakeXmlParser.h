#pragma once
/// A reader that hands out a fake DOM's root with the results it was made with.
#include <string>
#include <vector>

#include "FakeUnknown.h"
#include "FakeXmlNode.h"
#include "strings/ZEBString.h"
#include "tov/ITOVXmlParser.h"

class FakeXmlParser : public FakeUnknown<UTIL::ITOVXmlParser> {
public:
    /// A null `root` is handed out as null with success; `live` counts readers not yet freed.
    FakeXmlParser(std::vector<std::string>& log, TOVRESULT parseResult, TOVRESULT rootResult, FakeXmlNode* root,
                  int& live)
        : m_Log(log), m_ParseResult(parseResult), m_RootResult(rootResult), m_Root(root), m_Live(live) {
        ++m_Live;
    }
    ~FakeXmlParser() { --m_Live; }

    TOVRESULT ParseFile(ITOVString* path) override { return Parsed("ParseFile", path); }
    TOVRESULT ParseText(ITOVString* text) override { return Parsed("ParseText", text); }
    TOVRESULT GetRoot(ITOVUnknown** out) override {
        *out = nullptr;
        if (m_RootResult < 0) return m_RootResult;
        if (m_Root) {
            *out = static_cast<UTIL::ITOVXmlDomElement*>(m_Root);
            m_Root->AddRef();
        }
        return TOV_OK;
    }
    TOVRESULT GetLastError(ITOVString** out) override {
        *out = nullptr;
        return TOV_OK;
    }

private:
    TOVRESULT Parsed(const char* what, ITOVString* argument) {
        m_Log.push_back(std::string(what) + " " + reinterpret_cast<const char*>(ZEB::ZEBString(argument, 0).GetUTF8String()));
        return m_ParseResult;
    }

    std::vector<std::string>& m_Log;
    const TOVRESULT m_ParseResult;
    const TOVRESULT m_RootResult;
    FakeXmlNode* const m_Root;
    int& m_Live;
};
