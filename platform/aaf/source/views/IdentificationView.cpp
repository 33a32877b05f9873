#include "IdentificationView.h"

#include "../core/LibraryVersion.h"
#include "../core/Schema.h"
#include "ViewSupport.h"

namespace aafmodel {

AAFRESULT IdentificationView::Initialize(aafCharacter_constptr companyName, aafCharacter_constptr productName,
                                         aafCharacter_constptr productVersionString, aafUID_constref productID) {
    return Guarded([&] {
        Require(companyName);
        Require(productName);
        Require(productVersionString);
        m_object.MarkInitialized();
        const BuiltinDefinitions& b = Builtins(m_object);
        m_object.SetString(*b.p.identCompanyName, companyName);
        m_object.SetString(*b.p.identProductName, productName);
        m_object.SetString(*b.p.identProductVersionString, productVersionString);
        m_object.SetFixed(*b.p.identProductID, productID);
        m_object.SetFixed(*b.p.identDate, Now());
        m_object.SetFixed(*b.p.identToolkitVersion, kLibraryVersion);
        // The generation is this identification's own: the product's id.
        m_object.SetFixed(*b.p.identGenerationAUID, productID);
        return AAFRESULT_SUCCESS;
    });
}

#define STRING_GETTERS(Name, prop)                                                  \
    AAFRESULT IdentificationView::Get##Name(aafCharacter* p, aafUInt32 bufSize) {   \
        return Guarded([&] {                                                        \
            CopyStringProperty(m_object, *Builtins(m_object).p.prop, p, bufSize);   \
            return AAFRESULT_SUCCESS;                                               \
        });                                                                         \
    }                                                                               \
    AAFRESULT IdentificationView::Get##Name##BufLen(aafUInt32* pBufSize) {          \
        return Guarded([&] {                                                        \
            Require(pBufSize);                                                      \
            *pBufSize = StringPropertyBufLen(m_object, *Builtins(m_object).p.prop); \
            return AAFRESULT_SUCCESS;                                               \
        });                                                                         \
    }

STRING_GETTERS(CompanyName, identCompanyName)
STRING_GETTERS(ProductName, identProductName)
STRING_GETTERS(ProductVersionString, identProductVersionString)
STRING_GETTERS(Platform, identPlatform)
#undef STRING_GETTERS

AAFRESULT IdentificationView::GetProductVersion(aafProductVersion_t* pVersion) {
    return Guarded([&] {
        Require(pVersion);
        *pVersion = m_object.GetRequired<aafProductVersion_t>(*Builtins(m_object).p.identProductVersion);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT IdentificationView::SetProductVersion(aafProductVersion_constref version) {
    return Guarded([&] {
        m_object.SetFixed(*Builtins(m_object).p.identProductVersion, version);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT IdentificationView::GetProductID(aafUID_t* pProductID) {
    return Guarded([&] {
        Require(pProductID);
        *pProductID = m_object.GetRequired<aafUID_t>(*Builtins(m_object).p.identProductID);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT IdentificationView::GetDate(aafTimeStamp_t* pTimestamp) {
    return Guarded([&] {
        Require(pTimestamp);
        *pTimestamp = m_object.GetRequired<aafTimeStamp_t>(*Builtins(m_object).p.identDate);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT IdentificationView::GetRefImplVersion(aafProductVersion_t* pVersion) {
    return Guarded([&] {
        Require(pVersion);
        *pVersion = m_object.GetRequired<aafProductVersion_t>(*Builtins(m_object).p.identToolkitVersion);
        return AAFRESULT_SUCCESS;
    });
}

AAFRESULT IdentificationView::GetGenerationID(aafUID_t* pGeneration) {
    return Guarded([&] {
        Require(pGeneration);
        *pGeneration = m_object.GetRequired<aafUID_t>(*Builtins(m_object).p.identGenerationAUID);
        return AAFRESULT_SUCCESS;
    });
}

}  // namespace aafmodel
