#pragma once
/// OpenSSL's libcrypto, opened at the first digest rather than at start:
/// loading and relocating it costs every run of a process a few milliseconds,
/// and most runs of the tool never take a digest. Only the MD5 entry points
/// that the host and the tool use are bound.
#include <openssl/evp.h>

class CryptoLibrary {
public:
    /// The library with its entry points bound, opened once for the life of
    /// the process; null when it cannot be loaded or lacks one of them.
    static const CryptoLibrary* Get();

    EVP_MD_CTX* (*MD_CTX_new)() = nullptr;
    void (*MD_CTX_free)(EVP_MD_CTX*) = nullptr;
    const EVP_MD* (*md5)() = nullptr;
    int (*DigestInit_ex)(EVP_MD_CTX*, const EVP_MD*, ENGINE*) = nullptr;
    int (*DigestUpdate)(EVP_MD_CTX*, const void*, size_t) = nullptr;
    int (*DigestFinal_ex)(EVP_MD_CTX*, unsigned char*, unsigned int*) = nullptr;
};
