#include "clipmodel/MetadataSelection.h"

#include <optional>

#include "clipmodel/FindBextKeyword.h"
#include "clipmodel/GetFileCreationTime.h"
#include "clipmodel/TextHelpers.h"
#include "reader/ixml/IXMLTextParsers.h"

namespace OrloReader {

namespace {

using Chunks::IXML::UTF8Text;

// The value of a `bext` Description keyword, if the file has one.
bool FindKeyword(const BEXTChunk* bext, bool hasBext, const char* key, std::string& value) {
    return hasBext && FindBextKeyword(bext, key, value);
}

// The fixed `bext` text fields are padded with zero bytes; their text ends
// at the first one, so a field of zeros is empty.
std::string FieldText(const std::string& field) { return std::string(field.c_str()); }

// Recorders write the `bext` date as yyyy:mm:dd or yyyy/mm/dd as well as
// yyyy-mm-dd: whatever stands at index 4 is taken as the separator. A date too
// short to have one is left as it is.
std::string DashedDate(std::string date) {
    if (date.size() < 5) return date;
    const char separator = date[4];
    for (char& c : date)
        if (c == separator) c = '-';
    return date;
}

// Scene and take follow the same rule: iXML, then the keyword, even when empty.
std::optional<std::string> IxmlOrKeyword(bool fromIxml, const ZEB::ZEBString& ixmlValue, const BEXTChunk* bext,
                                         bool hasBext, const char* key) {
    if (fromIxml) return UTF8Text(ixmlValue);
    std::string keyword;
    if (FindKeyword(bext, hasBext, key, keyword)) return keyword;
    return std::nullopt;
}

}  // namespace

void AddSceneFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml, Movie& movie) {
    const auto scene = IxmlOrKeyword(hasIxml && ixml.HasScene(), ixml.GetScene(), bext, hasBext, "SCENE");
    if (scene) movie.SetMovieScene(*scene);
    movie.SetHasMovieScene(scene.has_value());
}

void AddTakeFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml, Movie& movie) {
    const auto take = IxmlOrKeyword(hasIxml && ixml.HasTake(), ixml.GetTake(), bext, hasBext, "TAKE");
    if (take) movie.SetMovieTake(*take);
    movie.SetHasMovieTake(take.has_value());
}

void AddShootDateFromMetadata(const BEXTChunk* bext, bool hasBext, ZEB::ZEBString path, Movie& movie) {
    std::string date;
    std::string time;
    if (hasBext && bext != nullptr) {
        date = FieldText(bext->GetOriginationDate());
        if (!date.empty()) date = DashedDate(date);
        time = FieldText(bext->GetOriginationTime());
    }
    if (date.empty() || time.empty()) {
        _aafTimeStamp_t created{};
        GetFileCreationTime(path, &created);
        if (date.empty())
            date = std::to_string(created.date.year) + "-" + std::to_string(created.date.month) + "-" +
                   std::to_string(created.date.day);
        if (time.empty())
            time = std::to_string(created.time.hour) + ":" + std::to_string(created.time.minute) + ":" +
                   std::to_string(created.time.second);
    }
    movie.SetMovieShootDate(date + " " + time);
    movie.SetHasMovieShootDate(true);
}

void AddMovieNameFromMetadata(const std::string& fileName, Movie& movie) {
    std::string name;
    if (movie.HasMovieScene()) name += movie.GetMovieScene();
    if (movie.HasMovieTake()) name += "/" + movie.GetMovieTake();
    movie.SetMovieName(name.empty() ? fileName : name);
}

void AddUBITSFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml, Movie& movie) {
    std::string keyword;
    if (hasIxml && ixml.HasUBITS()) {
        std::string ubits = UTF8Text(ixml.GetUBITS());
        if (ubits.empty() || ubits[0] != '$') ubits.insert(0, "$");
        movie.SetMovieUBITS(ubits);
        movie.SetHasMovieUBITS(true);
    } else if (FindKeyword(bext, hasBext, "UBITS", keyword)) {
        movie.SetMovieUBITS(keyword);
        movie.SetHasMovieUBITS(true);
    } else {
        movie.SetHasMovieUBITS(false);
    }
}

void AddTapeFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml,
                         const std::string& fileName, bool makeTapeFromFile, Movie& movie) {
    if (hasIxml && ixml.HasTape()) {
        movie.SetMovieTape(UTF8Text(ixml.GetTape()));
        movie.SetIsMovieOnTape(true);
        movie.SetHasMovieTape(true);
        return;
    }
    std::string keyword;
    bool found = false;
    if (FindKeyword(bext, hasBext, "TAPE", keyword)) {
        const std::string tape = HelperFunctions::TrimFromBeginningAndEnd(keyword, ' ');
        if (!tape.empty()) {
            movie.SetMovieTape(tape);
            found = true;
        }
    }
    if (found || !makeTapeFromFile || !hasBext || bext == nullptr) {
        movie.SetIsMovieOnTape(found);
        movie.SetHasMovieTape(found);
        return;
    }
    // A file with production metadata but no tape gets one per file name and
    // day, so that all its takes of that day share a tape.
    const std::string date = FieldText(bext->GetOriginationDate());
    if (date.empty()) {
        movie.SetIsMovieOnTape(false);
        movie.SetHasMovieTape(false);
        return;
    }
    movie.SetMovieTape(fileName + ":" + DashedDate(date));
    movie.SetIsMovieOnTape(true);
    movie.SetHasMovieTape(true);
}

void AddCommentsFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml, Movie& movie) {
    std::string notes;
    if (hasIxml && ixml.HasNotes()) notes = UTF8Text(ixml.GetNotes());
    // iXML text is not trimmed: a NOTE of blanks still hides the keyword.
    std::string keyword;
    if (!ixml.HasNotes() && FindKeyword(bext, hasBext, "NOTE", keyword))
        notes = HelperFunctions::TrimFromBeginningAndEnd(keyword, ' ');
    if (notes.empty()) {
        movie.SetHasMovieNotes(false);
        return;
    }
    movie.SetMovieNotes(notes);
    movie.SetHasMovieNotes(true);
}

void AddUserCommentsFromMetadata(const IXMLData& ixml, bool hasIxml, Movie& movie) {
    if (!hasIxml || !ixml.HasUser()) return;
    movie.SetMovieUserComments(UTF8Text(ixml.GetUser()));
    movie.SetHasMovieUserComments(true);
}

void AddProjectFromMetadata(const IXMLData& ixml, bool hasIxml, Movie& movie) {
    if (!hasIxml || !ixml.HasProject()) return;
    movie.SetMovieProject(UTF8Text(ixml.GetProject()));
    movie.SetHasMovieProject(true);
}

void AddCircledFromMetadata(const BEXTChunk* bext, bool hasBext, const IXMLData& ixml, bool hasIxml, Movie& movie) {
    if (hasIxml && ixml.HasCircled()) {
        movie.SetMovieCircled(ixml.GetCircled());
        movie.SetHasMovieCircled(true);
        return;
    }
    std::string keyword;
    const bool found = FindKeyword(bext, hasBext, "CIRCLED", keyword);
    // Exact words only: "true" in lower case is no answer.
    if (found && (keyword == "TRUE" || keyword == "FALSE")) {
        movie.SetMovieCircled(keyword == "TRUE");
        movie.SetHasMovieCircled(true);
    } else {
        movie.SetHasMovieCircled(false);
    }
}

void AddWildTrackFromMetadata(const IXMLData& ixml, bool hasIxml, Movie& movie) {
    if (!hasIxml) return;
    movie.SetMovieWildTrack(ixml.GetWildTrack());
    movie.SetHasMovieWildTrack(ixml.HasWildTrack());
}

void AddFalseStartFromMetadata(const IXMLData& ixml, bool hasIxml, Movie& movie) {
    if (!hasIxml) return;
    movie.SetMovieFalseStart(ixml.GetFalseStart());
    movie.SetHasMovieFalseStart(ixml.HasFalseStart());
}

void AddNoGoodFromMetadata(const IXMLData& ixml, bool hasIxml, Movie& movie) {
    if (!hasIxml) return;
    movie.SetMovieNoGood(ixml.GetNoGood());
    movie.SetHasMovieNoGood(ixml.HasNoGood());
}

void AddDigitazerRateFromMetadata(const IXMLData& ixml, bool hasIxml, double sampleRate, Movie& movie) {
    if (!hasIxml || !ixml.HasSpeed() || !ixml.GetSpeed().HasDigitizerSampleRate()) {
        movie.SetHasMovieDigitizerRate(false);
        return;
    }
    const uint32_t rate = ixml.GetSpeed().GetDigitizerSampleRate();
    if (rate != 0) movie.SetMovieDigitizerRate(rate);
    movie.SetHasMovieDigitizerRate(rate != 0);
    // A recorder running pulled up or down writes the rate it really ran at;
    // a rate of 0 counts as a difference too.
    if (static_cast<double>(rate) != sampleRate) movie.SetUseDigitizerRate(true);
}

}  // namespace OrloReader
