#pragma once
/// A new Mob of the clip, held as both of its interfaces.
#include "aaf/AAF.h"
#include "aafbuilder/IAAFSmartPointer.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace ZEB {
namespace Impl {

/// Made from `cls` as IAAFMob, queried to `Specific` (IAAFMasterMob or
/// IAAFSourceMob) and initialised; a failing step throws its result.
template <class Specific>
struct NewMob {
    IAAFSmartPointer<IAAFMob> mob;
    IAAFSmartPointer<Specific> specific;

    explicit NewMob(IAAFClassDef* cls) {
        TOVCheck(cls->CreateInstance(IID_IAAFMob, reinterpret_cast<IUnknown**>(&mob)));
        TOVCheck(mob->QueryInterface(AAFInterfaceID<Specific>::value, reinterpret_cast<void**>(&specific)));
        TOVCheck(specific->Initialize());
    }
};

}  // namespace Impl
}  // namespace ZEB
