#pragma once
/// A transient file for the tests, with its header and dictionary at hand,
/// and a counted pointer for AAF interfaces.
#include <utility>

#include "aaf/AAF.h"

namespace aaftest {

template <class T>
class Ptr {
public:
    Ptr() = default;
    Ptr(const Ptr&) = delete;
    Ptr& operator=(const Ptr&) = delete;
    Ptr(Ptr&& o) noexcept : m_p(std::exchange(o.m_p, nullptr)) {}
    Ptr& operator=(Ptr&& o) noexcept {
        std::swap(m_p, o.m_p);
        return *this;
    }
    ~Ptr() {
        if (m_p) m_p->Release();
    }
    T* get() const { return m_p; }
    T* operator->() const { return m_p; }
    T** out() { return &m_p; }
    void** outVoid() { return reinterpret_cast<void**>(&m_p); }
    IUnknown** outUnknown() { return reinterpret_cast<IUnknown**>(&m_p); }
    explicit operator bool() const { return m_p != nullptr; }

private:
    T* m_p = nullptr;
};

/// The interface `I` of `from`, or an empty pointer.
template <class I, class From>
Ptr<I> Query(From* from) {
    Ptr<I> out;
    if (from) from->QueryInterface(AAFInterfaceID<I>::value, out.outVoid());
    return out;
}

/// The product identification of the tests.
aafProductIdentification_t* TestIdentification();

/// Opens a transient file through `open` (the library's entry point or the
/// loader's forwarder) and keeps its header and dictionary.
struct TransientFile {
    explicit TransientFile(AAFRESULT (*open)(aafProductIdentification_t*, IAAFFile**),
                           aafProductIdentification_t* ident = TestIdentification());
    Ptr<IAAFFile> file;
    Ptr<IAAFHeader> header;
    Ptr<IAAFDictionary> dictionary;

    /// A new object of `classId`, as interface `I`.
    template <class I>
    Ptr<I> Create(const aafUID_t& classId) {
        Ptr<I> out;
        dictionary->CreateInstance(classId, AAFInterfaceID<I>::value, out.outUnknown());
        return out;
    }
    Ptr<IAAFDataDef> DataDef(const aafUID_t& id);
    /// Registers a concrete class `id` under `parentId` through the dictionary,
    /// as a caller extends the model; false when any step fails.
    bool RegisterConcreteClass(const aafUID_t& id, const aafUID_t& parentId, const wchar_t* name);
};

}  // namespace aaftest
