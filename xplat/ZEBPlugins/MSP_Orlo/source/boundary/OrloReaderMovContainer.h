#pragma once
/// The container through which the host links one audio file: it parses the
/// file, builds its Movie and AAF clip, and makes the sample map. A file it
/// cannot parse is handed on to the host's QuickTime container, which from
/// then on answers the clip and sample map calls.
///
/// States: no path, path set, movie parsed, redirected (terminal; a movie
/// parsed before is then ignored).
#include "aaf/IAAFFile.h"
#include "aafbuilder/IAAFSmartPointer.h"
#include "clipmodel/Movie.h"
#include "strings/ZEBString.h"
#include "tov/IMediaContainer3.h"
#include "tov/ITOVComponentFactory.h"
#include "tov/sdk/CTOVUnknown.h"
#include "tov/sdk/TOVPtr.h"

namespace ZEB {
namespace Impl {

class OrloReaderMovContainer : public IMediaContainer3, public CTOVUnknown {
public:
    static TOVRESULT TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out);
    explicit OrloReaderMovContainer(ITOVUnknown* outer) : CTOVUnknown(outer) {}
    /// Deletes the movie, releases the redirection, then the path, the AAF
    /// file and the factory, in that order.
    ~OrloReaderMovContainer() override;

    TOV_FORWARD_UNKNOWN

    /// Keeps the host's component factory.
    TOVRESULT InitializeInstance(ITOVUnknown* host) override;
    TOVRESULT InternalQueryInterface(const _tovUID& iid, void** out) override;

    /// 1 when the file's chunks and any iXML text parse. Otherwise the answer
    /// of the redirection, or 0 when the host has no container to take it.
    /// Only a host without a factory makes this throw (TOV_E_POINTER), which
    /// creation prevents.
    int32_t IsContainerSupported() override;
    /// 1, always.
    int32_t IsAAFSupported() override { return 1; }
    /// TOV_E_NOTSUPPORTED, always: clips come only as AAF.
    TOVRESULT GetMasterClips(ITOVString* path, IClips** out) override;
    /// A new clip list holding a newly built AAF file; the Movie is parsed by
    /// the first call only.
    TOVRESULT GetAAFMasterClips(IAAFClips** out) override;
    /// Once: a second call fails with ZEB_E_ALREADYSET and keeps the first path.
    TOVRESULT SetFilePath(ITOVString* path) override;
    /// A new sample map of the file, or the redirection's.
    TOVRESULT GetSampleMapping(ISampleMapping** out) override;
    /// TOV_E_NOTSUPPORTED, always.
    TOVRESULT SetAttributeCallback(IAttributeCallback* callback) override;
    /// 0x4003, whose bits are the host's.
    TOVRESULT GetCapabilities(unsigned int* out) const override;
    unsigned int GetFileExtensionCount() const override;
    TOVRESULT GetFileExtension(unsigned int index, ITOVString** extension, ITOVString** shortName,
                               ITOVString** description) const override;

private:
    /// True when a redirected container exists or could be made and took the
    /// path; false when the host has none.
    bool InitializeRedirection();

    // Declared so that, after the destructor's body has deleted the movie and
    // released the redirection, the path goes, then the AAF file, then the factory.
    TOVPtr<ITOVComponentFactory> m_Factory;
    IAAFSmartPointer<IAAFFile> m_AAFFile;
    ZEBString m_Path;
    OrloReader::Movie* m_pMovie = nullptr;
    TOVPtr<IMediaContainer> m_Redirected;
};

}  // namespace Impl
}  // namespace ZEB
