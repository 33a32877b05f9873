#pragma once
/// The recipe by which every concrete component is created and queried.
#include <new>

#include "tov/sdk/CTOVUnknown.h"
#include "tov/sdk/TOVFailureStyle.h"

/// The first steps of every creation: construct with `outer` at a count of
/// one and run `InitializeInstance(host)`. On success `*made` holds the
/// construction reference; a failure destroys the object directly and is
/// returned. `T` is constructible from the outer unknown.
template <class T>
TOVRESULT TOVConstructComponent(ITOVUnknown* host, ITOVUnknown* outer, T** made) {
    *made = nullptr;
    T* object = new (std::nothrow) T(outer);
    if (!object) return TOV_E_OUTOFMEMORY;
    object->InternalAddRef();
    const TOVRESULT init = object->InitializeInstance(host);
    if (init < 0) {
        delete object;
        return init;
    }
    *made = object;
    return TOV_OK;
}

/// The steps of a component's `TOVCreate`: construct and initialise, query for
/// `iid`, and drop the construction reference, so the object lives on only
/// when the interface was found.
template <class T>
TOVRESULT TOVCreateComponent(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    *out = nullptr;  // the class factory has tested `out`
    T* object = nullptr;
    const TOVRESULT made = TOVConstructComponent(host, outer, &object);
    if (made < 0) return made;
    const TOVRESULT result = object->InternalQueryInterface(iid, out);
    object->InternalRelease();
    return result;
}

/// Hands out `object`'s public part `Interface` with one reference.
template <class Interface, class T>
TOVRESULT TOVExpose(T* object, void** out) {
    Interface* itf = static_cast<Interface*>(object);
    *out = itf;
    itf->AddRef();
    return TOV_OK;
}
