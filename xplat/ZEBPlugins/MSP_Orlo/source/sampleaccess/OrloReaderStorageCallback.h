#pragma once
/// The map's default way to the file's bytes: length and positional read on
/// the path, the file opened at first use and closed when the object goes.
/// Not a registered component: made by plain construction, it answers
/// `QueryInterface` for ITOVUnknown alone, and starts at a count of 0.
#include <cstdint>
#include <string>

#include "strings/ZEBString.h"
#include "tov/IStorageCallback.h"
#include "tov/sdk/CTOVUnknown.h"

namespace ZEB {
namespace Impl {

class OrloReaderStorageCallback : public IStorageCallback, public CTOVUnknown {
public:
    explicit OrloReaderStorageCallback(const ZEBString& path);
    /// Closes an open file; a failed close is logged, never thrown.
    ~OrloReaderStorageCallback() override;

    TOV_FORWARD_UNKNOWN

    /// The size as `stat` reports it on the path. A size once known (not 0)
    /// is kept, also if the file grows.
    TOVRESULT GetLength(unsigned long long* out) override;
    /// A short read, also one of nothing at the end, succeeds; the rest of
    /// `buffer` is left as it was.
    TOVRESULT Read(unsigned long long offset, unsigned char* buffer, unsigned int size) override;

private:
    /// Opens the file unless a descriptor is held. Only descriptor 0 counts as
    /// a failure: a failed open (-1) is kept as if open, and surfaces at the
    /// next read or close.
    void init();
    std::string Utf8Path() const;

    ZEBString m_Path;
    int m_FileDescriptor = 0;
    uint64_t m_Length = 0;
};

}  // namespace Impl
}  // namespace ZEB
