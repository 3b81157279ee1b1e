#include <gtest/gtest.h>
#include <zebmediatypes/pixel_aspect_ratio.h>

#include <boost/rational.hpp>
#include <climits>
#include <limits>
#include <sstream>
#include <string>
#include <type_traits>

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

TEST(PixelAspectRatio, IsATrivialValueDefaultingToSquare) {
  static_assert(std::is_trivially_copyable_v<PixelAspectRatio>);
  constexpr PixelAspectRatio r;
  static_assert(r.GetNumerator() == 1 && r.GetDenominator() == 1);
  PixelAspectRatio s(3, 2);
  s.SetValue(40, 33);
  unsigned int n = 0;
  unsigned int d = 0;
  s.GetValue(n, d);
  EXPECT_EQ(n, 40u);
  EXPECT_EQ(d, 33u);
}

TEST(PixelAspectRatio, ZeroDenominatorIsTheLargestDouble) {
  EXPECT_EQ(PixelAspectRatio(3, 0).ToDouble(), std::numeric_limits<double>::max());
  EXPECT_EQ(PixelAspectRatio(0, 0).ToDouble(), std::numeric_limits<double>::max());
  EXPECT_EQ(PixelAspectRatio(0, 5).ToDouble(), 0.0);
  EXPECT_EQ(PixelAspectRatio(UINT_MAX, 1).ToDouble(), 4294967295.0);
}

TEST(PixelAspectRatio, EqualityIsTolerant) {
  struct Case {
    PixelAspectRatio a;
    PixelAspectRatio b;
    bool equal;
  };
  const Case kCases[] = {
      {kPixelAspectRatio_Unknown, kPixelAspectRatio_Any, true},
      {{0, 7}, {0, 1}, true},
      {{0, 0}, {0, 1}, true},
      {{5, 0}, {7, 0}, true},
      {{5, 0}, {5, 1}, false},
      {{0, 1}, {1, 0}, false},
      {{768, 702}, {59, 54}, false},
      {{9, 10}, {648, 720}, true},
      {{9, 10}, {10, 11}, false},
      {{1920, 1440}, {4, 3}, true},
      {{1000, 1000}, {1002, 1000}, false},
      {{10000, 10000}, {10009, 10000}, true},
      {{UINT_MAX, 1}, {UINT_MAX, 1}, true},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.a.GetNumerator() << ":" << c.a.GetDenominator() << " vs "
                                    << c.b.GetNumerator() << ":" << c.b.GetDenominator());
    EXPECT_EQ(c.a == c.b, c.equal);
    EXPECT_EQ(c.b == c.a, c.equal);
    EXPECT_EQ(c.a != c.b, !c.equal);
  }
}

TEST(PixelAspectRatio, OrderingSkipsEqualRatios) {
  struct Case {
    PixelAspectRatio a;
    PixelAspectRatio b;
    bool less, greater, lessEqual, greaterEqual;
  };
  const Case kCases[] = {
      {{3, 2}, {2, 1}, true, false, true, false},
      {{2, 1}, {3, 2}, false, true, false, true},
      {{1, 1}, {1, 1}, false, false, true, true},
      {{1000, 1000}, {1000, 1001}, false, false, true, true},  // equal within 0.001
      {{3, 0}, {1000000, 1}, false, true, false, true},        // huge beats finite
      {{0, 1}, {1, 1000000}, true, false, true, false},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.a.GetNumerator() << ":" << c.a.GetDenominator() << " vs "
                                    << c.b.GetNumerator() << ":" << c.b.GetDenominator());
    EXPECT_EQ(c.a < c.b, c.less);
    EXPECT_EQ(c.a > c.b, c.greater);
    EXPECT_EQ(c.a <= c.b, c.lessEqual);
    EXPECT_EQ(c.a >= c.b, c.greaterEqual);
  }
}

TEST(PixelAspectRatio, TextHasOneOrFourFractionDigits) {
  struct Case {
    PixelAspectRatio r;
    const char* text;
  };
  const Case kCases[] = {
      {{1, 1}, "1.0"},        {{2, 1}, "2.0"},      {{3, 2}, "1.5"},
      {{10, 11}, "0.9091"},   {{40, 33}, "1.2121"}, {{1920, 1440}, "1.3333"},
      {{768, 702}, "1.0940"}, {{0, 1}, "0.0000"},   {{1001, 1000}, "1.0"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(Narrow(c.r), c.text);
    EXPECT_EQ(Text(c.r.GetDisplayString()), c.text);
    zebcore::string::oUTF16StringStream wide;
    wide << c.r;
    EXPECT_EQ(Text(wide.str()), c.text);
  }
}

TEST(PixelAspectRatio, TextOfHugeValuesIsBounded) {
  for (const PixelAspectRatio r :
       {PixelAspectRatio(3, 0), PixelAspectRatio(0, 0), PixelAspectRatio(UINT_MAX, 1)}) {
    SCOPED_TRACE(r.GetNumerator());
    const std::string text = Narrow(r);
    EXPECT_FALSE(text.empty());
    EXPECT_LE(text.size(), 31u);
    EXPECT_EQ(Text(r.GetDisplayString()), text);
  }
}

TEST(ReducePixelAspectRatio, GivesLowestTerms) {
  struct Case {
    PixelAspectRatio in;
    PixelAspectRatio out;
  };
  const Case kCases[] = {
      {{768, 702}, {128, 117}}, {{1920, 1440}, {4, 3}},       {{0, 2}, {0, 1}},
      {{10, 11}, {10, 11}},     {{INT_MAX, 1}, {INT_MAX, 1}}, {{INT_MAX - 1, 2}, {INT_MAX / 2, 1}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.in.GetNumerator() << ":" << c.in.GetDenominator());
    const PixelAspectRatio r = ReducePixelAspectRatio(c.in);
    EXPECT_EQ(r.GetNumerator(), c.out.GetNumerator());
    EXPECT_EQ(r.GetDenominator(), c.out.GetDenominator());
  }
}

TEST(ReducePixelAspectRatio, BadFieldsThrowWithAMessageThatSaysWhy) {
  struct Case {
    PixelAspectRatio in;
    const char* messagePart;
  };
  const Case kCases[] = {
      {{5, 0}, "zero denominator"},       {{0, 0}, "zero denominator"},
      {{4294967295u, 1}, "out of range"}, {{2147483648u, 1}, "out of range"},
      {{1, 2147483648u}, "out of range"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.in.GetNumerator() << ":" << c.in.GetDenominator());
    try {
      ReducePixelAspectRatio(c.in);
      ADD_FAILURE() << "no exception";
    } catch (const boost::bad_rational& e) {
      EXPECT_NE(std::string(e.what()).find(c.messagePart), std::string::npos) << e.what();
    }
  }
}

TEST(CorrectLegacyPixelAspectRatio, ReplacesTheHistoricWrongValues) {
  struct Case {
    PixelAspectRatio in;
    PixelAspectRatio out;
    bool legacy;
  };
  const Case kCases[] = {
      {{648, 720}, {10, 11}, true},     {{864, 720}, {40, 33}, true},
      {{768, 720}, {768, 702}, true},   {{59, 54}, {768, 702}, true},
      {{1024, 720}, {1024, 702}, true}, {{9, 10}, {10, 11}, true},
      {{10, 11}, {10, 11}, false},      {{40, 33}, {40, 33}, false},
      {{768, 702}, {768, 702}, false},  {{0, 1}, {0, 1}, false},
      {{1, 0}, {1, 0}, false},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(testing::Message() << c.in.GetNumerator() << ":" << c.in.GetDenominator());
    const PixelAspectRatio r = CorrectLegacyPixelAspectRatio(c.in);
    EXPECT_EQ(r.GetNumerator(), c.out.GetNumerator());
    EXPECT_EQ(r.GetDenominator(), c.out.GetDenominator());
    EXPECT_EQ(IsLegacyPixelAspectRatio(c.in), c.legacy);
  }
}

TEST(AdjustPixelAspectRatioForNonUniformDownsample, ScalesTheRatioWithTheFrame) {
  struct Case {
    const char* name;
    PixelAspectRatio r;
    RectT<int> src;
    RectT<int> dst;
    PixelAspectRatio out;
  };
  const Case kCases[] = {
      {"half width", {1, 1}, {0, 0, 1920, 1080}, {0, 0, 960, 1080}, {2, 1}},
      {"shape kept", {1, 1}, {0, 0, 1920, 1080}, {0, 0, 1280, 720}, {1, 1}},
      {"DV to square", {10, 11}, {0, 0, 720, 480}, {0, 0, 640, 480}, {45, 44}},
      {"reduced", {4, 3}, {0, 0, 1440, 1080}, {0, 0, 1920, 1080}, {1, 1}},
      {"zero denominator", {1, 0}, {0, 0, 1920, 1080}, {0, 0, 960, 1080}, {1, 1}},
      {"zero numerator", {0, 5}, {0, 0, 1920, 1080}, {0, 0, 960, 1080}, {0, 1}},
      {"zero source", {10, 11}, {0, 0, 0, 0}, {0, 0, 960, 1080}, {10, 11}},
      {"zero destination", {10, 11}, {0, 0, 720, 480}, {0, 0, 0, 480}, {10, 11}},
      {"negative source", {10, 11}, {0, 0, -720, 480}, {0, 0, 720, 240}, {10, 11}},
      {"negative destination", {10, 11}, {0, 0, 720, 480}, {0, 0, 720, -480}, {10, 11}},
      {"64-bit overflow", {UINT_MAX, 1}, {0, 0, INT_MAX, 1}, {0, 0, 1, INT_MAX}, {UINT_MAX, 1}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.name);
    const PixelAspectRatio r = AdjustPixelAspectRatioForNonUniformDownsample(c.r, c.src, c.dst);
    EXPECT_EQ(r.GetNumerator(), c.out.GetNumerator());
    EXPECT_EQ(r.GetDenominator(), c.out.GetDenominator());
  }
}

TEST(AdjustPixelAspectRatioForNonUniformDownsample, HugeTermsAreApproximated) {
  // 2147483647 : 1431655764 (1.5 in lowest terms) has a term beyond 2147483646.
  const PixelAspectRatio r = AdjustPixelAspectRatioForNonUniformDownsample(
      PixelAspectRatio(2147483647u, 2147483646u), {0, 0, 3, 1}, {0, 0, 2, 1});
  EXPECT_NE(r.GetDenominator(), 0u);
  EXPECT_LE(r.GetNumerator(), 2147483646u);
  EXPECT_NEAR(r.ToDouble(), 2147483647.0 * 3 / (2147483646.0 * 2), 1e-9);
}

TEST(AdaptVideoRectToPAR, CentresTheVideoInTheDisplay) {
  const RectT<float> r = AdaptVideoRectToPAR(kPixelAspectRatio_DVNTSC, RectT<float>{0, 0, 720, 480},
                                             RectT<float>{0, 0, 1000, 1000});
  EXPECT_NEAR(r.left, -0.25f, 1e-3f);
  EXPECT_NEAR(r.top, 133.36f, 1e-2f);
  EXPECT_NEAR(r.width, 1000.5f, 1e-3f);
  EXPECT_NEAR(r.height, 733.27f, 1e-2f);

  const RectT<int> i = AdaptVideoRectToPAR(kPixelAspectRatio_DVNTSC, RectT<int>{5, 5, 720, 480},
                                           RectT<int>{0, 0, 1000, 1000});
  EXPECT_EQ(i, (RectT<int>{0, 134, 1000, 732}));
}

TEST(AdaptVideoRectToPAR, DegenerateInputFallsBackToTheDisplay) {
  struct Case {
    const char* name;
    PixelAspectRatio r;
    RectT<float> video;
    RectT<float> display;
    RectT<float> want;
  };
  const Case kCases[] = {
      {"zero video", {1, 1}, {0, 0, 0, 0}, {10, 20, 300, 200}, {10, 20, 300, 200}},
      {"zero-height video", {1, 1}, {0, 0, 640, 0}, {10, 20, 300, 200}, {10, 20, 300, 200}},
      {"tiny display", {1, 1}, {0, 0, 0, 0}, {0, 0, 0, 0}, {-0.5f, -1.0f, 1.0f, 2.0f}},
      {"zero ratio uses the width",
       {0, 1},
       {0, 0, 200, 100},
       {0, 0, 400, 400},
       {0, 100, 400.5f, 200.5f}},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.name);
    const RectT<float> r = AdaptVideoRectToPAR(c.r, c.video, c.display);
    EXPECT_FLOAT_EQ(r.width, c.want.width);
    EXPECT_FLOAT_EQ(r.height, c.want.height);
    EXPECT_NEAR(r.left, c.want.left, 0.3f);
    EXPECT_NEAR(r.top, c.want.top, 0.3f);
  }
}

TEST(AdaptVideoRectToPAR, HugeFloatResultsSaturate) {
  const RectT<int> r = AdaptVideoRectToPAR(kPixelAspectRatio_Square, RectT<int>{0, 0, 1, 1},
                                           RectT<int>{INT_MAX, INT_MAX, INT_MAX, INT_MAX});
  EXPECT_EQ(r.left, INT_MAX);
  EXPECT_EQ(r.top, INT_MAX);
  const RectT<int> n = AdaptVideoRectToPAR(kPixelAspectRatio_Square, RectT<int>{0, 0, 1, 1},
                                           RectT<int>{INT_MIN, INT_MIN, INT_MAX, INT_MAX});
  EXPECT_EQ(n.left, INT_MIN);
}

TEST(PixelAspectRect, ConvertsWidthsBetweenSquareAndNonSquarePixels) {
  struct Case {
    PixelAspectRatio r;
    int width;
    int square;  // the width in square pixels
    int back;    // `square` taken back to the ratio's pixels
  };
  const Case kCases[] = {
      {{10, 11}, 720, 655, 721},  {{40, 33}, 720, 873, 720},  {{2, 1}, 960, 1920, 960},
      {{1, 1}, 1920, 1920, 1920}, {{3, 2}, 1280, 1920, 1280}, {{1920, 1440}, 1440, 1920, 1440},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.width);
    const RectT<int> rect{3, 4, c.width, 480};
    EXPECT_EQ(AdjustPixelAspectRectToSquarePixelRect(rect, c.r), (RectT<int>{3, 4, c.square, 480}));
    EXPECT_EQ(AdjustSquarePixelRectToPixelAspectRect(RectT<int>{3, 4, c.square, 480}, c.r),
              (RectT<int>{3, 4, c.back, 480}));
    EXPECT_EQ(AdjustPixelAspectDimensionToSquarePixelDimension(PointT<int>{c.width, 7}, c.r),
              (PointT<int>{c.square, 7}));
    EXPECT_EQ(AdjustSquarePixelDimensionToPixelAspectDimension(PointT<int>{c.square, 7}, c.r),
              (PointT<int>{c.back, 7}));
    const RectT<float> f = AdjustPixelAspectRectToSquarePixelRect(
        RectT<float>{3, 4, static_cast<float>(c.width), 480}, c.r);
    EXPECT_NEAR(f.width, static_cast<float>(c.r.ToDouble()) * static_cast<float>(c.width) + 0.5f,
                1e-3f);
  }
}

TEST(PixelAspectRect, ZeroFieldsAndHugeValuesAreSafe) {
  const RectT<int> rect{1, 2, 720, 480};
  for (const PixelAspectRatio r :
       {PixelAspectRatio(0, 1), PixelAspectRatio(1, 0), PixelAspectRatio(0, 0)}) {
    EXPECT_EQ(AdjustPixelAspectRectToSquarePixelRect(rect, r), rect);
    EXPECT_EQ(AdjustSquarePixelRectToPixelAspectRect(rect, r), rect);
    EXPECT_EQ(AdjustPixelAspectDimensionToSquarePixelDimension(PointT<int>{720, 480}, r),
              (PointT<int>{720, 480}));
    EXPECT_EQ(AdjustSquarePixelDimensionToPixelAspectDimension(PointT<int>{720, 480}, r),
              (PointT<int>{720, 480}));
  }
  const PixelAspectRatio wide(UINT_MAX, 1);
  EXPECT_EQ(AdjustPixelAspectDimensionToSquarePixelDimension(PointT<int>{INT_MAX, 0}, wide).x,
            INT_MAX);
  EXPECT_EQ(AdjustPixelAspectDimensionToSquarePixelDimension(PointT<int>{INT_MIN, 0}, wide).x,
            INT_MIN);
  EXPECT_EQ(AdjustSquarePixelDimensionToPixelAspectDimension(PointT<int>{INT_MAX, 0},
                                                             PixelAspectRatio(1, UINT_MAX))
                .x,
            INT_MAX);
  EXPECT_EQ(AdjustPixelAspectRectToSquarePixelRect(RectT<int>{0, 0, INT_MAX, 1}, wide).width,
            INT_MAX);
  EXPECT_EQ(AdjustSquarePixelRectToPixelAspectRect(RectT<int>{0, 0, INT_MIN, 1},
                                                   PixelAspectRatio(1, UINT_MAX))
                .width,
            INT_MIN);
}

TEST(FitRectInRect, ScalesIntoTheOuterCorner) {
  RectT<int> r;
  FitRectInRect(RectT<int>{0, 0, 200, 100}, RectT<int>{10, 20, 100, 100}, r);
  EXPECT_EQ(r, (RectT<int>{10, 20, 100, 50}));
  FitRectInRect(RectT<int>{0, 0, 100, 200}, RectT<int>{10, 20, 100, 100}, r);
  EXPECT_EQ(r, (RectT<int>{10, 20, 50, 100}));
  FitRectInRect(RectT<int>{0, 0, 0, 100}, RectT<int>{10, 20, 100, 100}, r);
  EXPECT_EQ(r, (RectT<int>{10, 20, 100, 100}));

  RectT<float> f;
  FitRectInRect(RectT<float>{0, 0, 200, 100}, RectT<float>{10, 20, 100, 100}, f);
  EXPECT_EQ(f, (RectT<float>{10, 20, 100.5f, 50.5f}));
}

TEST(FitRectInRect, HugeScalesSaturate) {
  RectT<int> r;
  FitRectInRect(RectT<int>{0, 0, 1, 1}, RectT<int>{0, 0, INT_MAX, INT_MAX}, r);
  EXPECT_EQ(r.width, INT_MAX);
  EXPECT_EQ(r.height, INT_MAX);
  RectT<float> huge{0, 0, 1, 1};
  RectT<float> out;
  FitRectInRect(huge, RectT<float>{0, 0, 3e38f, 3e38f}, out);
  FitRectInRect(RectT<int>{0, 0, 1, 1}, RectT<int>{INT_MIN, INT_MIN, INT_MAX, INT_MAX}, r);
  EXPECT_EQ(r.left, INT_MIN);
}

}  // namespace
}  // namespace zebmediatypes
