#pragma once
/// A component factory that makes fake readers and recording writers, with
/// results a test chooses, and logs what they are asked.
#include <string>
#include <vector>

#include "FakeXmlParser.h"
#include "RecordingXmlWriter.h"
#include "tov/ITOVComponentFactory.h"

class FakeXmlFactory : public ITOVComponentFactory {
public:
    TOVRESULT QueryInterface(const _tovUID&, void** out) override {
        *out = nullptr;
        return TOV_E_NOINTERFACE;
    }
    uint32_t AddRef() override { return ++refs; }
    uint32_t Release() override { return --refs; }
    TOVRESULT CreateComponent(const _tovUID& compID, ITOVUnknown*, const _tovUID&, void** out) override {
        *out = nullptr;
        if (createResult < 0) return createResult;
        if (nullComponent) return TOV_OK;
        if (compID == UTIL::CompID_TOVXmlReader) {
            *out = static_cast<UTIL::ITOVXmlParser*>(new FakeXmlParser(log, parseResult, rootResult, root, live));
        } else if (compID == UTIL::CompID_TOVXmlWriter) {
            *out = static_cast<UTIL::ITOVXmlWriter*>(new RecordingXmlWriter(log, &live));
        } else {
            return CLASS_E_CLASSNOTAVAILABLE;
        }
        return TOV_OK;
    }
    TOVRESULT GetClassFactory(const _tovUID&, const _tovUID&, void** out) override {
        *out = nullptr;
        return E_NOTIMPL;
    }
    TOVRESULT GetComponentDefinition(const _tovUID&, const _tovUID&, void** out) override {
        *out = nullptr;
        return E_NOTIMPL;
    }

    uint32_t refs = 1;
    /// Readers and writers not yet freed.
    int live = 0;
    /// What readers and writers were asked, in order.
    std::vector<std::string> log;
    /// Creation fails with this, or succeeds with null.
    TOVRESULT createResult = TOV_OK;
    bool nullComponent = false;
    /// What the readers made from now on answer.
    TOVRESULT parseResult = TOV_OK;
    TOVRESULT rootResult = TOV_OK;
    FakeXmlNode* root = nullptr;
};
