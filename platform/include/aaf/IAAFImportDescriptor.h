#pragma once
/// Describes a source that was imported from a file.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFImportDescriptor : public IUnknown {
public:
    virtual AAFRESULT Initialize() = 0;

protected:
    ~IAAFImportDescriptor() = default;
};
AAF_INTERFACE_ID(IAAFImportDescriptor);
