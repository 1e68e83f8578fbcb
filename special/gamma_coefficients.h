// gamma_coefficients.h: automatically generated, do not edit.
// Generator: tools/special/gen_coefficients.py (mpmath 1.2.1, 60 digits).
// Regenerate from the repository root:
//     /usr/bin/python3 tools/special/gen_coefficients.py
// Gamma, log-gamma, Stirling and digamma.
// Arrays hold the highest power first (PolyEval / PolyEval1 order).
#pragma once

#include "frame/types.h"

namespace tsm {

// Gamma(2 + x) = P(x)/Q(x), 0 <= x < 1; max relative error of the fit 2.3e-17
inline constexpr f64 kGammaP[] = {
    0.00016011915514881027,
    0.0011913479594430022,
    0.010421359129030479,
    0.04763668886084599,
    0.20744799140698003,
    0.49421437412568875,
    1.0,
};

// denominator
inline constexpr f64 kGammaQ[] = {
    -2.315838049658372e-05,
    0.000539607868899187,
    -0.004456426703042394,
    0.011813965010683838,
    0.03582375407076416,
    -0.23459184057545862,
    0.07143003902721894,
    1.0,
};

// ln Gamma(2 + x) = x B(x)/C(x), 0 <= x < 1; max relative error of the fit 7.1e-17
inline constexpr f64 kLogGammaB[] = {
    -1378.2518618311422,
    -38801.645871565794,
    -331613.14636314154,
    -1162371.5939755032,
    -1721738.0117144168,
    -853556.1883062663,
};

// denominator, monic, leading 1 implied
inline constexpr f64 kLogGammaC[] = {
    -351.8157755620888,
    -17064.21629652792,
    -220528.68449575524,
    -1139335.0160933116,
    -2532524.49991152,
    -2018892.6538810187,
};

// Stirling's series: Gamma(x) = sqrt(2 pi) x^(x-1/2) e^-x (1 + w S(w)), w = 1/x, x >= 33; S[0] and S[4] held; max relative error of 1 + w S(w) 4.4e-16
inline constexpr f64 kStirling[] = {
    0.0007873113957930937,
    -0.00022956367343087344,
    -0.002681325599129446,
    0.0034722222106211764,
    0.08333333333334822,
};

// ln Gamma(x) - ((x-1/2) ln x - x + ln sqrt(2 pi)) = A(p)/x, p = 1/x^2, 33 <= x < 1000; A[0] and A[4] held; max relative error of A 1.7e-15
inline constexpr f64 kLogGammaA[] = {
    0.0008116141674705085,
    -0.0005893842214839645,
    0.0007936427611503899,
    -0.0027777777750076136,
    0.08333333333333319,
};

// asymptotic series of psi: B_2j/(2j), j = 7 down to 1 (exact)
inline constexpr f64 kDigammaA[] = {
    0.08333333333333333,
    -0.021092796092796094,
    0.007575757575757576,
    -0.004166666666666667,
    0.003968253968253968,
    -0.008333333333333333,
    0.08333333333333333,
};

}  // namespace tsm
