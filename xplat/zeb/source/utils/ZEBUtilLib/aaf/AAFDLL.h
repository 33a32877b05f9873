#pragma once
/// The AAF library as the plug-in sees it: loaded at the first call, its
/// entry points resolved once into a table that this one instance holds.
#include "aaf/AAF.h"

/// The default library: found by the system's search, which for the plug-in
/// and the tools is their own folder ($ORIGIN in their run path).
inline constexpr const char* kAAFDefaultLibraryName = "libcom-api.so";

class AAFDLL {
public:
    AAFDLL();
    virtual ~AAFDLL();

    /// The one instance, or null.
    static AAFDLL* GetAAFDLL() { return _singleton; }
    /// Makes a fresh instance, which becomes the singleton.
    static AAFDLL* MakeAAFDLL();

    /// Opens `dllname` (the default when null) and resolves the table.
    AAFRESULT Load(const char* dllname);
    /// Forgets the library: it stays mapped, and what it handed out keeps working.
    AAFRESULT Unload();
    void ClearEntrypoints();
    bool HasHandle() const { return _libHandle != nullptr; }

    AAFRESULT OpenExistingRead(const aafCharacter* pFileName, aafUInt32 modeFlags, IAAFFile** ppFile);
    AAFRESULT OpenExistingModify(const aafCharacter* pFileName, aafUInt32 modeFlags, aafProductIdentification_t* pIdent,
                                 IAAFFile** ppFile);
    AAFRESULT OpenNewModify(const aafCharacter* pFileName, aafUInt32 modeFlags, aafProductIdentification_t* pIdent,
                            IAAFFile** ppFile);
    AAFRESULT OpenNewModifyEx(const aafCharacter* pFileName, const aafUID_t* pFileKind, aafUInt32 modeFlags,
                              aafProductIdentification_t* pIdent, IAAFFile** ppFile);
    AAFRESULT OpenTransient(aafProductIdentification_t* pIdent, IAAFFile** ppFile);
    AAFRESULT IsAAFFile(const aafCharacter* pFileName, aafUID_t* pAAFFileKind, aafBool* pFileIsAAFFile);
    AAFRESULT RawStorageIsAAFFile(IAAFRawStorage* pRawStorage, aafUID_t* pAAFFileKind, aafBool* pIsAAFFile);
    AAFRESULT FileIsAAFFileKind(const aafCharacter* pFileName, const aafUID_t* pAAFFileKind, aafBool* pIsAAFFile);
    AAFRESULT RawStorageIsAAFFileKind(IAAFRawStorage* pRawStorage, const aafUID_t* pAAFFileKind, aafBool* pIsAAFFile);
    AAFRESULT GetPluginManager(IAAFPluginManager** ppPluginManager);
    AAFRESULT CreateRawStorageMemory(aafFileAccess_t access, IAAFRawStorage** ppNewRawStorage);
    AAFRESULT CreateRawStorageDisk(const aafCharacter* pFilename, aafFileExistence_t existence, aafFileAccess_t access,
                                   IAAFRawStorage** ppNewRawStorage);
    AAFRESULT CreateRawStorageCachedDisk(const aafCharacter* pFilename, aafFileExistence_t existence,
                                         aafFileAccess_t access, aafUInt32 pageCount, aafUInt32 pageSize,
                                         IAAFRawStorage** ppNewRawStorage);
    AAFRESULT CreateRawStorageCached(IAAFRawStorage* pRawStorage, aafUInt32 pageCount, aafUInt32 pageSize,
                                     IAAFRawStorage** ppNewRawStorage);
    AAFRESULT CreateRawStorageCached2(IAAFRawStorage* pRawStorage, aafUInt32 pageCount, aafUInt32 pageSize,
                                      IAAFCachePageAllocator* pCachePageAllocator, IAAFRawStorage** ppNewRawStorage);
    AAFRESULT CreateAAFFileOnRawStorage(IAAFRawStorage* pRawStorage, aafFileExistence_t existence,
                                        aafFileAccess_t access, const aafUID_t* pFileKind, aafUInt32 modeFlags,
                                        aafProductIdentification_t* pIdent, IAAFFile** ppNewFile);
    AAFRESULT SetProgressCallback(IAAFProgress* pProgress);
    AAFRESULT GetFileEncodings(IEnumAAFFileEncodings** ppFileEncodings);
    AAFRESULT SetDiagnosticOutput(IAAFDiagnosticOutput* pOutput);
    AAFRESULT GetLibraryVersion(aafProductVersion_t* pVersion);
    AAFRESULT GetLibraryPathNameBufLen(aafUInt32* pBufSize);
    AAFRESULT GetLibraryPathName(aafCharacter* pLibraryPathName, aafUInt32 bufSize);
    AAFRESULT ResultToTextBufLen(AAFRESULT result, aafUInt32* pResultTextSize);
    AAFRESULT ResultToText(AAFRESULT result, aafCharacter* pResultText, aafUInt32 resultTextSize);

private:
    static AAFDLL* _singleton;

    void* _libHandle;
    // The entry points, in the library's table order; null until resolved.
    decltype(&::AAFFileOpenExistingRead) _pfnOpenExistingRead;
    decltype(&::AAFFileOpenExistingModify) _pfnOpenExistingModify;
    decltype(&::AAFFileOpenNewModify) _pfnOpenNewModify;
    decltype(&::AAFFileOpenNewModifyEx) _pfnOpenNewModifyEx;
    decltype(&::AAFFileOpenTransient) _pfnOpenTransient;
    decltype(&::AAFFileIsAAFFile) _pfnIsAAFFile;
    decltype(&::AAFRawStorageIsAAFFile) _pfnRawStorageIsAAFFile;
    decltype(&::AAFFileIsAAFFileKind) _pfnFileIsAAFFileKind;
    decltype(&::AAFRawStorageIsAAFFileKind) _pfnRawStorageIsAAFFileKind;
    decltype(&::AAFGetPluginManager) _pfnGetPluginManager;
    decltype(&::AAFCreateRawStorageMemory) _pfnCreateRawStorageMemory;
    decltype(&::AAFCreateRawStorageDisk) _pfnCreateRawStorageDisk;
    decltype(&::AAFCreateRawStorageCachedDisk) _pfnCreateRawStorageCachedDisk;
    decltype(&::AAFCreateRawStorageCached) _pfnCreateRawStorageCached;
    decltype(&::AAFCreateRawStorageCached2) _pfnCreateRawStorageCached2;
    decltype(&::AAFCreateAAFFileOnRawStorage) _pfnCreateAAFFileOnRawStorage;
    decltype(&::AAFSetProgressCallback) _pfnSetProgressCallback;
    decltype(&::AAFGetFileEncodings) _pfnGetFileEncodings;
    decltype(&::AAFSetDiagnosticOutput) _pfnSetDiagnosticOutput;
    decltype(&::AAFGetLibraryVersion) _pfnGetLibraryVersion;
    decltype(&::AAFGetLibraryPathNameBufLen) _pfnGetLibraryPathNameBufLen;
    decltype(&::AAFGetLibraryPathName) _pfnGetLibraryPathName;
    decltype(&::AAFResultToTextBufLen) _pfnResultToTextBufLen;
    decltype(&::AAFResultToText) _pfnResultToText;
};
