#pragma once
/// A component factory in front of a reference host that answers for the UID
/// generator itself and passes every other request on. Going through it keeps
/// the tests apart from whatever the host registers under that identifier.
#include "FakeUIDGenerator.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/host/TOVHost.h"
#include "tov/sdk/TOVComponent.h"

class GeneratorFactory : public ITOVComponentFactory {
public:
    enum class Generator {
        Fake,           ///< a FakeUIDGenerator
        Missing,        ///< creation fails
        NullOnSuccess,  ///< creation succeeds without an object
    };

    explicit GeneratorFactory(TOVHost* host) : m_Host(host) {}

    TOVRESULT QueryInterface(const _tovUID& iid, void** out) override { return m_Host->QueryInterface(iid, out); }
    // Lives on the test's stack: counting is not needed.
    uint32_t AddRef() override { return 2; }
    uint32_t Release() override { return 1; }

    TOVRESULT CreateComponent(const _tovUID& compID, ITOVUnknown* outer, const _tovUID& iid, void** out) override {
        if (compID != TOVCompID_UIDGenerator) return m_Host->CreateComponent(compID, outer, iid, out);
        *out = nullptr;
        switch (generator) {
            case Generator::Fake:
                return TOVCreateComponent<FakeUIDGenerator>(m_Host->AsUnknown(), outer, iid, out);
            case Generator::Missing:
                return ZEB_E_NOTFOUND;
            case Generator::NullOnSuccess:
                return TOV_OK;
        }
        return TOV_E_UNEXPECTED;
    }
    TOVRESULT GetClassFactory(const _tovUID& clsid, const _tovUID& iid, void** out) override {
        return m_Host->GetClassFactory(clsid, iid, out);
    }
    TOVRESULT GetComponentDefinition(const _tovUID& compID, const _tovUID& iid, void** out) override {
        return m_Host->GetComponentDefinition(compID, iid, out);
    }

    Generator generator = Generator::Fake;

private:
    TOVHost* m_Host;
};
