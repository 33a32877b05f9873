#include "tov/host/CryptoLibrary.h"

#include <dlfcn.h>
#include <openssl/opensslv.h>

#include <string>

namespace {

template <class Function>
bool Bind(void* library, const char* name, Function& function) {
    function = reinterpret_cast<Function>(dlsym(library, name));
    return function != nullptr;
}

CryptoLibrary* Open() {
    // The soname of the major version the host was built against.
    const std::string name = "libcrypto.so." + std::to_string(OPENSSL_VERSION_MAJOR);
    void* library = dlopen(name.c_str(), RTLD_NOW | RTLD_LOCAL);
    if (!library) return nullptr;
    static CryptoLibrary bound;
    const bool complete = Bind(library, "EVP_MD_CTX_new", bound.MD_CTX_new) &&
                          Bind(library, "EVP_MD_CTX_free", bound.MD_CTX_free) && Bind(library, "EVP_md5", bound.md5) &&
                          Bind(library, "EVP_DigestInit_ex", bound.DigestInit_ex) &&
                          Bind(library, "EVP_DigestUpdate", bound.DigestUpdate) &&
                          Bind(library, "EVP_DigestFinal_ex", bound.DigestFinal_ex);
    // Kept open for the life of the process: digests may be in progress anywhere.
    return complete ? &bound : nullptr;
}

}  // namespace

const CryptoLibrary* CryptoLibrary::Get() {
    static const CryptoLibrary* const library = Open();
    return library;
}
