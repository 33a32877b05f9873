#pragma once
/// Passing UTF-8 text in and out of the host's string component.
#include <string>

#include "tov/ITOVString.h"

namespace HostText {

/// A new host string holding `utf8`, stored as UTF-8; `*out` owns one reference.
TOVRESULT Make(const std::string& utf8, ITOVString** out);
/// The text of `text` as UTF-8. A null string throws TOV_E_POINTER, a failing
/// conversion its result, both as an `int`.
std::string Read(ITOVString* text);

}  // namespace HostText
