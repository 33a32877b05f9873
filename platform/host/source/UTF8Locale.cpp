#include "tov/host/UTF8Locale.h"

locale_t UTF8Locale() {
    static const locale_t locale = newlocale(LC_CTYPE_MASK, "C.UTF-8", static_cast<locale_t>(0));
    return locale;
}
