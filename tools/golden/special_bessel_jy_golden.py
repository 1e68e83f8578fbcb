#!/usr/bin/python3
"""Golden values for the Bessel J and Y tests (tests/special_bessel_jy).

mpmath at 40 digits. Orders and arguments are random draws from fixed seeds,
log-uniform where the range is wide, plus the break points of the kernels
(x = 2, 17, 25, 200, 3.6 sqrt(nu), x near nu) and integer, half-integer and
near-integer orders. Every float64 is written as a hex float (float.hex());
values beyond the float64 range as inf.

Each value comes with its scale, the size against which its error is judged:
where the functions oscillate (|x| >= |v|) the modulus sqrt(J^2 + Y^2);
below, the value itself, or for a negative non-integer order the size of the
two terms of J_-nu = cos(pi nu) J_nu - sin(pi nu) Y_nu (and of
Y_-nu = sin(pi nu) J_nu + cos(pi nu) Y_nu) that may cancel.

Regenerate (Debian's python3 with python3-mpmath and python3-numpy):
    /usr/bin/python3 tools/golden/special_bessel_jy_golden.py tests/data

Files, one case a line, whitespace-separated:
    special_bessel_jy_real.txt       v x J Y scaleJ scaleY  (Y, scaleY 0 for x < 0)
    special_bessel_jy_spherical.txt  n x j y scale_j scale_y
"""
import math
import multiprocessing
import os
import sys

import mpmath as mp
import numpy as np

sys.path.insert(0, os.path.dirname(os.path.abspath(__file__)))
from special_bessel_golden import write  # noqa: E402

mp.mp.dps = 40
BIG = dict(maxprec=200000, maxterms=10 ** 6)
rng = np.random.RandomState(20261125)


def loguni(a, b, n):
    return [float(v) for v in np.exp(rng.uniform(math.log(a), math.log(b), n))]


def reference(v, x):
    """J_v(x), Y_v(x) and their scales, x > 0."""
    v, x = mp.mpf(v), mp.mpf(x)
    nu = abs(v)
    j, y = mp.besselj(nu, x, **BIG), mp.bessely(nu, x, **BIG)
    if x >= nu:
        m = mp.hypot(j, y)
        sj = sy = m
    else:
        sj, sy = abs(j), abs(y)
    if v < 0 and v != int(v):
        c, s = mp.cospi(nu), mp.sinpi(nu)
        j, y = c * j - s * y, s * j + c * y
        if x < nu:
            sj, sy = abs(c * sj) + abs(s * sy), abs(s * sj) + abs(c * sy)
    elif v < 0:
        sign = -1 if int(nu) % 2 else 1
        j, y = sign * j, sign * y
    return j, y, sj, sy


def real_row(vx):
    v, x = vx
    if x > 0:
        return [v, x] + list(reference(v, x))
    j, _, sj, _ = reference(v, -x)  # integer orders only: J_n(-x) = (-1)^n J_n(x)
    return [v, x, (-1) ** int(abs(v)) * j, 0, sj, 0]


def spherical_row(nx):
    n, x = nx
    ax = abs(mp.mpf(x))
    k = mp.sqrt(mp.pi / (2 * ax))
    j, y, sj, sy = reference(n + 0.5, ax)
    if x < 0:
        j, y = (-1) ** n * j, (-1) ** (n + 1) * y
    return [n, x, k * j, k * y, k * sj, k * sy]


def real_cases():
    cases = []
    orders = [float(s * v) for s, v in zip(rng.choice([-1, 1], 40), loguni(0.01, 100, 40))]
    orders += [0.0, 1.0, 2.0, 3.0, 7.0, 20.0, 100.0, -1.0, -2.0, -5.0, -50.0, 0.5, 2.5, -0.5, -3.5, 49.5]
    orders += [3 + 1e-6, 3 - 1e-3, -4 - 1e-6, -4 + 1e-3, 1e-6, -1e-3, 50 + 1e-3, 10 - 1e-6]
    for v in orders:
        nu = abs(v)
        xs = loguni(1e-6, 1e4, 50)
        for b in (2.0, 17.0, 25.0, 200.0, 3.6 * math.sqrt(nu), nu, nu + 1, 1.1 * nu):
            if b > 0:
                xs += [math.nextafter(b, 0), b, math.nextafter(b, math.inf)]
        if v == int(v):
            xs += [-x for x in loguni(1e-3, 1e3, 10)]
        cases += [(v, x) for x in xs]
    # large orders, mostly around the turning point x = nu
    for nu in (500.0, 500.5, 1234.25, 3000.0, 4999.7):
        for s in (1, -1) if nu != int(nu) else (1,):
            xs = [nu * float(t) for t in rng.uniform(0.5, 1.5, 24)] + [nu - 1, nu, nu + 1, 20.0, 100.0, 0.1 * nu]
            cases += [(s * nu, x) for x in xs]
    return cases


def spherical_cases():
    cases = []
    for n in (0, 1, 2, 3, 5, 10, 20, 50, 100, -1, -2, -5, -20):
        xs = loguni(1e-6, 1e4, 60) + [-x for x in loguni(1e-3, 100, 8)] + [n + 0.5, 2.0, 17.0, 25.0]
        cases += [(n, x) for x in xs]
    return cases


def main():
    dirname = sys.argv[1] if len(sys.argv) > 1 else 'tests/data'
    with multiprocessing.Pool(2) as pool:
        write(dirname, 'jy_real', 'v x J Y scaleJ scaleY', pool.map(real_row, real_cases(), chunksize=8))
        write(dirname, 'jy_spherical', 'n x j y scale_j scale_y',
              pool.map(spherical_row, spherical_cases(), chunksize=8))


if __name__ == '__main__':
    main()
