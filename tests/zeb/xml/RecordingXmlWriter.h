#pragma once
/// A writer that records each call as a line of text instead of writing XML,
/// and frees itself at the last release.
#include <string>
#include <vector>

#include "strings/ZEBString.h"
#include "tov/ITOVXmlWriter.h"

class RecordingXmlWriter : public UTIL::ITOVXmlWriter {
public:
    /// `live`, when given, counts writers not yet freed.
    explicit RecordingXmlWriter(std::vector<std::string>& log, int* live = nullptr) : m_Log(log), m_Live(live) {
        if (m_Live) ++*m_Live;
    }
    virtual ~RecordingXmlWriter() {
        if (m_Live) --*m_Live;
    }

    TOVRESULT QueryInterface(const _tovUID&, void** out) override {
        *out = nullptr;
        return TOV_E_NOINTERFACE;
    }
    uint32_t AddRef() override { return ++m_Refs; }
    uint32_t Release() override {
        const uint32_t refs = --m_Refs;
        if (refs == 0) delete this;
        return refs;
    }
    TOVRESULT Open(ITOVString* path) override { return Record("open " + (path ? Read(path) : "<memory>")); }
    TOVRESULT Close() override { return Record("close"); }
    TOVRESULT GetText(ITOVString** out) override {
        ZEB::ZEBString::CreateString(out);
        return (*out)->Assign(kTOVUnicodeUTF8, reinterpret_cast<const unsigned char*>("recorded"), 9);
    }
    TOVRESULT WriteAttribute(ITOVString* name, ITOVString* value, ITOVString* elementTag) override {
        return Record("attribute " + Read(name) + "=" + Read(value) + " on " + Read(elementTag));
    }
    TOVRESULT WriteElement(ITOVString* tag, ITOVString* parentTag) override {
        return Record("element " + Read(tag) + (parentTag ? " in " + Read(parentTag) : ""));
    }
    TOVRESULT WriteText(ITOVString* text, ITOVString* elementTag) override {
        return Record("text " + Read(text) + " on " + Read(elementTag));
    }

private:
    static std::string Read(ITOVString* s) {
        return reinterpret_cast<const char*>(ZEB::ZEBString(s, 0).GetUTF8String());
    }
    TOVRESULT Record(const std::string& line) {
        m_Log.push_back(line);
        return TOV_OK;
    }

    std::vector<std::string>& m_Log;
    int* m_Live;
    uint32_t m_Refs = 1;
};
