#include "boundary/OrloReaderMovContainer.h"

#include <memory>

#include "aafbuilder/NewAAFFromMovie.h"
#include "boundary/ModuleGlobals.h"
#include "boundary/NewMovieFromFilePath.h"
#include "boundary/OrloConstants.h"
#include "boundary/OrloReaderClips.h"
#include "boundary/OrloRegInfo.h"
#include "reader/OrloStream.h"
#include "reader/ixml/IXMLData.h"
#include "sampleaccess/OrloReaderSampleMapping.h"
#include "tov/sdk/TOVComponent.h"

namespace ZEB {
namespace Impl {

namespace {

constexpr unsigned int kCapabilities = 0x4003;

}  // namespace

TOVRESULT OrloReaderMovContainer::TOVCreate(ITOVUnknown* host, ITOVUnknown* outer, const _tovUID& iid, void** out) {
    return TOVCreateComponent<OrloReaderMovContainer>(host, outer, iid, out);
}

OrloReaderMovContainer::~OrloReaderMovContainer() {
    delete m_pMovie;
    m_Redirected.Reset();
}

TOVRESULT OrloReaderMovContainer::InitializeInstance(ITOVUnknown* host) {
    return TOVGuarded([&] {
        if (!host) throw static_cast<int>(TOV_E_POINTER);
        TOVCheck(host->QueryInterface(IID_ITOVComponentFactory, m_Factory.Out()));
        return TOV_OK;
    });
}

TOVRESULT OrloReaderMovContainer::InternalQueryInterface(const _tovUID& iid, void** out) {
    return TOVGuarded([&] {
        if (!out) return TOV_E_INVALIDARG;
        // The three forms of the container are one chain: one pointer answers all.
        if (iid == IID_IMediaContainer || iid == IID_IMediaContainer2 || iid == IID_IMediaContainer3)
            return TOVExpose<IMediaContainer3>(this, out);
        return CTOVUnknown::InternalQueryInterface(iid, out);
    });
}

int32_t OrloReaderMovContainer::IsContainerSupported() {
    if (m_Path.IsEmpty()) return 0;
    TOVRESULT parsed = TOV_E_UNEXPECTED;
    try {
        // Only the answer survives: the stream and the iXML go at once, and
        // the clip is parsed anew when it is asked for.
        ZEBString utf8(m_Path);
        utf8.ConvertTo(kTOVUnicodeUTF8);
        std::unique_ptr<Orlo::OrloStream> stream;
        Chunks::IXML::IXMLData ixml;
        parsed = OrloReader::Movie::ParseFromFile(m_Factory.Get(), utf8.GetUTF8String(), stream, &ixml);
    } catch (...) {
        parsed = TOV_E_UNEXPECTED;
    }
    if (parsed >= 0) return 1;
    // No try block here: a missing factory or redirection leaves as TOV_E_POINTER.
    if (!InitializeRedirection()) return 0;
    if (!m_Redirected) throw static_cast<int>(TOV_E_POINTER);
    return m_Redirected->IsContainerSupported();
}

bool OrloReaderMovContainer::InitializeRedirection() {
    if (m_Redirected) return true;
    if (!m_Factory) throw static_cast<int>(TOV_E_POINTER);
    if (m_Factory->CreateComponent(CompID_QuickTimeContainer, nullptr, IID_IMediaContainer, m_Redirected.Out()) < 0)
        return false;
    if (!m_Redirected) throw static_cast<int>(TOV_E_POINTER);
    return m_Redirected->SetFilePath(m_Path.InArg()) >= 0;
}

TOVRESULT OrloReaderMovContainer::GetMasterClips(ITOVString*, IClips**) { return TOV_E_NOTSUPPORTED; }

TOVRESULT OrloReaderMovContainer::GetAAFMasterClips(IAAFClips** out) {
    return TOVGuarded([&] {
        if (m_Redirected) return m_Redirected->GetAAFMasterClips(out);
        if (!m_pMovie) {
            TOVCheck(NewMovieFromFilePath(m_Path, &m_pMovie, m_Factory.Get()));
            if (!m_pMovie) throw static_cast<int>(ZEB_E_NOTREADY);
        }
        TOVCheck(m_Factory->CreateComponent(OrloRegInfo::CompID_OrloReaderClips, nullptr, IID_IAAFClips,
                                            reinterpret_cast<void**>(out)));
        // From here on a failure leaves the new list in `out`: the caller's.
        auto* clips = *out ? dynamic_cast<OrloReaderClips*>(*out) : nullptr;
        if (!clips) throw static_cast<int>(TOV_E_UNEXPECTED);
        m_AAFFile = IAAFSmartPointer<IAAFFile>();
        TOVCheck(NewAAFFromMovie(m_pMovie, m_Path, &m_AAFFile, m_Factory.Get()));
        clips->SetAAFFile(m_AAFFile);
        return TOV_OK;
    });
}

TOVRESULT OrloReaderMovContainer::SetFilePath(ITOVString* path) {
    return TOVGuarded([&] {
        if (!m_Path.IsEmpty()) throw static_cast<int>(ZEB_E_ALREADYSET);
        ZEBString stored(path, 0);
        ZEBString wide(stored);
        wide.ConvertTo(kTOVUnicodeWCHAR);
        m_Path = wide;
        ZEBString utf8(m_Path);
        utf8.ConvertTo(kTOVUnicodeUTF8);
        g_logger.Write(kTOVDebugLevelTrace, "Container File Path = %s", utf8.GetUTF8String());
        return TOV_OK;
    });
}

TOVRESULT OrloReaderMovContainer::GetSampleMapping(ISampleMapping** out) {
    return TOVGuarded([&] {
        if (m_Redirected) return m_Redirected->GetSampleMapping(out);
        TOVCheck(m_Factory->CreateComponent(OrloRegInfo::CompID_OrloReaderMovSampleMapping, nullptr, IID_ISampleMapping,
                                            reinterpret_cast<void**>(out)));
        auto* map = *out ? dynamic_cast<OrloReaderSampleMapping*>(*out) : nullptr;
        if (!map) throw static_cast<int>(TOV_E_UNEXPECTED);
        if (map->SetFilePath(m_Path)) return TOV_OK;
        // Not audio after all: the caller keeps a map without media unless
        // the host's own container takes the file.
        if (!InitializeRedirection()) return TOV_OK;
        // The map made above is overwritten without a release and lives on
        // until the process ends: this leak is the container's defined behaviour.
        if (!m_Redirected) throw static_cast<int>(TOV_E_POINTER);
        return m_Redirected->GetSampleMapping(out);
    });
}

TOVRESULT OrloReaderMovContainer::SetAttributeCallback(IAttributeCallback*) { return TOV_E_NOTSUPPORTED; }

TOVRESULT OrloReaderMovContainer::GetCapabilities(unsigned int* out) const {
    if (!out) return TOV_E_INVALIDARG;
    *out = kCapabilities;
    return TOV_OK;
}

unsigned int OrloReaderMovContainer::GetFileExtensionCount() const {
    return static_cast<unsigned int>(sizeof kOrloFileExtensions / sizeof kOrloFileExtensions[0]);
}

TOVRESULT OrloReaderMovContainer::GetFileExtension(unsigned int index, ITOVString** extension, ITOVString** shortName,
                                                   ITOVString** description) const {
    return TOVGuarded([&] {
        if (index >= GetFileExtensionCount()) return TOV_E_OUTOFRANGE;
        const OrloFileExtension& row = kOrloFileExtensions[index];
        const std::pair<ITOVString**, const char*> columns[] = {
            {extension, row.extension}, {shortName, row.shortName}, {description, row.description}};
        for (const auto& [target, text] : columns) {
            if (!target) continue;
            ZEBString string(reinterpret_cast<const unsigned char*>(text));
            ITOVString* handed = string.InArg();
            handed->AddRef();
            *target = handed;
        }
        return TOV_OK;
    });
}

}  // namespace Impl
}  // namespace ZEB
