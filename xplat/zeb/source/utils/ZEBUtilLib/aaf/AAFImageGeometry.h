#pragma once
/// The image boxes' arithmetic: from stored rectangles and an aspect ratio to
/// the three bounds boxes of an image descriptor, in a frame of square pixels.
#include "AAFDescriptorExtensions.h"
#include "RationalHelper.h"

namespace ZEB {
namespace AAFUtils {

/// A size: width and height in stored pixels.
struct Rectangle {
    RationalHelper::Rational<int> width;
    RationalHelper::Rational<int> height;
};

/// Lowest terms, the sign on the numerator; a zero denominator is left as it is.
void ReduceRational(_aafRational_t& value);

/// A standard or high definition frame: neither side beyond 1920 by 1080
/// (equal passes) and a shape of 16:9 or 4:3. A zero denominator is none.
bool IsSDorHD(_aafRational_t width, _aafRational_t height);

/// The size in square pixels: a standard or high definition size as it is,
/// any other scaled by 5/6. 0x80000008 on a zero denominator or a result out
/// of range; the outputs change only on success.
TOVRESULT GetWorldDimensions(_aafRational_t width, _aafRational_t height, _aafRational_t& worldWidth,
                             _aafRational_t& worldHeight);

/// The essence box spans the essence rectangle's world size at (0, 0); the
/// source and valid boxes are their rectangles in that frame, centred on it.
/// The pixel aspect ratio is used when positive, otherwise it follows from
/// the image aspect ratio and the world size. 0x80000008 when neither ratio
/// is positive or the arithmetic fails; the boxes change only on success.
TOVRESULT CalculateDefaultOrrinBoxes(const Rectangle& essence, const Rectangle& source, const Rectangle& valid,
                                     _aafRational_t imageAspectRatio, _aafRational_t pixelAspectRatio,
                                     aafBoundsBox_t& essenceBox, aafBoundsBox_t& sourceBox, aafBoundsBox_t& validBox);

}  // namespace AAFUtils
}  // namespace ZEB
