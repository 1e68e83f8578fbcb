// erf_coefficients.h: automatically generated, do not edit.
// Generator: tools/special/gen_coefficients.py (mpmath 1.2.1, 60 digits).
// Regenerate from the repository root:
//     /usr/bin/python3 tools/special/gen_coefficients.py
// Error function, complementary error function and Dawson's integral.
// Arrays hold the highest power first (PolyEval / PolyEval1 order).
#pragma once

#include "frame/types.h"

namespace tsm {

// erf(x) = x T(x^2)/U(x^2), |x| <= 1; T[0] held; max relative error of the fit 2.6e-17
inline constexpr f64 kErfT[] = {
    9.604973739870516,
    90.02601963754636,
    2232.005345719601,
    7003.325138524497,
    55592.301302809785,
};

// denominator, monic, leading 1 implied
inline constexpr f64 kErfU[] = {
    33.561714151869765,
    521.3579496048425,
    4594.323828756732,
    22629.000059604714,
    49267.39426243247,
};

// erfc(x) = exp(-x^2) P(x)/Q(x), 1 <= x < 8; P[0] held; max relative error of the fit 2.4e-17
inline constexpr f64 kErfcP[] = {
    2.461949814735305e-10,
    0.5641895648311894,
    7.463212511522869,
    48.63721663182316,
    196.5209303731991,
    526.4454902913493,
    934.529094884861,
    1027.5525458421175,
    557.5357048625498,
};

// denominator, monic, leading 1 implied
inline constexpr f64 kErfcQ[] = {
    13.228198566625585,
    86.70724871029392,
    354.93795328184234,
    975.7090424439037,
    1823.9102577767976,
    2246.3390203978142,
    1656.664167818043,
    557.535710310749,
};

// erfc(x) = exp(-x^2) R(x)/S(x), 8 <= x <= 27; R[0] held; max relative error of the fit 2.2e-17
inline constexpr f64 kErfcR[] = {
    0.5641895835477551,
    1.4166521726412433,
    5.283463837398264,
    6.971631881742371,
    8.121831068010454,
    3.443474164146782,
};

// denominator, monic, leading 1 implied
inline constexpr f64 kErfcS[] = {
    2.5109505987885203,
    9.864695825201116,
    13.612371040148847,
    18.577920186496304,
    11.026328194826425,
    3.766295100786215,
};

// Dawson F(x) = x AN(x^2)/AD(x^2), |x| < 3.25; max relative error of the fit 5.2e-17
inline constexpr f64 kDawsonAN[] = {
    1.136796750288415e-11,
    8.492552091571169e-10,
    1.9443149928922662e-08,
    9.531495372171201e-07,
    3.0781777868329643e-06,
    0.00035251346771203646,
    -0.0008501631182211306,
    0.04226184822642211,
    -0.09174836421669762,
    1.0,
};

// denominator
inline constexpr f64 kDawsonAD[] = {
    2.4036856438540642e-11,
    1.4886310592259478e-09,
    5.2126103493692316e-08,
    1.2725767171222603e-06,
    2.324891069819052e-05,
    0.00032552352051122595,
    0.0034880484699677445,
    0.027944798991968507,
    0.1588740498597531,
    0.5749183024499679,
    1.0,
};

// 2 x F(x) = 1 + y BN(y)/BD(y), y = 1/x^2, 3.25 <= |x| < 6.25; max relative error of the fit 3.5e-15
inline constexpr f64 kDawsonBN[] = {
    0.505775700150034,
    -0.24537903410158002,
    0.09505227739090649,
    -0.0222188924346151,
    0.003735725213511338,
    -0.00043337149760047455,
    3.69191289826935e-05,
    -2.2081933946742347e-06,
    9.368709136391891e-08,
    -2.474824785515847e-09,
    3.6894512879154085e-11,
};

// denominator, monic, leading 1 implied
inline constexpr f64 kDawsonBD[] = {
    -0.6363258702065452,
    0.2395292141650094,
    -0.0540831116001677,
    0.00865629964091299,
    -0.0009710405421644054,
    8.019092261584393e-05,
    -4.690189042405961e-06,
    1.946857730410872e-07,
    -5.0603200023977275e-09,
    7.378899021072244e-11,
};

// 2 x F(x) = 1 + y CN(y)/CD(y), y = 1/x^2, |x| >= 6.25; max relative error of the fit 7.4e-16
inline constexpr f64 kDawsonCN[] = {
    -0.5946976880423505,
    0.652486172274981,
    -0.1842070334033622,
    0.01805380989259079,
    -0.0005486910128342217,
};

// denominator, monic, leading 1 implied
inline constexpr f64 kDawsonCD[] = {
    -2.7554032310885583,
    1.8091932717017558,
    -0.4209294234484919,
    0.0377536928236867,
    -0.0010973820256684438,
};

}  // namespace tsm
