#pragma once
/// Small conveniences for driving the host's XML components in tests.
#include <string>

#include "tov/host/HostText.h"
#include "tov/sdk/TOVPtr.h"

inline TOVPtr<ITOVString> Str(const std::string& utf8) {
    TOVPtr<ITOVString> s;
    if (HostText::Make(utf8, s.OutT()) < 0) throw static_cast<int>(TOV_E_FAIL);
    return s;
}

inline std::string Utf8(ITOVString* s) { return HostText::Read(s); }
