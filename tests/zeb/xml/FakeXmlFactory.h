#pragma once
/// A component factory that is also the reader it makes, handing out a fake
/// DOM's root with results a test chooses, and makes recording writers.
/// Releasing never frees it; its count tells whether references came back.
#include <string>
#include <vector>

#include "FakeXmlNode.h"
#include "RecordingXmlWriter.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/ITOVXmlParser.h"

class FakeXmlFactory : public ITOVComponentFactory, public UTIL::ITOVXmlParser {
public:
    TOVRESULT QueryInterface(const _tovUID&, void** out) override {
        *out = nullptr;
        return TOV_E_NOINTERFACE;
    }
    uint32_t AddRef() override { return ++refs; }
    uint32_t Release() override { return --refs; }
    TOVRESULT CreateComponent(const _tovUID& compID, ITOVUnknown*, const _tovUID&, void** out) override {
        *out = nullptr;
        if (createResult < 0 || nullComponent) return createResult;
        if (compID == UTIL::CompID_TOVXmlReader) {
            *out = static_cast<UTIL::ITOVXmlParser*>(this);
            AddRef();
        } else {
            *out = static_cast<UTIL::ITOVXmlWriter*>(new RecordingXmlWriter(log, &writers));
        }
        return TOV_OK;
    }
    TOVRESULT GetClassFactory(const _tovUID&, const _tovUID&, void**) override { return E_NOTIMPL; }
    TOVRESULT GetComponentDefinition(const _tovUID&, const _tovUID&, void**) override { return E_NOTIMPL; }

    TOVRESULT ParseFile(ITOVString*) override { return parseResult; }
    TOVRESULT ParseText(ITOVString*) override { return parseResult; }
    TOVRESULT GetRoot(ITOVUnknown** out) override {
        *out = nullptr;
        if (rootResult < 0 || !root) return rootResult;
        *out = root->Dom();
        root->AddRef();
        return TOV_OK;
    }
    TOVRESULT GetLastError(ITOVString**) override { return E_NOTIMPL; }

    /// One for the test; each document and each reader it holds add one.
    uint32_t refs = 1;
    /// Writers not yet freed, and what they were asked, in order.
    int writers = 0;
    std::vector<std::string> log;
    /// Creation fails with this, or succeeds with null.
    TOVRESULT createResult = TOV_OK;
    bool nullComponent = false;
    /// What the reader answers; a null root is handed out as null with success.
    TOVRESULT parseResult = TOV_OK;
    TOVRESULT rootResult = TOV_OK;
    FakeXmlNode* root = nullptr;
};
