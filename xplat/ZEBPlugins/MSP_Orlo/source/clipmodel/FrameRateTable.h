#pragma once
/// The known frame and sample rates, and the look-ups from a figure or a text
/// to a rational rate.
#include <cstddef>
#include <string>

#include "aaf/AAFTypes.h"
#include "strings/ZEBString.h"

namespace HelperFunctions {

/// One range of figures and the rate it stands for. Every look-up truncates
/// `low` to an integer: 23.9 searches from 23.
struct FrameRateConvertRow {
    double low;
    double high;
    _aafRational_t rate;
};

/// Rows 0 to 7 are frame rates (23.976 to 60), rows 8 to 10 sample rates.
inline constexpr size_t kFrameRateConvertRows = 11;
inline constexpr size_t kFrameRateVideoRows = 8;
extern const FrameRateConvertRow s_tableFrameRateConvert[kFrameRateConvertRows];

/// The rational of a frames-per-second figure: a table rate, three or four
/// times a frame rate from 69 up to under 244, or else the figure rounded.
void RationalRateFromFPS(double fps, _aafRational_t& rate);
/// The same for an integer figure; the fall-back is the figure itself.
void RationalVideoRateFromFPS(int fps, _aafRational_t& rate);

/// The frame rate named by the number at the head of `text`, and drop frame
/// when the text says "DF" (or "df") not after an "N". False, and nothing
/// written, when the number is no frame rate of the table.
bool StringToFrameRate(std::string text, _aafRational_t& rate, bool& drop);
/// The video format named exactly by `text` ("29.97i", "50p", ...): its
/// frames per second and whether it is interlaced. False, and nothing written,
/// for any other text. A null output is not written.
bool StringToFrameRate(const ZEB::ZEBString& text, unsigned short* fps, bool* interlaced);

}  // namespace HelperFunctions
