#include "reader/ixml/ParceRawIXML.h"

#include <optional>
#include <string_view>
#include <vector>

#include "reader/ixml/IXMLElements.h"
#include "reader/ixml/IXMLTextParsers.h"
#include "tov/sdk/TOVFailureStyle.h"
#include "xml/ZEBXmlDoc.h"

namespace Chunks {
namespace IXML {

namespace {

using ZEB::ZEBString;
using ZEB::XMLUtils::ZEBXmlElement;
namespace E = IXMLElements;

// Element names are fixed UTF-8 texts, looked up without making host strings of them.
ZEBXmlElement* Child(ZEBXmlElement* parent, const char* name) { return parent->GetElement(std::string_view(name), 0); }

// The text of the child `name` when the child is there and its text is not empty.
std::optional<ZEBString> NonEmptyText(ZEBXmlElement* parent, const char* name) {
    ZEBXmlElement* element = Child(parent, name);
    if (!element) return std::nullopt;
    ZEBString text = element->GetText();
    if (text.IsEmpty()) return std::nullopt;
    return text;
}

using FlagSetter = void (IXMLData::*)(bool);

// A text field counts when its element is there and not empty.
void ReadText(ZEBXmlElement* root, const char* name, IXMLData& data, void (IXMLData::*set)(const ZEBString&),
              FlagSetter setHas) {
    const std::optional<ZEBString> text = NonEmptyText(root, name);
    if (text) (data.*set)(*text);
    (data.*setHas)(text.has_value());
}

// A flag counts when its element holds exactly "TRUE" or "FALSE".
void ReadBool(ZEBXmlElement* root, const char* name, IXMLData& data, void (IXMLData::*set)(const bool&),
              FlagSetter setHas) {
    const std::optional<ZEBString> text = NonEmptyText(root, name);
    bool value = false;
    const bool has = text && BoolFromString(*text, value);
    if (has) (data.*set)(value);
    (data.*setHas)(has);
}

void ReadVersion(ZEBXmlElement* root, IXMLData& data) {
    const std::optional<ZEBString> text = NonEmptyText(root, E::IXML_VERSION);
    double version = 0;
    const bool has = text && VersionFromString(*text, version);
    if (has) data.SetVersion(version);
    data.SetHasVersion(has);
}

// An index counts when its element holds a number.
bool ReadIndex(ZEBXmlElement* parent, const char* name, uint16_t& index) {
    const std::optional<ZEBString> text = NonEmptyText(parent, name);
    return text && IntegerFromZEBString(*text, index);
}

void ReadTrack(ZEBXmlElement* element, IXMLData& data) {
    if (!element || !element->HasTag(E::TRACK)) return;

    IXMLTrack track;
    uint16_t index = 0;
    if (ReadIndex(element, E::CHANNEL_INDEX, index)) {
        track.SetChannelIndex(index);
        track.SetHasChannelIndex(true);
    }
    if (ReadIndex(element, E::INTERLEAVE_INDEX, index)) {
        track.SetInterleaveIndex(index);
        track.SetHasInterleaveIndex(true);
    }
    if (const std::optional<ZEBString> name = NonEmptyText(element, E::NAME)) {
        track.SetName(*name);
        track.SetHasName(true);
    } else {
        track.SetName(ZEBString(reinterpret_cast<const unsigned char*>("")));
    }
    // Whether the list is usable is the clip model's decision.
    data.AddTrackToTrackList(track);
}

void ReadTrackList(ZEBXmlElement* root, IXMLData& data) {
    ZEBXmlElement* list = Child(root, E::TRACK_LIST);
    if (!list) {
        data.SetHasTracksCount(false);
        data.SetHasTracksList(false);
        return;
    }
    std::vector<ZEBXmlElement*> children;
    const TOVRESULT result = list->GetAllElements(children);
    data.SetHasTracksList(result == TOV_OK && !children.empty());
    for (ZEBXmlElement* child : children) ReadTrack(child, data);

    const std::optional<ZEBString> text = NonEmptyText(list, E::TRACK_COUNT);
    uint16_t count = 0;
    const bool has = text && IntegerFromZEBString(*text, count);
    if (has) data.SetTracksCount(count);
    data.SetHasTracksCount(has);
}

void ReadSpeed(ZEBXmlElement* root, IXMLData& data) {
    ZEBXmlElement* element = Child(root, E::SPEED);
    if (!element) {
        data.SetHasSpeed(false);
        return;
    }
    IXMLSpeed speed;

    _aafRational_t rate{0, 0};
    const std::optional<ZEBString> rateText = NonEmptyText(element, E::TIMECODE_RATE);
    const bool hasRate = rateText && FrameRateFromString(*rateText, rate);
    speed.SetTimeCodeRate(hasRate ? rate : _aafRational_t{0, 0});
    speed.SetHasTimeCodeRate(hasRate);

    bool drop = false;
    const std::optional<ZEBString> flagText = NonEmptyText(element, E::TIMECODE_FLAG);
    if (flagText && DropFrameFromString(*flagText, drop)) {
        speed.SetTimeCodeFlag(drop);
        speed.SetHasTimeCodeFlag(true);
    }

    ZEBXmlElement* hi = Child(element, E::TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI);
    ZEBXmlElement* lo = Child(element, E::TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO);
    unsigned long long samples = 0;
    if (hi && lo && SamplesFromString(hi->GetText(), lo->GetText(), samples)) {
        speed.SetSamplesSinceMidnight(samples);
        speed.SetHasSamplesSinceMidnight(true);
    }

    uint32_t digitizer = 0;
    if (ZEBXmlElement* e = Child(element, E::DIGITIZER_SAMPLE_RATE);
        e && IntegerFromZEBString(e->GetText(), digitizer)) {
        speed.SetDigitizerSampleRate(digitizer);
        speed.SetHasDigitizerSampleRate(true);
    }
    uint32_t stampRate = 0;
    if (ZEBXmlElement* e = Child(element, E::TIMESTAMP_SAMPLE_RATE);
        e && IntegerFromZEBString(e->GetText(), stampRate)) {
        speed.SetTimeStampSampleRate(stampRate);
        speed.SetHasTimeStampSampleRate(true);
    }

    // Present whenever the element exists, whatever its children held.
    speed.SetPresent(true);
    data.SetSpeed(speed);
    data.SetHasSpeed(true);
}

}  // namespace

void GetTrackFromXMLWithNameCheck(ZEBXmlElement* element, IXMLData* data) {
    if (!data) return;
    ReadTrack(element, *data);
}

TOVRESULT ParceRawIXML(const std::string& rawXml, ITOVComponentFactory* factory, IXMLData& data) {
    return TOVGuarded([&] {
        // A zero byte ends the text, as it ends any C string. The string keeps
        // the text where it stands, in the chunk: a document may be tens of
        // megabytes, and parsing only reads it, so nothing writes there.
        ZEBString text;
        text.SetExternalBuffer(kTOVUnicodeUTF8, reinterpret_cast<unsigned char*>(const_cast<char*>(rawXml.c_str())),
                               static_cast<unsigned int>(rawXml.size() + 1));
        ZEB::XMLUtils::ZEBXmlDoc document(factory);
        const TOVRESULT loaded = document.Load(text);
        if (loaded < 0) return loaded;
        ZEBXmlElement* root = document.DocumentElement();
        if (!root) return ZEB_E_NOTREADY;

        // The order in which recorders' files have always been read.
        ReadText(root, E::PROJECT, data, &IXMLData::SetProject, &IXMLData::SetHasProject);
        ReadVersion(root, data);
        ReadText(root, E::SCENE, data, &IXMLData::SetScene, &IXMLData::SetHasScene);
        ReadText(root, E::TAKE, data, &IXMLData::SetTake, &IXMLData::SetHasTake);
        ReadText(root, E::FILE_UID, data, &IXMLData::SetFileUID, &IXMLData::SetHasFileUID);
        ReadBool(root, E::CIRCLED, data, &IXMLData::SetCircled, &IXMLData::SetHasCircled);
        ReadText(root, E::UBITS, data, &IXMLData::SetUBITS, &IXMLData::SetHasUBITS);
        ReadText(root, E::TAPE, data, &IXMLData::SetTape, &IXMLData::SetHasTape);
        ReadText(root, E::NOTE, data, &IXMLData::SetNotes, &IXMLData::SetHasNotes);
        ReadTrackList(root, data);
        ReadSpeed(root, data);
        ReadText(root, E::USER, data, &IXMLData::SetUser, &IXMLData::SetHasUser);
        ReadBool(root, E::NO_GOOD, data, &IXMLData::SetNoGood, &IXMLData::SetHasNoGood);
        ReadBool(root, E::FALSE_START, data, &IXMLData::SetFalseStart, &IXMLData::SetHasFalseStart);
        ReadBool(root, E::WILD_TRACK, data, &IXMLData::SetWildTrack, &IXMLData::SetHasWildTrack);

        data.parsed = true;
        return TOV_OK;
    });
}

}  // namespace IXML
}  // namespace Chunks
