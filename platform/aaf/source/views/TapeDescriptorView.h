#pragma once
/// A tape descriptor.
#include "../core/ViewBase.h"
#include "aaf/IAAFTapeDescriptor.h"

namespace aafmodel {

class TapeDescriptorView final : public View<IAAFTapeDescriptor> {
public:
    using View::View;

    AAFRESULT Initialize() override;
    AAFRESULT SetTapeManufacturer(aafCharacter_constptr pName) override;
    AAFRESULT GetTapeManufacturer(aafCharacter* pName, aafUInt32 bufSize) override;
    AAFRESULT GetTapeManufacturerBufLen(aafUInt32* pLen) override;
    AAFRESULT SetTapeModel(aafCharacter_constptr pModelName) override;
    AAFRESULT GetTapeModel(aafCharacter* pModelName, aafUInt32 bufSize) override;
    AAFRESULT GetTapeModelBufLen(aafUInt32* pLen) override;
    AAFRESULT SetTapeFormFactor(aafTapeCaseType_t formFactor) override;
    AAFRESULT GetTapeFormFactor(aafTapeCaseType_t* pFormFactor) override;
    AAFRESULT SetSignalType(aafVideoSignalType_t videoSignal) override;
    AAFRESULT GetSignalType(aafVideoSignalType_t* pVideoSignal) override;
    AAFRESULT SetTapeFormat(aafTapeFormatType_t tapeFormat) override;
    AAFRESULT GetTapeFormat(aafTapeFormatType_t* pTapeFormat) override;
    AAFRESULT SetTapeLength(aafUInt32 tapeLength) override;
    AAFRESULT GetTapeLength(aafUInt32* pTapeLength) override;
};

}  // namespace aafmodel
