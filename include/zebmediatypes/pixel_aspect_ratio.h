// PixelAspectRatio and frame geometry.
//
// The width-to-height ratio of one pixel as two unsigned integers, compared
// with a tolerance of 0.001, plus the rectangle conversions between square and
// non-square pixels that display code uses to fit video into a view.
//
//   PixelAspectRatio r = kPixelAspectRatio_DVNTSC;     // 10:11
//   r.GetDisplayString();                              // u"0.9091"
//   ReducePixelAspectRatio(kPixelAspectRatio_DVPAL);   // 128:117
#pragma once

#include <zebcore/geom.h>
#include <zebcore/stream.h>
#include <zebcore/string.h>
#include <zebmediatypes/export.h>

#include <iosfwd>

namespace zebmediatypes {

// PixelAspectRatio
//
// numerator:denominator, neither checked: 0 in either field is legal. A zero
// numerator means "unknown" or "any" (all such ratios compare equal); a zero
// denominator compares equal only to other zero-denominator ratios and has the
// value of the largest finite double. Trivially copyable; pass by value.
class PixelAspectRatio {
 public:
  constexpr PixelAspectRatio() noexcept = default;  // 1:1
  constexpr PixelAspectRatio(unsigned int numerator, unsigned int denominator) noexcept
      : numerator_(numerator), denominator_(denominator) {}

  constexpr unsigned int GetNumerator() const noexcept { return numerator_; }
  constexpr unsigned int GetDenominator() const noexcept { return denominator_; }
  void GetValue(unsigned int& numerator, unsigned int& denominator) const noexcept {
    numerator = numerator_;
    denominator = denominator_;
  }
  void SetValue(unsigned int numerator, unsigned int denominator) noexcept {
    numerator_ = numerator;
    denominator_ = denominator;
  }

  // numerator / denominator; 1.7976931348623157e308 when the denominator is 0.
  ZEBMEDIATYPES_API double ToDouble() const noexcept;

  // The value with 1 fraction digit for 1:1, 3:2 and 2:1 (tolerantly) and 4
  // otherwise: "1.0", "1.5", "0.9091". A zero denominator's huge value is
  // written in scientific notation to stay short.
  ZEBMEDIATYPES_API zebcore::UTF16String GetDisplayString() const;

 private:
  unsigned int numerator_ = 1;
  unsigned int denominator_ = 1;
};

// Tolerant equality: when either numerator is 0, whether the numerators are
// equal; else when either denominator is 0, whether the denominators are
// equal; else whether the values differ by less than 0.001. Not transitive.
ZEBMEDIATYPES_API bool operator==(PixelAspectRatio a, PixelAspectRatio b) noexcept;
inline bool operator!=(PixelAspectRatio a, PixelAspectRatio b) noexcept { return !(a == b); }
// Ordering by value among ratios that are not equal.
ZEBMEDIATYPES_API bool operator<(PixelAspectRatio a, PixelAspectRatio b) noexcept;
ZEBMEDIATYPES_API bool operator>(PixelAspectRatio a, PixelAspectRatio b) noexcept;
inline bool operator<=(PixelAspectRatio a, PixelAspectRatio b) noexcept { return a == b || a < b; }
inline bool operator>=(PixelAspectRatio a, PixelAspectRatio b) noexcept { return a == b || a > b; }

// The display text (see GetDisplayString), as UTF-8 or UTF-16.
ZEBMEDIATYPES_API std::ostream& operator<<(std::ostream& out, PixelAspectRatio r);
ZEBMEDIATYPES_API zebcore::string::UTF16OStream& operator<<(zebcore::string::UTF16OStream& out,
                                                            PixelAspectRatio r);

// Named ratios, stored unreduced.
inline constexpr PixelAspectRatio kPixelAspectRatio_Unknown{0, 2};
inline constexpr PixelAspectRatio kPixelAspectRatio_Any{0, 1};
inline constexpr PixelAspectRatio kPixelAspectRatio_Square{1, 1};
inline constexpr PixelAspectRatio kPixelAspectRatio_DVNTSC{10, 11};
inline constexpr PixelAspectRatio kPixelAspectRatio_DVNTSCWide{40, 33};
inline constexpr PixelAspectRatio kPixelAspectRatio_DVPAL{768, 702};
inline constexpr PixelAspectRatio kPixelAspectRatio_DVPALWide{1024, 702};
inline constexpr PixelAspectRatio kPixelAspectRatio_DVNTSC_Incorrect{648, 720};
inline constexpr PixelAspectRatio kPixelAspectRatio_DVNTSCWide_Incorrect{864, 720};
inline constexpr PixelAspectRatio kPixelAspectRatio_DVPAL_Incorrect{768, 720};
inline constexpr PixelAspectRatio kPixelAspectRatio_DVPAL_TooPrecise{59, 54};
inline constexpr PixelAspectRatio kPixelAspectRatio_DVPALWide_Incorrect{1024, 720};
inline constexpr PixelAspectRatio kPixelAspectRatio_Anamorphic{2, 1};
inline constexpr PixelAspectRatio kPixelAspectRatio_HDAnamorphic1080{1920, 1440};
inline constexpr PixelAspectRatio kPixelAspectRatio_DVCProHD{3, 2};

// ReducePixelAspectRatio()
//
// The ratio in lowest terms (0:n gives 0:1). Throws boost::bad_rational when
// the denominator is 0, and when a field is 2147483648 or more (the message
// says the field is out of range).
ZEBMEDIATYPES_API PixelAspectRatio ReducePixelAspectRatio(PixelAspectRatio r);

// The corrected value of the historic wrong ratios that older projects stored
// (648:720 -> 10:11, 864:720 -> 40:33, 768:720 and 59:54 -> 768:702,
// 1024:720 -> 1024:702, tolerantly); any other ratio is returned unchanged.
ZEBMEDIATYPES_API PixelAspectRatio CorrectLegacyPixelAspectRatio(PixelAspectRatio r) noexcept;
ZEBMEDIATYPES_API bool IsLegacyPixelAspectRatio(PixelAspectRatio r) noexcept;

// AdjustPixelAspectRatioForNonUniformDownsample()
//
// The ratio of `r`'s pixels after the frame `src` is scaled to `dst`. Unchanged
// when the scaling keeps the frame's shape (within 1%), when a dimension is 0
// or negative, or when the exact products do not fit 64 bits; 1:1 when the
// denominator of the result is 0. Results with terms beyond 2147483646 are
// approximated by the nearest fraction with 32-bit terms.
ZEBMEDIATYPES_API PixelAspectRatio AdjustPixelAspectRatioForNonUniformDownsample(
    const PixelAspectRatio& r, const zebcore::geom::RectT<int>& src,
    const zebcore::geom::RectT<int>& dst) noexcept;

// AdaptVideoRectToPAR()
//
// The rectangle, centred in `display`, in which `video` (whose pixels have the
// ratio `r`; its position is ignored) fills the display as far as its shape
// allows. At least 1 wide and 2 high. A zero-sized video, or a ratio with a 0
// field, fits the display itself (a zero field: the video's width is used as
// it is). The int overload rounds the float result inward to whole pixels,
// saturating at the int range.
ZEBMEDIATYPES_API zebcore::geom::RectT<float> AdaptVideoRectToPAR(
    const PixelAspectRatio& r, const zebcore::geom::RectT<float>& video,
    const zebcore::geom::RectT<float>& display) noexcept;
ZEBMEDIATYPES_API zebcore::geom::RectT<int> AdaptVideoRectToPAR(
    const PixelAspectRatio& r, const zebcore::geom::RectT<int>& video,
    const zebcore::geom::RectT<int>& display) noexcept;

// The rectangle with its width scaled by r (to square pixels) or by 1/r (from
// square pixels), rounded to nearest; left, top and height unchanged. A ratio
// with a 0 field leaves the rectangle unchanged. Int results saturate.
ZEBMEDIATYPES_API zebcore::geom::RectT<int> AdjustPixelAspectRectToSquarePixelRect(
    const zebcore::geom::RectT<int>& rect, PixelAspectRatio r) noexcept;
ZEBMEDIATYPES_API zebcore::geom::RectT<float> AdjustPixelAspectRectToSquarePixelRect(
    const zebcore::geom::RectT<float>& rect, PixelAspectRatio r) noexcept;
ZEBMEDIATYPES_API zebcore::geom::RectT<int> AdjustSquarePixelRectToPixelAspectRect(
    const zebcore::geom::RectT<int>& rect, PixelAspectRatio r) noexcept;

// The point with x scaled by r (to square pixels) or by 1/r, rounded to
// nearest; y unchanged. A ratio with a 0 field leaves the point unchanged.
ZEBMEDIATYPES_API zebcore::geom::PointT<int> AdjustPixelAspectDimensionToSquarePixelDimension(
    const zebcore::geom::PointT<int>& p, PixelAspectRatio r) noexcept;
ZEBMEDIATYPES_API zebcore::geom::PointT<int> AdjustSquarePixelDimensionToPixelAspectDimension(
    const zebcore::geom::PointT<int>& p, PixelAspectRatio r) noexcept;

// FitRectInRect()
//
// `inner` scaled uniformly to fit `outer`, anchored at outer's top-left
// corner (not centred). An inner rectangle of zero width or height gives
// `outer`. The int overload rounds inward to whole pixels, saturating.
ZEBMEDIATYPES_API void FitRectInRect(const zebcore::geom::RectT<int>& inner,
                                     const zebcore::geom::RectT<int>& outer,
                                     zebcore::geom::RectT<int>& result) noexcept;
ZEBMEDIATYPES_API void FitRectInRect(const zebcore::geom::RectT<float>& inner,
                                     const zebcore::geom::RectT<float>& outer,
                                     zebcore::geom::RectT<float>& result) noexcept;

}  // namespace zebmediatypes
