// Script classes of the video and colour values: "PixelFormat",
// "PixelAspectRatio" (both in the script namespace "zebmediatypes" and globals
// of their own names) and "ColorObject" (in "zebmediatypes" only).
//
// Every item is defined with the host flag 0x80000. Script sees, for example:
//
//   var f = PixelFormat.createPixelFormat(PixelFormat.PIXELFORMAT_BGRA_4444_8U);
//   f.isEqual(PixelFormat.createPixelFormat("bgra"));     // true
//   PixelAspectRatio.createPixelAspectRatio(10, 11).numerator;   // 10
//   new zebmediatypes.ColorObject(1, 0.5, 0).alpha;       // 1
//
// Writes that a setter refuses (returns false) leave the value as it was.
#pragma once

#include <zebcore/string.h>
#include <zebmediatypes/color/rgba.h>
#include <zebmediatypes/export.h>
#include <zebmediatypes/pixel_aspect_ratio.h>
#include <zebmediatypes/pixel_format.h>
#include <zebscripting/script_object.h>
#include <zebscripting/utils.h>

#include <cstdint>

namespace zebmediatypes::scripting {

using zebscripting::ScriptObjectPtr;

// "PixelFormat": one PixelFormat, kPixelFormat_Invalid at first. No script
// constructor.
//
// Items: static "createPixelFormat"(text); the 37 PIXELFORMAT_ string
// constants (pixel_format_constants.h), each the FourCC text of its format.
class ZEBMEDIATYPES_API PixelFormatObject : public zebscripting::ScriptObject {
 public:
  PixelFormatObject();
  static const char* GetClassname() noexcept { return "PixelFormat"; }
  static const char* GetDescription() noexcept {
    return "There are fixed sets of supported PixelFormats, choose one. Use with VideoFrame "
           "objects.";
  }
  static void DefineObject();

  void Initialize(const PixelFormat& format) noexcept { format_ = format; }
  const PixelFormat& GetPixelFormat() const noexcept { return format_; }

  // True for a "PixelFormat" object with the same FourCC and properties word.
  bool IsEqual(const ScriptObjectPtr& other) const override;
  // FNV-1a over the FourCC and the properties word, the two parts IsEqual
  // compares.
  std::uint64_t Hash() const override;

  // A new object holding { FourCC of `text`, LookupPropertiesForName }, in the
  // calling context. Null unless `text` is exactly four printable ASCII
  // characters (0x20 to 0x7E): the wildcard FourCC 0 and bytes the constants
  // cannot show are not creatable. Unknown printable FourCCs are accepted.
  static ScriptObjectPtr CreatePixelFormat(int contextHandle, const zebcore::UTF8String& text);

 private:
  PixelFormat format_;
};

// "PixelAspectRatio": one PixelAspectRatio, 1:1 at first. No script
// constructor.
//
// Items: static "createPixelAspectRatio"(numerator, denominator); "numerator"
// and "denominator" (unsigned). Terms above 2^31 - 1 are refused (the setters
// return false, the factory raises a parameter error); 0 is accepted.
// Equality and hash are the host's own (identity).
class ZEBMEDIATYPES_API PixelAspectRatioObject : public zebscripting::ScriptObject {
 public:
  PixelAspectRatioObject();
  static const char* GetClassname() noexcept { return "PixelAspectRatio"; }
  static const char* GetDescription() noexcept {
    return "Pixel aspect ration has a numerator and a denominator.";
  }
  static void DefineObject();

  void Initialize(const PixelAspectRatio& ratio) noexcept { ratio_ = ratio; }
  const PixelAspectRatio& GetPixelAspectRatio() const noexcept { return ratio_; }

  static ScriptObjectPtr CreatePixelAspectRatio(int contextHandle, unsigned int numerator,
                                                unsigned int denominator);
  unsigned int GetNumerator() const noexcept { return ratio_.GetNumerator(); }
  bool SetNumerator(unsigned int numerator) noexcept;
  unsigned int GetDenominator() const noexcept { return ratio_.GetDenominator(); }
  bool SetDenominator(unsigned int denominator) noexcept;

 private:
  PixelAspectRatio ratio_;
};

// The largest term "PixelAspectRatio" takes.
inline constexpr unsigned int kScriptPixelAspectRatioTerm_Max = 2147483647u;

// "ColorObject": one color::RGBA, opaque black at first.
//
// Items: constructor(Red = 0, Green = 0, Blue = 0, Alpha = 1); "red", "green",
// "blue", "alpha" (float). Values outside [0, 1] and infinities are kept as
// given; NaN is refused (the constructor raises a parameter error, a setter
// returns false); a number beyond the float range is a parameter error.
// Equality and hash are the host's own (identity).
class ZEBMEDIATYPES_API ColorObject : public zebscripting::ScriptObject {
 public:
  ColorObject();
  static const char* GetClassname() noexcept { return "ColorObject"; }
  static const char* GetDescription() noexcept { return "Color class"; }
  static void DefineObject();

  void Initialize(const color::RGBA& color) noexcept { color_ = color; }
  color::RGBA GetColorRGBA() const noexcept { return color_; }

  bool Construct(float red, float green, float blue, float alpha) noexcept;
  float GetRed() const noexcept { return color_.Red(); }
  float GetGreen() const noexcept { return color_.Green(); }
  float GetBlue() const noexcept { return color_.Blue(); }
  float GetAlpha() const noexcept { return color_.Alpha(); }
  bool SetRed(float red) noexcept;
  bool SetGreen(float green) noexcept;
  bool SetBlue(float blue) noexcept;
  bool SetAlpha(float alpha) noexcept;

 private:
  color::RGBA color_;
};

// Factories: a new object of the class in script context `contextHandle`;
// null when none can be made there.
ZEBMEDIATYPES_API ScriptObjectPtr CreatePixelFormatObject(const PixelFormat& format,
                                                          int contextHandle);
ZEBMEDIATYPES_API ScriptObjectPtr CreatePixelAspectRatioObject(const PixelAspectRatio& ratio,
                                                               int contextHandle);
ZEBMEDIATYPES_API ScriptObjectPtr CreateColorObject(const color::RGBA& color, int contextHandle);

}  // namespace zebmediatypes::scripting

template <>
struct zebscripting::utility::TransformObjectIntoScriptingObject<zebmediatypes::color::RGBA> {
  zebscripting::ScriptObjectPtr operator()(const zebmediatypes::color::RGBA& color,
                                           int contextHandle) const {
    return zebmediatypes::scripting::CreateColorObject(color, contextHandle);
  }
};
