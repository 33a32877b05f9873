#include "clipmodel/Movie.h"

#include <stdexcept>

#include "clipmodel/AddTimeCodeFromMetadata.h"
#include "clipmodel/AudioTracks.h"
#include "clipmodel/MetadataSelection.h"
#include "clipmodel/MobIDFromMetadata.h"
#include "clipmodel/TextHelpers.h"
#include "grouping/TrackIndexFromFileName.h"
#include "reader/OrloStream.h"
#include "reader/UMIDChunk.h"
#include "reader/ixml/IXMLChunk.h"
#include "reader/ixml/ParceRawIXML.h"
#include "tov/TOVResult.h"
#include "tov/sdk/TOVFailureStyle.h"

namespace OrloReader {

Movie::Movie() { m_EditRate = _aafRational_t{0, 1}; }

Movie::Movie(const _aafMobID_t& mobID) : Movie() { m_MobID = mobID; }

void Movie::Initialize() {
    m_Has = HasFlags{};
    m_DigitizerRate = 0;
    m_StartOffset = 0;
    m_GroupLength = 0;
}

std::shared_ptr<Track> Movie::GetTrack(unsigned int index) const {
    if (index >= GetTrackCount()) throw std::logic_error("no track with such index");
    return m_Tracks[index];
}

TOVRESULT Movie::ParseFromFile(ITOVComponentFactory* factory, const unsigned char* utf8Path,
                               std::unique_ptr<Orlo::OrloStream>& stream, Chunks::IXML::IXMLData* ixml) {
    stream = std::make_unique<Orlo::OrloStream>(reinterpret_cast<const char*>(utf8Path), Orlo::kAllChunks);
    if (stream->GetError() != nullptr) return TOV_E_UNEXPECTED;
    if (ixml != nullptr && stream->HasChunk(Orlo::OrloStream::IXML_CHUNK)) {
        // A document that does not parse leaves `ixml` unparsed; the clip is
        // then made from `bext` and the file name.
        Chunks::IXML::ParceRawIXML(stream->GetChunk<Chunks::IXML::IXMLChunk>()->GetRawXml(), factory, *ixml);
    }
    return TOV_OK;
}

TOVRESULT Movie::InitFromFile(const ZEB::ZEBString& path, ITOVComponentFactory* factory, bool allowGrouping) {
    return TOVGuarded([&] {
        Chunks::IXML::IXMLData ixml;
        m_FilePath = path;
        ZEB::ZEBString utf8Path(path);
        utf8Path.ConvertTo(kTOVUnicodeUTF8);
        std::unique_ptr<Orlo::OrloStream> stream;
        const TOVRESULT parsed = ParseFromFile(factory, utf8Path.GetUTF8String(), stream, &ixml);
        if (parsed < 0) throw static_cast<int>(parsed);
        FillFromStream(*stream, ixml, factory, allowGrouping);
        return TOV_OK;
    });
}

void Movie::FillFromStream(const Orlo::OrloStream& stream, const Chunks::IXML::IXMLData& ixml,
                           ITOVComponentFactory* factory, bool allowGrouping) {
    const bool hasIxml = ixml.parsed;
    const bool hasUmid = stream.HasChunk(Orlo::OrloStream::UMID_CHUNK);
    const auto bextChunk = stream.GetChunk<Chunks::BEXT::BEXTChunk>();
    const auto umidChunk = stream.GetChunk<Chunks::UMID::UMIDChunk>();
    const Chunks::BEXT::BEXTChunk* bext = bextChunk.get();
    const bool hasBext = stream.HasChunk(Orlo::OrloStream::BEXT_CHUNK) && bext != nullptr;
    const std::string fileName = HelperFunctions::GetFullFileNameFromPath(stream.GetFullFileName());

    AddSceneFromMetadata(bext, hasBext, ixml, hasIxml, *this);
    AddTakeFromMetadata(bext, hasBext, ixml, hasIxml, *this);
    AddShootDateFromMetadata(bext, hasBext, m_FilePath, *this);
    AddMovieNameFromMetadata(fileName, *this);
    AddUBITSFromMetadata(bext, hasBext, ixml, hasIxml, *this);
    AddTapeFromMetadata(bext, hasBext, ixml, hasIxml, fileName, HasMovieScene() || HasMovieTake() || HasMovieUBITS(),
                        *this);

    const double sampleRate = stream.GetSampleRate();
    AddTimeCodeFromMetadata(bext, hasBext, ixml, hasIxml, sampleRate, static_cast<long long>(stream.GetSampleCount()),
                            m_FilePath, *this, factory);

    _aafMobID_t mobID = MobIDFromMetadata(bext, hasBext, ixml, hasIxml, umidChunk.get(), hasUmid, m_FilePath);
    const int channels = stream.GetChannelCount();
    AddAudioTracks(bext, hasBext, ixml, hasIxml, GetMovieTimeCode(), stream.GetSampleCount(), channels, sampleRate,
                   stream.GetBitsPerSample(), stream.GetIsDataWrongEndian(), stream.GetIsDataFloatingPoint(),
                   static_cast<unsigned long long>(stream.GetStartPosition()), *this, &mobID, factory, allowGrouping);
    SetMobID(mobID);

    AddCommentsFromMetadata(bext, hasBext, ixml, hasIxml, *this);
    AddUserCommentsFromMetadata(ixml, hasIxml, *this);
    AddProjectFromMetadata(ixml, hasIxml, *this);
    AddCircledFromMetadata(bext, hasBext, ixml, hasIxml, *this);
    // Plain copies of flags with their has flags; nothing here can fail.
    AddWildTrackFromMetadata(ixml, hasIxml, *this);
    AddFalseStartFromMetadata(ixml, hasIxml, *this);
    AddNoGoodFromMetadata(ixml, hasIxml, *this);
    AddDigitazerRateFromMetadata(ixml, hasIxml, sampleRate, *this);
    SetMovieTapeID(fileName);

    SetStartingTrackIndex(1);
    int index = 0;
    if (channels == 1 && VTImportGrouping::TrackIndexFromFileName(fileName, index)) SetStartingTrackIndex(index);
}

}  // namespace OrloReader
