#include "aafbuilder/AddMovieMetaData.h"

#include "aafbuilder/FrameRateAndDropToString.h"
#include "aafbuilder/WideThroughString.h"

namespace ZEB {
namespace Impl {

namespace {

const char* YesNo(bool value) { return value ? "yes" : "no"; }

void WriteComments(IAAFMob* mob, const OrloReader::Movie& m) {
    if (m.HasMovieNotes()) AddCustomColumnEntry(mob, "Comments", m.GetMovieNotes());
    // These two test for an empty text, not for a flag.
    if (!m.GetMovieUBITS().empty()) AddCustomColumnEntry(mob, "UBITS", m.GetMovieUBITS());
    if (!m.GetMovieTapeID().empty()) AddCustomColumnEntry(mob, "TapeID", m.GetMovieTapeID());
    if (m.HasMovieShootDate()) AddCustomColumnEntry(mob, "Shoot Date", m.GetMovieShootDate());
    if (m.HasMovieScene()) AddCustomColumnEntry(mob, "Scene", m.GetMovieScene());
    if (m.HasMovieTake()) AddCustomColumnEntry(mob, "Take", m.GetMovieTake());
    if (m.HasMovieTRKs())
        for (const auto& trk : m.GetMovieTRKs()) AddCustomColumnEntry(mob, trk.first, trk.second);
    if (m.HasMovieUserComments()) AddCustomColumnEntry(mob, "User", m.GetMovieUserComments());
    if (m.UseDigitizerRate() && m.HasMovieDigitizerRate())
        AddCustomColumnEntry(mob, "Digitizer sample rate", std::to_string(m.GetMovieDigitizerRate()));
    if (m.HasMovieProject()) AddCustomColumnEntry(mob, "Production", m.GetMovieProject());
    if (m.HasMovieCircled()) AddCustomColumnEntry(mob, "Circled", YesNo(m.GetMovieCircled()));
    if (m.HasMovieWildTrack()) AddCustomColumnEntry(mob, "Wild Track", YesNo(m.GetMovieWildTrack()));
    if (m.HasMovieFalseStart()) AddCustomColumnEntry(mob, "False Start", YesNo(m.GetMovieFalseStart()));
    if (m.HasMovieNoGood()) AddCustomColumnEntry(mob, "No Good", YesNo(m.GetMovieNoGood()));
    if (m.IsMovieOnTape()) return;
    if (m.HasMovieTape()) AddCustomColumnEntry(mob, "Soundroll", m.GetMovieTape());
    if (m.HasFileFrameRate()) {
        const OrloReader::FrameRateSettings& rate = m.GetFileFrameRate();
        AddCustomColumnEntry(mob, "Soundroll TC Rate",
                             FrameRateAndDropToString(rate.GetRationalFramerate(), rate.GetDropFrame()));
    }
}

}  // namespace

void AddCustomColumnEntry(IAAFMob* mob, const std::string& name, const std::string& value) {
    try {
        const std::wstring wideName = WideThroughString(name);
        const std::wstring wideValue = WideThroughString(value);
        if (mob) mob->AppendComment(wideName.c_str(), wideValue.c_str());
    } catch (...) {
        // This comment alone is lost.
    }
}

void AddMovieMetaData(IAAFMob* mob, OrloReader::Movie* movie) {
    try {
        WriteComments(mob, *movie);
    } catch (...) {
        // Out of memory for a text: the comments written so far stand.
    }
}

}  // namespace Impl
}  // namespace ZEB
