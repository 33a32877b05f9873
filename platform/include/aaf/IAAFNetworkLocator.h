#pragma once
/// A locator by URL.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFNetworkLocator : public IUnknown {
public:
    virtual AAFRESULT Initialize() = 0;

protected:
    ~IAAFNetworkLocator() = default;
};
AAF_INTERFACE_ID(IAAFNetworkLocator);
