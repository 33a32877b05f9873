#include "clipmodel/TextForms.h"

#include <algorithm>
#include <cstdio>
#include <cstring>

#include "clipmodel/TruncateToInteger.h"
#include "identity/IDText.h"

namespace OrloReader {

namespace {

/// Room for the longest form written here, the time stamp.
constexpr size_t kTextSize = 96;

}  // namespace

std::string ToString(unsigned long long value) {
    char text[kTextSize];
    std::snprintf(text, sizeof text, "%lld", static_cast<long long>(value));
    return text;
}

std::string ToString(const _aafRational_t& rate) {
    char text[kTextSize];
    std::snprintf(text, sizeof text, "%d/%d", rate.denominator, rate.numerator);
    return text;
}

std::string ToString(const _aafMobID_t& id) {
    // Label bytes 6 to 11 are the 12 digits from 12 on.
    return ZEB::MobIDDigits(id, ZEB::HexCase::Upper).erase(12, 12);
}

std::string ToString(const _tovUID& uid) {
    _aafUID_t id{uid.Data1, uid.Data2, uid.Data3, {}};
    std::copy(std::begin(uid.Data4), std::end(uid.Data4), id.Data4);
    return "urn:uuid:" + ZEB::GUIDText(id, ZEB::HexCase::Lower);
}

std::string ToString(const TimeCodeInfo& timecode) {
    char text[kTextSize];
    std::snprintf(text, sizeof text, "%02d:%02d:%02d:%02d", timecode.GetHours(), timecode.GetMinutes(),
                  timecode.GetSeconds(), timecode.GetFrames());
    return text;
}

std::string ToString(const _aafTimeStamp_t& stamp) {
    char text[kTextSize];
    std::snprintf(text, sizeof text, "%04d-%02d-%02dT%02d:%02d:%02d+00:00", stamp.date.year, stamp.date.month,
                  stamp.date.year, stamp.time.hour, stamp.time.minute, stamp.time.second);
    return text;
}

_tovUID StringToUID(const ZEB::ZEBString& text) {
    unsigned int data1 = 0, data2 = 0, data3 = 0;
    unsigned int data4[8] = {};
    if (!text.IsEmpty()) {
        std::sscanf(reinterpret_cast<const char*>(text.GetUTF8String()),
                    "urn:uuid:%8x-%4x-%4x-%2x%2x-%2x%2x%2x%2x%2x%2x", &data1, &data2, &data3, &data4[0], &data4[1],
                    &data4[2], &data4[3], &data4[4], &data4[5], &data4[6], &data4[7]);
    }
    _tovUID uid{data1, static_cast<uint16_t>(data2), static_cast<uint16_t>(data3), {}};
    for (int i = 0; i < 8; ++i) uid.Data4[i] = static_cast<uint8_t>(data4[i]);
    return uid;
}

TimeCodeInfo StringToTimecode(const ZEB::ZEBString& text) {
    // Hours, minutes, seconds, frames, filled from the right.
    int fields[4] = {};
    if (!text.IsEmpty()) {
        const char* bytes = reinterpret_cast<const char*>(text.GetUTF8String());
        int digits = 0;
        for (size_t at = std::strlen(bytes); at > 0 && digits < 8; --at) {
            const char c = bytes[at - 1];
            if (c < '0' || c > '9') continue;
            int& field = fields[3 - digits / 2];
            field += (digits % 2 == 0 ? 1 : 10) * (c - '0');
            ++digits;
        }
    }
    return TimeCodeInfo(fields[0], fields[1], fields[2], fields[3]);
}

void TimeCodeToTimeCodeInfo(const Timecode::timecode_t& tc, TimeCodeInfo& info) {
    short hours = 0, minutes = 0, seconds = 0, frames = 0;
    Timecode::TCDeconstruct(tc, nullptr, &hours, &minutes, &seconds, &frames);
    info.SetHours(hours);
    info.SetMinutes(minutes);
    info.SetSeconds(seconds);
    info.SetFrames(frames);
    info.SetFPS(tc.desc.fps);
    info.SetDropFrame((tc.desc.flags & Timecode::TCDropFrameFlag) != 0);
    info.SetTotalFrames(tc.count);
}

void TimeToSamples(short hours, short minutes, short seconds, double sampleRate, unsigned long long& samples) {
    // A negative or out-of-range result is cut as a signed 64-bit number and
    // then read as unsigned, so it never is undefined.
    samples = static_cast<unsigned long long>(HelperFunctions::TruncateToInt64(
        seconds * sampleRate + minutes * (sampleRate * 60) + hours * (60 * (sampleRate * 60))));
}

}  // namespace OrloReader
