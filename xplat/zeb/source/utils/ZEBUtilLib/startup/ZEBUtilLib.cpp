#include "startup/ZEBUtilLib.h"

#include "tov/ITOVComponentDefinition.h"
#include "tov/ITOVString.h"
#include "tov/sdk/TOVFailureStyle.h"
#include "tov/sdk/TOVPtr.h"

namespace ZEB {
namespace ZEBUtilLib {

uint32_t gZEBRef = 0;
ITOVComponentFactory* gpComponentFactory = nullptr;
ITOVClassFactory* gpClassFactory = nullptr;
ITOVConsole* gpConsole = nullptr;

}  // namespace ZEBUtilLib

namespace {

template <class T>
void ReleaseGlobal(T*& global) {
    if (T* p = global) {
        global = nullptr;
        p->Release();
    }
}

void ReleaseGlobals() {
    ReleaseGlobal(ZEBUtilLib::gpConsole);
    ReleaseGlobal(ZEBUtilLib::gpClassFactory);
    ReleaseGlobal(ZEBUtilLib::gpComponentFactory);
}

}  // namespace

TOVRESULT ZEBInitialize(ITOVComponentFactory* factory) { return ZEBInitializeInternal(factory, nullptr); }

TOVRESULT ZEBInitialize(ITOVComponentFactory* factory, unsigned char* unused) {
    return ZEBInitializeInternal(factory, unused);
}

TOVRESULT ZEBInitializeInternal(ITOVComponentFactory* factory, unsigned char*) {
    using namespace ZEBUtilLib;
    // The count stays raised on a repeated start, so a later ZEBTerminate pays for it.
    if (gZEBRef++ != 0) return ZEB_E_ALREADYSET;
    bool started = false;
    const TOVRESULT result = TOVGuarded([&] {
        if (!factory) throw static_cast<int>(TOV_E_POINTER);
        factory->AddRef();
        gpComponentFactory = factory;

        TOVPtr<ITOVComponentDefinition> definition;
        TOVCheck(factory->GetComponentDefinition(TOVCompID_TOVString, IID_ITOVComponentDefinition, definition.Out()));
        _tovUID clsid{};
        TOVCheck(definition->GetAttribute(TOVATTR_Component_CLSID, TOVTypeID_UID, &clsid, sizeof clsid));
        TOVCheck(factory->GetClassFactory(clsid, IID_ITOVClassFactory, reinterpret_cast<void**>(&gpClassFactory)));
        TOVCheck(factory->QueryInterface(IID_ITOVConsole, reinterpret_cast<void**>(&gpConsole)));
        if (!gpConsole) throw static_cast<int>(TOV_E_POINTER);
        gpConsole->Write(kTOVDebugLevelStartup, L"ZEBUtilLib initialized");
        started = true;
        return TOV_OK;
    });
    if (!started) {
        // A failed start leaves nothing behind, so it can be tried again.
        ReleaseGlobals();
        --gZEBRef;
    }
    return result;
}

TOVRESULT ZEBTerminate() {
    using namespace ZEBUtilLib;
    if (gZEBRef == 0) return TOV_OK;
    if (--gZEBRef == 0) ReleaseGlobals();
    return TOV_OK;
}

}  // namespace ZEB
