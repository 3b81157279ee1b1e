// RationalApproximation by continued fractions.

#include <zebcore/rational.h>

#include <climits>
#include <cmath>

namespace zebcore::utility {
namespace {

// A convergent this close (relative) is taken as the fraction meant: a value
// typed with ten significant digits, such as 29.97002997, gives 30000/1001
// rather than a larger fraction that matches the typed digits.
constexpr double kCloseEnough = 1e-10;

}  // namespace

boost::rational<int> RationalApproximation(double value) noexcept {
  if (std::isnan(value)) return boost::rational<int>(0, 1);
  if (value >= static_cast<double>(INT_MAX)) return boost::rational<int>(INT_MAX, 1);
  if (value <= -static_cast<double>(INT_MAX)) return boost::rational<int>(-INT_MAX, 1);

  const bool negative = value < 0;
  const double x = std::fabs(value);
  // Convergents p/q from h(n) = a(n) h(n-1) + h(n-2), held in double to test
  // the int range before converting (terms are integers below 2^53 here).
  double p0 = 1, q0 = 0;  // h(-1), k(-1)
  double a = std::floor(x);
  double p1 = a, q1 = 1;  // h(0), k(0)
  double rest = x - a;
  for (int step = 0; step < 64; ++step) {
    if (rest <= 0 || std::fabs(x - p1 / q1) <= kCloseEnough * x) break;
    const double inverse = 1.0 / rest;
    a = std::floor(inverse);
    rest = inverse - a;
    const double p2 = a * p1 + p0;
    const double q2 = a * q1 + q0;
    if (p2 > INT_MAX || q2 > INT_MAX) break;
    p0 = p1;
    q0 = q1;
    p1 = p2;
    q1 = q2;
  }
  const int numerator = static_cast<int>(p1);
  const int denominator = static_cast<int>(q1);
  return boost::rational<int>(negative ? -numerator : numerator, denominator);
}

}  // namespace zebcore::utility
