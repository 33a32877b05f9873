#pragma once
/// The one UTF-8 character locale of the host, for case mapping and for
/// formatting with the standard wide functions. It never changes the process
/// locale; the console makes it current for one thread while it formats.
#include <locale.h>

/// Made once and kept for the life of the process; null if the system has no
/// C.UTF-8 locale.
locale_t UTF8Locale();
