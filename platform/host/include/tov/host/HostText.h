#pragma once
/// Passing UTF-8 text in and out of the host's string component.
#include <string>
#include <string_view>

#include "tov/ITOVString.h"

namespace HostText {

/// A new host string holding `utf8`, stored as UTF-8; `*out` owns one reference.
TOVRESULT Make(std::string_view utf8, ITOVString** out);
/// The text of `text` as UTF-8. A null string throws TOV_E_POINTER, a failing
/// conversion its result, both as an `int`.
std::string Read(ITOVString* text);
/// The same without a copy: the string's own UTF-8 view, valid until the
/// string next changes or dies.
std::string_view View(ITOVString* text);

}  // namespace HostText
