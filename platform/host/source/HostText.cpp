#include "tov/host/HostText.h"

#include "tov/host/CreateKnownComponent.h"
#include "tov/host/HostString.h"
#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"

namespace HostText {

TOVRESULT Make(std::string_view utf8, ITOVString** out) {
    if (!out) return TOV_E_INVALIDARG;
    *out = nullptr;
    TOVPtr<ITOVString> text;
    // The string component needs no host services, so it is made directly.
    TOVRESULT result = CreateKnownComponent<ITOVString, HostString>(text.OutT());
    if (result < 0) return result;
    result = text->Assign(kTOVUnicodeUTF8, reinterpret_cast<const unsigned char*>(utf8.data()),
                          static_cast<unsigned int>(utf8.size()));
    if (result < 0) return result;
    *out = text.Detach();
    return TOV_OK;
}

std::string Read(ITOVString* text) { return std::string(View(text)); }

std::string_view View(ITOVString* text) {
    if (!text) throw static_cast<int>(TOV_E_POINTER);
    // The UTF-8 view leaves the stored encoding alone, and the text holds no
    // zero, so the view's terminator marks its end.
    const unsigned char* bytes = nullptr;
    TOVCheck(text->GetUTF8String(&bytes));
    if (!bytes) throw static_cast<int>(TOV_E_POINTER);
    return reinterpret_cast<const char*>(bytes);
}

}  // namespace HostText
