#pragma once
/// Readers of iXML element texts. Each reports success and leaves its output
/// alone on failure. Numbers are read as a text stream in the classic locale
/// reads them: leading digits count and trailing text is ignored.
#include <cstdint>
#include <string>

#include "aaf/AAFTypes.h"
#include "strings/ZEBString.h"

namespace Chunks {
namespace IXML {

/// Exactly "TRUE" or "FALSE".
bool BoolFromString(const ZEB::ZEBString& text, bool& value);
/// "DF" is drop frame, "NDF" is not.
bool DropFrameFromString(const ZEB::ZEBString& text, bool& drop);
/// "numerator/denominator", both present and read as signed integers.
bool FrameRateFromString(const ZEB::ZEBString& text, _aafRational_t& rate);
/// hi × 2^32 + lo, each read as an unsigned 32-bit integer; neither may be empty.
bool SamplesFromString(const ZEB::ZEBString& hi, const ZEB::ZEBString& lo, unsigned long long& samples);
/// A number such as "2.10".
bool VersionFromString(const ZEB::ZEBString& text, double& version);
/// Cuts `text` after its last ">".
void TruncateIXMLString(std::string& text);

/// The UTF-8 text of a string.
std::string UTF8Text(const ZEB::ZEBString& text);

/// A non-empty text read as an unsigned 16- or 32-bit integer.
bool IntegerFromZEBString(const ZEB::ZEBString& text, uint16_t& value);
bool IntegerFromZEBString(const ZEB::ZEBString& text, uint32_t& value);

}  // namespace IXML
}  // namespace Chunks
