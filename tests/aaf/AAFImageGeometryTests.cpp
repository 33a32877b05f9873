// The image boxes' arithmetic: reduction, the standard-size test, the world
// size and the default boxes, at their edges.
#include <gtest/gtest.h>

#include <climits>

#include "aaf/AAFImageGeometry.h"

using namespace ZEB::AAFUtils;
using RationalHelper::Rational;

namespace {

bool Same(const _aafRational_t& a, const _aafRational_t& b) {
    return a.numerator == b.numerator && a.denominator == b.denominator;
}

::testing::AssertionResult SameBox(const aafBoundsBox_t& box, const aafBoundsBox_t& expected) {
    const _aafRational_t* got[] = {&box.PositionX, &box.PositionY, &box.Width, &box.Height};
    const _aafRational_t* want[] = {&expected.PositionX, &expected.PositionY, &expected.Width, &expected.Height};
    for (int i = 0; i < 4; ++i)
        if (!Same(*got[i], *want[i]))
            return ::testing::AssertionFailure()
                   << "member " << i << " is " << got[i]->numerator << "/" << got[i]->denominator << ", expected "
                   << want[i]->numerator << "/" << want[i]->denominator;
    return ::testing::AssertionSuccess();
}

TEST(AAFImageGeometry, ReduceRational) {
    struct Case {
        _aafRational_t in, out;
    } cases[] = {
        {{1920, 1080}, {16, 9}},
        {{0, 25}, {0, 1}},
        {{3, -6}, {-1, 2}},
        {{-4, -8}, {1, 2}},
        {{7, 0}, {7, 0}},
        {{0, 0}, {0, 0}},
        {{INT_MIN, -2}, {1073741824, 1}},
        {{INT_MIN, -1}, {INT_MIN, -1}},  // the sign cannot move
        {{30000, 1001}, {30000, 1001}},
    };
    for (const Case& c : cases) {
        _aafRational_t r = c.in;
        ReduceRational(r);
        EXPECT_TRUE(Same(r, c.out)) << c.in.numerator << "/" << c.in.denominator << " gave " << r.numerator << "/"
                                    << r.denominator;
    }
}

TEST(AAFImageGeometry, IsSDorHD) {
    struct Case {
        _aafRational_t width, height;
        bool expected;
    } cases[] = {
        {{1920, 1}, {1080, 1}, true},  // the limits themselves pass
        {{3840, 2}, {2160, 2}, true},  // so do they unreduced
        {{1280, 1}, {720, 1}, true},   {{640, 1}, {480, 1}, true},
        {{1440, 1}, {1080, 1}, true},                                  // 4:3 at full height
        {{1921, 1}, {1080, 1}, false}, {{3841, 2}, {1080, 1}, false},  // 1920.5 is too wide
        {{1920, 1}, {2161, 2}, false}, {{2048, 1}, {1152, 1}, false},  // 16:9 but too large
        {{3839, 2}, {2159, 2}, false},                                 // within the limits, a shape of 3839:2159
        {{720, 1}, {480, 1}, false},   {{720, 1}, {576, 1}, false},
        {{1920, 1}, {1200, 1}, false}, {{16, 0}, {9, 1}, false},
        {{16, 1}, {9, 0}, false},      {{16, 1}, {0, 1}, false},
    };
    for (const Case& c : cases)
        EXPECT_EQ(IsSDorHD(c.width, c.height), c.expected) << c.width.numerator << "/" << c.width.denominator << " x "
                                                           << c.height.numerator << "/" << c.height.denominator;
}

TEST(AAFImageGeometry, GetWorldDimensions) {
    struct Case {
        _aafRational_t width, height;
        TOVRESULT result;
        _aafRational_t worldWidth, worldHeight;
    } cases[] = {
        {{3840, 2}, {1080, 1}, TOV_OK, {1920, 1}, {1080, 1}},
        {{720, 1}, {576, 1}, TOV_OK, {600, 1}, {480, 1}},
        {{721, 1}, {486, 1}, TOV_OK, {3605, 6}, {405, 1}},
        {{720, 0}, {576, 1}, TOV_E_NOTSUPPORTED, {-1, -1}, {-1, -1}},
        {{720, 1}, {576, 0}, TOV_E_NOTSUPPORTED, {-1, -1}, {-1, -1}},
        {{INT_MAX, 1}, {576, 1}, TOV_E_NOTSUPPORTED, {-1, -1}, {-1, -1}},  // 5/6 of it has no int form
    };
    for (const Case& c : cases) {
        _aafRational_t w{-1, -1}, h{-1, -1};
        EXPECT_EQ(GetWorldDimensions(c.width, c.height, w, h), c.result) << c.width.numerator;
        EXPECT_TRUE(Same(w, c.worldWidth) && Same(h, c.worldHeight))
            << c.width.numerator << " gave " << w.numerator << "/" << w.denominator << " x " << h.numerator << "/"
            << h.denominator;
    }
}

struct BoxCase {
    const char* name;
    Rectangle essence, source, valid;
    _aafRational_t imageAspect, pixelAspect;
    aafBoundsBox_t essenceBox, sourceBox, validBox;
};

// Names the case in test output instead of its bytes.
void PrintTo(const BoxCase& c, std::ostream* out) { *out << c.name; }

class DefaultBoxes : public ::testing::TestWithParam<BoxCase> {};

TEST_P(DefaultBoxes, AreCentredInTheWorldFrame) {
    const BoxCase& c = GetParam();
    aafBoundsBox_t e{}, s{}, v{};
    ASSERT_EQ(CalculateDefaultOrrinBoxes(c.essence, c.source, c.valid, c.imageAspect, c.pixelAspect, e, s, v), TOV_OK);
    EXPECT_TRUE(SameBox(e, c.essenceBox));
    EXPECT_TRUE(SameBox(s, c.sourceBox));
    EXPECT_TRUE(SameBox(v, c.validBox));
}

const Rectangle kHD{{1920, 1}, {1080, 1}};
const Rectangle kPAL{{720, 1}, {576, 1}};

// A rectangle and a box of whole numbers.
Rectangle Rect(int width, int height) { return {{width, 1}, {height, 1}}; }
aafBoundsBox_t Box(int x, int y, int width, int height) { return ToAAFBox({x, 1}, {y, 1}, {width, 1}, {height, 1}); }

BoxCase Case(const char* name, Rectangle essence, Rectangle source, Rectangle valid, _aafRational_t imageAspect,
             _aafRational_t pixelAspect, aafBoundsBox_t essenceBox, aafBoundsBox_t sourceBox, aafBoundsBox_t validBox) {
    return {name, essence, source, valid, imageAspect, pixelAspect, essenceBox, sourceBox, validBox};
}

INSTANTIATE_TEST_SUITE_P(
    Frames, DefaultBoxes,
    ::testing::Values(Case("HDSquarePixels", kHD, kHD, Rect(1900, 1060), {0, 0}, {1, 1}, Box(0, 0, 1920, 1080),
                           Box(0, 0, 1920, 1080), Box(10, 10, 1900, 1060)),
                      // Without a pixel aspect ratio, 16:9 over the HD frame gives square pixels again.
                      Case("HDFromTheImageAspect", kHD, kHD, Rect(1901, 1080), {32, 18}, {0, 1}, Box(0, 0, 1920, 1080),
                           Box(0, 0, 1920, 1080), ToAAFBox({19, 2}, {0, 1}, {1901, 1}, {1080, 1})),
                      // 720 x 576 is scaled to 600 x 480 and widened to 4:3 by the pixels' 16/15.
                      Case("PALFromTheImageAspect", kPAL, {{1440, 2}, {576, 1}}, Rect(702, 576), {4, 3}, {0, 0},
                           Box(0, 0, 640, 480), Box(0, 0, 640, 480), Box(8, 0, 624, 480)),
                      // A positive pixel aspect ratio wins over the image aspect ratio.
                      Case("PixelAspectWins", kPAL, kPAL, kPAL, {16, 9}, {12, 10}, Box(0, 0, 720, 480),
                           Box(0, 0, 720, 480), Box(0, 0, 720, 480)),
                      // A source larger than the essence lies at a negative position.
                      Case("LargerSource", kHD, Rect(2000, 1100), kHD, {16, 9}, {1, 1}, Box(0, 0, 1920, 1080),
                           Box(-40, -10, 2000, 1100), Box(0, 0, 1920, 1080))),
    [](const auto& info) { return std::string(info.param.name); });

TEST(AAFImageGeometry, DefaultBoxesRefuseWhatCannotBeWorkedOut) {
    struct Case {
        const char* why;
        Rectangle essence;
        _aafRational_t imageAspect, pixelAspect;
    } cases[] = {
        {"no positive ratio", kHD, {0, 1}, {-1, 1}},
        {"ratios with zero denominators", kHD, {16, 0}, {1, 0}},
        {"negative terms, though their quotients are positive", kHD, {-16, -9}, {-1, -1}},
        {"an essence of no width", {{0, 1}, {1080, 1}}, {16, 9}, {0, 0}},
        {"an essence of no height", {{1920, 1}, {0, 1}}, {16, 9}, {1, 1}},
        {"an essence with a zero denominator", {{1920, 0}, {1080, 1}}, {1, 1}, {1, 1}},
    };
    for (const Case& c : cases) {
        const aafBoundsBox_t untouched = ToAAFBox({7, 1}, {7, 1}, {7, 1}, {7, 1});
        aafBoundsBox_t e = untouched, s = untouched, v = untouched;
        EXPECT_EQ(CalculateDefaultOrrinBoxes(c.essence, kHD, kHD, c.imageAspect, c.pixelAspect, e, s, v),
                  TOV_E_NOTSUPPORTED)
            << c.why;
        EXPECT_TRUE(SameBox(e, untouched) && SameBox(s, untouched) && SameBox(v, untouched)) << c.why;
    }
}

TEST(AAFImageGeometry, RationalArithmeticReportsOverflowAndDivisionByZero) {
    const Rational<int> big(INT_MAX, 1), zero(0, 1);
    EXPECT_THROW(big * Rational<int>(2, 1), std::overflow_error);
    EXPECT_THROW(Rational<int>(1, 1) / zero, std::domain_error);
    EXPECT_TRUE(Rational<int>(INT_MAX, 3) * Rational<int>(3, INT_MAX) == Rational<int>(1, 1));
    EXPECT_TRUE(Rational<int>(1, 3) - Rational<int>(1, 2) == Rational<int>(-1, 6));
}

}  // namespace
