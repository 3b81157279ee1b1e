// RationalApproximation: the closest fraction with 32-bit terms.
#pragma once

#include <zebcore/export.h>

#include <boost/rational.hpp>

namespace zebcore::utility {

// The first continued-fraction convergent of `value` that agrees with it to a
// relative 1e-10 (ten significant digits), or else the closest convergent whose
// numerator and denominator both fit in int. The denominator is > 0. NaN gives
// 0/1; values beyond the int range clamp to INT_MAX/1 or -INT_MAX/1.
//
//   RationalApproximation(29.97002997002997)  // 30000/1001
//   RationalApproximation(29.97002997)        // 30000/1001 as well
ZEBCORE_API boost::rational<int> RationalApproximation(double value) noexcept;

}  // namespace zebcore::utility
