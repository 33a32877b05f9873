#include "tov/host/HostUIDGeneratorMD5.h"

#include <cstring>

#include "tov/host/CryptoLibrary.h"
#include "tov/sdk/TOVComponent.h"

namespace {

constexpr unsigned int kMD5Size = 16;
static_assert(sizeof(_aafUID_t) == kMD5Size, "an AAF UID holds exactly one MD5 digest");

}  // namespace

TOVRESULT HostUIDGeneratorMD5::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<HostUIDGeneratorMD5>(host, outer, iid, out);
}

TOVRESULT HostUIDGeneratorMD5::Begin(void** context) {
    return TOVGuarded([&] {
        if (!context) return TOV_E_INVALIDARG;
        *context = nullptr;
        const CryptoLibrary* crypto = CryptoLibrary::Get();
        if (!crypto) return TOV_E_FAIL;
        EVP_MD_CTX* digest = crypto->MD_CTX_new();
        if (!digest) return TOV_E_OUTOFMEMORY;
        if (crypto->DigestInit_ex(digest, crypto->md5(), nullptr) != 1) {
            crypto->MD_CTX_free(digest);
            return TOV_E_FAIL;
        }
        *context = digest;
        return TOV_OK;
    });
}

TOVRESULT HostUIDGeneratorMD5::AddData(void* context, unsigned char* data, unsigned int count) {
    return TOVGuarded([&] {
        if (!context || (!data && count != 0)) return TOV_E_INVALIDARG;
        // A context exists only where Begin found the library.
        const CryptoLibrary* crypto = CryptoLibrary::Get();
        return crypto->DigestUpdate(static_cast<EVP_MD_CTX*>(context), data, count) == 1 ? TOV_OK : TOV_E_FAIL;
    });
}

TOVRESULT HostUIDGeneratorMD5::Finish(_aafUID_t* result, void** context) {
    return TOVGuarded([&] {
        if (!result || !context || !*context) return TOV_E_INVALIDARG;
        EVP_MD_CTX* digest = static_cast<EVP_MD_CTX*>(*context);
        *context = nullptr;
        unsigned char bytes[EVP_MAX_MD_SIZE];
        unsigned int size = 0;
        const CryptoLibrary* crypto = CryptoLibrary::Get();
        const bool done = crypto->DigestFinal_ex(digest, bytes, &size) == 1 && size == kMD5Size;
        crypto->MD_CTX_free(digest);
        if (!done) return TOV_E_FAIL;
        std::memcpy(result, bytes, kMD5Size);
        return TOV_OK;
    });
}

TOVRESULT HostUIDGeneratorMD5::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == IID_ITOVUIDGeneratorMD5) return TOVExpose<ITOVUIDGeneratorMD5>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}
