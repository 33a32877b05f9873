#include "reader/ParceRawIXML.h"

#include <map>
#include <sstream>
#include <vector>

#include "reader/IXMLElements.h"
#include "reader/IXMLTextParsers.h"
#include "xml/ZEBXmlDoc.h"

namespace Chunks {
namespace IXML {

namespace {

using ZEB::ZEBString;
using ZEB::XMLUtils::ZEBXmlElement;
namespace E = IXMLElements;

ZEBString Name(const char* text) { return ZEBString(reinterpret_cast<const unsigned char*>(text)); }

// Each element name is made into a host string once per parse, not per lookup.
using Names = std::map<const char*, ZEBString>;

ZEBXmlElement* Child(Names& names, ZEBXmlElement* parent, const char* name) {
    auto found = names.find(name);
    if (found == names.end()) found = names.emplace(name, Name(name)).first;
    return parent->GetElement(found->second, 0);
}

// An element that is there with a text that is not empty; the text goes to `text`.
bool NonEmptyText(Names& names, ZEBXmlElement* parent, const char* name, ZEBString& text) {
    ZEBXmlElement* element = Child(names, parent, name);
    if (!element) return false;
    text = element->GetText();
    return !text.IsEmpty();
}

using FlagSetter = void (IXMLData::*)(bool);

// A text field counts when its element is there and not empty.
void ReadText(Names& names, ZEBXmlElement* root, const char* name, IXMLData& data, void (IXMLData::*set)(const ZEBString&),
              FlagSetter setHas) {
    ZEBString text;
    const bool has = NonEmptyText(names, root, name, text);
    if (has) (data.*set)(text);
    (data.*setHas)(has);
}

// A flag counts when its element holds exactly "TRUE" or "FALSE".
void ReadBool(Names& names, ZEBXmlElement* root, const char* name, IXMLData& data, void (IXMLData::*set)(const bool&),
              FlagSetter setHas) {
    ZEBString text;
    bool value = false;
    const bool has = NonEmptyText(names, root, name, text) && BoolFromString(text, value);
    if (has) (data.*set)(value);
    (data.*setHas)(has);
}

void ReadVersion(Names& names, ZEBXmlElement* root, IXMLData& data) {
    ZEBString text;
    double version = 0;
    bool has = false;
    if (NonEmptyText(names, root, E::IXML_VERSION, text)) {
        std::istringstream stream(UTF8Text(text));
        has = static_cast<bool>(stream >> version);
    }
    if (has) data.SetVersion(version);
    data.SetHasVersion(has);
}

void ReadTrack(Names& names, ZEBXmlElement* element, IXMLData& data) {
    if (!element) return;
    const ZEBString tag = element->GetTagName();
    if (tag.IsEmpty() || !(tag == reinterpret_cast<const unsigned char*>(E::TRACK))) return;

    IXMLTrack track;
    track.SetName(Name(""));
    ZEBString text;
    uint16_t index = 0;
    if (NonEmptyText(names, element, E::CHANNEL_INDEX, text) && IntegerFromZEBString(text, index)) {
        track.SetChannelIndex(index);
        track.SetHasChannelIndex(true);
    }
    if (NonEmptyText(names, element, E::INTERLEAVE_INDEX, text) && IntegerFromZEBString(text, index)) {
        track.SetInterleaveIndex(index);
        track.SetHasInterleaveIndex(true);
    }
    if (NonEmptyText(names, element, E::NAME, text)) {
        track.SetName(text);
        track.SetHasName(true);
    }
    // Whether the list is usable is the clip model's decision.
    data.AddTrackToTrackList(track);
}

void ReadTrackList(Names& names, ZEBXmlElement* root, IXMLData& data) {
    ZEBXmlElement* list = Child(names, root, E::TRACK_LIST);
    if (!list) {
        data.SetHasTracksCount(false);
        data.SetHasTracksList(false);
        return;
    }
    std::vector<ZEBXmlElement*> children;
    const TOVRESULT result = list->GetAllElements(children);
    data.SetHasTracksList(result == TOV_OK && !children.empty());
    for (ZEBXmlElement* child : children) ReadTrack(names, child, data);

    ZEBString text;
    uint16_t count = 0;
    const bool has = NonEmptyText(names, list, E::TRACK_COUNT, text) && IntegerFromZEBString(text, count);
    if (has) data.SetTracksCount(count);
    data.SetHasTracksCount(has);
}

void ReadSpeed(Names& names, ZEBXmlElement* root, IXMLData& data) {
    ZEBXmlElement* element = Child(names, root, E::SPEED);
    if (!element) {
        data.SetHasSpeed(false);
        return;
    }
    IXMLSpeed speed;
    ZEBString text;

    _aafRational_t rate{0, 0};
    const bool hasRate = NonEmptyText(names, element, E::TIMECODE_RATE, text) && FrameRateFromString(text, rate);
    speed.SetTimeCodeRate(hasRate ? rate : _aafRational_t{0, 0});
    speed.SetHasTimeCodeRate(hasRate);

    bool drop = false;
    if (NonEmptyText(names, element, E::TIMECODE_FLAG, text) && DropFrameFromString(text, drop)) {
        speed.SetTimeCodeFlag(drop);
        speed.SetHasTimeCodeFlag(true);
    }

    ZEBXmlElement* hi = Child(names, element, E::TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_HI);
    ZEBXmlElement* lo = Child(names, element, E::TIMESTAMP_SAMPLES_SINCE_MIDNIGHT_LO);
    unsigned long long samples = 0;
    if (hi && lo && SamplesFromString(hi->GetText(), lo->GetText(), samples)) {
        speed.SetSamplesSinceMidnight(samples);
        speed.SetHasSamplesSinceMidnight(true);
    }

    uint32_t digitizer = 0;
    if (ZEBXmlElement* e = Child(names, element, E::DIGITIZER_SAMPLE_RATE); e && IntegerFromZEBString(e->GetText(), digitizer)) {
        speed.SetDigitizerSampleRate(digitizer);
        speed.SetHasDigitizerSampleRate(true);
    }
    uint32_t stampRate = 0;
    if (ZEBXmlElement* e = Child(names, element, E::TIMESTAMP_SAMPLE_RATE); e && IntegerFromZEBString(e->GetText(), stampRate)) {
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
    Names names;
    ReadTrack(names, element, *data);
}

TOVRESULT ParceRawIXML(const std::string& rawXml, ITOVComponentFactory* factory, IXMLData& data) {
    try {
        // A zero byte ends the text, as it ends any C string.
        const ZEBString text(reinterpret_cast<const unsigned char*>(rawXml.c_str()));
        ZEB::XMLUtils::ZEBXmlDoc document(factory);
        const TOVRESULT loaded = document.Load(text);
        if (loaded < 0) return loaded;
        ZEBXmlElement* root = document.DocumentElement();
        if (!root) return ZEB_E_NOTREADY;
        Names names;

        // The order in which recorders' files have always been read.
        ReadText(names, root, E::PROJECT, data, &IXMLData::SetProject, &IXMLData::SetHasProject);
        ReadVersion(names, root, data);
        ReadText(names, root, E::SCENE, data, &IXMLData::SetScene, &IXMLData::SetHasScene);
        ReadText(names, root, E::TAKE, data, &IXMLData::SetTake, &IXMLData::SetHasTake);
        ReadText(names, root, E::FILE_UID, data, &IXMLData::SetFileUID, &IXMLData::SetHasFileUID);
        ReadBool(names, root, E::CIRCLED, data, &IXMLData::SetCircled, &IXMLData::SetHasCircled);
        ReadText(names, root, E::UBITS, data, &IXMLData::SetUBITS, &IXMLData::SetHasUBITS);
        ReadText(names, root, E::TAPE, data, &IXMLData::SetTape, &IXMLData::SetHasTape);
        ReadText(names, root, E::NOTE, data, &IXMLData::SetNotes, &IXMLData::SetHasNotes);
        ReadTrackList(names, root, data);
        ReadSpeed(names, root, data);
        ReadText(names, root, E::USER, data, &IXMLData::SetUser, &IXMLData::SetHasUser);
        ReadBool(names, root, E::NO_GOOD, data, &IXMLData::SetNoGood, &IXMLData::SetHasNoGood);
        ReadBool(names, root, E::FALSE_START, data, &IXMLData::SetFalseStart, &IXMLData::SetHasFalseStart);
        ReadBool(names, root, E::WILD_TRACK, data, &IXMLData::SetWildTrack, &IXMLData::SetHasWildTrack);

        data.parsed = true;
        return TOV_OK;
    } catch (int result) {
        return result;
    } catch (...) {
        return TOV_E_UNEXPECTED;
    }
}

}  // namespace IXML
}  // namespace Chunks
