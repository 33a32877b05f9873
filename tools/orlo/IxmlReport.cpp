#include "IxmlReport.h"

#include "JsonMaybe.h"
#include "ResultText.h"
#include "reader/ixml/IXMLTextParsers.h"
#include "reader/ixml/ParceRawIXML.h"

namespace {

using Json = nlohmann::ordered_json;
using namespace Chunks::IXML;

// iXML texts as UTF-8.
Json TextMaybe(bool has, const ZEB::ZEBString& value) { return JsonMaybe(has, UTF8Text(value)); }

Json Tracks(const IXMLData& data) {
    if (!data.HasTracksList()) return nullptr;
    Json tracks = Json::array();
    for (const IXMLTrack& track : data.GetTracksList())
        tracks.push_back({{"name", TextMaybe(track.HasName(), track.GetName())},
                          {"channelIndex", JsonMaybe(track.HasChannelIndex(), track.GetChannelIndex())},
                          {"interleaveIndex", JsonMaybe(track.HasInterleaveIndex(), track.GetInterleaveIndex())}});
    return tracks;
}

Json Speed(const IXMLData& data) {
    if (!data.HasSpeed()) return nullptr;
    const IXMLSpeed speed = data.GetSpeed();
    const _aafRational_t rate = speed.GetTimeCodeRate();
    return {{"timecodeRate", JsonMaybe(speed.HasTimeCodeRate(),
                                       std::to_string(rate.numerator) + "/" + std::to_string(rate.denominator))},
            {"timecodeDrop", JsonMaybe(speed.HasTimeCodeFlag(), speed.GetTimeCodeFlag())},
            {"timestampSampleRate", JsonMaybe(speed.HasTimeStampSampleRate(), speed.GetTimeStampSampleRate())},
            {"samplesSinceMidnight", JsonMaybe(speed.HasSamplesSinceMidnight(), speed.GetSamplesSinceMidnight())},
            {"digitizerSampleRate", JsonMaybe(speed.HasDigitizerSampleRate(), speed.GetDigitizerSampleRate())}};
}

}  // namespace

Json IxmlReport(const std::string& rawXml, ITOVComponentFactory* factory) {
    IXMLData data;
    const TOVRESULT result = ParceRawIXML(rawXml, factory, data);
    return {{"raw", rawXml},
            {"parsed", data.parsed},
            {"result", ResultJson(result)},
            {"version", JsonMaybe(data.HasVersion(), data.GetVersion())},
            {"project", TextMaybe(data.HasProject(), data.GetProject())},
            {"scene", TextMaybe(data.HasScene(), data.GetScene())},
            {"take", TextMaybe(data.HasTake(), data.GetTake())},
            {"tape", TextMaybe(data.HasTape(), data.GetTape())},
            {"ubits", TextMaybe(data.HasUBITS(), data.GetUBITS())},
            {"notes", TextMaybe(data.HasNotes(), data.GetNotes())},
            {"user", TextMaybe(data.HasUser(), data.GetUser())},
            {"fileUID", TextMaybe(data.HasFileUID(), data.GetFileUID())},
            {"circled", JsonMaybe(data.HasCircled(), data.GetCircled())},
            {"noGood", JsonMaybe(data.HasNoGood(), data.GetNoGood())},
            {"falseStart", JsonMaybe(data.HasFalseStart(), data.GetFalseStart())},
            {"wildTrack", JsonMaybe(data.HasWildTrack(), data.GetWildTrack())},
            {"tracksCount", JsonMaybe(data.HasTracksCount(), data.GetTracksCount())},
            {"tracks", Tracks(data)},
            {"speed", Speed(data)}};
}
