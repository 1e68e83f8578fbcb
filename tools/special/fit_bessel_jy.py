#!/usr/bin/python3
"""Coefficient sets of the Bessel J and Y kernels.

Writes special/bessel_jy_coefficients.h: Chebyshev series (the fitting code
of fit_integrals.py), fitted against mpmath at 40 digits, of
  J0(x) and J1(x)/x on [0, 8], in u = x^2/64 (t = x^2/32 - 1);
  Y0(x) - (2/pi) ln(x/2) J0(x) and x Y1(x) - (2/pi) x ln(x/2) J1(x) on
    (0, 8], in u (both even entire functions of x);
  the factors P and Q of Hankel's form for orders 0 and 1 from x = 8 up,
    J = sqrt(2/(pi x)) (P cos chi - Q sin chi),
    Y = sqrt(2/(pi x)) (P sin chi + Q cos chi),  chi = x - (n/2 + 1/4) pi,
    P and x Q/8 in s = 64/x^2 (t = 2 s - 1);
  Temme's gamma factors on |mu| <= 1/2 (t = 2 mu):
    G1(mu) = (1/Gamma(1 - mu) - 1/Gamma(1 + mu))/(2 mu),
    G2(mu) = (1/Gamma(1 - mu) + 1/Gamma(1 + mu))/2.

Regenerate:
    /usr/bin/python3 tools/special/fit_bessel_jy.py > special/bessel_jy_coefficients.h
"""
import os
import sys

sys.path.insert(0, os.path.dirname(os.path.abspath(__file__)))
import mpmath as mp  # noqa: E402
from fit_integrals import cheb, emit  # noqa: E402

mp.mp.dps = 40
TWO_PI = 2 / mp.pi


def x_of_u(u):
    return 8 * mp.sqrt(u)


def hankel_pq(n, x):
    j, y = mp.besselj(n, x), mp.bessely(n, x)
    chi = x - (mp.mpf(n) / 2 + mp.mpf(1) / 4) * mp.pi
    k = mp.sqrt(mp.pi * x / 2)
    return k * (j * mp.cos(chi) + y * mp.sin(chi)), k * (y * mp.cos(chi) - j * mp.sin(chi))


def main():
    out = []
    out.append('// Automatically generated, do not edit.')
    out.append('// Generator: tools/special/fit_bessel_jy.py (mpmath, 40 digits).')
    out.append('// Regenerate: /usr/bin/python3 tools/special/fit_bessel_jy.py > special/bessel_jy_coefficients.h')
    out.append('// Chebyshev sets hold sum c_k T_k(t), t in [-1, 1], c_0 not halved, lowest first.')
    out.append('#pragma once\n\n#include "frame/types.h"\n\nnamespace tsm {\n')
    emit(out, 'kJ0Small', cheb(lambda u: mp.besselj(0, x_of_u(u)), 0, 1), 'J0(x) on [0, 8] in u = x^2/64, t = 2u - 1')
    emit(out, 'kJ1Small', cheb(lambda u: mp.besselj(1, x_of_u(u)) / x_of_u(u), 0, 1), 'J1(x)/x on [0, 8], t = 2u - 1')
    y0s = lambda x: mp.bessely(0, x) - TWO_PI * mp.log(x / 2) * mp.besselj(0, x)  # noqa: E731
    y1s = lambda x: x * mp.bessely(1, x) - TWO_PI * x * mp.log(x / 2) * mp.besselj(1, x)  # noqa: E731
    emit(out, 'kY0Small', cheb(lambda u: y0s(x_of_u(u)), 0, 1), 'Y0(x) - (2/pi) ln(x/2) J0(x) on (0, 8], t = 2u - 1')
    emit(out, 'kY1Small', cheb(lambda u: y1s(x_of_u(u)), 0, 1),
         'x Y1(x) - (2/pi) x ln(x/2) J1(x) on (0, 8], t = 2u - 1')
    for n in (0, 1):
        x_of_s = lambda s: 8 / mp.sqrt(s)  # noqa: E731
        emit(out, 'kP%dLarge' % n, cheb(lambda s: hankel_pq(n, x_of_s(s))[0], 0, 1, nodes=120),
             'P of order %d from x = 8 up, in s = 64/x^2, t = 2s - 1' % n)
        emit(out, 'kQ%dLarge' % n, cheb(lambda s: hankel_pq(n, x_of_s(s))[1] * x_of_s(s) / 8, 0, 1, nodes=120),
             'x Q/8 of order %d from x = 8 up, t = 2s - 1' % n)
    rg = mp.rgamma
    emit(out, 'kTemmeG1', cheb(lambda m: (rg(1 - m) - rg(1 + m)) / (2 * m), -0.5, 0.5),
         'G1(mu) on [-1/2, 1/2], t = 2 mu')
    emit(out, 'kTemmeG2', cheb(lambda m: (rg(1 - m) + rg(1 + m)) / 2, -0.5, 0.5), 'G2(mu) on [-1/2, 1/2], t = 2 mu')
    out.append('}  // namespace tsm')
    print('\n'.join(out))


if __name__ == '__main__':
    main()
