#pragma once
/// The ITOVUnknown part of a fake component: it answers no query and frees
/// itself at the last release.
#include <cstdint>

#include "tov/ITOVUnknown.h"

template <class Interface>
class FakeUnknown : public Interface {
public:
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

protected:
    virtual ~FakeUnknown() = default;

private:
    uint32_t m_Refs = 1;
};
