#include "ProbeText.h"

#include <algorithm>
#include <cstdio>
#include <string>
#include <vector>

#include "JsonText.h"

namespace {

using Json = nlohmann::ordered_json;

struct Label {
    const char* key;
    const char* text;
};

// The clip's lines, in the report's order; keys not listed here are not shown.
const Label kLabels[] = {{"file", "file"},
                         {"groupingAllowed", "grouping allowed"},
                         {"movieName", "movie name"},
                         {"tapeID", "tape ID"},
                         {"tape", "tape"},
                         {"onTape", "on tape"},
                         {"scene", "scene"},
                         {"take", "take"},
                         {"shootDate", "shoot date"},
                         {"ubits", "user bits"},
                         {"notes", "notes"},
                         {"userComments", "user comments"},
                         {"project", "project"},
                         {"circled", "circled"},
                         {"wildTrack", "wild track"},
                         {"falseStart", "false start"},
                         {"noGood", "no good"},
                         {"digitizerRate", "digitizer rate"},
                         {"useDigitizerRate", "use digitizer rate"},
                         {"editRate", "edit rate"},
                         {"fileFrameRate", "file frame rate"},
                         {"tapeMobEditRate", "tape mob edit rate"},
                         {"movieTimeCode", "movie timecode"},
                         {"fileTimeCode", "file timecode"},
                         {"startOffset", "start offset"},
                         {"groupLength", "group length"},
                         {"mobID", "mob ID"},
                         {"startingTrackIndex", "starting track"},
                         {"monoAudio", "mono audio"},
                         {"monophonicGroup", "monophonic group"},
                         {"trks", "track names"}};

std::string Shown(const Json& value);

// "25/1, 25.00 fps", or "01:00:00:00 at 25 fps, frame 90000", each with
// ", drop frame" when set; the track names as "TRK1=Boom  TRK2=Lav".
std::string ShownObject(const Json& object) {
    std::string text;
    if (object.contains("rate")) {
        char fps[32];
        std::snprintf(fps, sizeof fps, "%.2f", object["fps"].get<double>());
        text = object["rate"].get<std::string>() + ", " + fps + " fps";
    } else if (object.contains("totalFrames")) {
        text = object["text"].get<std::string>() + " at " + Shown(object["fps"]) + " fps, frame " +
               Shown(object["totalFrames"]);
    } else {
        for (const auto& [key, value] : object.items()) text += (text.empty() ? "" : "  ") + key + "=" + Shown(value);
        return text;
    }
    return object["drop"].get<bool>() ? text + ", drop frame" : text;
}

std::string Shown(const Json& value) {
    if (value.is_boolean()) return value.get<bool>() ? "yes" : "no";
    if (value.is_object()) return ShownObject(value);
    return ShownValue(value);
}

void PrintTable(const std::vector<std::vector<std::string>>& rows) {
    std::vector<size_t> widths;
    for (const auto& row : rows) {
        widths.resize(std::max(widths.size(), row.size()));
        for (size_t i = 0; i < row.size(); ++i) widths[i] = std::max(widths[i], row[i].size());
    }
    for (const auto& row : rows) {
        std::string line;
        for (size_t i = 0; i < row.size(); ++i)
            line += row[i] + (i + 1 < row.size() ? std::string(widths[i] - row[i].size() + 2, ' ') : "");
        std::printf("  %s\n", line.c_str());
    }
}

// One row per track; audio columns are "-" for the timecode track, and the
// path column appears only when a track lies in a file of its own.
void PrintTracks(const Json& tracks) {
    const bool paths =
        std::any_of(tracks.begin(), tracks.end(), [](const Json& t) { return !t["path"].get<std::string>().empty(); });
    std::vector<std::vector<std::string>> rows = {
        {"#", "type", "channel", "bytes", "samples", "rate", "bits", "of", "frame", "offset", "order", "float"}};
    if (paths) rows[0].push_back("path");
    for (size_t i = 0; i < tracks.size(); ++i) {
        const Json& track = tracks[i];
        const bool audio = track.contains("sampleRate");
        const auto field = [&](const char* key) { return audio ? Shown(track[key]) : std::string("-"); };
        std::vector<std::string> row = {std::to_string(i),
                                        Shown(track["type"]),
                                        Shown(track["channelIndex"]),
                                        Shown(track["sampleSize"]),
                                        Shown(track["sampleCount"]),
                                        field("sampleRate"),
                                        field("bitsPerChannel"),
                                        field("channelsPerFrame"),
                                        field("bytesPerFrame"),
                                        field("startOffset"),
                                        audio ? (track["bigEndian"].get<bool>() ? "big" : "little") : "-",
                                        field("floatingPoint")};
        if (paths) row.push_back(Shown(track["path"]));
        rows.push_back(row);
    }
    PrintTable(rows);
}

}  // namespace

void PrintProbeText(const Json& report) {
    size_t width = 0;
    for (const Label& label : kLabels) width = std::max(width, std::string(label.text).size());
    std::printf("Clip\n");
    for (const Label& label : kLabels) {
        if (!report.contains(label.key)) continue;
        std::printf("  %-*s  %s\n", static_cast<int>(width), label.text, Shown(report[label.key]).c_str());
    }
    if (report.contains("tracks")) {
        std::printf("Tracks\n");
        PrintTracks(report["tracks"]);
    }
}
