// RGBA
//
// A plain colour value of four single-precision components. Nominally 0 to 1,
// but nothing is clamped, checked or normalized: every value is kept as given.
// Knows nothing of colour spaces. Trivially copyable; pass by value.
//
//   RGBA c(0.9f, 0.5f, 0.4f);   // red, green, blue; alpha 1
//   c.Blue();                   // 0.4f
#pragma once

namespace zebmediatypes::color {

class RGBA {
 public:
  // Opaque black by default. Arguments in the order red, green, blue, alpha.
  constexpr RGBA(float red = 0.0f, float green = 0.0f, float blue = 0.0f,  // NOLINT
                 float alpha = 1.0f) noexcept
      : red_(red), blue_(blue), green_(green), alpha_(alpha) {}

  constexpr float Red() const noexcept { return red_; }
  constexpr float Green() const noexcept { return green_; }
  constexpr float Blue() const noexcept { return blue_; }
  constexpr float Alpha() const noexcept { return alpha_; }

  constexpr void SetRed(float red) noexcept { red_ = red; }
  constexpr void SetGreen(float green) noexcept { green_ = green; }
  constexpr void SetBlue(float blue) noexcept { blue_ = blue; }
  constexpr void SetAlpha(float alpha) noexcept { alpha_ = alpha; }

 private:
  // Stored red, blue, green, alpha: the layout that stored records and peers
  // share, which is not the constructor's order.
  float red_;
  float blue_;
  float green_;
  float alpha_;
};

}  // namespace zebmediatypes::color
