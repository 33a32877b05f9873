#pragma once
/// Text forms of the clip model's values for diagnostics, the few parses back,
/// and the conversions between timecode forms. No route of the plug-in
/// depends on the texts.
#include <string>

#include "aaf/AAFTypes.h"
#include "clipmodel/TimeCodeInfo.h"
#include "clipmodel/Timecode.h"
#include "strings/ZEBString.h"
#include "tov/tovUID.h"

namespace OrloReader {

/// Printed as a signed number: values from 2^63 up show negative.
std::string ToString(unsigned long long value);
/// "denominator/numerator": the denominator comes first.
std::string ToString(const _aafRational_t& rate);
/// Upper-case hex of label bytes 0 to 5, bytes 12 to 15 and the material;
/// label bytes 6 to 11 are left out.
std::string ToString(const _aafMobID_t& id);
/// "urn:uuid:" and the GUID in lower-case hex.
std::string ToString(const _tovUID& uid);
/// hh:mm:ss:ff, always with ":".
std::string ToString(const TimeCodeInfo& timecode);
/// An ISO 8601 form in which the day's place holds the year once more.
std::string ToString(const _aafTimeStamp_t& stamp);

/// The GUID of a "urn:uuid:" text. Fields the text does not give stay 0.
_tovUID StringToUID(const ZEB::ZEBString& text);
/// A timecode from the decimal digits of `text`, read from its end: two for
/// the frames, then seconds, minutes and hours; other characters are passed
/// over and further digits ignored. Fps 0, no drop frame, no count.
TimeCodeInfo StringToTimecode(const ZEB::ZEBString& text);

/// `info` takes the displayed fields, rate and drop frame of `tc`, and its
/// count as total frames. Days are dropped.
void TimeCodeToTimeCodeInfo(const Timecode::timecode_t& tc, TimeCodeInfo& info);
/// The sample position of a time of day at `sampleRate`, truncated.
void TimeToSamples(short hours, short minutes, short seconds, double sampleRate, unsigned long long& samples);

}  // namespace OrloReader
