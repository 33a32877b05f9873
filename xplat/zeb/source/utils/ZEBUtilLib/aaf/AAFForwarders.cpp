// The library's C entry points, as the plug-in calls them: each one loads
// the library at its first use and forwards to the AAFDLL member of the same
// name, and no exception from the library crosses it.
#include "AAFDLL.h"
#include "AAFLoaderPlatform.h"

namespace {

constexpr AAFRESULT kLibraryException = static_cast<AAFRESULT>(0x801201D1u);

/// Loads the default library when none is loaded. A failed load leaves no
/// instance behind, so that the next call tries again from the start.
AAFRESULT EnsureLoaded() {
    if (AAFDLL::GetAAFDLL()) return AAFRESULT_SUCCESS;
    AAFDLL* dll = AAFDLL::MakeAAFDLL();
    const AAFRESULT result = dll->Load(nullptr);
    if (result != AAFRESULT_SUCCESS) {
        dll->Unload();
        delete dll;
    }
    return result;
}

template <class Call>
AAFRESULT Forward(Call&& call) {
    const AAFRESULT loaded = EnsureLoaded();
    if (loaded != AAFRESULT_SUCCESS) return loaded;
    try {
        return call(*AAFDLL::GetAAFDLL());
    } catch (...) {
        return kLibraryException;
    }
}

}  // namespace

extern "C" {

AAFRESULT AAFFileOpenExistingRead(const aafCharacter* a, aafUInt32 b, IAAFFile** c) {
    return Forward([&](AAFDLL& d) { return d.OpenExistingRead(a, b, c); });
}
AAFRESULT AAFFileOpenExistingModify(const aafCharacter* a, aafUInt32 b, aafProductIdentification_t* c, IAAFFile** e) {
    return Forward([&](AAFDLL& d) { return d.OpenExistingModify(a, b, c, e); });
}
AAFRESULT AAFFileOpenNewModify(const aafCharacter* a, aafUInt32 b, aafProductIdentification_t* c, IAAFFile** e) {
    return Forward([&](AAFDLL& d) { return d.OpenNewModify(a, b, c, e); });
}
AAFRESULT AAFFileOpenNewModifyEx(const aafCharacter* a, const aafUID_t* b, aafUInt32 c, aafProductIdentification_t* e,
                                 IAAFFile** f) {
    return Forward([&](AAFDLL& d) { return d.OpenNewModifyEx(a, b, c, e, f); });
}
AAFRESULT AAFFileOpenTransient(aafProductIdentification_t* a, IAAFFile** b) {
    return Forward([&](AAFDLL& d) { return d.OpenTransient(a, b); });
}
AAFRESULT AAFFileIsAAFFile(const aafCharacter* a, aafUID_t* b, aafBool* c) {
    return Forward([&](AAFDLL& d) { return d.IsAAFFile(a, b, c); });
}
AAFRESULT AAFRawStorageIsAAFFile(IAAFRawStorage* a, aafUID_t* b, aafBool* c) {
    return Forward([&](AAFDLL& d) { return d.RawStorageIsAAFFile(a, b, c); });
}
AAFRESULT AAFFileIsAAFFileKind(const aafCharacter* a, const aafUID_t* b, aafBool* c) {
    return Forward([&](AAFDLL& d) { return d.FileIsAAFFileKind(a, b, c); });
}
AAFRESULT AAFRawStorageIsAAFFileKind(IAAFRawStorage* a, const aafUID_t* b, aafBool* c) {
    return Forward([&](AAFDLL& d) { return d.RawStorageIsAAFFileKind(a, b, c); });
}
AAFRESULT AAFGetPluginManager(IAAFPluginManager** a) {
    return Forward([&](AAFDLL& d) { return d.GetPluginManager(a); });
}
AAFRESULT AAFCreateRawStorageMemory(aafFileAccess_t a, IAAFRawStorage** b) {
    return Forward([&](AAFDLL& d) { return d.CreateRawStorageMemory(a, b); });
}
AAFRESULT AAFCreateRawStorageDisk(const aafCharacter* a, aafFileExistence_t b, aafFileAccess_t c, IAAFRawStorage** e) {
    return Forward([&](AAFDLL& d) { return d.CreateRawStorageDisk(a, b, c, e); });
}
AAFRESULT AAFCreateRawStorageCachedDisk(const aafCharacter* a, aafFileExistence_t b, aafFileAccess_t c, aafUInt32 e,
                                        aafUInt32 f, IAAFRawStorage** g) {
    return Forward([&](AAFDLL& d) { return d.CreateRawStorageCachedDisk(a, b, c, e, f, g); });
}
AAFRESULT AAFCreateRawStorageCached(IAAFRawStorage* a, aafUInt32 b, aafUInt32 c, IAAFRawStorage** e) {
    return Forward([&](AAFDLL& d) { return d.CreateRawStorageCached(a, b, c, e); });
}
AAFRESULT AAFCreateRawStorageCached2(IAAFRawStorage* a, aafUInt32 b, aafUInt32 c, IAAFCachePageAllocator* e,
                                     IAAFRawStorage** f) {
    return Forward([&](AAFDLL& d) { return d.CreateRawStorageCached2(a, b, c, e, f); });
}
AAFRESULT AAFCreateAAFFileOnRawStorage(IAAFRawStorage* a, aafFileExistence_t b, aafFileAccess_t c, const aafUID_t* e,
                                       aafUInt32 f, aafProductIdentification_t* g, IAAFFile** h) {
    return Forward([&](AAFDLL& d) { return d.CreateAAFFileOnRawStorage(a, b, c, e, f, g, h); });
}
AAFRESULT AAFSetProgressCallback(IAAFProgress* a) {
    return Forward([&](AAFDLL& d) { return d.SetProgressCallback(a); });
}
AAFRESULT AAFGetFileEncodings(IEnumAAFFileEncodings** a) {
    return Forward([&](AAFDLL& d) { return d.GetFileEncodings(a); });
}
AAFRESULT AAFSetDiagnosticOutput(IAAFDiagnosticOutput* a) {
    return Forward([&](AAFDLL& d) { return d.SetDiagnosticOutput(a); });
}
AAFRESULT AAFGetLibraryVersion(aafProductVersion_t* a) {
    return Forward([&](AAFDLL& d) { return d.GetLibraryVersion(a); });
}
AAFRESULT AAFGetLibraryPathNameBufLen(aafUInt32* a) {
    return Forward([&](AAFDLL& d) { return d.GetLibraryPathNameBufLen(a); });
}
AAFRESULT AAFGetLibraryPathName(aafCharacter* a, aafUInt32 b) {
    return Forward([&](AAFDLL& d) { return d.GetLibraryPathName(a, b); });
}
AAFRESULT AAFResultToTextBufLen(AAFRESULT a, aafUInt32* b) {
    return Forward([&](AAFDLL& d) { return d.ResultToTextBufLen(a, b); });
}
AAFRESULT AAFResultToText(AAFRESULT a, aafCharacter* b, aafUInt32 c) {
    return Forward([&](AAFDLL& d) { return d.ResultToText(a, b, c); });
}

}  // extern "C"
