#pragma once
/// The host's content identifier generator (TOVCompID_UIDGenerator) over
/// OpenSSL's MD5. The object keeps nothing: each context is one digest in
/// progress, independent of the others and of the object that began it.
///
/// How this implementation reads the interface:
/// - The result is the 16 digest bytes copied unaltered, in order, into the
///   record's memory; no version or variant bits are set. On a little-endian
///   machine Data1 read as a number is digest bytes 0-3 in reverse
///   (d0 | d1 << 8 | d2 << 16 | d3 << 24), Data2 bytes 4-5 and Data3 bytes
///   6-7 likewise; Data4 is bytes 8-15 in order. So the same bytes give the
///   same UID on every machine of one byte order.
/// - The context is the digest state itself. Finish frees it whatever the
///   outcome and sets `*context` to null; a context never finished is the
///   caller's leak.
/// - Null arguments are TOV_E_INVALIDARG, and so is null data with a count
///   other than 0; a refused call changes nothing, so a context refused by
///   Finish can still be finished.
/// - A failure inside the digest is TOV_E_FAIL, no memory for a context TOV_E_OUTOFMEMORY.
#include "tov/ITOVUIDGeneratorMD5.h"
#include "tov/sdk/CTOVUnknown.h"

inline constexpr _tovUID CLSID_HostUIDGeneratorMD5 = {
    0x9FADABD7, 0xD5F4, 0x44EE, {0x97, 0x73, 0xEE, 0x5B, 0x23, 0x4A, 0xE6, 0x83}};

class HostUIDGeneratorMD5 : public ITOVUIDGeneratorMD5, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit HostUIDGeneratorMD5(ITOVUnknown* outer) : CTOVUnknown(outer) {}

    TOV_FORWARD_UNKNOWN

    TOVRESULT Begin(void** context) override;
    TOVRESULT AddData(void* context, unsigned char* data, unsigned int count) override;
    TOVRESULT Finish(_aafUID_t* result, void** context) override;

    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;
};
