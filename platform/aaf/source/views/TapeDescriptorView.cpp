#include "TapeDescriptorView.h"

#include "../core/Schema.h"
#include "../core/WideText.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT TapeDescriptorView::Initialize() {
    return Guarded([&] {
        m_object.MarkInitialized();
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TapeDescriptorView::SetTapeManufacturer(aafCharacter_constptr pName) {
    return Guarded([&] {
        m_object.SetString(*Builtins(m_object).p.tapeManufacturerID, WideArg(pName));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TapeDescriptorView::GetTapeManufacturer(aafCharacter* pName, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyStringProperty(m_object, *Builtins(m_object).p.tapeManufacturerID, pName, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TapeDescriptorView::GetTapeManufacturerBufLen(aafUInt32* pLen) {
    return Guarded([&] {
        Require(pLen);
        *pLen = StringPropertyBufLen(m_object, *Builtins(m_object).p.tapeManufacturerID);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TapeDescriptorView::SetTapeModel(aafCharacter_constptr pModelName) {
    return Guarded([&] {
        m_object.SetString(*Builtins(m_object).p.tapeModel, WideArg(pModelName));
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TapeDescriptorView::GetTapeModel(aafCharacter* pModelName, aafUInt32 bufSize) {
    return Guarded([&] {
        CopyStringProperty(m_object, *Builtins(m_object).p.tapeModel, pModelName, bufSize);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TapeDescriptorView::GetTapeModelBufLen(aafUInt32* pLen) {
    return Guarded([&] {
        Require(pLen);
        *pLen = StringPropertyBufLen(m_object, *Builtins(m_object).p.tapeModel);
        return AAFRESULT_SUCCESS;
    });
}

// Form factor, signal type and tape format are not kept by this library.
AAFRESULT TapeDescriptorView::SetTapeFormFactor(aafTapeCaseType_t) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT TapeDescriptorView::GetTapeFormFactor(aafTapeCaseType_t*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT TapeDescriptorView::SetSignalType(aafVideoSignalType_t) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT TapeDescriptorView::GetSignalType(aafVideoSignalType_t*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT TapeDescriptorView::SetTapeFormat(aafTapeFormatType_t) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT TapeDescriptorView::GetTapeFormat(aafTapeFormatType_t*) { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT TapeDescriptorView::SetTapeLength(aafUInt32 tapeLength) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.tapeLength, tapeLength);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT TapeDescriptorView::GetTapeLength(aafUInt32* pTapeLength) {
    return Guarded([&] {
        Require(pTapeLength);
        *pTapeLength = m_object.GetRequired<aafUInt32>(*Builtins(m_object).p.tapeLength);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
