#pragma once
/// Making a host component whose class the host code knows.
#include "tov/sdk/TOVComponent.h"

/// TOVCreateComponent's steps for a class `T` made with no host and no outer
/// unknown, handing out `Interface`, which `T` implements: no query for it, so
/// no extra counted reference taken and dropped again. Those two counts cost
/// more than the rest where the host makes an object per DOM node and per
/// string. `*out` owns one reference.
template <class Interface, class T>
TOVRESULT CreateKnownComponent(Interface** out) {
    *out = nullptr;
    T* object = nullptr;
    const TOVRESULT made = TOVConstructComponent(nullptr, nullptr, &object);
    if (made < 0) return made;
    *out = static_cast<Interface*>(object);
    return TOV_OK;
}
