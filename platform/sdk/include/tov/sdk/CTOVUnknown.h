#pragma once
/// The implementation base of every component: reference counting,
/// aggregation through a controlling unknown, and the module's count of live
/// objects.
#include <cstdint>

#include "tov/ITOVUnknown.h"

class CTOVUnknown {
public:
    /// `outer` is the aggregating object, not owned; null makes the object
    /// control itself through its embedded `PrivateUnknown`. The count starts at 0.
    explicit CTOVUnknown(ITOVUnknown* outer);
    virtual ~CTOVUnknown();

    CTOVUnknown(const CTOVUnknown&) = delete;
    CTOVUnknown& operator=(const CTOVUnknown&) = delete;

    /// Second-stage construction with the creating host; 0 by default.
    virtual TOVRESULT InitializeInstance(ITOVUnknown* host);
    /// Called once when the count reaches zero, before the memory goes.
    virtual void FinalRelease();
    virtual void ReclaimMemory();
    /// Knows only ITOVUnknown, which answers with the embedded PrivateUnknown:
    /// the object's identity.
    virtual TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out);
    virtual uint32_t InternalAddRef();
    virtual uint32_t InternalRelease();

    /// Where the public QueryInterface, AddRef and Release forward.
    ITOVUnknown* GetControllingUnknown() const { return m_pControllingUnknown; }

    static void IncrementActiveObjects();
    static void DecrementActiveObjects();
    static int32_t GetActiveObjectCount();

    /// Live objects of this module; the module may unload only at zero.
    static int m_ActiveObjects;

private:
    /// The non-delegating unknown.
    class PrivateUnknown : public ITOVUnknown {
    public:
        explicit PrivateUnknown(CTOVUnknown* owner) : m_pOwner(owner) {}
        TOVRESULT QueryInterface(const _tovUID& iid, void** out) override;
        uint32_t AddRef() override;
        uint32_t Release() override;

    private:
        CTOVUnknown* m_pOwner;
    };

    int m_RefCount = 0;
    ITOVUnknown* m_pControllingUnknown;
    PrivateUnknown m_PrivateUnknown;
};

/// Public ITOVUnknown slots of a concrete component: they forward unconditionally
/// to the controlling unknown, so a component never counts in its public slots.
#define TOV_FORWARD_UNKNOWN                                                               \
    TOVRESULT QueryInterface(const _tovUID& iid, void** out) override {                   \
        return CTOVUnknown::GetControllingUnknown()->QueryInterface(iid, out);            \
    }                                                                                     \
    uint32_t AddRef() override { return CTOVUnknown::GetControllingUnknown()->AddRef(); } \
    uint32_t Release() override { return CTOVUnknown::GetControllingUnknown()->Release(); }
