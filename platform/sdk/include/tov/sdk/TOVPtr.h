#pragma once
/// The owning smart pointer for framework interfaces.
#include <utility>

#include "tov/TOVResult.h"

/// Holds one reference to a `T`, or null. Reading through an empty pointer
/// throws TOV_E_POINTER as an `int`, so a missing service becomes a clean
/// failure of the outermost call rather than a crash.
template <class T>
class TOVPtr {
public:
    TOVPtr() = default;
    /// Takes over one reference that the caller owns.
    explicit TOVPtr(T* owned) : m_p(owned) {}
    TOVPtr(const TOVPtr& other) : m_p(other.m_p) {
        if (m_p) m_p->AddRef();
    }
    TOVPtr(TOVPtr&& other) noexcept : m_p(std::exchange(other.m_p, nullptr)) {}
    ~TOVPtr() { Reset(); }

    TOVPtr& operator=(TOVPtr other) noexcept {
        std::swap(m_p, other.m_p);
        return *this;
    }

    /// Releases the pointee, then stores null.
    void Reset() {
        if (T* p = std::exchange(m_p, nullptr)) p->Release();
    }
    /// Releases what is held and takes over `owned`.
    void Attach(T* owned) {
        Reset();
        m_p = owned;
    }
    /// Hands the reference to the caller and leaves this pointer empty.
    T* Detach() { return std::exchange(m_p, nullptr); }
    /// Stores `p` with a reference of its own.
    void Assign(T* p) {
        if (p) p->AddRef();
        Attach(p);
    }

    T* operator->() const { return Deref(); }
    T& operator*() const { return *Deref(); }
    /// The raw pointer, possibly null; the reference stays here.
    T* Get() const { return m_p; }
    explicit operator bool() const { return m_p != nullptr; }

    /// For use as the out parameter of a query or factory: releases what is
    /// held first.
    void** Out() {
        Reset();
        return reinterpret_cast<void**>(&m_p);
    }
    T** OutT() {
        Reset();
        return &m_p;
    }

private:
    T* Deref() const {
        if (!m_p) throw static_cast<int>(TOV_E_POINTER);
        return m_p;
    }

    T* m_p = nullptr;
};
