#include "MovieReport.h"

#include <string>

#include "JsonMaybe.h"
#include "identity/IDText.h"
#include "reader/ixml/IXMLTextParsers.h"

namespace {

using Json = nlohmann::ordered_json;
using namespace OrloReader;

std::string RateText(const _aafRational_t& rate) {
    return std::to_string(rate.numerator) + "/" + std::to_string(rate.denominator);
}

Json FrameRate(const FrameRateSettings& rate) {
    return {{"rate", RateText(rate.GetRationalFramerate())},
            {"fps", rate.GetFloatingFrameRate()},
            {"drop", rate.GetDropFrame()}};
}

Json TimeCode(const TimeCodeInfo& timecode) {
    std::string text;
    timecode.ToString(text);
    return {{"text", text},
            {"fps", timecode.GetFPS()},
            {"drop", timecode.IsDropFrame()},
            {"totalFrames", timecode.GetTotalFrames()}};
}

Json Trks(const HelperFunctions::TrkMap& trks) {
    Json out = Json::object();
    for (const auto& [key, name] : trks) out[key] = name;
    return out;
}

Json Descriptor(const AudioMediaDescriptor& descriptor) {
    return {{"sampleRate", descriptor.GetSampleRate()},         {"bytesPerFrame", descriptor.GetBytesPerFrame()},
            {"bytesPerPacket", descriptor.GetBytesPerPacket()}, {"channelsPerFrame", descriptor.GetChannelsPerFrame()},
            {"bitsPerChannel", descriptor.GetBitsPerChannel()}, {"bigEndian", descriptor.IsBigEndian()},
            {"floatingPoint", descriptor.IsFloatingPoint()},    {"startOffset", descriptor.GetStartOffset()}};
}

Json Tracks(const Movie& movie) {
    Json tracks = Json::array();
    for (unsigned int i = 0; i < movie.GetTrackCount(); ++i) {
        const std::shared_ptr<Track> track = movie.GetTrack(i);
        const std::shared_ptr<Media> media = track->GetMedia();
        const bool audio = media->GetType() == kMediaTypeAudio;
        Json entry = {{"type", audio ? "audio" : "timecode"},
                      {"channelIndex", track->GetChannelIndex()},
                      {"path", Chunks::IXML::UTF8Text(track->GetPathToSource())},
                      {"sampleSize", media->GetChannelSampleSize()},
                      {"sampleCount", media->GetSampleCount()}};
        if (const auto descriptor = media->GetSoundDescriptor()) entry.update(Descriptor(*descriptor));
        tracks.push_back(entry);
    }
    return tracks;
}

}  // namespace

Json MovieReport(const Movie& movie) {
    return {{"movieName", movie.GetMovieName()},
            {"tapeID", movie.GetMovieTapeID()},
            {"tape", JsonMaybe(movie.HasMovieTape(), movie.GetMovieTape())},
            {"onTape", movie.IsMovieOnTape()},
            {"scene", JsonMaybe(movie.HasMovieScene(), movie.GetMovieScene())},
            {"take", JsonMaybe(movie.HasMovieTake(), movie.GetMovieTake())},
            {"shootDate", JsonMaybe(movie.HasMovieShootDate(), movie.GetMovieShootDate())},
            {"ubits", JsonMaybe(movie.HasMovieUBITS(), movie.GetMovieUBITS())},
            {"notes", JsonMaybe(movie.HasMovieNotes(), movie.GetMovieNotes())},
            {"userComments", JsonMaybe(movie.HasMovieUserComments(), movie.GetMovieUserComments())},
            {"project", JsonMaybe(movie.HasMovieProject(), movie.GetMovieProject())},
            {"circled", JsonMaybe(movie.HasMovieCircled(), movie.GetMovieCircled())},
            {"wildTrack", JsonMaybe(movie.HasMovieWildTrack(), movie.GetMovieWildTrack())},
            {"falseStart", JsonMaybe(movie.HasMovieFalseStart(), movie.GetMovieFalseStart())},
            {"noGood", JsonMaybe(movie.HasMovieNoGood(), movie.GetMovieNoGood())},
            {"digitizerRate", JsonMaybe(movie.HasMovieDigitizerRate(), movie.GetMovieDigitizerRate())},
            {"useDigitizerRate", movie.UseDigitizerRate()},
            {"editRate", JsonMaybe(movie.HasMovieEditRate(), RateText(movie.GetMovieEditRate()))},
            {"fileFrameRate", movie.HasFileFrameRate() ? FrameRate(movie.GetFileFrameRate()) : Json(nullptr)},
            {"tapeMobEditRate", movie.HasTapeMobEditRate() ? FrameRate(movie.GetTapeMobEditRate()) : Json(nullptr)},
            {"movieTimeCode", movie.HasMovieTimeCode() ? TimeCode(movie.GetMovieTimeCode()) : Json(nullptr)},
            {"fileTimeCode", movie.HasMovieFileTimeCode() ? TimeCode(movie.GetMovieFileTimeCode()) : Json(nullptr)},
            {"startOffset", JsonMaybe(movie.HasMovieStartOffset(), movie.GetMovieStartOffset())},
            {"groupLength", JsonMaybe(movie.HasMovieGroupLength(), movie.GetMovieGroupLength())},
            {"mobID", ZEB::MobIDDigits(movie.GetMobID(), ZEB::HexCase::Upper)},
            {"startingTrackIndex", movie.GetStartingTrackIndex()},
            {"monoAudio", movie.IsMonoAudio()},
            {"monophonicGroup", movie.IsMonophonicGroup()},
            {"trks", movie.HasMovieTRKs() ? Trks(movie.GetMovieTRKs()) : Json(nullptr)},
            {"tracks", Tracks(movie)}};
}
