#pragma once
/// The path of a locator.
#include "../core/ViewBase.h"
#include "aaf/IAAFLocator.h"

namespace aafmodel {

class LocatorView final : public View<IAAFLocator> {
public:
    using View::View;

    AAFRESULT SetPath(aafCharacter_constptr pPath) override;
    AAFRESULT GetPath(aafCharacter* pPath, aafUInt32 bufSize) override;
    AAFRESULT GetPathBufLen(aafUInt32* pBufSize) override;
};

}  // namespace aafmodel
