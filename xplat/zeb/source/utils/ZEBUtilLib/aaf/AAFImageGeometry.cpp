#include "AAFImageGeometry.h"

#include <stdexcept>

namespace ZEB {
namespace AAFUtils {

namespace {

using Fraction = RationalHelper::Rational<int>;

Fraction From(const _aafRational_t& r) { return Fraction(r.numerator, r.denominator).Reduced(); }
_aafRational_t To(const Fraction& f) { return {f.Numerator(), f.Denominator()}; }
/// Judged as given, before reduction: -16/-9 is no usable ratio.
bool IsPositive(const _aafRational_t& r) { return r.numerator > 0 && r.denominator > 0; }

/// The integer part is checked first: 1920.5 is too wide though its ratio may fit.
bool WithinLimit(const Fraction& side, int limit) {
    return side.Numerator() / side.Denominator() < limit || side == Fraction(limit, 1);
}

}  // namespace

void ReduceRational(_aafRational_t& value) { value = To(From(value)); }

bool IsSDorHD(_aafRational_t width, _aafRational_t height) {
    if (width.denominator == 0 || height.denominator == 0) return false;
    const Fraction w = From(width), h = From(height);
    if (!WithinLimit(w, 1920) || !WithinLimit(h, 1080)) return false;
    if (h.Numerator() == 0) return false;
    const Fraction shape = w / h;
    return shape == Fraction(16, 9) || shape == Fraction(4, 3);
}

TOVRESULT GetWorldDimensions(_aafRational_t width, _aafRational_t height, _aafRational_t& worldWidth,
                             _aafRational_t& worldHeight) {
    if (width.denominator == 0 || height.denominator == 0) return TOV_E_NOTSUPPORTED;
    try {
        const Fraction scale = IsSDorHD(width, height) ? Fraction(1, 1) : Fraction(5, 6);
        const Fraction w = From(width) * scale, h = From(height) * scale;
        worldWidth = To(w);
        worldHeight = To(h);
        return TOV_OK;
    } catch (const std::exception&) {
        return TOV_E_NOTSUPPORTED;
    }
}

TOVRESULT CalculateDefaultOrrinBoxes(const Rectangle& essence, const Rectangle& source, const Rectangle& valid,
                                     _aafRational_t imageAspectRatio, _aafRational_t pixelAspectRatio,
                                     aafBoundsBox_t& essenceBox, aafBoundsBox_t& sourceBox, aafBoundsBox_t& validBox) {
    if (!IsPositive(imageAspectRatio) && !IsPositive(pixelAspectRatio)) return TOV_E_NOTSUPPORTED;
    const Fraction imageAspect = From(imageAspectRatio), pixelAspect = From(pixelAspectRatio);
    try {
        const Fraction essenceWidth = essence.width.Reduced(), essenceHeight = essence.height.Reduced();
        _aafRational_t worldWidth{}, worldHeight{};
        const TOVRESULT world = GetWorldDimensions(To(essenceWidth), To(essenceHeight), worldWidth, worldHeight);
        if (world != TOV_OK) return world;
        const Fraction frameWidth = From(worldWidth), frameHeight = From(worldHeight);
        const Fraction aspect = IsPositive(pixelAspectRatio) ? pixelAspect : imageAspect * frameHeight / frameWidth;
        const Fraction scaleX = frameWidth / essenceWidth * aspect, scaleY = frameHeight / essenceHeight;
        const Fraction fullWidth = frameWidth * aspect, half(1, 2);
        auto centred = [&](const Rectangle& r) {
            const Fraction w = r.width.Reduced() * scaleX, h = r.height.Reduced() * scaleY;
            return ToAAFBox(To((fullWidth - w) * half), To((frameHeight - h) * half), To(w), To(h));
        };
        const aafBoundsBox_t e = ToAAFBox({0, 1}, {0, 1}, To(fullWidth), To(frameHeight));
        const aafBoundsBox_t s = centred(source), v = centred(valid);
        essenceBox = e;
        sourceBox = s;
        validBox = v;
        return TOV_OK;
    } catch (const std::exception&) {
        return TOV_E_NOTSUPPORTED;
    }
}

}  // namespace AAFUtils
}  // namespace ZEB
