// The library's C entry points: the twenty-four that the loader resolves.
// Only the transient file exists; entry points for disk files and raw
// storage answer not-implemented until this library has a file format.
#include <cwchar>
#include <string>

#include "../core/Guard.h"
#include "../core/LibraryVersion.h"
#include "TransientFile.h"
#include "aaf/AAF.h"

#define AAF_EXPORT extern "C" __attribute__((visibility("default")))

using aafmodel::Guarded;
using aafmodel::Require;

namespace {

struct ResultText {
    AAFRESULT code;
    const wchar_t* text;
};

// The texts of the results that this library and its loader give.
const ResultText kResultTexts[] = {
    {AAFRESULT_SUCCESS, L"AAFRESULT_SUCCESS"},
    {AAFRESULT_FILE_NOT_FOUND, L"AAFRESULT_FILE_NOT_FOUND"},
    {AAFRESULT_BADOPEN, L"AAFRESULT_BADOPEN"},
    {AAFRESULT_SMALLBUF, L"AAFRESULT_SMALLBUF"},
    {AAFRESULT_EOF, L"AAFRESULT_EOF"},
    {AAFRESULT_BADINDEX, L"AAFRESULT_BADINDEX"},
    {AAFRESULT_BAD_TYPE, L"AAFRESULT_BAD_TYPE"},
    {AAFRESULT_PROP_NOT_PRESENT, L"AAFRESULT_PROP_NOT_PRESENT"},
    {AAFRESULT_INVALID_DATADEF, L"AAFRESULT_INVALID_DATADEF"},
    {AAFRESULT_OBJECT_NOT_FOUND, L"AAFRESULT_OBJECT_NOT_FOUND"},
    {AAFRESULT_PROPERTY_NOT_FOUND, L"AAFRESULT_PROPERTY_NOT_FOUND"},
    {AAFRESULT_NOT_SOURCE_CLIP, L"AAFRESULT_NOT_SOURCE_CLIP"},
    {AAFRESULT_TIMECODE_NOT_FOUND, L"AAFRESULT_TIMECODE_NOT_FOUND"},
    {AAFRESULT_SLOT_NOT_FOUND, L"AAFRESULT_SLOT_NOT_FOUND"},
    {AAFRESULT_MOB_NOT_FOUND, L"AAFRESULT_MOB_NOT_FOUND"},
    {AAFRESULT_DUPLICATE_MOBID, L"AAFRESULT_DUPLICATE_MOBID"},
    {AAFRESULT_NO_MORE_OBJECTS, L"AAFRESULT_NO_MORE_OBJECTS"},
    {AAFRESULT_OBJECT_NOT_IN_FILE, L"AAFRESULT_OBJECT_NOT_IN_FILE"},
    {AAFRESULT_OBJECT_ALREADY_ATTACHED, L"AAFRESULT_OBJECT_ALREADY_ATTACHED"},
    {AAFRESULT_OBJECT_NOT_ATTACHED, L"AAFRESULT_OBJECT_NOT_ATTACHED"},
    {AAFRESULT_NOMEMORY, L"AAFRESULT_NOMEMORY"},
    {AAFRESULT_NOT_IN_CURRENT_VERSION, L"AAFRESULT_NOT_IN_CURRENT_VERSION"},
    {AAFRESULT_NULL_PARAM, L"AAFRESULT_NULL_PARAM"},
    {AAFRESULT_ALREADY_INITIALIZED, L"AAFRESULT_ALREADY_INITIALIZED"},
    {AAFRESULT_NOT_INITIALIZED, L"AAFRESULT_NOT_INITIALIZED"},
    {AAFRESULT_INTERNAL_ERROR, L"AAFRESULT_INTERNAL_ERROR"},
    {AAFRESULT_ILLEGAL_VALUE, L"AAFRESULT_ILLEGAL_VALUE"},
    {AAFRESULT_INVALID_PARAM, L"AAFRESULT_INVALID_PARAM"},
    {AAFRESULT_INVALID_OBJ, L"AAFRESULT_INVALID_OBJ"},
    {AAFRESULT_TABLE_DUP_KEY, L"AAFRESULT_TABLE_DUP_KEY"},
    {AAFRESULT_UNEXPECTED_EXCEPTION, L"AAFRESULT_UNEXPECTED_EXCEPTION"},
    {AAFRESULT_DLL_LOAD_FAILED, L"AAFRESULT_DLL_LOAD_FAILED"},
    {AAFRESULT_DLL_SYMBOL_NOT_FOUND, L"AAFRESULT_DLL_SYMBOL_NOT_FOUND"},
    {AAFRESULT_NOT_IMPLEMENTED, L"AAFRESULT_NOT_IMPLEMENTED"},
    {AAF_E_NOINTERFACE, L"E_NOINTERFACE"},
};

const wchar_t* TextOf(AAFRESULT result) {
    for (const ResultText& t : kResultTexts)
        if (t.code == result) return t.text;
    return nullptr;
}

}  // namespace

AAF_EXPORT AAFRESULT AAFFileOpenExistingRead(const aafCharacter*, aafUInt32, IAAFFile**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAF_EXPORT AAFRESULT AAFFileOpenExistingModify(const aafCharacter*, aafUInt32, aafProductIdentification_t*,
                                               IAAFFile**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAF_EXPORT AAFRESULT AAFFileOpenNewModify(const aafCharacter*, aafUInt32, aafProductIdentification_t*, IAAFFile**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAF_EXPORT AAFRESULT AAFFileOpenNewModifyEx(const aafCharacter*, const aafUID_t*, aafUInt32,
                                            aafProductIdentification_t*, IAAFFile**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}

AAF_EXPORT AAFRESULT AAFFileOpenTransient(aafProductIdentification_t* pIdent, IAAFFile** ppFile) {
    return Guarded([&] {
        Require(pIdent);
        Require(ppFile);
        *ppFile = aafmodel::TransientFile::Create(*pIdent);
        return AAFRESULT_SUCCESS;
    });
}

AAF_EXPORT AAFRESULT AAFFileIsAAFFile(const aafCharacter*, aafUID_t*, aafBool*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAF_EXPORT AAFRESULT AAFRawStorageIsAAFFile(IAAFRawStorage*, aafUID_t*, aafBool*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAF_EXPORT AAFRESULT AAFFileIsAAFFileKind(const aafCharacter*, const aafUID_t*, aafBool*) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAF_EXPORT AAFRESULT AAFRawStorageIsAAFFileKind(IAAFRawStorage*, const aafUID_t*, aafBool*) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAF_EXPORT AAFRESULT AAFGetPluginManager(IAAFPluginManager**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAF_EXPORT AAFRESULT AAFCreateRawStorageMemory(aafFileAccess_t, IAAFRawStorage**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAF_EXPORT AAFRESULT AAFCreateRawStorageDisk(const aafCharacter*, aafFileExistence_t, aafFileAccess_t,
                                             IAAFRawStorage**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAF_EXPORT AAFRESULT AAFCreateRawStorageCachedDisk(const aafCharacter*, aafFileExistence_t, aafFileAccess_t, aafUInt32,
                                                   aafUInt32, IAAFRawStorage**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAF_EXPORT AAFRESULT AAFCreateRawStorageCached(IAAFRawStorage*, aafUInt32, aafUInt32, IAAFRawStorage**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAF_EXPORT AAFRESULT AAFCreateRawStorageCached2(IAAFRawStorage*, aafUInt32, aafUInt32, IAAFCachePageAllocator*,
                                                IAAFRawStorage**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAF_EXPORT AAFRESULT AAFCreateAAFFileOnRawStorage(IAAFRawStorage*, aafFileExistence_t, aafFileAccess_t, const aafUID_t*,
                                                  aafUInt32, aafProductIdentification_t*, IAAFFile**) {
    return AAFRESULT_NOT_IMPLEMENTED;
}
AAF_EXPORT AAFRESULT AAFSetProgressCallback(IAAFProgress*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAF_EXPORT AAFRESULT AAFGetFileEncodings(IEnumAAFFileEncodings**) { return AAFRESULT_NOT_IMPLEMENTED; }
AAF_EXPORT AAFRESULT AAFSetDiagnosticOutput(IAAFDiagnosticOutput*) { return AAFRESULT_NOT_IMPLEMENTED; }

AAF_EXPORT AAFRESULT AAFGetLibraryVersion(aafProductVersion_t* pVersion) {
    if (!pVersion) return AAFRESULT_NULL_PARAM;
    *pVersion = aafmodel::kLibraryVersion;
    return AAFRESULT_SUCCESS;
}

AAF_EXPORT AAFRESULT AAFGetLibraryPathNameBufLen(aafUInt32*) { return AAFRESULT_NOT_IMPLEMENTED; }
AAF_EXPORT AAFRESULT AAFGetLibraryPathName(aafCharacter*, aafUInt32) { return AAFRESULT_NOT_IMPLEMENTED; }

AAF_EXPORT AAFRESULT AAFResultToTextBufLen(AAFRESULT result, aafUInt32* pResultTextSize) {
    if (!pResultTextSize) return AAFRESULT_NULL_PARAM;
    const wchar_t* text = TextOf(result);
    if (!text) return AAFRESULT_INVALID_PARAM;
    *pResultTextSize = static_cast<aafUInt32>((std::wcslen(text) + 1) * sizeof(aafCharacter));
    return AAFRESULT_SUCCESS;
}

AAF_EXPORT AAFRESULT AAFResultToText(AAFRESULT result, aafCharacter* pResultText, aafUInt32 resultTextSize) {
    if (!pResultText) return AAFRESULT_NULL_PARAM;
    const wchar_t* text = TextOf(result);
    if (!text) return AAFRESULT_INVALID_PARAM;
    const size_t bytes = (std::wcslen(text) + 1) * sizeof(aafCharacter);
    if (resultTextSize < bytes) return AAFRESULT_SMALLBUF;
    std::wmemcpy(pResultText, text, bytes / sizeof(aafCharacter));
    return AAFRESULT_SUCCESS;
}
