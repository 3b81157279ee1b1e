// RenderQuality: how much effort a render may spend.
#pragma once

#include <cstdint>

namespace zebmediatypes {

// Values from 3 (Medium) up count as high quality in format selection.
enum RenderQuality : std::int32_t {
  kRenderQuality_Draft = 1,
  kRenderQuality_Low = 2,
  kRenderQuality_Medium = 3,
  kRenderQuality_High = 4,
  kRenderQuality_Max = 5,
};

}  // namespace zebmediatypes
