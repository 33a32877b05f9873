#include "tov/sdk/CTOVClassFactory.h"

#include <new>

TOVRESULT CTOVClassFactory::Create(Creator creator, const _tovUID& iid, void** out) {
    if (!creator || !out) return TOV_E_INVALIDARG;
    *out = nullptr;
    auto* factory = new (std::nothrow) CTOVClassFactory(creator, nullptr);
    if (!factory) return TOV_E_OUTOFMEMORY;
    factory->InternalAddRef();
    const TOVRESULT result = factory->QueryInterface(iid, out);
    factory->InternalRelease();
    return result;
}

CTOVClassFactory::CTOVClassFactory(Creator creator, ITOVUnknown* outer) : CTOVUnknown(outer), m_Creator(creator) {}

CTOVClassFactory::~CTOVClassFactory() { m_Creator = nullptr; }

TOVRESULT CTOVClassFactory::CreateInstance(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    if (!m_Creator) return TOV_E_UNEXPECTED;
    if (!host || !out) return TOV_E_INVALIDARG;
    *out = nullptr;
    if (outer && iid != IID_ITOVUnknown) return CLASS_E_NOAGGREGATION;
    return m_Creator(host, outer, iid, out);
}

TOVRESULT CTOVClassFactory::InternalQueryInterface(const _tovUID& iid, void** out) {
    if (!out) return TOV_E_INVALIDARG;
    if (iid == IID_ITOVClassFactory) {
        *out = static_cast<ITOVClassFactory*>(this);
        AddRef();
        return TOV_OK;
    }
    return CTOVUnknown::InternalQueryInterface(iid, out);
}
