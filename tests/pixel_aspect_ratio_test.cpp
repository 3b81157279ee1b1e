#include <gtest/gtest.h>
#include <zebmediatypes/pixel_aspect_ratio.h>

#include <array>
#include <boost/rational.hpp>
#include <climits>
#include <cmath>
#include <limits>
#include <sstream>
#include <string>
#include <utility>

namespace zebmediatypes {
namespace {

using zebcore::geom::PointT;
using zebcore::geom::RectT;

std::string Narrow(PixelAspectRatio r) {
  std::ostringstream out;
  out << r;
  return out.str();
}

std::string Text(const zebcore::UTF16String& s) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(s));
}

// The exact terms (operator== is tolerant).
std::pair<unsigned, unsigned> Terms(PixelAspectRatio r) {
  return {r.GetNumerator(), r.GetDenominator()};
}

std::string Str(PixelAspectRatio r) {
  return std::to_string(r.GetNumerator()) + ":" + std::to_string(r.GetDenominator());
}

TEST(PixelAspectRatio, ComparisonsAreTolerant) {
  // clang-format off
  struct Case { PixelAspectRatio a, b; bool equal, less; };
  const Case kCases[] = {
      {kPixelAspectRatio_Unknown, kPixelAspectRatio_Any, true, false}, {{0, 7}, {0, 1}, true, false}, {{0, 0}, {0, 1}, true, false},
      {{5, 0}, {7, 0}, true, false}, {{5, 1}, {5, 0}, false, true}, {{0, 1}, {1, 0}, false, true}, {{59, 54}, {768, 702}, false, true},
      {{9, 10}, {648, 720}, true, false}, {{9, 10}, {10, 11}, false, true}, {{1920, 1440}, {4, 3}, true, false},
      {{1000, 1000}, {1002, 1000}, false, true}, {{1000, 1000}, {1000, 1001}, true, false}, {{10000, 10000}, {10009, 10000}, true, false},
      {{UINT_MAX, 1}, {UINT_MAX, 1}, true, false}, {{3, 2}, {2, 1}, false, true}, {{0, 1}, {1, 1000000}, false, true},
      {{1000000, 1}, {3, 0}, false, true},  // huge beats finite
  };
  // clang-format on
  for (const auto& [a, b, equal, less] : kCases) {
    SCOPED_TRACE(Str(a) + " vs " + Str(b));
    const bool lessOrEqual = equal || less;  // and never b < a: the two orders agree
    // clang-format off
    EXPECT_EQ((std::array{a == b, b == a, a != b, a < b, b > a, b < a, a <= b, b >= a}),
              (std::array{equal, equal, !equal, less, less, false, lessOrEqual, lessOrEqual}));
    // clang-format on
  }
}

TEST(PixelAspectRatio, TextHasOneOrFourFractionDigits) {
  // clang-format off
  const std::pair<PixelAspectRatio, const char*> kCases[] = {
      {{1, 1}, "1.0"}, {{2, 1}, "2.0"}, {{3, 2}, "1.5"}, {{10, 11}, "0.9091"}, {{40, 33}, "1.2121"},
      {{1920, 1440}, "1.3333"}, {{768, 702}, "1.0940"}, {{0, 1}, "0.0000"}, {{1001, 1000}, "1.0"}, {{}, "1.0"},
  };
  // clang-format on
  for (const auto& [r, text] : kCases) {
    zebcore::string::oUTF16StringStream wide;
    wide << r;
    EXPECT_EQ((std::array{Narrow(r), Text(r.GetDisplayString()), Text(wide.str())}),
              (std::array<std::string, 3>{text, text, text}));
  }
}

TEST(PixelAspectRatio, TextOfHugeValuesIsBounded) {
  // A zero denominator makes the largest double, over 300 digits in fixed notation.
  constexpr double kMax = std::numeric_limits<double>::max();
  // clang-format off
  const std::pair<PixelAspectRatio, double> kCases[] = {{{3, 0}, kMax}, {{0, 0}, kMax}, {{UINT_MAX, 1}, 4294967295.0}};
  // clang-format on
  for (const auto& [r, value] : kCases) {
    SCOPED_TRACE(Str(r));
    EXPECT_EQ(r.ToDouble(), value);
    const std::string text = Narrow(r);
    EXPECT_TRUE(!text.empty() && text.size() <= 31u) << text;
    EXPECT_EQ(Text(r.GetDisplayString()), text);
  }
}

TEST(ReducePixelAspectRatio, GivesLowestTerms) {
  // clang-format off
  const std::pair<PixelAspectRatio, PixelAspectRatio> kCases[] = {
      {{768, 702}, {128, 117}}, {{1920, 1440}, {4, 3}}, {{0, 2}, {0, 1}}, {{10, 11}, {10, 11}},
      {{INT_MAX, 1}, {INT_MAX, 1}}, {{INT_MAX - 1, 2}, {INT_MAX / 2, 1}},
  };
  // clang-format on
  for (const auto& [in, out] : kCases)
    EXPECT_EQ(Terms(ReducePixelAspectRatio(in)), Terms(out)) << Str(in);
}

TEST(ReducePixelAspectRatio, BadFieldsThrowWithAMessageThatSaysWhy) {
  // clang-format off
  const std::pair<PixelAspectRatio, const char*> kCases[] = {
      {{5, 0}, "zero denominator"}, {{0, 0}, "zero denominator"}, {{4294967295u, 1}, "out of range"},
      {{2147483648u, 1}, "out of range"}, {{1, 2147483648u}, "out of range"},
  };
  // clang-format on
  for (const auto& [in, messagePart] : kCases) {
    SCOPED_TRACE(Str(in));
    try {
      ReducePixelAspectRatio(in);
      ADD_FAILURE() << "no exception";
    } catch (const boost::bad_rational& e) {
      EXPECT_NE(std::string(e.what()).find(messagePart), std::string::npos) << e.what();
    }
  }
}

TEST(CorrectLegacyPixelAspectRatio, ReplacesTheHistoricWrongValues) {
  // clang-format off
  struct Case { PixelAspectRatio in, out; bool legacy; };
  const Case kCases[] = {
      {{648, 720}, {10, 11}, true}, {{864, 720}, {40, 33}, true}, {{768, 720}, {768, 702}, true}, {{59, 54}, {768, 702}, true},
      {{1024, 720}, {1024, 702}, true}, {{9, 10}, {10, 11}, true}, {{10, 11}, {10, 11}, false}, {{40, 33}, {40, 33}, false},
      {{768, 702}, {768, 702}, false}, {{0, 1}, {0, 1}, false}, {{1, 0}, {1, 0}, false},
  };
  // clang-format on
  for (const Case& c : kCases)
    EXPECT_EQ(
        std::make_pair(Terms(CorrectLegacyPixelAspectRatio(c.in)), IsLegacyPixelAspectRatio(c.in)),
        std::make_pair(Terms(c.out), c.legacy))
        << Str(c.in);
}

TEST(AdjustPixelAspectRatioForNonUniformDownsample, ScalesTheRatioWithTheFrame) {
  // clang-format off
  struct Case { const char* name; PixelAspectRatio r; RectT<int> src, dst; PixelAspectRatio out; };
  const Case kCases[] = {
      {"half width", {1, 1}, {0, 0, 1920, 1080}, {0, 0, 960, 1080}, {2, 1}}, {"shape kept", {1, 1}, {0, 0, 1920, 1080}, {0, 0, 1280, 720}, {1, 1}},
      {"DV to square", {10, 11}, {0, 0, 720, 480}, {0, 0, 640, 480}, {45, 44}}, {"reduced", {4, 3}, {0, 0, 1440, 1080}, {0, 0, 1920, 1080}, {1, 1}},
      {"zero denominator", {1, 0}, {0, 0, 1920, 1080}, {0, 0, 960, 1080}, {1, 1}}, {"zero numerator", {0, 5}, {0, 0, 1920, 1080}, {0, 0, 960, 1080}, {0, 1}},
      {"zero source", {10, 11}, {0, 0, 0, 0}, {0, 0, 960, 1080}, {10, 11}}, {"zero destination", {10, 11}, {0, 0, 720, 480}, {0, 0, 0, 480}, {10, 11}},
      {"negative source", {10, 11}, {0, 0, -720, 480}, {0, 0, 720, 240}, {10, 11}}, {"negative destination", {10, 11}, {0, 0, 720, 480}, {0, 0, 720, -480}, {10, 11}},
      {"64-bit overflow", {UINT_MAX, 1}, {0, 0, INT_MAX, 1}, {0, 0, 1, INT_MAX}, {UINT_MAX, 1}},
  };
  // clang-format on
  for (const Case& c : kCases)
    EXPECT_EQ(Terms(AdjustPixelAspectRatioForNonUniformDownsample(c.r, c.src, c.dst)), Terms(c.out))
        << c.name;
}

TEST(AdjustPixelAspectRatioForNonUniformDownsample, HugeTermsAreApproximated) {
  // 2147483647 : 1431655764 (1.5 in lowest terms) has a term beyond 2147483646.
  const PixelAspectRatio r = AdjustPixelAspectRatioForNonUniformDownsample(
      PixelAspectRatio(2147483647u, 2147483646u), {0, 0, 3, 1}, {0, 0, 2, 1});
  EXPECT_TRUE(r.GetDenominator() != 0 && r.GetNumerator() <= 2147483646u) << Str(r);
  EXPECT_NEAR(r.ToDouble(), 2147483647.0 * 3 / (2147483646.0 * 2), 1e-9);
}

TEST(AdaptVideoRectToPAR, CentresTheVideoInTheDisplay) {
  // clang-format off
  struct Case { const char* name; PixelAspectRatio r; RectT<float> video, display, want; };
  const Case kCases[] = {
      {"DV NTSC", {10, 11}, {0, 0, 720, 480}, {0, 0, 1000, 1000}, {-0.25f, 133.36f, 1000.5f, 733.27f}},
      {"zero video", {1, 1}, {0, 0, 0, 0}, {10, 20, 300, 200}, {10, 20, 300, 200}}, {"zero-height video", {1, 1}, {0, 0, 640, 0}, {10, 20, 300, 200}, {10, 20, 300, 200}},
      {"tiny display", {1, 1}, {0, 0, 0, 0}, {0, 0, 0, 0}, {-0.5f, -1.0f, 1.0f, 2.0f}},
      {"zero ratio uses the width", {0, 1}, {0, 0, 200, 100}, {0, 0, 400, 400}, {0, 100, 400.5f, 200.5f}},
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.name);
    const RectT<float> r = AdaptVideoRectToPAR(c.r, c.video, c.display);
    EXPECT_TRUE(std::abs(r.width - c.want.width) < 0.01f &&
                std::abs(r.height - c.want.height) < 0.01f &&
                std::abs(r.left - c.want.left) < 0.3f && std::abs(r.top - c.want.top) < 0.3f)
        << r.left << " " << r.top << " " << r.width << " " << r.height;
  }
  EXPECT_EQ(AdaptVideoRectToPAR(kPixelAspectRatio_DVNTSC, RectT<int>{5, 5, 720, 480},
                                RectT<int>{0, 0, 1000, 1000}),
            (RectT<int>{0, 134, 1000, 732}));
}

TEST(PixelAspectRect, ConvertsWidthsBetweenSquareAndNonSquarePixels) {
  // square: the width in square pixels; back: `square` taken back to the ratio's pixels.
  // clang-format off
  struct Case { PixelAspectRatio r; int width, square, back; };
  const Case kCases[] = {
      {{10, 11}, 720, 655, 721}, {{40, 33}, 720, 873, 720}, {{2, 1}, 960, 1920, 960}, {{1, 1}, 1920, 1920, 1920}, {{3, 2}, 1280, 1920, 1280},
      {{1920, 1440}, 1440, 1920, 1440}, {{0, 1}, 720, 720, 720}, {{1, 0}, 720, 720, 720}, {{0, 0}, 720, 720, 720},  // left alone
  };
  // clang-format on
  for (const Case& c : kCases) {
    SCOPED_TRACE(Str(c.r));
    const RectT<int> square{3, 4, c.square, 480};
    EXPECT_EQ(AdjustPixelAspectRectToSquarePixelRect(RectT<int>{3, 4, c.width, 480}, c.r), square);
    EXPECT_EQ(AdjustSquarePixelRectToPixelAspectRect(square, c.r), (RectT<int>{3, 4, c.back, 480}));
    const PointT<int> toSquare =
        AdjustPixelAspectDimensionToSquarePixelDimension({c.width, 7}, c.r);
    const PointT<int> back = AdjustSquarePixelDimensionToPixelAspectDimension(toSquare, c.r);
    EXPECT_EQ(std::make_pair(toSquare, back),
              std::make_pair(PointT<int>{c.square, 7}, PointT<int>{c.back, 7}));
  }
  const RectT<float> f = AdjustPixelAspectRectToSquarePixelRect(RectT<float>{3, 4, 720, 480},
                                                                kPixelAspectRatio_DVNTSC);
  EXPECT_NEAR(f.width, 720.0f * 10 / 11 + 0.5f, 1e-3f);
}

TEST(FitRectInRect, ScalesIntoTheOuterCorner) {
  // clang-format off
  struct Case { RectT<int> inner, want; };
  const Case kCases[] = {
      {{0, 0, 200, 100}, {10, 20, 100, 50}}, {{0, 0, 100, 200}, {10, 20, 50, 100}}, {{0, 0, 0, 100}, {10, 20, 100, 100}},  // empty: fills
  };
  // clang-format on
  for (const Case& c : kCases) {
    RectT<int> r;
    FitRectInRect(c.inner, RectT<int>{10, 20, 100, 100}, r);
    EXPECT_EQ(r, c.want) << c.inner.width;
  }
  RectT<float> f;
  FitRectInRect(RectT<float>{0, 0, 200, 100}, RectT<float>{10, 20, 100, 100}, f);
  EXPECT_EQ(f, (RectT<float>{10, 20, 100.5f, 50.5f}));
}

TEST(PixelAspectGeometry, FloatToIntConversionsSaturate) {
  const PixelAspectRatio square = kPixelAspectRatio_Square, wide(UINT_MAX, 1), narrow(1, UINT_MAX);
  const RectT<int> unit{0, 0, 1, 1}, huge{INT_MAX, INT_MAX, INT_MAX, INT_MAX};
  const RectT<int> hugeNegative{INT_MIN, INT_MIN, INT_MAX, INT_MAX};
  const RectT<int> adapted = AdaptVideoRectToPAR(square, unit, huge);
  RectT<int> fit, fitNegative;
  FitRectInRect(unit, RectT<int>{0, 0, INT_MAX, INT_MAX}, fit);
  FitRectInRect(unit, hugeNegative, fitNegative);
  RectT<float> fitFloat;
  FitRectInRect(RectT<float>{0, 0, 1, 1}, RectT<float>{0, 0, 3e38f, 3e38f}, fitFloat);  // no UB
  // clang-format off
  struct Case { const char* name; int got, want; };
  const Case kCases[] = {
      {"adapt left", adapted.left, INT_MAX}, {"adapt top", adapted.top, INT_MAX},
      {"adapt negative left", AdaptVideoRectToPAR(square, unit, hugeNegative).left, INT_MIN},
      {"to square point", AdjustPixelAspectDimensionToSquarePixelDimension({INT_MAX, 0}, wide).x, INT_MAX},
      {"to square negative point", AdjustPixelAspectDimensionToSquarePixelDimension({INT_MIN, 0}, wide).x, INT_MIN},
      {"from square point", AdjustSquarePixelDimensionToPixelAspectDimension({INT_MAX, 0}, narrow).x, INT_MAX},
      {"to square rect", AdjustPixelAspectRectToSquarePixelRect(RectT<int>{0, 0, INT_MAX, 1}, wide).width, INT_MAX},
      {"from square rect", AdjustSquarePixelRectToPixelAspectRect({0, 0, INT_MIN, 1}, narrow).width, INT_MIN},
      {"fit width", fit.width, INT_MAX}, {"fit height", fit.height, INT_MAX}, {"fit negative left", fitNegative.left, INT_MIN},
  };
  // clang-format on
  for (const Case& c : kCases) EXPECT_EQ(c.got, c.want) << c.name;
}

}  // namespace
}  // namespace zebmediatypes
