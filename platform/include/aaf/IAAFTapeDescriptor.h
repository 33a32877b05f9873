#pragma once
/// Describes a tape.
#include "aaf/AAFCOM.h"
#include "aaf/AAFForward.h"

class IAAFTapeDescriptor : public IUnknown {
public:
    virtual AAFRESULT Initialize() = 0;
    virtual AAFRESULT SetTapeManufacturer(aafCharacter_constptr pName) = 0;
    virtual AAFRESULT GetTapeManufacturer(aafCharacter* pName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetTapeManufacturerBufLen(aafUInt32* pLen) = 0;
    virtual AAFRESULT SetTapeModel(aafCharacter_constptr pModelName) = 0;
    virtual AAFRESULT GetTapeModel(aafCharacter* pModelName, aafUInt32 bufSize) = 0;
    virtual AAFRESULT GetTapeModelBufLen(aafUInt32* pLen) = 0;
    virtual AAFRESULT SetTapeFormFactor(aafTapeCaseType_t formFactor) = 0;
    virtual AAFRESULT GetTapeFormFactor(aafTapeCaseType_t* pFormFactor) = 0;
    virtual AAFRESULT SetSignalType(aafVideoSignalType_t videoSignal) = 0;
    virtual AAFRESULT GetSignalType(aafVideoSignalType_t* pVideoSignal) = 0;
    virtual AAFRESULT SetTapeFormat(aafTapeFormatType_t tapeFormat) = 0;
    virtual AAFRESULT GetTapeFormat(aafTapeFormatType_t* pTapeFormat) = 0;
    virtual AAFRESULT SetTapeLength(aafUInt32 tapeLength) = 0;
    virtual AAFRESULT GetTapeLength(aafUInt32* pTapeLength) = 0;

protected:
    ~IAAFTapeDescriptor() = default;
};
AAF_INTERFACE_ID(IAAFTapeDescriptor);
