#pragma once
/// The loader's platform layer and load control: dlopen and dlsym behind the
/// AAF result values, the walk of a folder for libraries, and the explicit
/// load and unload of the library.
#include "aaf/AAFResult.h"
#include "aaf/AAFTypes.h"

/// The file name extension of libraries, as AAFFindLibrary reports them.
inline constexpr const char* kAAFLibraryExtension = "so";

extern "C" {
/// Loads `dllname` (the default when null); AAFRESULT_ALREADY_INITIALIZED when loaded already.
AAFRESULT AAFLoad(const char* dllname);
/// Forgets the loaded library, if any.
AAFRESULT AAFUnload();
/// The version of this loading layer, without loading anything.
AAFRESULT AAFGetStaticLibraryVersion(aafProductVersion_t* pVersion);

AAFRESULT AAFLoadLibrary(const char* name, void** pLibHandle);
/// Leaves the library mapped until the process ends, on purpose: objects it
/// handed out keep working after an unload.
AAFRESULT AAFUnloadLibrary(void* libHandle);
AAFRESULT AAFFindSymbol(void* libHandle, const char* symbolName, void** pSymbol);
/// Called with the full path, the entry's name, 0 for a file or 1 for a
/// folder, and the caller's data; a non-zero result stops the walk.
typedef AAFRESULT (*LPFNAAFTESTFILEPROC)(const char* path, const char* name, char isDirectory, void* userData);
/// Reports the libraries and the folders of one folder, without going below it.
AAFRESULT AAFFindLibrary(const char* path, LPFNAAFTESTFILEPROC callback, void* userData);
}
