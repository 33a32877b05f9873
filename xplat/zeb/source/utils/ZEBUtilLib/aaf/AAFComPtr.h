#pragma once
/// A counted reference to an AAF interface for the toolkit's own walks:
/// released on scope exit, filled through out(), queried with As<I>().
#include <utility>

#include "aaf/AAF.h"

namespace ZEB {
namespace AAFUtils {

template <class T>
class AAFComPtr {
public:
    AAFComPtr() = default;
    AAFComPtr(const AAFComPtr&) = delete;
    AAFComPtr& operator=(const AAFComPtr&) = delete;
    AAFComPtr(AAFComPtr&& o) noexcept : m_p(std::exchange(o.m_p, nullptr)) {}
    AAFComPtr& operator=(AAFComPtr&& o) noexcept {
        std::swap(m_p, o.m_p);
        return *this;
    }
    ~AAFComPtr() {
        if (m_p) m_p->Release();
    }

    T* get() const { return m_p; }
    T* operator->() const { return m_p; }
    explicit operator bool() const { return m_p != nullptr; }
    /// For an out parameter: releases what is held first.
    T** out() {
        if (m_p) m_p->Release();
        m_p = nullptr;
        return &m_p;
    }
    /// The interface `I` of the same object, or empty.
    template <class I>
    AAFComPtr<I> As() const {
        AAFComPtr<I> other;
        if (m_p) m_p->QueryInterface(AAFInterfaceID<I>::value, reinterpret_cast<void**>(other.out()));
        return other;
    }

private:
    T* m_p = nullptr;
};

}  // namespace AAFUtils
}  // namespace ZEB
