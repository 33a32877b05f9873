#include "boundary/OrloComponents.h"

#include "boundary/OrloReaderClips.h"
#include "boundary/OrloReaderMovContainer.h"
#include "boundary/OrloRegInfo.h"
#include "sampleaccess/OrloReaderSampleMapping.h"

using namespace OrloRegInfo;

// The first four belong to the volume route, which builds clips from XML
// metadata; their classes come with it, and until then the module registers
// them but makes none (TOVGetClassFactory answers CLASS_E_CLASSNOTAVAILABLE).
const OrloComponent kOrloComponents[kOrloComponentCount] = {
    {CompID_OrloReaderMediaFormat, CLSID_OrloReaderMediaFormat, L"OrloReaderMediaFormat", nullptr},
    {CompID_OrloReaderSequences, CLSID_OrloReaderSequences, L"OrloReaderSequences", nullptr},
    {CompID_OrloReaderMasterClips, CLSID_OrloReaderMasterClips, L"OrloReaderMasterClips", nullptr},
    {CompID_OrloReaderMetadataHandler, CLSID_TOVOrloReaderMetadataHandler, L"OrloReaderDocumentHandler", nullptr},
    {CompID_OrloReaderMovContainer, CLSID_OrloReaderMovContainer, L"OrloReaderMovMediaContainer",
     ZEB::Impl::OrloReaderMovContainer::TOVCreate},
    {CompID_OrloReaderMovSampleMapping, CLSID_OrloReaderMovSampleMapping, L"OrloReaderMovSampleMapping",
     ZEB::Impl::OrloReaderSampleMapping::TOVCreate},
    {CompID_OrloReaderClips, CLSID_OrloReaderClips, L"OrloReaderClips", ZEB::Impl::OrloReaderClips::TOVCreate},
};
