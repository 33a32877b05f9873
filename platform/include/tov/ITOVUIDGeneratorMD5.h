#pragma once
/// The host's content identifier generator: an MD5 digest over the bytes
/// added, in order, given back as a 16-byte AAF UID.
#include "aaf/AAFTypes.h"
#include "tov/ITOVUnknown.h"

inline constexpr _tovUID IID_ITOVUIDGeneratorMD5 = {
    0xEAA499A0, 0x414A, 0x4755, {0xB8, 0x00, 0x5D, 0xF7, 0xD6, 0x35, 0xC6, 0x02}};
inline constexpr _tovUID TOVCompID_UIDGenerator = {
    0x0A949D4F, 0xB3B5, 0x11D7, {0x94, 0xA1, 0x00, 0x30, 0x65, 0x42, 0xA0, 0x24}};

/// A digest lives in a context that Begin makes and Finish frees; contexts are
/// independent of each other and of the generator object.
class ITOVUIDGeneratorMD5 : public ITOVUnknown {
public:
    /// Starts a digest into `*context`.
    virtual TOVRESULT Begin(void** context) = 0;
    /// Feeds `count` bytes; a count of 0 is allowed and adds nothing.
    virtual TOVRESULT AddData(void* context, unsigned char* data, unsigned int count) = 0;
    /// Ends the digest, writes its 16 bytes into `result` and frees the
    /// context, setting `*context` to null. The bytes are the digest copied
    /// unaltered and in order into the record's memory, so Data1 to Data3 read
    /// as numbers in the machine's byte order.
    virtual TOVRESULT Finish(_aafUID_t* result, void** context) = 0;

protected:
    ~ITOVUIDGeneratorMD5() = default;
};
