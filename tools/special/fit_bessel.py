#!/usr/bin/python3
"""Coefficient sets of the Airy and modified Bessel kernels.

`airy` writes special/airy_coefficients.h: Chebyshev series (the fitting code of
fit_integrals.py) in z = 1/zeta, zeta = 2/3 |x|^(3/2), of the smooth factors
of the asymptotic forms:
  x >= 2.09:    Ai(x)  = A(z) / (2 sqrt(pi) x^(1/4) e^zeta),
                Ai'(x) = -x^(1/4) A'(z) / (2 sqrt(pi) e^zeta);
  x > 8.32...:  Bi(x)  = B(z) e^zeta / (sqrt(pi) x^(1/4)),
                Bi'(x) = x^(1/4) B'(z) e^zeta / sqrt(pi);
  x < -2.09:    with theta = zeta + pi/4, k = 1/(sqrt(pi) |x|^(1/4)),
                Ai = k (sin(theta) F - cos(theta) G), Bi = k (cos(theta) F + sin(theta) G)
                and for the derivatives, k' = |x|^(1/4)/sqrt(pi),
                Ai' = -k' (cos(theta) F' + sin(theta) G'), Bi' = k' (sin(theta) F' - cos(theta) G').

`ik` writes special/bessel_ik_coefficients.h: Chebyshev series of
  e^-x I0(x) and e^-x I1(x)/x on [0, 8], in t = x/4 - 1 (that is (x/2 - 2)/2);
  K0(x) + ln(x/2) I0(x) and x K1(x) - x ln(x/2) I1(x) on (0, 2], in t = x^2/4 - 1;
  sqrt(x) e^x K0(x) and sqrt(x) e^x K1(x) on [2, inf), in t = 4/x - 1 (that
  is (8/x - 2)/2).

Regenerate:
    /usr/bin/python3 tools/special/fit_bessel.py airy > special/airy_coefficients.h
    /usr/bin/python3 tools/special/fit_bessel.py ik > special/bessel_ik_coefficients.h
"""
import os
import sys

sys.path.insert(0, os.path.dirname(os.path.abspath(__file__)))
import mpmath as mp  # noqa: E402
from fit_integrals import cheb, emit  # noqa: E402

mp.mp.dps = 40
SQPI = mp.sqrt(mp.pi)


def x_of(z):
    return (mp.mpf(3) / (2 * z)) ** (mp.mpf(2) / 3)


def ai_pos(z):
    x = x_of(z)
    return mp.airyai(x) * 2 * SQPI * x ** 0.25 * mp.exp(1 / z)


def aip_pos(z):
    x = x_of(z)
    return -mp.airyai(x, 1) * 2 * SQPI * mp.exp(1 / z) / x ** 0.25


def bi_pos(z):
    x = x_of(z)
    return mp.airybi(x) * SQPI * x ** 0.25 * mp.exp(-1 / z)


def bip_pos(z):
    x = x_of(z)
    return mp.airybi(x, 1) * SQPI * mp.exp(-1 / z) / x ** 0.25


def neg_parts(z, deriv):
    x = -x_of(z)
    th = 1 / z + mp.pi / 4
    s, c = mp.sin(th), mp.cos(th)
    a, b = mp.airyai(x, deriv), mp.airybi(x, deriv)
    if deriv == 0:
        k = 1 / (SQPI * (-x) ** 0.25)
        a, b = a / k, b / k
        return s * a + c * b, -c * a + s * b
    k = (-x) ** 0.25 / SQPI
    a, b = -a / k, b / k
    return c * a + s * b, s * a - c * b


def opening(out, which, fname):
    out.append('// Automatically generated, do not edit.\n')
    out.append('// Generator: tools/special/fit_bessel.py (mpmath, 40 digits).\n')
    out.append('// Regenerate: /usr/bin/python3 tools/special/fit_bessel.py %s > special/%s\n' % (which, fname))
    out.append('// Chebyshev sets hold sum c_k T_k(t), t in [-1, 1], c_0 not halved, lowest first.\n')
    out.append('#pragma once\n\n#include "frame/types.h"\n\nnamespace tsm {\n\n')


def ik_file(out):
    opening(out, 'ik', 'bessel_ik_coefficients.h')
    emit(out, 'kI0Small', cheb(lambda x: mp.exp(-x) * mp.besseli(0, x), 0, 8), 'e^-x I0(x) on [0, 8], t = x/4 - 1')
    emit(out, 'kI1Small', cheb(lambda x: mp.exp(-x) * mp.besseli(1, x) / x, 0, 8),
         'e^-x I1(x)/x on [0, 8], t = x/4 - 1')
    k0s = lambda x: mp.besselk(0, x) + mp.log(x / 2) * mp.besseli(0, x)  # noqa: E731
    k1s = lambda x: x * mp.besselk(1, x) - x * mp.log(x / 2) * mp.besseli(1, x)  # noqa: E731
    emit(out, 'kK0Small', cheb(lambda u: k0s(2 * mp.sqrt(u)), 0, 1),
         'K0(x) + ln(x/2) I0(x) on (0, 2] as a function of u = x^2/4, t = 2 u - 1 = x^2/2 - 1')
    emit(out, 'kK1Small', cheb(lambda u: k1s(2 * mp.sqrt(u)), 0, 1),
         'x K1(x) - x ln(x/2) I1(x) on (0, 2] in u = x^2/4, t = x^2/2 - 1')
    emit(out, 'kK0Large', cheb(lambda w: mp.sqrt(2 / w) * mp.exp(2 / w) * mp.besselk(0, 2 / w), 0, 1),
         'sqrt(x) e^x K0(x) on [2, inf) in w = 2/x, t = 2 w - 1 = 4/x - 1')
    emit(out, 'kK1Large', cheb(lambda w: mp.sqrt(2 / w) * mp.exp(2 / w) * mp.besselk(1, 2 / w), 0, 1),
         'sqrt(x) e^x K1(x) on [2, inf) in w = 2/x, t = 4/x - 1')
    out.append('}  // namespace tsm\n')


def airy_file(out):
    opening(out, 'airy', 'airy_coefficients.h')
    zpos = 1 / (mp.mpf(2) / 3 * mp.mpf('2.09') ** 1.5)
    zbig = 1 / (mp.mpf(2) / 3 * mp.mpf('8.3203353') ** 1.5)
    note = 'on z in [0, %s], t = 2 z / %s - 1'
    zp, zb = mp.nstr(zpos, 17), mp.nstr(zbig, 17)
    emit(out, 'kAiryA', cheb(ai_pos, 0, zpos), 'A(z) ' + note % (zp, zp))
    emit(out, 'kAiryAp', cheb(aip_pos, 0, zpos), "A'(z) " + note % (zp, zp))
    emit(out, 'kAiryB', cheb(bi_pos, 0, zbig), 'B(z) ' + note % (zb, zb))
    emit(out, 'kAiryBp', cheb(bip_pos, 0, zbig), "B'(z) " + note % (zb, zb))
    emit(out, 'kAiryF', cheb(lambda z: neg_parts(z, 0)[0], 0, zpos), 'F(z) ' + note % (zp, zp))
    emit(out, 'kAiryG', cheb(lambda z: neg_parts(z, 0)[1] / z, 0, zpos), 'G(z)/z ' + note % (zp, zp))
    emit(out, 'kAiryFp', cheb(lambda z: neg_parts(z, 1)[0], 0, zpos), "F'(z) " + note % (zp, zp))
    emit(out, 'kAiryGp', cheb(lambda z: neg_parts(z, 1)[1] / z, 0, zpos), "G'(z)/z " + note % (zp, zp))
    out.append('inline constexpr f64 kAiryZPos = %s;\n' % zp)
    out.append('inline constexpr f64 kAiryZBig = %s;\n\n' % zb)
    out.append('}  // namespace tsm\n')


def main():
    out = []
    {'airy': airy_file, 'ik': ik_file}[sys.argv[1] if len(sys.argv) > 1 else 'airy'](out)
    sys.stdout.write(''.join(l if l.endswith('\n') else l + '\n' for l in out))


if __name__ == '__main__':
    main()
