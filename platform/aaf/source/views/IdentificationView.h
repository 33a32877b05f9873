#pragma once
/// An identification record of the application that wrote a file.
#include "../core/ViewBase.h"
#include "aaf/IAAFIdentification.h"

namespace aafmodel {

class IdentificationView final : public View<IAAFIdentification> {
public:
    using View::View;

    AAFRESULT Initialize(aafCharacter_constptr companyName, aafCharacter_constptr productName,
                         aafCharacter_constptr productVersionString, aafUID_constref productID) override;
    AAFRESULT GetCompanyName(aafCharacter* pCompanyName, aafUInt32 bufSize) override;
    AAFRESULT GetCompanyNameBufLen(aafUInt32* pBufSize) override;
    AAFRESULT GetProductName(aafCharacter* pProductName, aafUInt32 bufSize) override;
    AAFRESULT GetProductNameBufLen(aafUInt32* pBufSize) override;
    AAFRESULT GetProductVersionString(aafCharacter* pProductVersionString, aafUInt32 bufSize) override;
    AAFRESULT GetProductVersionStringBufLen(aafUInt32* pBufSize) override;
    AAFRESULT GetProductVersion(aafProductVersion_t* pVersion) override;
    AAFRESULT SetProductVersion(aafProductVersion_constref version) override;
    AAFRESULT GetProductID(aafUID_t* pProductID) override;
    AAFRESULT GetDate(aafTimeStamp_t* pTimestamp) override;
    AAFRESULT GetRefImplVersion(aafProductVersion_t* pVersion) override;
    AAFRESULT GetPlatform(aafCharacter* pPlatform, aafUInt32 bufSize) override;
    AAFRESULT GetPlatformBufLen(aafUInt32* pBufSize) override;
    AAFRESULT GetGenerationID(aafUID_t* pGeneration) override;
};

}  // namespace aafmodel
