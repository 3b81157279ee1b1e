// Rectangles and points: plain aggregates of (left, top, width, height) and (x, y).
#pragma once

namespace zebcore::geom {

template <class T>
struct PointT {
  T x{};
  T y{};
  friend constexpr bool operator==(const PointT& a, const PointT& b) noexcept {
    return a.x == b.x && a.y == b.y;
  }
  friend constexpr bool operator!=(const PointT& a, const PointT& b) noexcept { return !(a == b); }
};

template <class T>
struct RectT {
  T left{};
  T top{};
  T width{};
  T height{};
  friend constexpr bool operator==(const RectT& a, const RectT& b) noexcept {
    return a.left == b.left && a.top == b.top && a.width == b.width && a.height == b.height;
  }
  friend constexpr bool operator!=(const RectT& a, const RectT& b) noexcept { return !(a == b); }
};

}  // namespace zebcore::geom
