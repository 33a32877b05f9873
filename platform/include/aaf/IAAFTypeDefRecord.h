#pragma once
/// A record of named members, each of its own type, laid out as a C struct.
#include "aaf/IAAFTypeDef.h"

class IAAFTypeDefRecord : public IAAFTypeDef {
public:
    virtual AAFRESULT Initialize(aafUID_constref id, IAAFTypeDef** ppMemberTypes, aafString_t* pMemberNames,
                                 aafUInt32 numMembers, aafCharacter_constptr pTypeName) = 0;
    virtual AAFRESULT GetMemberType(aafUInt32 index, IAAFTypeDef** ppTypeDef) = 0;
    virtual AAFRESULT GetMemberName(aafUInt32 index, aafCharacter* pName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetMemberNameBufLen(aafUInt32 index, aafUInt32* pLen) = 0;
    virtual AAFRESULT CreateValueFromValues(IAAFPropertyValue** pMemberValues, aafUInt32 numMembers,
                                            IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT CreateValueFromStruct(aafMemPtr_t pInitData, aafUInt32 initDataSize,
                                            IAAFPropertyValue** ppPropVal) = 0;
    virtual AAFRESULT GetValue(IAAFPropertyValue* pInPropVal, aafUInt32 index, IAAFPropertyValue** ppOutPropVal) = 0;
    virtual AAFRESULT GetStruct(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) = 0;
    virtual AAFRESULT SetValue(IAAFPropertyValue* pPropVal, aafUInt32 index, IAAFPropertyValue* pMemberPropVal) = 0;
    virtual AAFRESULT SetStruct(IAAFPropertyValue* pPropVal, aafMemPtr_t pData, aafUInt32 dataSize) = 0;
    virtual AAFRESULT GetCount(aafUInt32* pCount) = 0;
    virtual AAFRESULT RegisterMembers(aafUInt32* pOffsets, aafUInt32 numMembers, aafUInt32 structSize) = 0;

protected:
    ~IAAFTypeDefRecord() = default;
};
AAF_INTERFACE_ID(IAAFTypeDefRecord);
