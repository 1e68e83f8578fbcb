#!/usr/bin/python3
"""Coefficient sets of the integral, elliptic and dilogarithm kernels.

Writes special/integrals_coefficients.h. Every set is fitted here against
mpmath at 40 digits:
  - Chebyshev series (sum c_k T_k(t), t in [-1, 1], c_0 not halved) of smooth
    pieces, truncated where the tail falls below 1e-18 of the smallest value;
  - the complete elliptic integrals as P(q) - ln(q) Q(q) with q = 1 - m, a
    linear fit in relative error (Lawson-weighted least squares, near minimax).

Regenerate:
    /usr/bin/python3 tools/special/fit_integrals.py > special/integrals_coefficients.h
"""
import sys

import mpmath as mp

mp.mp.dps = 40
NODES = 80
TAIL = mp.mpf('1e-18')


def cheb(f, a, b, nodes=NODES, maxdeg=None):
    """Chebyshev coefficients of f on [a, b], truncated at the tail tolerance."""
    a, b = mp.mpf(a), mp.mpf(b)
    th = [mp.pi * (j + mp.mpf(1) / 2) / nodes for j in range(nodes)]
    fx = [f((a + b) / 2 + (b - a) / 2 * mp.cos(t)) for t in th]
    c = [2 * mp.fsum(fx[j] * mp.cos(k * th[j]) for j in range(nodes)) / nodes for k in range(nodes)]
    c[0] /= 2
    scale = min(abs(v) for v in fx)
    n = nodes
    while n > 1 and abs(c[n - 1]) < TAIL * scale:
        n -= 1
    if maxdeg is not None:
        n = min(n, maxdeg + 1)
    if n >= nodes - 4:
        sys.stderr.write('warning: series on [%s, %s] did not converge\n' % (a, b))
    # check the truncated series at points between the nodes
    err = 0
    for j in range(200):
        t = mp.cos(mp.pi * (j + mp.mpf(1) / 3) / 200)
        x = (a + b) / 2 + (b - a) / 2 * t
        s = mp.fsum(c[k] * mp.chebyt(k, t) for k in range(n))
        err = max(err, abs(s / f(x) - 1))
    sys.stderr.write('cheb [%s, %s]: %d terms, rel err %.2e\n' % (mp.nstr(a, 6), mp.nstr(b, 6), n, float(err)))
    return c[:n]


def log_form(func, np_, nq, qshift):
    """P(q) - ln(q) q^qshift Q(q), degrees np_ and nq, fitted in relative error on q in (0, 1]."""
    pts = [(1 - mp.cos(mp.pi * (j + mp.mpf(1) / 2) / 400)) / 2 for j in range(400)]
    vals = [func(q) for q in pts]
    w = [mp.mpf(1)] * len(pts)
    for _ in range(12):
        rows, rhs = [], []
        for q, v, wi in zip(pts, vals, w):
            s = mp.sqrt(wi) / v
            row = [q ** i * s for i in range(np_ + 1)]
            row += [-mp.log(q) * q ** (i + qshift) * s for i in range(nq + 1)]
            rows.append(row)
            rhs.append(s * v)
        sol, _ = mp.qr_solve(mp.matrix(rows), mp.matrix(rhs))
        p = [sol[i] for i in range(np_ + 1)]
        qq = [sol[np_ + 1 + i] for i in range(nq + 1)]
        errs = []
        for q, v in zip(pts, vals):
            approx = mp.fsum(p[i] * q ** i for i in range(np_ + 1)) - mp.log(q) * q ** qshift * mp.fsum(qq[i] * q ** i for i in range(nq + 1))
            errs.append(abs(approx / v - 1))
        tot = mp.fsum(wi * e for wi, e in zip(w, errs))
        w = [wi * e / tot for wi, e in zip(w, errs)]
    sys.stderr.write('log form: max rel err %.2e\n' % float(max(errs)))
    # highest power first, as PolyEval takes them
    return p[::-1], qq[::-1]


def si_ratio(x):
    return mp.si(x) / x


def cin_ratio(x):
    return (mp.euler + mp.log(x) - mp.ci(x)) / (x * x)


def sici_fg(x):
    s, c = mp.si(x), mp.ci(x)
    f = c * mp.sin(x) + (mp.pi / 2 - s) * mp.cos(x)
    g = -c * mp.cos(x) + (mp.pi / 2 - s) * mp.sin(x)
    return f, g


def fresnel_fg(x):
    S, C = mp.fresnels(x), mp.fresnelc(x)
    th = mp.pi * x * x / 2
    s, c = mp.sin(th), mp.cos(th)
    f = (C - mp.mpf(1) / 2) * s + (mp.mpf(1) / 2 - S) * c
    g = -(C - mp.mpf(1) / 2) * c + (mp.mpf(1) / 2 - S) * s
    return f, g


def shi_scaled(x):
    return x * mp.exp(-x) * mp.shi(x)


def chi_scaled(x):
    return x * mp.exp(-x) * mp.chi(x)


def spence_ratio(w):
    # -spence(1 + w) / w = Li2(-w) / (-w)
    return mp.polylog(2, -w) / (-w)


def emit(out, name, coefs, note):
    out.append('// %s (%d terms)' % (note, len(coefs)))
    out.append('inline constexpr f64 %s[] = {' % name)
    for c in coefs:
        out.append('    %s,' % repr(float(c)))
    out.append('};')
    out.append('')


def main():
    out = []
    out.append('// Automatically generated, do not edit.')
    out.append('// Generator: tools/special/fit_integrals.py (mpmath, 40 digits).')
    out.append('// Regenerate: /usr/bin/python3 tools/special/fit_integrals.py > special/integrals_coefficients.h')
    out.append('// Chebyshev sets hold sum c_k T_k(t), t in [-1, 1], c_0 not halved, lowest first;')
    out.append('// PolyEval sets stand highest power first.')
    out.append('#pragma once')
    out.append('')
    out.append('#include "frame/types.h"')
    out.append('')
    out.append('namespace tsm {')
    out.append('')

    # complete elliptic integrals, q = 1 - m
    kp, kq = log_form(lambda q: mp.ellipk(1 - q), 10, 10, 0)
    emit(out, 'kEllipKP', kp, 'K(m) = P(q) - ln(q) Q(q), q = 1 - m: P, degree 10')
    emit(out, 'kEllipKQ', kq, 'K(m): Q, degree 10')
    ep, eq = log_form(lambda q: mp.ellipe(1 - q), 10, 9, 1)
    emit(out, 'kEllipEP', ep, 'E(m) = P(q) - ln(q) q Q(q): P, degree 10')
    emit(out, 'kEllipEQ', eq, 'E(m): Q, degree 9')

    # sine and cosine integrals
    emit(out, 'kSiSmall', cheb(lambda u: si_ratio(4 * mp.sqrt(u)) if u > 0 else mp.mpf(1), 0, 1),
         'Si(x)/x on x < 4, in u = x^2/16, t = 2u - 1')
    emit(out, 'kCinSmall', cheb(lambda u: cin_ratio(4 * mp.sqrt(u)) if u > 0 else mp.mpf(1) / 4, 0, 1),
         '(Euler + ln x - Ci(x))/x^2 on x < 4, in u = x^2/16, t = 2u - 1')
    emit(out, 'kSiciF4', cheb(lambda x: x * sici_fg(x)[0], 4, 8), 'x f(x) on [4, 8], t = (x - 6)/2')
    emit(out, 'kSiciG4', cheb(lambda x: x * x * sici_fg(x)[1], 4, 8), 'x^2 g(x) on [4, 8], t = (x - 6)/2')
    emit(out, 'kSiciF8', cheb(lambda s: mp.sqrt(64 / s) * sici_fg(mp.sqrt(64 / s))[0] if s > 0 else mp.mpf(1), 0, 1),
         'x f(x) from 8 up, in s = 64/x^2, t = 2s - 1')
    emit(out, 'kSiciG8', cheb(lambda s: (64 / s) * sici_fg(mp.sqrt(64 / s))[1] if s > 0 else mp.mpf(1), 0, 1),
         'x^2 g(x) from 8 up, in s = 64/x^2, t = 2s - 1')

    # hyperbolic sine and cosine integrals, x e^-x Shi(x) and x e^-x Chi(x)
    # against a = (576/x - 52)/10 on [8, 18] and a = (6336/x - 212)/70 on [18, 88]
    emit(out, 'kShi18', cheb(lambda a: shi_scaled(576 / (10 * a + 52)), -2, 2), 'x e^-x Shi(x) on [8, 18], t = a/2')
    emit(out, 'kChi18', cheb(lambda a: chi_scaled(576 / (10 * a + 52)), -2, 2), 'x e^-x Chi(x) on [8, 18], t = a/2')
    emit(out, 'kShi88', cheb(lambda a: shi_scaled(6336 / (70 * a + 212)), -2, 2), 'x e^-x Shi(x) on [18, 88], t = a/2')
    emit(out, 'kChi88', cheb(lambda a: chi_scaled(6336 / (70 * a + 212)), -2, 2), 'x e^-x Chi(x) on [18, 88], t = a/2')

    # Fresnel integrals
    emit(out, 'kFresnelS', cheb(lambda u: mp.fresnels(mp.root(u * mp.mpf('6.56640625'), 4)) / mp.root(u * mp.mpf('6.56640625'), 4) ** 3 if u > 0 else mp.pi / 6, 0, 1),
         'S(x)/x^3 on x^2 < 2.5625, in u = x^4/6.56640625, t = 2u - 1')
    emit(out, 'kFresnelC', cheb(lambda u: mp.fresnelc(mp.root(u * mp.mpf('6.56640625'), 4)) / mp.root(u * mp.mpf('6.56640625'), 4) if u > 0 else mp.mpf(1), 0, 1),
         'C(x)/x on x^2 < 2.5625, in u = x^4/6.56640625, t = 2u - 1')
    fx = lambda v: mp.sqrt(mp.mpf('2.5625') / v)
    emit(out, 'kFresnelF', cheb(lambda v: mp.pi * fx(v) * fresnel_fg(fx(v))[0] if v > 0 else mp.mpf(1), 0, 1),
         'pi x f(x) from x^2 = 2.5625 up, in v = 2.5625/x^2, t = 2v - 1')
    emit(out, 'kFresnelG', cheb(lambda v: mp.pi ** 2 * fx(v) ** 3 * fresnel_fg(fx(v))[1] if v > 0 else mp.mpf(1), 0, 1),
         'pi^2 x^3 g(x) from x^2 = 2.5625 up, in v = 2.5625/x^2, t = 2v - 1')

    # dilogarithm, folded to w in [-0.5, 0.5]
    emit(out, 'kSpence', cheb(lambda w: spence_ratio(w) if w != 0 else mp.mpf(1), -0.5, 0.5),
         '-spence(1 + w)/w on w in [-0.5, 0.5], t = 2w')

    out.append('}  // namespace tsm')
    print('\n'.join(out))


if __name__ == '__main__':
    main()
