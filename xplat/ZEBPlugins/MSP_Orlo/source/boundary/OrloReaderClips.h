#pragma once
/// The clip list that the container hands the host: one transient AAF file,
/// answered as clip 0. The XML form of the list is not offered.
#include "aaf/IAAFFile.h"
#include "tov/IClips.h"
#include "tov/sdk/CTOVUnknown.h"

namespace ZEB {
namespace Impl {

class OrloReaderClips : public IClips, public IAAFClips, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit OrloReaderClips(ITOVUnknown* outer) : CTOVUnknown(outer) {}
    ~OrloReaderClips() override;

    TOV_FORWARD_UNKNOWN

    /// Keeps no service of the host: only a null host fails.
    TOVRESULT InitializeInstance(ITOVUnknown* host) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

    /// 1, always, whether or not a file was set: the container sets one
    /// before it hands the list out.
    unsigned int Count() override { return 1; }
    /// TOV_E_NOTSUPPORTED, always.
    TOVRESULT GetMetadata(unsigned int index, UTIL::ITOVXmlParser** out) override;
    /// The AAF file with one reference for the caller. A null `out` is not an
    /// error: nothing happens.
    TOVRESULT GetMetadata(unsigned int index, IAAFFile** out) override;

    /// Holds `file` (one reference) in place of the one held before.
    void SetAAFFile(IAAFFile* file);

private:
    IAAFFile* m_pAAFFile = nullptr;
};

}  // namespace Impl
}  // namespace ZEB
