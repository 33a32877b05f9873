#include "IxmlReport.h"

#include <cstdio>

#include "reader/IXMLTextParsers.h"
#include "reader/ParceRawIXML.h"

namespace {

using Json = nlohmann::ordered_json;
using namespace Chunks::IXML;

// A value whose has flag is false is null.
template <typename T>
Json Maybe(bool has, const T& value) {
    return has ? Json(value) : Json(nullptr);
}

Json Maybe(bool has, const ZEB::ZEBString& value) { return has ? Json(UTF8Text(value)) : Json(nullptr); }

Json Tracks(const IXMLData& data) {
    if (!data.HasTracksList()) return nullptr;
    Json tracks = Json::array();
    for (const IXMLTrack& track : data.GetTracksList())
        tracks.push_back({{"name", Maybe(track.HasName(), track.GetName())},
                          {"channelIndex", Maybe(track.HasChannelIndex(), track.GetChannelIndex())},
                          {"interleaveIndex", Maybe(track.HasInterleaveIndex(), track.GetInterleaveIndex())}});
    return tracks;
}

Json Speed(const IXMLData& data) {
    if (!data.HasSpeed()) return nullptr;
    const IXMLSpeed speed = data.GetSpeed();
    const _aafRational_t rate = speed.GetTimeCodeRate();
    return {{"timecodeRate", Maybe(speed.HasTimeCodeRate(),
                                   std::to_string(rate.numerator) + "/" + std::to_string(rate.denominator))},
            {"timecodeDrop", Maybe(speed.HasTimeCodeFlag(), speed.GetTimeCodeFlag())},
            {"timestampSampleRate", Maybe(speed.HasTimeStampSampleRate(), speed.GetTimeStampSampleRate())},
            {"samplesSinceMidnight", Maybe(speed.HasSamplesSinceMidnight(), speed.GetSamplesSinceMidnight())},
            {"digitizerSampleRate", Maybe(speed.HasDigitizerSampleRate(), speed.GetDigitizerSampleRate())}};
}

}  // namespace

Json IxmlReport(const std::string& rawXml, ITOVComponentFactory* factory) {
    IXMLData data;
    const TOVRESULT result = ParceRawIXML(rawXml, factory, data);
    char code[16];
    std::snprintf(code, sizeof code, "0x%08X", static_cast<unsigned>(result));
    return {{"raw", rawXml},
            {"parsed", data.parsed},
            {"result", result == TOV_OK ? Json(0) : Json(code)},
            {"version", Maybe(data.HasVersion(), data.GetVersion())},
            {"project", Maybe(data.HasProject(), data.GetProject())},
            {"scene", Maybe(data.HasScene(), data.GetScene())},
            {"take", Maybe(data.HasTake(), data.GetTake())},
            {"tape", Maybe(data.HasTape(), data.GetTape())},
            {"ubits", Maybe(data.HasUBITS(), data.GetUBITS())},
            {"notes", Maybe(data.HasNotes(), data.GetNotes())},
            {"user", Maybe(data.HasUser(), data.GetUser())},
            {"fileUID", Maybe(data.HasFileUID(), data.GetFileUID())},
            {"circled", Maybe(data.HasCircled(), data.GetCircled())},
            {"noGood", Maybe(data.HasNoGood(), data.GetNoGood())},
            {"falseStart", Maybe(data.HasFalseStart(), data.GetFalseStart())},
            {"wildTrack", Maybe(data.HasWildTrack(), data.GetWildTrack())},
            {"tracksCount", Maybe(data.HasTracksCount(), data.GetTracksCount())},
            {"tracks", Tracks(data)},
            {"speed", Speed(data)}};
}
