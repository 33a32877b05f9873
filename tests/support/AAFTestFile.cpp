#include "AAFTestFile.h"

namespace aaftest {

aafProductIdentification_t* TestIdentification() {
    static aafProductVersion_t version{1, 2, 3, 4, kAAFVersionReleased};
    static aafCharacter company[] = L"Test Company";
    static aafCharacter product[] = L"Test Product";
    static aafCharacter versionText[] = L"1.2.3.4";
    static aafCharacter platform[] = L"Linux";
    static aafProductIdentification_t ident{company,     product,
                                            versionText, {0x01020304, 0x0506, 0x0708, {9, 10, 11, 12, 13, 14, 15, 16}},
                                            platform,    &version};
    return &ident;
}

TransientFile::TransientFile(AAFRESULT (*open)(aafProductIdentification_t*, IAAFFile**),
                             aafProductIdentification_t* ident) {
    if (AAFRESULT_FAILED(open(ident, file.out()))) return;
    file->GetHeader(header.out());
    header->GetDictionary(dictionary.out());
}

Ptr<IAAFDataDef> TransientFile::DataDef(const aafUID_t& id) {
    Ptr<IAAFDataDef> out;
    dictionary->LookupDataDef(id, out.out());
    return out;
}

bool TransientFile::RegisterConcreteClass(const aafUID_t& id, const aafUID_t& parentId, const wchar_t* name) {
    Ptr<IAAFClassDef> parent, cls;
    return AAFRESULT_SUCCEEDED(dictionary->LookupClassDef(parentId, parent.out())) &&
           AAFRESULT_SUCCEEDED(
               dictionary->CreateMetaInstance(kAAFClassID_ClassDefinition, IID_IAAFClassDef, cls.outUnknown())) &&
           AAFRESULT_SUCCEEDED(cls->Initialize(id, parent.get(), name, kAAFTrue)) &&
           AAFRESULT_SUCCEEDED(dictionary->RegisterClassDef(cls.get()));
}

}  // namespace aaftest
