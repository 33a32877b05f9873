#pragma once
/// Components one after another.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFSequence : public IUnknown {
public:
    virtual AAFRESULT Initialize(IAAFDataDef* pDataDef) = 0;
    virtual AAFRESULT AppendComponent(IAAFComponent* pComponent) = 0;
    virtual AAFRESULT PrependComponent(IAAFComponent* pComponent) = 0;
    virtual AAFRESULT InsertComponentAt(aafUInt32 index, IAAFComponent* pComponent) = 0;
    virtual AAFRESULT GetComponentAt(aafUInt32 index, IAAFComponent** ppComponent) = 0;
    virtual AAFRESULT RemoveComponentAt(aafUInt32 index) = 0;
    virtual AAFRESULT CountComponents(aafUInt32* pResult) = 0;
    virtual AAFRESULT GetComponents(IEnumAAFComponents** ppEnum) = 0;

protected:
    ~IAAFSequence() = default;
};
AAF_INTERFACE_ID(IAAFSequence);
