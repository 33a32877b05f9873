#pragma once
/// Who wrote a file: company, product, version, platform.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFIdentification : public IUnknown {
public:
    virtual AAFRESULT Initialize(aafCharacter_constptr companyName, aafCharacter_constptr productName,
                                 aafCharacter_constptr productVersionString, aafUID_constref productID) = 0;
    virtual AAFRESULT GetCompanyName(aafCharacter* pCompanyName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetCompanyNameBufLen(aafUInt32* pBufSize) = 0;
    virtual AAFRESULT GetProductName(aafCharacter* pProductName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetProductNameBufLen(aafUInt32* pBufSize) = 0;
    virtual AAFRESULT GetProductVersionString(aafCharacter* pProductVersionString, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetProductVersionStringBufLen(aafUInt32* pBufSize) = 0;
    virtual AAFRESULT GetProductVersion(aafProductVersion_t* pVersion) = 0;
    virtual AAFRESULT SetProductVersion(aafProductVersion_constref version) = 0;
    virtual AAFRESULT GetProductID(aafUID_t* pProductID) = 0;
    virtual AAFRESULT GetDate(aafTimeStamp_t* pTimestamp) = 0;
    virtual AAFRESULT GetRefImplVersion(aafProductVersion_t* pVersion) = 0;
    virtual AAFRESULT GetPlatform(aafCharacter* pPlatform, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetPlatformBufLen(aafUInt32* pBufSize) = 0;
    virtual AAFRESULT GetGenerationID(aafUID_t* pGeneration) = 0;

protected:
    ~IAAFIdentification() = default;
};
AAF_INTERFACE_ID(IAAFIdentification);
