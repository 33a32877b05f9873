#include "AAFDLL.h"

#include <dlfcn.h>

#include <string>

#include "AAFLoaderPlatform.h"

AAFDLL* AAFDLL::_singleton = nullptr;

AAFDLL::AAFDLL() : _libHandle(nullptr) {
    ClearEntrypoints();
    _singleton = this;
}

// The handle is left alone: the library stays mapped.
AAFDLL::~AAFDLL() {
    ClearEntrypoints();
    _singleton = nullptr;
}

AAFDLL* AAFDLL::MakeAAFDLL() { return new AAFDLL(); }

void AAFDLL::ClearEntrypoints() {
    _pfnOpenExistingRead = nullptr;
    _pfnOpenExistingModify = nullptr;
    _pfnOpenNewModify = nullptr;
    _pfnOpenNewModifyEx = nullptr;
    _pfnOpenTransient = nullptr;
    _pfnIsAAFFile = nullptr;
    _pfnRawStorageIsAAFFile = nullptr;
    _pfnFileIsAAFFileKind = nullptr;
    _pfnRawStorageIsAAFFileKind = nullptr;
    _pfnGetPluginManager = nullptr;
    _pfnCreateRawStorageMemory = nullptr;
    _pfnCreateRawStorageDisk = nullptr;
    _pfnCreateRawStorageCachedDisk = nullptr;
    _pfnCreateRawStorageCached = nullptr;
    _pfnCreateRawStorageCached2 = nullptr;
    _pfnCreateAAFFileOnRawStorage = nullptr;
    _pfnSetProgressCallback = nullptr;
    _pfnGetFileEncodings = nullptr;
    _pfnSetDiagnosticOutput = nullptr;
    _pfnGetLibraryVersion = nullptr;
    _pfnGetLibraryPathNameBufLen = nullptr;
    _pfnGetLibraryPathName = nullptr;
    _pfnResultToTextBufLen = nullptr;
    _pfnResultToText = nullptr;
}

namespace {

/// The default library in the folder of the module that holds this loader
/// (the plug-in, a tool or a test), or empty when that cannot be told.
std::string BesideThisModule() {
    Dl_info info{};
    if (!dladdr(reinterpret_cast<void*>(&BesideThisModule), &info) || !info.dli_fname) return std::string();
    std::string path = info.dli_fname;
    const size_t slash = path.rfind('/');
    if (slash == std::string::npos) return std::string();
    return path.substr(0, slash + 1) + kAAFDefaultLibraryName;
}

template <class Fn>
AAFRESULT Resolve(void* handle, const char* name, Fn& out) {
    void* symbol = nullptr;
    const AAFRESULT result = AAFFindSymbol(handle, name, &symbol);
    out = reinterpret_cast<Fn>(symbol);
    return result;
}
}  // namespace

AAFRESULT AAFDLL::Load(const char* dllname) {
    AAFRESULT opened = AAFLoadLibrary(dllname ? dllname : kAAFDefaultLibraryName, &_libHandle);
    // The bare default name is found through the caller's run path ($ORIGIN).
    // Where the system search cannot see that run path (a dlopen that a
    // sanitizer runtime intercepts makes the runtime the caller), the library
    // beside this module is the one meant; this is our choice of search path.
    if (opened != AAFRESULT_SUCCESS && !dllname) {
        const std::string beside = BesideThisModule();
        if (!beside.empty()) opened = AAFLoadLibrary(beside.c_str(), &_libHandle);
    }
    if (opened != AAFRESULT_SUCCESS) return opened;
    void* h = _libHandle;
    // Required symbols end the load when missing; the others stay null.
    AAFRESULT r;
    if (AAFRESULT_FAILED(r = Resolve(h, "AAFFileOpenExistingRead", _pfnOpenExistingRead))) return r;
    if (AAFRESULT_FAILED(r = Resolve(h, "AAFFileOpenExistingModify", _pfnOpenExistingModify))) return r;
    if (AAFRESULT_FAILED(r = Resolve(h, "AAFFileOpenNewModify", _pfnOpenNewModify))) return r;
    Resolve(h, "AAFFileOpenNewModifyEx", _pfnOpenNewModifyEx);
    if (AAFRESULT_FAILED(r = Resolve(h, "AAFFileOpenTransient", _pfnOpenTransient))) return r;
    if (AAFRESULT_FAILED(r = Resolve(h, "AAFFileIsAAFFile", _pfnIsAAFFile))) return r;
    Resolve(h, "AAFRawStorageIsAAFFile", _pfnRawStorageIsAAFFile);
    if (AAFRESULT_FAILED(r = Resolve(h, "AAFGetPluginManager", _pfnGetPluginManager))) return r;
    // Raw storage comes as a whole or not at all.
    if (AAFRESULT_SUCCEEDED(Resolve(h, "AAFCreateRawStorageMemory", _pfnCreateRawStorageMemory))) {
        if (AAFRESULT_FAILED(r = Resolve(h, "AAFCreateRawStorageDisk", _pfnCreateRawStorageDisk))) return r;
        if (AAFRESULT_FAILED(r = Resolve(h, "AAFCreateAAFFileOnRawStorage", _pfnCreateAAFFileOnRawStorage))) return r;
    }
    Resolve(h, "AAFSetProgressCallback", _pfnSetProgressCallback);
    Resolve(h, "AAFCreateRawStorageCachedDisk", _pfnCreateRawStorageCachedDisk);
    Resolve(h, "AAFCreateRawStorageCached", _pfnCreateRawStorageCached);
    Resolve(h, "AAFCreateRawStorageCached2", _pfnCreateRawStorageCached2);
    Resolve(h, "AAFGetFileEncodings", _pfnGetFileEncodings);
    Resolve(h, "AAFFileIsAAFFileKind", _pfnFileIsAAFFileKind);
    Resolve(h, "AAFRawStorageIsAAFFileKind", _pfnRawStorageIsAAFFileKind);
    Resolve(h, "AAFSetDiagnosticOutput", _pfnSetDiagnosticOutput);
    Resolve(h, "AAFGetLibraryVersion", _pfnGetLibraryVersion);
    Resolve(h, "AAFGetLibraryPathNameBufLen", _pfnGetLibraryPathNameBufLen);
    Resolve(h, "AAFGetLibraryPathName", _pfnGetLibraryPathName);
    Resolve(h, "AAFResultToTextBufLen", _pfnResultToTextBufLen);
    Resolve(h, "AAFResultToText", _pfnResultToText);
    return AAFRESULT_SUCCESS;
}

AAFRESULT AAFDLL::Unload() {
    if (!_libHandle) return AAFRESULT_SUCCESS;
    const AAFRESULT result = AAFUnloadLibrary(_libHandle);
    if (AAFRESULT_FAILED(result)) return result;
    _libHandle = nullptr;
    ClearEntrypoints();
    return result;
}

// Members of required symbols call without a test, as the forwarders do.
AAFRESULT AAFDLL::OpenExistingRead(const aafCharacter* a, aafUInt32 b, IAAFFile** c) {
    return _pfnOpenExistingRead(a, b, c);
}
AAFRESULT AAFDLL::OpenExistingModify(const aafCharacter* a, aafUInt32 b, aafProductIdentification_t* c, IAAFFile** d) {
    return _pfnOpenExistingModify(a, b, c, d);
}
AAFRESULT AAFDLL::OpenNewModify(const aafCharacter* a, aafUInt32 b, aafProductIdentification_t* c, IAAFFile** d) {
    return _pfnOpenNewModify(a, b, c, d);
}
AAFRESULT AAFDLL::OpenTransient(aafProductIdentification_t* a, IAAFFile** b) { return _pfnOpenTransient(a, b); }
AAFRESULT AAFDLL::GetPluginManager(IAAFPluginManager** a) { return _pfnGetPluginManager(a); }

AAFRESULT AAFDLL::IsAAFFile(const aafCharacter* a, aafUID_t* b, aafBool* c) {
    if (!_pfnIsAAFFile) return AAFRESULT_DLL_SYMBOL_NOT_FOUND;
    const AAFRESULT result = _pfnIsAAFFile(a, b, c);
    return result == AAFRESULT_NOT_IMPLEMENTED ? AAFRESULT_DLL_SYMBOL_NOT_FOUND : result;
}

#define AAFDLL_OPTIONAL(Member, Pointer, Params, Args)       \
    AAFRESULT AAFDLL::Member Params {                        \
        if (!Pointer) return AAFRESULT_DLL_SYMBOL_NOT_FOUND; \
        return Pointer Args;                                 \
    }

AAFDLL_OPTIONAL(OpenNewModifyEx, _pfnOpenNewModifyEx,
                (const aafCharacter* a, const aafUID_t* b, aafUInt32 c, aafProductIdentification_t* d, IAAFFile** e),
                (a, b, c, d, e))
AAFDLL_OPTIONAL(RawStorageIsAAFFile, _pfnRawStorageIsAAFFile, (IAAFRawStorage * a, aafUID_t* b, aafBool* c), (a, b, c))
AAFDLL_OPTIONAL(FileIsAAFFileKind, _pfnFileIsAAFFileKind, (const aafCharacter* a, const aafUID_t* b, aafBool* c),
                (a, b, c))
AAFDLL_OPTIONAL(RawStorageIsAAFFileKind, _pfnRawStorageIsAAFFileKind,
                (IAAFRawStorage * a, const aafUID_t* b, aafBool* c), (a, b, c))
AAFDLL_OPTIONAL(CreateRawStorageMemory, _pfnCreateRawStorageMemory, (aafFileAccess_t a, IAAFRawStorage** b), (a, b))
AAFDLL_OPTIONAL(CreateRawStorageDisk, _pfnCreateRawStorageDisk,
                (const aafCharacter* a, aafFileExistence_t b, aafFileAccess_t c, IAAFRawStorage** d), (a, b, c, d))
AAFDLL_OPTIONAL(CreateRawStorageCachedDisk, _pfnCreateRawStorageCachedDisk,
                (const aafCharacter* a, aafFileExistence_t b, aafFileAccess_t c, aafUInt32 d, aafUInt32 e,
                 IAAFRawStorage** f),
                (a, b, c, d, e, f))
AAFDLL_OPTIONAL(CreateRawStorageCached, _pfnCreateRawStorageCached,
                (IAAFRawStorage * a, aafUInt32 b, aafUInt32 c, IAAFRawStorage** d), (a, b, c, d))
AAFDLL_OPTIONAL(CreateRawStorageCached2, _pfnCreateRawStorageCached2,
                (IAAFRawStorage * a, aafUInt32 b, aafUInt32 c, IAAFCachePageAllocator* d, IAAFRawStorage** e),
                (a, b, c, d, e))
AAFDLL_OPTIONAL(CreateAAFFileOnRawStorage, _pfnCreateAAFFileOnRawStorage,
                (IAAFRawStorage * a, aafFileExistence_t b, aafFileAccess_t c, const aafUID_t* d, aafUInt32 e,
                 aafProductIdentification_t* f, IAAFFile** g),
                (a, b, c, d, e, f, g))
AAFDLL_OPTIONAL(SetProgressCallback, _pfnSetProgressCallback, (IAAFProgress * a), (a))
AAFDLL_OPTIONAL(GetFileEncodings, _pfnGetFileEncodings, (IEnumAAFFileEncodings * *a), (a))
AAFDLL_OPTIONAL(SetDiagnosticOutput, _pfnSetDiagnosticOutput, (IAAFDiagnosticOutput * a), (a))
AAFDLL_OPTIONAL(GetLibraryVersion, _pfnGetLibraryVersion, (aafProductVersion_t * a), (a))
AAFDLL_OPTIONAL(GetLibraryPathNameBufLen, _pfnGetLibraryPathNameBufLen, (aafUInt32 * a), (a))
AAFDLL_OPTIONAL(GetLibraryPathName, _pfnGetLibraryPathName, (aafCharacter * a, aafUInt32 b), (a, b))
AAFDLL_OPTIONAL(ResultToTextBufLen, _pfnResultToTextBufLen, (AAFRESULT a, aafUInt32* b), (a, b))
AAFDLL_OPTIONAL(ResultToText, _pfnResultToText, (AAFRESULT a, aafCharacter* b, aafUInt32 c), (a, b, c))

#undef AAFDLL_OPTIONAL
