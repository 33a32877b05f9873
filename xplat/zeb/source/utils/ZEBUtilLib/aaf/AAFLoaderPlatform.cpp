#include "AAFLoaderPlatform.h"

#include <dirent.h>
#include <dlfcn.h>
#include <sys/stat.h>

#include <cerrno>
#include <cstring>
#include <string>

#include "AAFDLL.h"

namespace {

constexpr AAFRESULT kBadFileSystemObject = static_cast<AAFRESULT>(0x80120019u);
constexpr AAFRESULT kBadDirectory = static_cast<AAFRESULT>(0x80120021u);
constexpr size_t kMaxPath = 1022;

/// Closes the folder on every path out of the walk.
struct DirCloser {
    DIR* dir;
    ~DirCloser() { closedir(dir); }
};

bool HasLibraryExtension(const char* name) {
    const char* dot = std::strrchr(name, '.');
    return dot && std::strcmp(dot + 1, kAAFLibraryExtension) == 0;
}

}  // namespace

extern "C" {

AAFRESULT AAFLoad(const char* dllname) {
    if (AAFDLL::GetAAFDLL()) return AAFRESULT_ALREADY_INITIALIZED;
    AAFDLL* dll = AAFDLL::MakeAAFDLL();
    const AAFRESULT result = dll->Load(dllname);
    if (result != AAFRESULT_SUCCESS) {
        dll->Unload();
        delete dll;
    }
    return result;
}

AAFRESULT AAFUnload() {
    AAFDLL* dll = AAFDLL::GetAAFDLL();
    if (!dll) return AAFRESULT_SUCCESS;
    if (dll->HasHandle()) {
        const AAFRESULT result = dll->Unload();
        if (AAFRESULT_FAILED(result)) return result;
    }
    delete dll;
    return AAFRESULT_SUCCESS;
}

AAFRESULT AAFGetStaticLibraryVersion(aafProductVersion_t* pVersion) {
    if (!pVersion) return AAFRESULT_NULL_PARAM;
    *pVersion = aafProductVersion_t{2, 0, 8, 10032, kAAFVersionReleased};
    return AAFRESULT_SUCCESS;
}

AAFRESULT AAFLoadLibrary(const char* name, void** pLibHandle) {
    if (!name || !pLibHandle) return AAFRESULT_NULL_PARAM;
    *pLibHandle = dlopen(name, RTLD_NOW);
    return *pLibHandle ? AAFRESULT_SUCCESS : AAFRESULT_DLL_LOAD_FAILED;
}

AAFRESULT AAFUnloadLibrary(void* libHandle) { return libHandle ? AAFRESULT_SUCCESS : AAFRESULT_NULL_PARAM; }

AAFRESULT AAFFindSymbol(void* libHandle, const char* symbolName, void** pSymbol) {
    if (!libHandle || !symbolName || !pSymbol) return AAFRESULT_NULL_PARAM;
    *pSymbol = dlsym(libHandle, symbolName);
    return *pSymbol ? AAFRESULT_SUCCESS : AAFRESULT_DLL_SYMBOL_NOT_FOUND;
}

AAFRESULT AAFFindLibrary(const char* path, LPFNAAFTESTFILEPROC callback, void* userData) {
    if (!path || !callback) return AAFRESULT_NULL_PARAM;
    DIR* dir = opendir(path);
    if (!dir) return kBadDirectory;
    DirCloser closer{dir};
    const size_t pathLength = std::strlen(path);
    while (const dirent* entry = readdir(dir)) {
        if (std::strlen(entry->d_name) + pathLength > kMaxPath) return AAFRESULT_INVALID_PARAM;
        const std::string full = std::string(path) + "/" + entry->d_name;
        struct stat info;
        if (lstat(full.c_str(), &info) != 0) {
            switch (errno) {
                case EBADF:
                case EFAULT:
                    return kBadFileSystemObject;
                case ENOMEM:
                    return AAFRESULT_NOMEMORY;
                case EACCES:
                    continue;
                default:
                    return kBadDirectory;
            }
        }
        AAFRESULT result = AAFRESULT_SUCCESS;
        if (S_ISREG(info.st_mode) && HasLibraryExtension(entry->d_name))
            result = callback(full.c_str(), entry->d_name, 0, userData);
        else if (S_ISDIR(info.st_mode) && std::strcmp(entry->d_name, ".") != 0 && std::strcmp(entry->d_name, "..") != 0)
            result = callback(full.c_str(), entry->d_name, 1, userData);
        if (result != AAFRESULT_SUCCESS) return result;
    }
    return AAFRESULT_SUCCESS;
}

}  // extern "C"
