#pragma once
/// What every component has: data definition and length.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFComponent : public IUnknown {
public:
    virtual AAFRESULT SetLength(aafLength_constref length) = 0;
    virtual AAFRESULT GetLength(aafLength_t* pLength) = 0;
    virtual AAFRESULT SetDataDef(IAAFDataDef* pDataDef) = 0;
    virtual AAFRESULT GetDataDef(IAAFDataDef** ppDatadef) = 0;
    virtual AAFRESULT AppendKLVData(IAAFKLVData* pData) = 0;
    virtual AAFRESULT CountKLVData(aafUInt32* pNumData) = 0;
    virtual AAFRESULT GetKLVData(IEnumAAFKLVData** ppEnum) = 0;
    virtual AAFRESULT RemoveKLVData(IAAFKLVData* pData) = 0;

protected:
    ~IAAFComponent() = default;
};
AAF_INTERFACE_ID(IAAFComponent);
