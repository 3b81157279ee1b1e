#include <zebcore/rational.h>
#include <zebcore/string.h>
#include <zebmediatypes/pixel_aspect_ratio.h>

#include <algorithm>
#include <boost/integer/common_factor_rt.hpp>
#include <boost/rational.hpp>
#include <cmath>
#include <cstdint>
#include <limits>
#include <ostream>

namespace zebmediatypes {
namespace {

using zebcore::geom::PointT;
using zebcore::geom::RectT;

constexpr double kEqualityTolerance = 0.001;
constexpr unsigned int kLargestSignedTerm = 2147483646u;

// The integer part of `v`, saturated at the int range; NaN gives 0.
int SaturateToInt(double v) noexcept {
  if (std::isnan(v)) return 0;
  if (v <= static_cast<double>(std::numeric_limits<int>::min())) {
    return std::numeric_limits<int>::min();
  }
  if (v >= static_cast<double>(std::numeric_limits<int>::max())) {
    return std::numeric_limits<int>::max();
  }
  return static_cast<int>(v);
}

bool HasZeroField(PixelAspectRatio r) noexcept {
  return r.GetNumerator() == 0 || r.GetDenominator() == 0;
}

RectT<float> ToFloat(const RectT<int>& r) noexcept {
  return {static_cast<float>(r.left), static_cast<float>(r.top), static_cast<float>(r.width),
          static_cast<float>(r.height)};
}

// The whole-pixel rectangle inside `r`: edges rounded inward.
RectT<int> SnapInward(const RectT<float>& r) noexcept {
  const double left = std::ceil(static_cast<double>(r.left));
  const double top = std::ceil(static_cast<double>(r.top));
  const double right = std::floor(static_cast<double>(r.left) + static_cast<double>(r.width));
  const double bottom = std::floor(static_cast<double>(r.top) + static_cast<double>(r.height));
  return {SaturateToInt(left), SaturateToInt(top), SaturateToInt(right - left),
          SaturateToInt(bottom - top)};
}

int FractionDigits(PixelAspectRatio r) noexcept {
  return r == kPixelAspectRatio_Square || r == kPixelAspectRatio_DVCProHD ||
                 r == kPixelAspectRatio_Anamorphic
             ? 1
             : 4;
}

// The narrow display text: at most 31 characters (the core's number writer
// switches to scientific notation for values whose fixed form is longer).
std::string DisplayText(PixelAspectRatio r) {
  return zebcore::string::UTF16toNarrow(zebcore::string::View(
      zebcore::string::NumberToString(r.ToDouble(), 1, FractionDigits(r), {}, 31)));
}

// a * b * c in unsigned 64-bit; false on overflow.
bool MultiplyChecked(std::uint64_t a, std::uint64_t b, std::uint64_t c,
                     std::uint64_t& product) noexcept {
  std::uint64_t ab = 0;
  return !__builtin_mul_overflow(a, b, &ab) && !__builtin_mul_overflow(ab, c, &product);
}

}  // namespace

double PixelAspectRatio::ToDouble() const noexcept {
  if (denominator_ == 0) return std::numeric_limits<double>::max();
  return static_cast<double>(numerator_) / static_cast<double>(denominator_);
}

zebcore::UTF16String PixelAspectRatio::GetDisplayString() const {
  return zebcore::string::UTF8to16(DisplayText(*this));
}

bool operator==(PixelAspectRatio a, PixelAspectRatio b) noexcept {
  if (a.GetNumerator() == 0 || b.GetNumerator() == 0) return a.GetNumerator() == b.GetNumerator();
  if (a.GetDenominator() == 0 || b.GetDenominator() == 0) {
    return a.GetDenominator() == b.GetDenominator();
  }
  return std::fabs(a.ToDouble() - b.ToDouble()) < kEqualityTolerance;
}

bool operator<(PixelAspectRatio a, PixelAspectRatio b) noexcept {
  return !(a == b) && a.ToDouble() < b.ToDouble();
}

bool operator>(PixelAspectRatio a, PixelAspectRatio b) noexcept {
  return !(a == b) && a.ToDouble() > b.ToDouble();
}

std::ostream& operator<<(std::ostream& out, PixelAspectRatio r) { return out << DisplayText(r); }

zebcore::string::UTF16OStream& operator<<(zebcore::string::UTF16OStream& out, PixelAspectRatio r) {
  return out << r.GetDisplayString();
}

PixelAspectRatio ReducePixelAspectRatio(PixelAspectRatio r) {
  constexpr unsigned int kIntMax = static_cast<unsigned int>(std::numeric_limits<int>::max());
  if (r.GetNumerator() > kIntMax || r.GetDenominator() > kIntMax) {
    throw boost::bad_rational(
        "bad rational: pixel aspect ratio term out of range (at most 2147483647)");
  }
  if (r.GetDenominator() == 0) throw boost::bad_rational();
  if (r.GetNumerator() == 0) return {0, 1};
  const unsigned int divisor = boost::integer::gcd(r.GetNumerator(), r.GetDenominator());
  return {r.GetNumerator() / divisor, r.GetDenominator() / divisor};
}

PixelAspectRatio CorrectLegacyPixelAspectRatio(PixelAspectRatio r) noexcept {
  struct Correction {
    PixelAspectRatio legacy;
    PixelAspectRatio replacement;
  };
  constexpr Correction kCorrections[] = {
      {kPixelAspectRatio_DVNTSC_Incorrect, kPixelAspectRatio_DVNTSC},
      {kPixelAspectRatio_DVNTSCWide_Incorrect, kPixelAspectRatio_DVNTSCWide},
      {kPixelAspectRatio_DVPAL_Incorrect, kPixelAspectRatio_DVPAL},
      {kPixelAspectRatio_DVPAL_TooPrecise, kPixelAspectRatio_DVPAL},
      {kPixelAspectRatio_DVPALWide_Incorrect, kPixelAspectRatio_DVPALWide},
  };
  static_assert(std::size(kCorrections) == 5);
  for (const Correction& c : kCorrections) {
    if (r == c.legacy) return c.replacement;
  }
  return r;
}

bool IsLegacyPixelAspectRatio(PixelAspectRatio r) noexcept {
  return CorrectLegacyPixelAspectRatio(r) != r;
}

PixelAspectRatio AdjustPixelAspectRatioForNonUniformDownsample(const PixelAspectRatio& r,
                                                               const RectT<int>& src,
                                                               const RectT<int>& dst) noexcept {
  if (src.width <= 0 || src.height <= 0 || dst.width <= 0 || dst.height <= 0) return r;
  const double q = (static_cast<double>(src.width) / static_cast<double>(src.height)) /
                   (static_cast<double>(dst.width) / static_cast<double>(dst.height));
  if (std::fabs(q - 1.0) < 0.01) return r;

  std::uint64_t n = 0;
  std::uint64_t d = 0;
  if (!MultiplyChecked(r.GetNumerator(), static_cast<std::uint64_t>(dst.height),
                       static_cast<std::uint64_t>(src.width), n) ||
      !MultiplyChecked(r.GetDenominator(), static_cast<std::uint64_t>(dst.width),
                       static_cast<std::uint64_t>(src.height), d)) {
    return r;
  }
  if (d == 0) return {1, 1};
  if (n == 0) return {0, 1};
  const std::uint64_t divisor = boost::integer::gcd(n, d);
  n /= divisor;
  d /= divisor;
  if (n <= kLargestSignedTerm && d <= kLargestSignedTerm) {
    return {static_cast<unsigned int>(n), static_cast<unsigned int>(d)};
  }
  const boost::rational<int> approx =
      zebcore::utility::RationalApproximation(static_cast<double>(n) / static_cast<double>(d));
  return {static_cast<unsigned int>(std::max(approx.numerator(), 0)),
          static_cast<unsigned int>(std::max(approx.denominator(), 0))};
}

RectT<float> AdaptVideoRectToPAR(const PixelAspectRatio& r, const RectT<float>& video,
                                 const RectT<float>& display) noexcept {
  float w = video.width;
  if (!HasZeroField(r)) w = static_cast<float>(r.ToDouble()) * video.width + 0.5f;
  float width = display.width;
  float height = display.height;
  if (w != 0.0f && video.height != 0.0f) {
    const float s = std::min(display.height / video.height, display.width / w);
    width = w * s + 0.5f;
    height = video.height * s + 0.5f;
  }
  width = std::max(width, 1.0f);
  height = std::max(height, 2.0f);
  return {display.left + (display.width - width) * 0.5f,
          display.top + (display.height - height) * 0.5f, width, height};
}

RectT<int> AdaptVideoRectToPAR(const PixelAspectRatio& r, const RectT<int>& video,
                               const RectT<int>& display) noexcept {
  return SnapInward(AdaptVideoRectToPAR(r, ToFloat(video), ToFloat(display)));
}

RectT<float> AdjustPixelAspectRectToSquarePixelRect(const RectT<float>& rect,
                                                    PixelAspectRatio r) noexcept {
  if (HasZeroField(r)) return rect;
  RectT<float> result = rect;
  result.width = static_cast<float>(r.ToDouble()) * rect.width + 0.5f;
  return result;
}

RectT<int> AdjustPixelAspectRectToSquarePixelRect(const RectT<int>& rect,
                                                  PixelAspectRatio r) noexcept {
  if (HasZeroField(r)) return rect;
  return SnapInward(AdjustPixelAspectRectToSquarePixelRect(ToFloat(rect), r));
}

RectT<int> AdjustSquarePixelRectToPixelAspectRect(const RectT<int>& rect,
                                                  PixelAspectRatio r) noexcept {
  if (HasZeroField(r)) return rect;
  RectT<int> result = rect;
  result.width = SaturateToInt(static_cast<double>(rect.width) / r.ToDouble() + 0.5);
  return result;
}

PointT<int> AdjustPixelAspectDimensionToSquarePixelDimension(const PointT<int>& p,
                                                             PixelAspectRatio r) noexcept {
  if (HasZeroField(r)) return p;
  return {SaturateToInt(r.ToDouble() * static_cast<double>(p.x) + 0.5), p.y};
}

PointT<int> AdjustSquarePixelDimensionToPixelAspectDimension(const PointT<int>& p,
                                                             PixelAspectRatio r) noexcept {
  if (HasZeroField(r)) return p;
  return {SaturateToInt(static_cast<double>(p.x) / r.ToDouble() + 0.5), p.y};
}

void FitRectInRect(const RectT<float>& inner, const RectT<float>& outer,
                   RectT<float>& result) noexcept {
  if (inner.width == 0.0f || inner.height == 0.0f) {
    result = outer;
    return;
  }
  const float s = std::min(outer.height / inner.height, outer.width / inner.width);
  result = {outer.left, outer.top, inner.width * s + 0.5f, inner.height * s + 0.5f};
}

void FitRectInRect(const RectT<int>& inner, const RectT<int>& outer, RectT<int>& result) noexcept {
  RectT<float> fitted;
  FitRectInRect(ToFloat(inner), ToFloat(outer), fitted);
  result = SnapInward(fitted);
}

}  // namespace zebmediatypes
