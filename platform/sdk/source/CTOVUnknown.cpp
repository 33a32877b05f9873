#include "tov/sdk/CTOVUnknown.h"

#include "tov/sdk/TOVInterlocked.h"

int CTOVUnknown::m_ActiveObjects = 0;

CTOVUnknown::CTOVUnknown(ITOVUnknown* outer)
    : m_pControllingUnknown(outer ? outer : &m_PrivateUnknown), m_PrivateUnknown(this) {
    IncrementActiveObjects();
}

CTOVUnknown::~CTOVUnknown() { DecrementActiveObjects(); }

TOVRESULT CTOVUnknown::InitializeInstance(ITOVUnknown*) { return TOV_OK; }

void CTOVUnknown::FinalRelease() {}

void CTOVUnknown::ReclaimMemory() { delete this; }

TOVRESULT CTOVUnknown::InternalQueryInterface(const _tovUID& iid, void** out) {
    *out = nullptr;
    if (iid != IID_ITOVUnknown) return TOV_E_NOINTERFACE;
    *out = &m_PrivateUnknown;
    m_PrivateUnknown.AddRef();
    return TOV_OK;
}

uint32_t CTOVUnknown::InternalAddRef() { return static_cast<uint32_t>(TOVInterlockedIncrement(&m_RefCount)); }

uint32_t CTOVUnknown::InternalRelease() {
    // Nothing guards against a count below zero: an extra Release is the caller's fault.
    const int count = TOVInterlockedDecrement(&m_RefCount);
    if (count != 0) return static_cast<uint32_t>(count);
    FinalRelease();
    ReclaimMemory();
    return 0;
}

void CTOVUnknown::IncrementActiveObjects() { TOVInterlockedIncrement(&m_ActiveObjects); }

void CTOVUnknown::DecrementActiveObjects() { TOVInterlockedDecrement(&m_ActiveObjects); }

int32_t CTOVUnknown::GetActiveObjectCount() { return __atomic_load_n(&m_ActiveObjects, __ATOMIC_RELAXED); }

TOVRESULT CTOVUnknown::PrivateUnknown::QueryInterface(const _tovUID& iid, void** out) {
    return m_pOwner->InternalQueryInterface(iid, out);
}

uint32_t CTOVUnknown::PrivateUnknown::AddRef() { return m_pOwner->InternalAddRef(); }

uint32_t CTOVUnknown::PrivateUnknown::Release() { return m_pOwner->InternalRelease(); }
