#include "clipmodel/FrameRateTable.h"

#include <cctype>
#include <cstdlib>
#include <cstring>

#include "clipmodel/Timecode.h"
#include "clipmodel/TruncateToInteger.h"

namespace HelperFunctions {

const FrameRateConvertRow s_tableFrameRateConvert[kFrameRateConvertRows] = {
    {23.9, 24.0, {24000, 1001}},    {24.0, 25.0, {24, 1}},           {25.0, 26.0, {25, 1}},
    {29.9, 30.0, {30000, 1001}},    {30.0, 31.0, {30, 1}},           {50.0, 51.0, {50, 1}},
    {59.9, 60.0, {60000, 1001}},    {60.0, 61.0, {60, 1}},           {40000.0, 47000.0, {44100, 1}},
    {47000.0, 95000.0, {48000, 1}}, {95000.0, 100000.0, {96000, 1}},
};

namespace {

/// The first of the first `rows` rows whose range, scaled by `scale`, holds
/// `fps`; null if none does.
const FrameRateConvertRow* FindRow(double fps, size_t rows, int scale) {
    for (size_t i = 0; i < rows; ++i) {
        const FrameRateConvertRow& row = s_tableFrameRateConvert[i];
        const double low = static_cast<double>(TruncateToInt32(row.low * scale));
        if (low <= fps && fps < row.high * scale) return &row;
    }
    return nullptr;
}

/// The table rate, or a multiple of a frame rate, for a figure that passed
/// the gate of 69 to under 244; false when none fits.
bool MultipleOfFrameRate(double fps, _aafRational_t& rate) {
    for (const int scale : {3, 4}) {
        // Three times a frame rate ends under 183.
        if (scale == 3 && fps >= 183) continue;
        if (const FrameRateConvertRow* row = FindRow(fps, kFrameRateVideoRows, scale)) {
            rate = {row->rate.numerator * scale, row->rate.denominator};
            return true;
        }
    }
    return false;
}

}  // namespace

void RationalRateFromFPS(double fps, _aafRational_t& rate) {
    if (const FrameRateConvertRow* row = FindRow(fps, kFrameRateConvertRows, 1)) {
        rate = row->rate;
        return;
    }
    if (fps >= 69 && fps < 244 && MultipleOfFrameRate(fps, rate)) return;
    rate = {TruncateToInt32(fps + 0.5), 1};
}

void RationalVideoRateFromFPS(int fps, _aafRational_t& rate) {
    const double value = fps;
    if (const FrameRateConvertRow* row = FindRow(value, kFrameRateConvertRows, 1)) {
        rate = row->rate;
        return;
    }
    if (fps >= 69 && fps <= 243 && MultipleOfFrameRate(value, rate)) return;
    rate = {fps, 1};
}

bool StringToFrameRate(std::string text, _aafRational_t& rate, bool& drop) {
    const double value = TruncateToInt32(std::atof(text.c_str()));
    const FrameRateConvertRow* row = FindRow(value, kFrameRateVideoRows, 1);
    if (!row) return false;
    rate = row->rate;
    const double fps = static_cast<double>(rate.numerator) / rate.denominator;
    if (!Timecode::TCFPSCanBeDF(TruncateToInt32(fps + 0.5))) {
        drop = false;
        return true;
    }
    size_t at = text.find("DF");
    if (at == std::string::npos) at = text.find("df");
    // "NDF" and "ndf" say non-drop. A "DF" at the very start has no number
    // before it, so the look-up above has already refused such a text.
    drop = at != std::string::npos && at > 0 && std::toupper(static_cast<unsigned char>(text[at - 1])) != 'N';
    return true;
}

bool StringToFrameRate(const ZEB::ZEBString& text, unsigned short* fps, bool* interlaced) {
    struct VideoFormat {
        const char* name;
        unsigned short fps;
        bool interlaced;
    };
    static const VideoFormat formats[] = {
        {"23.976p", 24, false}, {"24p", 24, false},    {"29.97i", 30, true}, {"30i", 30, true},  {"25p", 25, false},
        {"25i", 25, true},      {"59.94p", 30, false}, {"59.94i", 30, true}, {"50p", 25, false}, {"50i", 25, true},
    };
    if (text.IsEmpty()) return false;
    const char* name = reinterpret_cast<const char*>(text.GetUTF8String());
    for (const VideoFormat& format : formats) {
        if (std::strcmp(name, format.name) != 0) continue;
        if (fps) *fps = format.fps;
        if (interlaced) *interlaced = format.interlaced;
        return true;
    }
    return false;
}

}  // namespace HelperFunctions
