#pragma once
/// A component with comments and attributes.
#include "aaf/IAAFComponent.h"

class IAAFComponent2 : public IAAFComponent {
public:
    virtual AAFRESULT AppendComment(aafCharacter_constptr pName, aafCharacter_constptr pValue) = 0;
    virtual AAFRESULT CountComments(aafUInt32* pNumComments) = 0;
    virtual AAFRESULT GetComments(IEnumAAFTaggedValues** ppEnum) = 0;
    virtual AAFRESULT RemoveComment(IAAFTaggedValue* pComment) = 0;
    virtual AAFRESULT AppendAttribute(aafCharacter_constptr pName, aafCharacter_constptr pValue) = 0;
    virtual AAFRESULT CountAttributes(aafUInt32* pNumAttributes) = 0;
    virtual AAFRESULT GetAttributes(IEnumAAFTaggedValues** ppEnum) = 0;
    virtual AAFRESULT RemoveAttribute(IAAFTaggedValue* pAttribute) = 0;

protected:
    ~IAAFComponent2() = default;
};
AAF_INTERFACE_ID(IAAFComponent2);
