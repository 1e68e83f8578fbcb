#!/usr/bin/python3
"""Coefficient sets of the gamma-family special functions.

Each set is a rational (or polynomial) approximation of a fixed form, fitted in
relative error on its interval with mpmath at 60 digits: a linearised
least-squares fit (Sanathanan-Koerner iteration) followed by Lawson's
reweighting, which drives the fit to the minimax (equi-oscillating) solution.
Coefficients that the kernels must carry with a given value are held fixed and
the others are fitted around them. The digamma series is exact (Bernoulli
numbers) and the zeta table is zeta(n) - 1 to full precision.

Writes special/gamma_coefficients.h, special/erf_coefficients.h and
special/zeta_coefficients.h; regenerate from the repository root with
    /usr/bin/python3 tools/special/gen_coefficients.py
Each file records the maximum relative error of every set after rounding its
coefficients to float64 (measured by this script on a fine grid).
"""
import os
import sys

import mpmath
from mpmath import mp, mpf

mp.dps = 60
ROOT = os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "..")


def horner(c, t):
    y = mpf(0)
    for a in c:
        y = y * t + a
    return y


class Form:
    """f(t) ~ num(t)/den(t). num and den are lists of coefficients, highest
    power first; an entry of None is free, a number is held fixed."""

    def __init__(self, num, den):
        self.num, self.den = num, den
        self.free = [("n", i) for i, c in enumerate(num) if c is None] + \
                    [("d", i) for i, c in enumerate(den) if c is None]

    def split(self, vec):
        num, den = list(self.num), list(self.den)
        for (which, i), v in zip(self.free, vec):
            (num if which == "n" else den)[i] = v
        return [mpf(c) for c in num], [mpf(c) for c in den]


def fit(form, f, a, b, npts=240, sk_rounds=8, lawson_rounds=60):
    a, b = mpf(a), mpf(b)
    ts = [(a + b) / 2 + (b - a) / 2 * mpmath.cos(mp.pi * (2 * k + 1) / (2 * npts)) for k in range(npts)]
    fs = [f(t) for t in ts]
    omega = [mpf(1)] * npts
    den_prev = [mpf(1)] * npts
    best = None
    for rnd in range(sk_rounds + lawson_rounds):
        rows, rhs = [], []
        for t, ft, w, dp in zip(ts, fs, omega, den_prev):
            s = mpmath.sqrt(w) / abs(ft * dp)
            nn, nd = len(form.num) - 1, len(form.den) - 1
            row = []
            for which, i in form.free:
                if which == "n":
                    row.append(-s * t ** (nn - i))
                else:
                    row.append(s * ft * t ** (nd - i))
            fixed = sum((-(mpf(c)) * t ** (nn - i) for i, c in enumerate(form.num) if c is not None), mpf(0)) + \
                sum((ft * mpf(c) * t ** (nd - i) for i, c in enumerate(form.den) if c is not None), mpf(0))
            rows.append(row)
            rhs.append(-s * fixed)
        # Equilibrate the columns: monomials over short or far intervals
        # differ by many orders of magnitude.
        scale = [max(abs(r[j]) for r in rows) for j in range(len(form.free))]
        rows = [[r[j] / scale[j] for j in range(len(r))] for r in rows]
        vec, _ = mpmath.qr_solve(mpmath.matrix(rows), mpmath.matrix(rhs))
        vec = [vec[j] / scale[j] for j in range(len(scale))]
        num, den = form.split(list(vec))
        errs = [abs(horner(num, t) / horner(den, t) / ft - 1) for t, ft in zip(ts, fs)]
        emax = max(errs)
        if best is None or emax < best[0]:
            best = (emax, num, den)
        if rnd < sk_rounds:
            den_prev = [abs(horner(den, t)) for t in ts]
        else:
            tot = sum(w * e for w, e in zip(omega, errs))
            omega = [w * e / tot for w, e in zip(omega, errs)]
    return best[1], best[2]


def rounded_error(num, den, f, a, b, n=2000, poly=False):
    num = [mpf(float(c)) for c in num]
    den = [mpf(float(c)) for c in den]
    a, b = mpf(a), mpf(b)
    worst = mpf(0)
    for k in range(n + 1):
        t = a + (b - a) * (k + mpf(0.5)) / (n + 1)
        ft = f(t)
        worst = max(worst, abs(horner(num, t) / horner(den, t) / ft - 1))
    return float(worst)


def c_array(name, coefs, comment):
    body = ",\n".join("    %s" % repr(float(c)) for c in coefs)
    return "// %s\ninline constexpr f64 %s[] = {\n%s,\n};\n" % (comment, name, body)


def header(fname, what, blocks):
    text = ("// %s: automatically generated, do not edit.\n"
            "// Generator: tools/special/gen_coefficients.py (mpmath %s, %d digits).\n"
            "// Regenerate from the repository root:\n"
            "//     /usr/bin/python3 tools/special/gen_coefficients.py\n"
            "// %s\n"
            "// Arrays hold the highest power first (PolyEval / PolyEval1 order).\n"
            "#pragma once\n\n#include \"frame/types.h\"\n\nnamespace tsm {\n\n"
            % (fname, mpmath.__version__, mp.dps, what))
    text += "\n".join(blocks) + "\n}  // namespace tsm\n"
    with open(os.path.join(ROOT, "special", fname), "w") as fh:
        fh.write(text)


def set_block(name_num, name_den, form, f, a, b, desc, monic_den=False, npts=240):
    num, den = fit(form, f, a, b, npts=npts)
    err = rounded_error(num, den, f, a, b)
    sys.stderr.write("%s/%s: max rel error %.3g\n" % (name_num, name_den, err))
    dens = den[1:] if monic_den else den
    note = "%s; max relative error of the fit %.2g" % (desc, err)
    return c_array(name_num, num, note) + "\n" + c_array(name_den, dens, "denominator%s" % (
        ", monic, leading 1 implied" if monic_den else ""))


def F(x):
    return mpf(float(x))


def gamma_file():
    blocks = []
    # Gamma(2 + x) = P(x)/Q(x) on [0, 1], P degree 6, Q degree 7 with Q(0) = 1.
    blocks.append(set_block("kGammaP", "kGammaQ", Form([None] * 7, [None] * 7 + [1]),
                            lambda t: mpmath.gamma(2 + t), 0, 1, "Gamma(2 + x) = P(x)/Q(x), 0 <= x < 1"))
    # ln Gamma(2 + x) = x B(x)/C(x) on [0, 1], B degree 5, C monic degree 6.
    blocks.append(set_block("kLogGammaB", "kLogGammaC", Form([None] * 6, [1] + [None] * 6),
                            lambda t: mpmath.loggamma(2 + t) / t, 0, 1,
                            "ln Gamma(2 + x) = x B(x)/C(x), 0 <= x < 1", monic_den=True))
    # Stirling: Gamma(x) = sqrt(2 pi) x^(x - 1/2) e^-x (1 + w S(w)), w = 1/x, x >= 33.
    stir = lambda w: (mpmath.gamma(1 / w) * mpmath.exp(1 / w) / (mpmath.sqrt(2 * mp.pi) * (1 / w) ** (1 / w - mpf(0.5))) - 1) / w
    s_num, _ = fit(Form([F(0.0007873113957930937), None, None, None, F(0.08333333333334822)], [1]), stir, 0, mpf(1) / 33)
    s_err = rounded_error(s_num + [1], [1], lambda w: 1 + w * stir(w), mpf(1) / 2000, mpf(1) / 33)
    sys.stderr.write("kStirling: %.3g\n" % s_err)
    blocks.append(c_array("kStirling", s_num,
                          "Stirling's series: Gamma(x) = sqrt(2 pi) x^(x-1/2) e^-x (1 + w S(w)), w = 1/x, x >= 33;"
                          " S[0] and S[4] held; max relative error of 1 + w S(w) %.2g" % s_err))
    # ln Gamma(x) = (x - 1/2) ln x - x + ln sqrt(2 pi) + A(p)/x, p = 1/x^2, 33 <= x < 1000.
    lga = lambda p: (mpmath.loggamma(1 / mpmath.sqrt(p)) - ((1 / mpmath.sqrt(p) - mpf(0.5)) * mpmath.log(1 / mpmath.sqrt(p))
                                                           - 1 / mpmath.sqrt(p) + mpmath.log(2 * mp.pi) / 2)) / mpmath.sqrt(p)
    a_num, _ = fit(Form([F(0.0008116141674705085), None, None, None, F(0.08333333333333319)], [1]), lga,
                   mpf(1) / 1000 ** 2, mpf(1) / 33 ** 2)
    a_err = rounded_error(a_num, [1], lga, mpf(1) / 1000 ** 2, mpf(1) / 33 ** 2)
    sys.stderr.write("kLogGammaA: %.3g\n" % a_err)
    blocks.append(c_array("kLogGammaA", a_num,
                          "ln Gamma(x) - ((x-1/2) ln x - x + ln sqrt(2 pi)) = A(p)/x, p = 1/x^2, 33 <= x < 1000;"
                          " A[0] and A[4] held; max relative error of A %.2g" % a_err))
    # psi(s) = ln s - 1/(2s) - z A(z), z = 1/s^2: A[k] = B_2j/(2j), exact.
    psi = [mpmath.bernoulli(2 * j) / (2 * j) for j in range(7, 0, -1)]
    blocks.append(c_array("kDigammaA", psi, "asymptotic series of psi: B_2j/(2j), j = 7 down to 1 (exact)"))
    header("gamma_coefficients.h", "Gamma, log-gamma, Stirling and digamma.", blocks)


def erf_file():
    blocks = []
    blocks.append(set_block("kErfT", "kErfU", Form([F(9.604973739870516)] + [None] * 4, [1] + [None] * 5),
                            lambda t: mpmath.erf(mpmath.sqrt(t)) / mpmath.sqrt(t), 0, 1,
                            "erf(x) = x T(x^2)/U(x^2), |x| <= 1; T[0] held", monic_den=True))
    blocks.append(set_block("kErfcP", "kErfcQ", Form([F(2.461949814735305e-10)] + [None] * 8, [1] + [None] * 8),
                            lambda x: mpmath.erfc(x) * mpmath.exp(x * x), 1, 8,
                            "erfc(x) = exp(-x^2) P(x)/Q(x), 1 <= x < 8; P[0] held", monic_den=True))
    blocks.append(set_block("kErfcR", "kErfcS", Form([F(0.5641895835477551)] + [None] * 5, [1] + [None] * 6),
                            lambda x: mpmath.erfc(x) * mpmath.exp(x * x), 8, 28,
                            "erfc(x) = exp(-x^2) R(x)/S(x), 8 <= x <= 27; R[0] held", monic_den=True))
    daw = lambda x: mpmath.sqrt(mp.pi) / 2 * mpmath.exp(-x * x) * mpmath.erfi(x)
    blocks.append(set_block("kDawsonAN", "kDawsonAD", Form([None] * 10, [None] * 10 + [1]),
                            lambda t: daw(mpmath.sqrt(t)) / mpmath.sqrt(t), 0, mpf(3.25) ** 2,
                            "Dawson F(x) = x AN(x^2)/AD(x^2), |x| < 3.25"))
    blocks.append(set_block("kDawsonBN", "kDawsonBD", Form([None] * 11, [1] + [None] * 10),
                            lambda y: (2 * daw(1 / mpmath.sqrt(y)) / mpmath.sqrt(y) - 1) / y,
                            1 / mpf(6.25) ** 2, 1 / mpf(3.25) ** 2,
                            "2 x F(x) = 1 + y BN(y)/BD(y), y = 1/x^2, 3.25 <= |x| < 6.25", monic_den=True))
    blocks.append(set_block("kDawsonCN", "kDawsonCD", Form([None] * 5, [1] + [None] * 5),
                            lambda y: (2 * daw(1 / mpmath.sqrt(y)) / mpmath.sqrt(y) - 1) / y if y > 0 else mpf(0.5),
                            mpf(1e-12), 1 / mpf(6.25) ** 2,
                            "2 x F(x) = 1 + y CN(y)/CD(y), y = 1/x^2, |x| >= 6.25", monic_den=True))
    header("erf_coefficients.h", "Error function, complementary error function and Dawson's integral.", blocks)


def zeta_file():
    blocks = []
    zc = lambda x: mpmath.zeta(x) - 1
    blocks.append(set_block("kZetaR", "kZetaS", Form([None] * 6, [1] + [None] * 5),
                            lambda x: zc(x) * (1 - x), 0, 1,
                            "zeta(x) - 1 = R(x)/(S(x) (1 - x)), 0 <= x < 1", monic_den=True))
    # zeta(x) - 1 = x^2 P(w) / (2^x (1 - x) Q(w)), w = 1/x: the pole at x = 1 is
    # carried by the exact factor 1 - x instead of a root of the denominator.
    blocks.append(set_block("kZetaP", "kZetaQ", Form([None] * 9, [1] + [None] * 7),
                            lambda w: zc(1 / w) * 2 ** (1 / w) * (1 - 1 / w) * w * w, mpf(1) / 10, 1,
                            "zeta(x) - 1 = x^2 P(w)/(2^x (1 - x) Q(w)), w = 1/x, 1 < x <= 10", monic_den=True))
    blocks.append(set_block("kZetaA", "kZetaB", Form([None] * 11, [1] + [None] * 10),
                            lambda x: mpmath.log(zc(x) - mpf(2) ** (-x)), 10, 50,
                            "zeta(x) - 1 = 2^-x + exp(A(x)/B(x)), 10 < x <= 50", monic_den=True))
    tab = [mpf(-1.5), mpmath.inf] + [zc(n) for n in range(2, 31)]
    blocks.append("// zeta(n) - 1 for n = 0 to 30; n = 1 is the pole.\ninline constexpr f64 kZetaMinusOne[] = {\n%s,\n};\n"
                  % ",\n".join("    %s" % ("__builtin_inf()" if mpmath.isinf(v) else repr(float(v))) for v in tab))
    header("zeta_coefficients.h", "Riemann zeta function.", blocks)


if __name__ == "__main__":
    which = sys.argv[1:] or ["gamma", "erf", "zeta"]
    for w in which:
        {"gamma": gamma_file, "erf": erf_file, "zeta": zeta_file}[w]()
