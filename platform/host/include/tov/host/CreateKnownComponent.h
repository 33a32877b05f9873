#pragma once
/// Making a host component whose class the host code knows.
#include <new>

#include "tov/sdk/CTOVUnknown.h"

/// TOVCreateComponent's steps for a class `T` made with no host and no outer
/// unknown, handing out `Interface`, which `T` implements: no query for it, so
/// no extra counted reference taken and dropped again. Those two counts cost
/// more than the rest where the host makes an object per DOM node and per
/// string. `*out` owns one reference.
template <class Interface, class T>
TOVRESULT CreateKnownComponent(Interface** out) {
    *out = nullptr;
    T* object = new (std::nothrow) T(nullptr);
    if (!object) return TOV_E_OUTOFMEMORY;
    object->InternalAddRef();
    const TOVRESULT init = object->InitializeInstance(nullptr);
    if (init < 0) {
        delete object;
        return init;
    }
    *out = static_cast<Interface*>(object);
    return TOV_OK;
}
