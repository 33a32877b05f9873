// libFuzzer target: the whole intake of one file into a Movie (chunk walk,
// iXML, the rules of trust, start timecode, identity, tracks) over any bytes,
// and the AAF clip of every Movie that comes of it.
// The first byte of the input also switches the five toggles, so that every
// route of the rules is reached.
#include <cstdint>
#include <cstdlib>
#include <string>

#include "FuzzHost.h"
#include "FuzzInputFile.h"
#include "aafbuilder/NewAAFFromMovie.h"
#include "boundary/DynamicToggles.h"
#include "boundary/OrloConstants.h"
#include "boundary/PluginStartup.h"
#include "clipmodel/Movie.h"

namespace {

FuzzInputFile* g_input = nullptr;
TOVPtr<ITOVComponentFactory> g_factory;

const char* const kToggles[] = {toggle_MobIDFromiXML, toggle_StartTimeCodeFromFileCreationTime,
                                toggle_StartTimeCodeFromBEXTOriginationDate, toggle_BigEndianSmpteIdInBEXTData,
                                toggle_IgnoreHostSettingsForUnitTest};

}  // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***) {
    TOVHost* host = StartFuzzHost();
    g_factory.Assign(host);
    // The plug-in's globals, as its start-up sets them, for the whole run.
    static PluginStartup startup(host->AsUnknown());
    if (startup.Result() != TOV_OK) std::abort();
    g_input = new FuzzInputFile("orlo-fuzz-movie");
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    g_input->Write(data, size);
    const unsigned bits = size > 0 ? data[0] : 0;
    for (unsigned i = 0; i < 5; ++i)
        if (ZEB::Impl::SetDynamicToggleValue(g_factory, kToggles[i], (bits >> i) & 1) != 0) std::abort();

    OrloReader::Movie movie;
    const TOVRESULT result = movie.InitFromFile(
        ZEB::ZEBString(reinterpret_cast<const unsigned char*>(g_input->Path().c_str())), g_factory.Get(), true);
    if (result == 0) {
        // A finished movie always starts with its timecode track.
        if (movie.GetTrackCount() == 0 || movie.GetTrack(0)->GetMedia()->GetType() != OrloReader::kMediaTypeTimecode)
            std::abort();
        for (unsigned i = 1; i < movie.GetTrackCount(); ++i) {
            const auto media = movie.GetTrack(i)->GetMedia();
            if (media->GetSoundDescriptor() == nullptr) std::abort();
            media->GetSampleOffset(media->GetSampleCount());
        }
        // A clip that fails part way leaves its transient file behind, by
        // design; the leak checker is told so in tests/lsan.supp.
        IAAFFile* file = nullptr;
        if (ZEB::Impl::NewAAFFromMovie(&movie,
                                       ZEB::ZEBString(reinterpret_cast<const unsigned char*>(g_input->Path().c_str())),
                                       &file, g_factory.Get()) == 0)
            file->Release();
    }
    return 0;
}
