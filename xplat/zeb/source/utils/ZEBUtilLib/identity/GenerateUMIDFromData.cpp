#include "identity/GenerateUMIDFromData.h"

#include "identity/CreateUIDGenerator.h"
#include "identity/UMIDDigest.h"
#include "startup/ZEBUtilLib.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {

TOVRESULT GenerateUMIDFromData_Begin(void** digestHandle) {
    if (!digestHandle) return TOV_E_INVALIDARG;
    if (!ZEBUtilLib::gpComponentFactory) return ZEB_E_NOTREADY;
    return TOVGuarded([&] {
        auto* digest = new UMIDDigest{nullptr, nullptr};
        *digestHandle = digest;
        TOVPtr<ITOVUIDGeneratorMD5> generator;
        if (TOVFailed(CreateUIDGenerator(generator)) || !generator) return TOV_E_UNEXPECTED;
        digest->generator = generator.Detach();
        return digest->generator->Begin(&digest->context);
    });
}

TOVRESULT GenerateUMIDFromData_AddData(void** digestHandle, unsigned int count, unsigned char* data) {
    if (!digestHandle || count == 0 || !data || !*digestHandle) return TOV_E_INVALIDARG;
    auto* digest = static_cast<UMIDDigest*>(*digestHandle);
    if (!digest->generator) return TOV_E_UNEXPECTED;
    return digest->generator->AddData(digest->context, data, count);
}

TOVRESULT GenerateUMIDFromData_Finish(void** digestHandle, _aafUID_t* out) {
    if (!digestHandle || !out || !*digestHandle) return TOV_E_INVALIDARG;
    auto* digest = static_cast<UMIDDigest*>(*digestHandle);
    if (!digest->generator) return TOV_E_UNEXPECTED;
    const TOVRESULT result = digest->generator->Finish(out, &digest->context);
    digest->generator->Release();
    delete digest;
    *digestHandle = nullptr;
    return result;
}

}  // namespace ZEB
