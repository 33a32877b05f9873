#include "TransientFile.h"

#include "../core/Guard.h"
#include "../core/LibraryVersion.h"
#include "../core/Schema.h"
#include "../views/ViewSupport.h"
#include "aaf/IAAFDictionary.h"
#include "aaf/IAAFHeader.h"

namespace aafmodel {

namespace {
RefPtr<ModelObject> NewIdentification(Schema& schema, const aafProductIdentification_t& ident) {
    const BuiltinDefinitions& b = schema.B();
    RefPtr<ModelObject> id = NewObject(*b.c.identification);
    id->SetString(*b.p.identCompanyName, ident.companyName);
    id->SetString(*b.p.identProductName, ident.productName);
    if (ident.productVersion) id->SetFixed(*b.p.identProductVersion, *ident.productVersion);
    id->SetString(*b.p.identProductVersionString, ident.productVersionString);
    id->SetFixed(*b.p.identProductID, ident.productID);
    id->SetFixed(*b.p.identDate, Now());
    id->SetFixed(*b.p.identToolkitVersion, kLibraryVersion);
    if (ident.platform) id->SetString(*b.p.identPlatform, ident.platform);
    id->SetFixed(*b.p.identGenerationAUID, ident.productID);
    return id;
}
}  // namespace

IAAFFile* TransientFile::Create(const aafProductIdentification_t& ident) {
    Require(ident.companyName);
    Require(ident.productName);
    Require(ident.productVersionString);
    RefPtr<Schema> schema = RefPtr<Schema>::Adopt(Schema::Create());
    const BuiltinDefinitions& b = schema->B();
    RefPtr<ModelObject> header = NewObject(*b.c.header);
    header->SetFixed(*b.p.headerLastModified, Now());
    header->SetFixed(*b.p.headerVersion, aafVersionType_t{1, 1});
    RefPtr<ModelObject> content = NewObject(*b.c.contentStorage);
    content->Ensure(*b.p.contentMobs);
    header->SetRef(*b.p.headerContent, *content);
    header->SetRef(*b.p.headerDictionary, *NewObject(*b.c.dictionary));
    header->InsertInto(*b.p.headerIdentificationList, 0, *NewIdentification(*schema, ident));
    auto* file = new TransientFile(std::move(header));
    file->AddRef();
    return file;
}

aafUInt32 TransientFile::Release() {
    const aafUInt32 left = --m_refs;
    if (left == 0) delete this;
    return left;
}

AAFRESULT TransientFile::QueryInterface(REFIID riid, void** ppvObj) {
    if (!ppvObj) return AAFRESULT_NULL_PARAM;
    if (riid != IID_IUnknown && riid != IID_IAAFFile) {
        *ppvObj = nullptr;
        return AAF_E_NOINTERFACE;
    }
    *ppvObj = static_cast<IAAFFile*>(this);
    AddRef();
    return AAFRESULT_SUCCESS;
}

// A transient file is open from its making; it has nowhere to be saved.
AAFRESULT TransientFile::Open() { return m_header ? AAFRESULT_ALREADY_INITIALIZED : AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT TransientFile::SaveCopyAs(IAAFFile*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAFRESULT TransientFile::Save() { return AAFRESULT_NOT_IMPLEMENTED; }

AAFRESULT TransientFile::GetHeader(IAAFHeader** ppHeader) {
    return Guarded([&] {
        Require(m_header, AAFRESULT_NOT_INITIALIZED);
        return HandOut(*m_header, ppHeader);
    });
}

AAFRESULT TransientFile::GetRevision(aafFileRev_t* pRev) {
    if (!pRev) return AAFRESULT_NULL_PARAM;
    *pRev = 0;
    return AAFRESULT_SUCCESS;
}

// Objects that callers still hold stay valid; the file no longer reaches them.
AAFRESULT TransientFile::Close() {
    if (!m_header) return AAFRESULT_NOT_INITIALIZED;
    m_header = RefPtr<ModelObject>();
    return AAFRESULT_SUCCESS;
}

AAFRESULT TransientFile::GetDictionary(IAAFDictionary** ppDictionary) {
    return Guarded([&] {
        Require(m_header, AAFRESULT_NOT_INITIALIZED);
        RefPtr<IAAFHeader> header = m_header->Query<IAAFHeader>();
        return header->GetDictionary(ppDictionary);
    });
}

}  // namespace aafmodel
