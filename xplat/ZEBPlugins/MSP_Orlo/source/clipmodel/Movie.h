#pragma once
/// The plug-in's picture of one audio clip: tracks, rates, timecode, identity
/// and the production metadata read from the file. Filled once by
/// InitFromFile (or by the grouping), then only read.
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "aaf/AAFTypes.h"
#include "clipmodel/FrameRateSettings.h"
#include "clipmodel/TimeCodeInfo.h"
#include "clipmodel/Track.h"
#include "grouping/TrkComparsion.h"
#include "reader/FlaggedField.h"
#include "strings/ZEBString.h"
#include "tov/ITOVComponentFactory.h"

namespace Chunks {
namespace IXML {
class IXMLData;
}
}  // namespace Chunks
namespace Orlo {
class OrloStream;
}

namespace OrloReader {

class Movie {
public:
    Movie();
    explicit Movie(const _aafMobID_t& mobID);

    /// Clears the has flags, the digitizer rate, the start offset and the group length.
    void Initialize();

    /// Fills the movie from the audio file at `path`. Returns 0 or a result
    /// code; never throws. `allowGrouping` lets a mono file look for siblings.
    TOVRESULT InitFromFile(const ZEB::ZEBString& path, ITOVComponentFactory* factory, bool allowGrouping);
    /// Walks the file's chunks into `stream` (replacing what it held) and
    /// parses any iXML text into `ixml` when given. 0x8000FFFF when the walk
    /// failed; an iXML text that does not parse leaves `ixml` unparsed, not a failure.
    static TOVRESULT ParseFromFile(ITOVComponentFactory* factory, const unsigned char* utf8Path,
                                   std::unique_ptr<Orlo::OrloStream>& stream, Chunks::IXML::IXMLData* ixml);

    int32_t GetStartingTrackIndex() const { return m_StartingTrackIndex; }
    void SetStartingTrackIndex(int32_t index) { m_StartingTrackIndex = index; }

    ORLO_FLAGGED_FIELD(Movie, std::string, Notes)
    ORLO_FLAGGED_FIELD(Movie, std::string, UBITS)
    ORLO_FLAGGED_FIELD(Movie, std::string, Tape)
    ORLO_FLAGGED_FIELD(Movie, std::string, ShootDate)
    ORLO_FLAGGED_FIELD(Movie, std::string, Scene)
    ORLO_FLAGGED_FIELD(Movie, std::string, Take)
    ORLO_FLAGGED_FIELD(Movie, std::string, UserComments)
    ORLO_FLAGGED_FIELD(Movie, std::string, Project)
    ORLO_FLAGGED_FIELD(Movie, bool, Circled)
    ORLO_FLAGGED_FIELD(Movie, bool, WildTrack)
    ORLO_FLAGGED_FIELD(Movie, bool, FalseStart)
    ORLO_FLAGGED_FIELD(Movie, bool, NoGood)
    ORLO_FLAGGED_FIELD(Movie, uint32_t, DigitizerRate)
    ORLO_FLAGGED_FIELD(Movie, int64_t, StartOffset)
    ORLO_FLAGGED_FIELD(Movie, int64_t, GroupLength)
    ORLO_FLAGGED_FIELD(Movie, HelperFunctions::TrkMap, TRKs)
    ORLO_FLAGGED_FIELD(Movie, _aafRational_t, EditRate)
    ORLO_FLAGGED_FIELD(Movie, TimeCodeInfo, TimeCode)
    ORLO_FLAGGED_FIELD(Movie, TimeCodeInfo, FileTimeCode)

public:
    const std::string& GetMovieTapeName() const { return m_Tape; }
    const std::string& GetMovieTapeID() const { return m_TapeID; }
    void SetMovieTapeID(const std::string& id) { m_TapeID = id; }

    bool IsMovieOnTape() const { return m_OnTape; }
    void SetIsMovieOnTape(bool onTape) { m_OnTape = onTape; }
    bool UseDigitizerRate() const { return m_UseDigitizerRate; }
    void SetUseDigitizerRate(bool use) { m_UseDigitizerRate = use; }
    bool IsMonoAudio() const { return m_MonoAudio; }
    void SetIsMonoAudio(bool mono) { m_MonoAudio = mono; }
    bool IsMonophonicGroup() const { return m_MonophonicGroup; }
    void SetIsMonophonicGroup(bool group) { m_MonophonicGroup = group; }

    const FrameRateSettings& GetTapeMobEditRate() const { return m_TapeMobEditRate; }
    void SetTapeMobEditRate(const FrameRateSettings& rate) { m_TapeMobEditRate = rate; }
    bool HasTapeMobEditRate() const { return m_Has.TapeMobEditRate; }
    void SetHasTapeMobRate(bool has) { m_Has.TapeMobEditRate = has; }
    const FrameRateSettings& GetFileFrameRate() const { return m_FileFrameRate; }
    void SetFileFrameRate(const FrameRateSettings& rate) { m_FileFrameRate = rate; }
    bool HasFileFrameRate() const { return m_Has.FileFrameRate; }
    void SetHasFileFrameRate(bool has) { m_Has.FileFrameRate = has; }

    const _aafMobID_t& GetMobID() const { return m_MobID; }
    void SetMobID(const _aafMobID_t& mobID) { m_MobID = mobID; }
    const std::string& GetName() const { return m_Name; }
    void SetName(const std::string& name) { m_Name = name; }
    const std::string& GetMovieName() const { return m_MovieName; }
    void SetMovieName(const std::string& name) { m_MovieName = name; }
    const ZEB::ZEBString& GetFilePath() const { return m_FilePath; }
    void SetFilePath(const ZEB::ZEBString& path) { m_FilePath = path; }

    /// Appends a track; the movie shares it.
    void AddTrack(std::shared_ptr<Track> track) { m_Tracks.push_back(std::move(track)); }
    /// Throws std::logic_error("no track with such index") past the end.
    std::shared_ptr<Track> GetTrack(unsigned int index) const;
    unsigned int GetTrackCount() const { return static_cast<unsigned int>(m_Tracks.size()); }

private:
    void FillFromStream(const Orlo::OrloStream& stream, const Chunks::IXML::IXMLData& ixml,
                        ITOVComponentFactory* factory, bool allowGrouping);

    struct HasFlags {
        bool Scene = false, Take = false, ShootDate = false, EditRate = false, TapeMobEditRate = false,
             FileFrameRate = false, TimeCode = false, FileTimeCode = false, TRKs = false, Tape = false, Notes = false,
             UBITS = false, UserComments = false, DigitizerRate = false, Project = false, Circled = false,
             WildTrack = false, FalseStart = false, NoGood = false, StartOffset = false, GroupLength = false;
    };

    int32_t m_StartingTrackIndex = 1;
    std::string m_TapeID;
    bool m_OnTape = false;
    bool m_UseDigitizerRate = false;
    bool m_MonoAudio = false;
    bool m_MonophonicGroup = false;
    HasFlags m_Has;
    FrameRateSettings m_TapeMobEditRate;
    FrameRateSettings m_FileFrameRate;
    _aafMobID_t m_MobID{};
    std::string m_Name;
    std::vector<std::shared_ptr<Track>> m_Tracks;
    ZEB::ZEBString m_FilePath;
    std::string m_MovieName;
};

}  // namespace OrloReader
