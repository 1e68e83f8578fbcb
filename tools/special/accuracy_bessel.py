#!/usr/bin/python3
"""Accuracy of the Bessel-family kernels on dense grids.

Calls the exported entries of libtsmath.so through ctypes and compares them,
and scipy.special on the same grid, with mpmath at 40 digits. Prints one
markdown row per kernel: grid, our max and median error, scipy's max and median.

Errors are relative to the function's envelope: for the oscillating side of
Airy (x < 0) the modulus sqrt(Ai^2 + Bi^2) (sqrt(Ai'^2 + Bi'^2) for the
derivatives); on (0, 2.09), where Ai and Ai' are a difference of terms of size
Bi/sqrt 3, that size. Kelvin functions: relative to the size of the series
terms that cancel, I_n(x) for ber, bei and (2 + |ln(x/2)| + ln(n + x + 2)) I_n(x)
for ker, kei, or the modulus where that is larger; the rows "x <= 10" also give
the error relative to the modulus itself. Struve: relative to sqrt(J_v^2 + Y_v^2)
where x >= |v| (H_v oscillates with Y_v there), or |H_v| where that is larger.

Usage: /usr/bin/python3 tools/special/accuracy_bessel.py build/libtsmath.so [airy|kelvin|kn|struve ...]
"""
import ctypes
import math
import os
import sys

sys.path.insert(0, os.path.dirname(os.path.abspath(__file__)))
import mpmath as mp  # noqa: E402
import numpy as np  # noqa: E402
import scipy.special as sc  # noqa: E402
from accuracy_integrals import D, P, TINY, call, err, logspace, row, with_breaks  # noqa: E402

mp.mp.dps = 40


def lib_funcs(path):
    ctypes.CDLL(path.replace('libtsmath.so', 'host/libtsrt.so'), mode=ctypes.RTLD_GLOBAL)
    lib = ctypes.CDLL(path)
    lib.TS_Airy.argtypes = [D, P, P, P, P]
    lib.TS_BesselKn.argtypes = [ctypes.c_int32, D, P]
    lib.TS_KelvinI.argtypes = [D, ctypes.c_int32, P, P]
    lib.TS_KelvinK.argtypes = [D, ctypes.c_int32, P, P]
    lib.TS_Struve.argtypes = [D, D, P]
    return lib


def airy_rows(lib):
    pos = with_breaks(logspace(1e-8, 103.892, 5000), [2.09, 8.3203353])
    pos = [x for x in pos + [103.892] if x <= 103.892]
    neg = [-x for x in with_breaks(logspace(1e-8, 1000, 5000), [2.09])]
    o, t = [], []
    for x in pos + neg:
        m = mp.mpf(x)
        ref = [mp.airyai(m), mp.airyai(m, 1), mp.airybi(m), mp.airybi(m, 1)]
        if x < 0:
            env = [mp.hypot(ref[0], ref[2]), mp.hypot(ref[1], ref[3])] * 2
        elif x < 2.09:
            env = [ref[2] / mp.sqrt(3), ref[3] / mp.sqrt(3), 0, 0]
        else:
            env = [0, 0, 0, 0]
        env = [max(e, TINY) for e in env]
        ours = call(lib.TS_Airy, x, outs=4)
        theirs = sc.airy(x)
        o.append(max(err(ours[k], ref[k], env[k]) for k in range(4)))
        t.append(max(err(float(theirs[k]), ref[k], env[k]) for k in range(4)))
    yield row('AiryFunctions (max of Ai, Ai\', Bi, Bi\')',
              '%d x: log-spaced in [1e-8, 103.892] and [-1000, -1e-8] + breaks' % len(o), o, t)
    # the same, split where the rounding of zeta = 2/3 |x|^1.5 dominates
    small = [i for i, x in enumerate(pos + neg) if abs(x) <= 20]
    yield row('AiryFunctions, |x| <= 20', '%d of the above' % len(small), [o[i] for i in small],
              [t[i] for i in small])


def kelvin_rows(lib):
    xs = with_breaks(logspace(1e-8, 30, 10000), [1.0])
    grids = [('n = 0', [(0, x) for x in xs]),
             ('n in {1, 2, 3, 5, 10, -1, -4}', [(n, x) for n in (1, 2, 3, 5, 10, -1, -4)
                                                  for x in xs[::7]])]
    for label, pts in grids:
        oi, ti, ok, tk, oir, okr = [], [], [], [], [], []
        for n, x in pts:
            m = mp.mpf(x)
            rb, rc = mp.ber(n, m), mp.bei(n, m)
            rk, rl = mp.ker(n, m), mp.kei(n, m)
            i_n = mp.besseli(n, m)
            si = max(mp.hypot(rb, rc), i_n)
            sk = max(mp.hypot(rk, rl), (2 + abs(mp.log(m / 2)) + mp.log(abs(n) + m + 2)) * i_n)
            b, c = call(lib.TS_KelvinI, x, n, outs=2)
            k, l = call(lib.TS_KelvinK, x, n, outs=2)
            oi.append(max(err(b, rb, si), err(c, rc, si)))
            ok.append(max(err(k, rk, sk), err(l, rl, sk)))
            if x <= 10:
                oir.append(max(err(b, rb, mp.hypot(rb, rc)), err(c, rc, mp.hypot(rb, rc))))
                okr.append(max(err(k, rk, mp.hypot(rk, rl)), err(l, rl, mp.hypot(rk, rl))))
            if n == 0:
                ti.append(max(err(float(sc.ber(x)), rb, si), err(float(sc.bei(x)), rc, si)))
                tk.append(max(err(float(sc.ker(x)), rk, sk), err(float(sc.kei(x)), rl, sk)))
        nan = [float('nan')]
        grid = '%d (n, x), x log-spaced in [1e-8, 30]' % len(pts)
        yield row('KelvinI (ber, bei), %s' % label, grid, oi, ti or nan)
        yield row('KelvinK (ker, kei), %s' % label, grid, ok, tk or nan)
        yield row('KelvinI, %s, x <= 10, relative to the modulus' % label, 'as above', oir, nan)
        yield row('KelvinK, %s, x <= 10, relative to the modulus' % label, 'as above', okr, nan)


def kn_rows(lib):
    for orders in ((0, 1), (2, 3, 5, 10, 20, 50, 100)):
        o, t = [], []
        per = 10000 // len(orders)
        for n in orders:
            for x in with_breaks(logspace(1e-6, 705, per), [2.0]):
                r = mp.besselk(n, mp.mpf(x))
                if not TINY < r < 1.7976931348623157e308:
                    continue  # outside the normal range no relative accuracy
                o.append(err(call(lib.TS_BesselKn, n, x), r))
                t.append(err(float(sc.kn(n, x)), r))
        yield row('BesselK, n in {%s}' % ', '.join(map(str, orders)),
                  '%d (n, x), x log-spaced in [1e-6, 705] + breaks, normal results' % len(o), o, t)


def struve_rows(lib):
    g = np.random.RandomState(5)
    vs = list(g.uniform(-20, 100, 8000)) + list(g.randint(-20, 100, 2000).astype(float))
    xs = np.exp(g.uniform(math.log(1e-3), math.log(1e4), len(vs)))
    xs[:40] = [18.0, 30.0] * 20
    o, t = [], []
    for v, x in zip(map(float, vs), map(float, xs)):
        h = mp.struveh(v, x)
        if not TINY < abs(h) < 1.7976931348623157e308:
            continue  # outside the normal range no relative accuracy
        env = mp.hypot(mp.besselj(v, x), mp.bessely(v, x)) if x >= abs(v) else 0
        o.append(err(call(lib.TS_Struve, x, v), h, env))
        t.append(err(float(sc.struve(v, x)), h, env))
    yield row('StruveH', '%d (v, x): v in [-20, 100] (a fifth integers), x log-spaced in [1e-3, 1e4], '
              'normal results' % len(o), o, t)


def main():
    lib = lib_funcs(sys.argv[1] if len(sys.argv) > 1 else 'build/libtsmath.so')
    which = sys.argv[2:] or ['airy', 'kelvin', 'kn', 'struve']
    for name, rows in (('airy', airy_rows), ('kelvin', kelvin_rows), ('kn', kn_rows), ('struve', struve_rows)):
        if name in which:
            for r in rows(lib):
                print(r)


if __name__ == '__main__':
    main()
