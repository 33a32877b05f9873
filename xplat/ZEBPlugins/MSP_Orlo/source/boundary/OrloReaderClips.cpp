#include "boundary/OrloReaderClips.h"

#include "tov/sdk/TOVComponent.h"

namespace ZEB {
namespace Impl {

TOVRESULT OrloReaderClips::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<OrloReaderClips>(host, outer, iid, out);
}

OrloReaderClips::~OrloReaderClips() {
    if (m_pAAFFile) m_pAAFFile->Release();
}

TOVRESULT OrloReaderClips::InitializeInstance(ITOVUnknown* host) {
    return TOVGuarded([&] {
        if (!host) throw static_cast<int>(TOV_E_POINTER);
        return TOV_OK;
    });
}

TOVRESULT OrloReaderClips::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        if (iid == IID_IClips) return TOVExpose<IClips>(this, out);
        if (iid == IID_IAAFClips) return TOVExpose<IAAFClips>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}

TOVRESULT OrloReaderClips::GetMetadata(unsigned int, UTIL::ITOVXmlParser**) { return TOV_E_NOTSUPPORTED; }

TOVRESULT OrloReaderClips::GetMetadata(unsigned int index, IAAFFile** out) {
    return TOVGuarded([&] {
        if (index != 0) return TOV_E_OUTOFRANGE;
        if (!out) return TOV_OK;
        // Not guarded: the host only gets lists that the container has filled.
        m_pAAFFile->AddRef();
        *out = m_pAAFFile;
        return TOV_OK;
    });
}

void OrloReaderClips::SetAAFFile(IAAFFile* file) {
    if (file == m_pAAFFile) return;
    if (file) file->AddRef();
    if (m_pAAFFile) m_pAAFFile->Release();
    m_pAAFFile = file;
}

}  // namespace Impl
}  // namespace ZEB
