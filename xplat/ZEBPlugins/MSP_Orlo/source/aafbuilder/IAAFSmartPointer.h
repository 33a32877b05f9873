#pragma once
/// A counted reference to an AAF interface, as the clip builder holds every
/// object it makes or reaches. Using an empty one (through `->` or as an
/// argument) throws the text "_rep", which ends the operation as
/// TOV_E_UNEXPECTED.
#include <utility>

#include "aaf/AAF.h"

template <class T>
class IAAFSmartPointer {
public:
    IAAFSmartPointer() = default;
    /// Shares `p` with a reference of its own.
    explicit IAAFSmartPointer(T* p) : m_rep(p) {
        if (m_rep) m_rep->AddRef();
    }
    IAAFSmartPointer(const IAAFSmartPointer& other) : m_rep(other.m_rep) {
        if (m_rep) m_rep->AddRef();
    }
    IAAFSmartPointer& operator=(IAAFSmartPointer other) noexcept {
        std::swap(m_rep, other.m_rep);
        return *this;
    }
    ~IAAFSmartPointer() {
        if (m_rep) m_rep->Release();
    }

    bool IsNull() const { return m_rep == nullptr; }
    T* operator->() const { return Rep(); }
    operator T*() const { return Rep(); }
    /// The place for an out argument to fill; what was held is released first.
    T** operator&() {
        if (T* old = std::exchange(m_rep, nullptr)) old->Release();
        return &m_rep;
    }

private:
    T* Rep() const {
        if (!m_rep) throw "_rep";
        return m_rep;
    }

    T* m_rep = nullptr;
};
