// RationalApproximation: the closest fraction with 32-bit terms.
#pragma once

#include <boost/rational.hpp>

#include <zebcore/export.h>

namespace zebcore::utility {

// The continued-fraction convergent of `value` closest to it whose numerator
// and denominator both fit in int (denominator > 0). NaN gives 0/1; values
// beyond the int range clamp to INT_MAX/1 or -INT_MAX/1.
//
//   RationalApproximation(29.97002997002997)  // 30000/1001
ZEBCORE_API boost::rational<int> RationalApproximation(double value) noexcept;

}  // namespace zebcore::utility
