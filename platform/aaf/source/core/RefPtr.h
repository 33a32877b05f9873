#pragma once
/// A counted reference to anything with AddRef and Release.
#include <utility>

namespace aafmodel {

template <class T>
class RefPtr {
public:
    RefPtr() = default;
    /// Takes a reference of its own.
    RefPtr(T* p) : m_p(p) {  // NOLINT: implicit on purpose, like a raw pointer
        if (m_p) m_p->AddRef();
    }
    RefPtr(const RefPtr& o) : RefPtr(o.m_p) {}
    RefPtr(RefPtr&& o) noexcept : m_p(std::exchange(o.m_p, nullptr)) {}
    ~RefPtr() {
        if (m_p) m_p->Release();
    }
    RefPtr& operator=(RefPtr o) noexcept {
        std::swap(m_p, o.m_p);
        return *this;
    }
    /// Takes over a reference that the caller already owns.
    static RefPtr Adopt(T* owned) {
        RefPtr r;
        r.m_p = owned;
        return r;
    }
    T* get() const { return m_p; }
    T* operator->() const { return m_p; }
    T& operator*() const { return *m_p; }
    explicit operator bool() const { return m_p != nullptr; }
    /// Hands the reference to the caller.
    T* detach() { return std::exchange(m_p, nullptr); }

private:
    T* m_p = nullptr;
};

}  // namespace aafmodel
