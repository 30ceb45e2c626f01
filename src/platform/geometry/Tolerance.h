#pragma once

#include <cmath>

// Zero tests of the geometry library and of the programs built on it.

/// Tolerance of Is_Zero(value, false): far below anything a survey measures, yet above the
/// rounding left by arithmetic on values of ordinary size.
inline constexpr double kZeroTolerance = 1e-10;

/// Tolerance of Is_Zero(value, true): a micrometre. Coordinates of several million metres
/// carry rounding of about 1e-9 after a few trigonometric steps; this stays clear of that
/// noise and far below the millimetre that a survey resolves. Used where positions are
/// compared (coincident points, a point lying on a line).
inline constexpr double kCoarseTolerance = 1e-6;

/// True when `value` is practically zero: |value| < kZeroTolerance, or, with `coarse` set,
/// |value| < kCoarseTolerance. A NaN is never zero.
inline bool Is_Zero(double value, bool coarse = false) {
    return std::fabs(value) < (coarse ? kCoarseTolerance : kZeroTolerance);
}
