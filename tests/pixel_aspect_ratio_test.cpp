#include <gtest/gtest.h>
#include <zebmediatypes/pixel_aspect_ratio.h>

#include <array>
#include <boost/rational.hpp>
#include <climits>
#include <sstream>
#include <string>
#include <utility>

namespace zebmediatypes {
namespace {

using zebcore::geom::RectT;

// The exact terms (operator== is tolerant).
std::string Terms(PixelAspectRatio r) {
  return std::to_string(r.GetNumerator()) + ":" + std::to_string(r.GetDenominator());
}

TEST(PixelAspectRatio, ComparisonsAreTolerant) {
  struct Case {
    PixelAspectRatio a, b;
    bool equal, less;
  };
  const Case kCases[] = {
      {kPixelAspectRatio_Unknown, kPixelAspectRatio_Any, true, false},
      {{5, 0}, {7, 0}, true, false},
      {{9, 10}, {648, 720}, true, false},
      {{1000, 1000}, {1002, 1000}, false, true},
  };
  for (const auto& [a, b, equal, less] : kCases) {
    SCOPED_TRACE(Terms(a) + " vs " + Terms(b));
    // and never b < a: the two orders agree
    const bool lessOrEqual = equal || less;
    EXPECT_EQ((std::array{a == b, b == a, a != b, (a < b), (b > a), (b < a), a <= b, b >= a}),
              (std::array{equal, equal, !equal, less, less, false, lessOrEqual, lessOrEqual}));
  }
}

TEST(PixelAspectRatio, TextHasOneOrFourFractionDigitsAndStaysShort) {
  const std::pair<PixelAspectRatio, const char*> kCases[] = {
      {{3, 2}, "1.5"},
      // tolerantly 1:1
      {{1001, 1000}, "1.0"},
      {{10, 11}, "0.9091"},
      // the largest double, over 300 digits in fixed notation
      {{3, 0}, "1.7976931348623157e+308"},
  };
  for (const auto& [r, text] : kCases) {
    std::ostringstream narrow;
    narrow << r;
    EXPECT_EQ(narrow.str(), text);
    EXPECT_EQ(r.GetDisplayString(), zebcore::string::UTF8to16(text));
  }
}

TEST(ReducePixelAspectRatio, GivesLowestTermsOrThrowsSayingWhy) {
  struct Case {
    PixelAspectRatio in;
    // the terms, or part of the exception's message
    const char* out;
  };
  const Case kCases[] = {
      {{768, 702}, "128:117"},
      {{0, 2}, "0:1"},
      // the largest term accepted
      {{INT_MAX, 1}, "2147483647:1"},
      {{5, 0}, "zero denominator"},
      {{2147483648u, 1}, "out of range"},
      {{1, 2147483648u}, "out of range"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(Terms(c.in));
    try {
      EXPECT_EQ(Terms(ReducePixelAspectRatio(c.in)), c.out);
    } catch (const boost::bad_rational& e) {
      EXPECT_NE(std::string(e.what()).find(c.out), std::string::npos) << e.what();
    }
  }
}

TEST(CorrectLegacyPixelAspectRatio, ReplacesTheHistoricWrongValues) {
  struct Case {
    PixelAspectRatio in;
    const char* out;
    bool legacy;
  };
  const Case kCases[] = {
      {{59, 54}, "768:702", true},
      // tolerantly 648:720
      {{9, 10}, "10:11", true},
      {{768, 702}, "768:702", false},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(Terms(c.in));
    EXPECT_EQ(Terms(CorrectLegacyPixelAspectRatio(c.in)), c.out);
    EXPECT_EQ(IsLegacyPixelAspectRatio(c.in), c.legacy);
  }
}

TEST(AdjustPixelAspectRatioForNonUniformDownsample, ScalesTheRatioWithTheFrame) {
  const RectT<int> hd{0, 0, 1920, 1080}, halfHD{0, 0, 960, 1080};
  struct Case {
    PixelAspectRatio r;
    RectT<int> src, dst;
    const char* out;
  };
  const Case kCases[] = {
      {{1, 1}, hd, halfHD, "2:1"},
      {{10, 11}, {0, 0, 720, 480}, {0, 0, 640, 480}, "45:44"},
      // the shape is kept
      {{1, 1}, hd, {0, 0, 1280, 720}, "1:1"},
      // a negative size
      {{10, 11}, {0, 0, -720, 480}, hd, "10:11"},
      // 64-bit overflow
      {{UINT_MAX, 1}, {0, 0, INT_MAX, 1}, {0, 0, 1, INT_MAX}, "4294967295:1"},
      // 2147483647:1431655764 has a term beyond 2147483646: approximated with smaller terms.
      {{2147483647u, 2147483646u}, {0, 0, 3, 1}, {0, 0, 2, 1}, "1073741825:715827883"},
  };
  for (const Case& c : kCases) {
    EXPECT_EQ(Terms(AdjustPixelAspectRatioForNonUniformDownsample(c.r, c.src, c.dst)), c.out)
        << Terms(c.r);
  }
}

TEST(PixelAspectGeometry, FitsAndConvertsRectangles) {
  const PixelAspectRatio ntsc = kPixelAspectRatio_DVNTSC;
  RectT<int> fit;
  FitRectInRect(RectT<int>{0, 0, 200, 100}, RectT<int>{10, 20, 100, 100}, fit);
  const std::pair<RectT<int>, RectT<int>> kCases[] = {
      {fit, {10, 20, 100, 50}},
      {AdaptVideoRectToPAR(ntsc, RectT<int>{5, 5, 720, 480}, {0, 0, 1000, 1000}),
       {0, 134, 1000, 732}},
      {AdaptVideoRectToPAR({0, 1}, RectT<int>{0, 0, 200, 100}, {0, 0, 400, 400}),
       // a zero term: the video's width as it is
       {0, 100, 400, 200}},
      {AdjustPixelAspectRectToSquarePixelRect(RectT<int>{3, 4, 720, 480}, ntsc), {3, 4, 655, 480}},
      {AdjustSquarePixelRectToPixelAspectRect({3, 4, 655, 480}, ntsc), {3, 4, 721, 480}},
  };
  for (std::size_t i = 0; i < std::size(kCases); ++i) {
    EXPECT_EQ(kCases[i].first, kCases[i].second) << "row " << i;
  }
}

TEST(PixelAspectGeometry, FloatToIntConversionsSaturate) {
  const PixelAspectRatio wide(UINT_MAX, 1), narrow(1, UINT_MAX);
  const RectT<int> unit{0, 0, 1, 1}, huge{INT_MIN, INT_MIN, INT_MAX, INT_MAX};
  RectT<int> fit;
  FitRectInRect(unit, huge, fit);
  RectT<float> fitFloat;
  // no UB
  FitRectInRect(RectT<float>{0, 0, 1, 1}, RectT<float>{0, 0, 3e38f, 3e38f}, fitFloat);
  const std::pair<int, int> kCases[] = {
      {AdaptVideoRectToPAR(kPixelAspectRatio_Square, unit, huge).left, INT_MIN},
      {AdjustPixelAspectDimensionToSquarePixelDimension({INT_MIN, 0}, wide).x, INT_MIN},
      {AdjustSquarePixelRectToPixelAspectRect({0, 0, INT_MAX, 1}, narrow).width, INT_MAX},
      {fit.width, INT_MAX},
  };
  for (std::size_t i = 0; i < std::size(kCases); ++i) {
    EXPECT_EQ(kCases[i].first, kCases[i].second) << "row " << i;
  }
}

}  // namespace
}  // namespace zebmediatypes
