#!/usr/bin/python3
"""Accuracy of the Bessel J and Y kernels on dense grids.

Calls the exported entries of libtsmath.so through ctypes and compares them,
and scipy.special on the same grid, with mpmath at 40 digits. Prints one
markdown row per kernel and region: grid, our max and median error, scipy's
max and median.

Errors are relative to the scale of tools/golden/special_bessel_jy_golden.py:
the modulus sqrt(J^2 + Y^2) where the functions oscillate (|x| >= |v|), the
value itself below (for negative non-integer orders the size of the two
reflected terms). A reference beyond the float64 range counts as exact when
the result is that infinity, one beneath the normal range when the result is
below it too; otherwise the error is 1.

Usage: /usr/bin/python3 tools/special/accuracy_bessel_jy.py build/libtsmath.so [j01 real large spherical ...]
"""
import ctypes
import math
import multiprocessing
import os
import sys

HERE = os.path.dirname(os.path.abspath(__file__))
sys.path.insert(0, HERE)
sys.path.insert(0, os.path.join(HERE, '..', 'golden'))
import mpmath as mp  # noqa: E402
import numpy as np  # noqa: E402
import scipy.special as sc  # noqa: E402
from accuracy_integrals import D, HUGE, P, TINY, call, logspace, row, with_breaks  # noqa: E402
from special_bessel_jy_golden import reference  # noqa: E402

mp.mp.dps = 40
LIB = None


def load(path):
    ctypes.CDLL(path.replace('libtsmath.so', 'host/libtsrt.so'), mode=ctypes.RTLD_GLOBAL)
    lib = ctypes.CDLL(path)
    for name in ('TS_BesselJr', 'TS_BesselYr'):
        getattr(lib, name).argtypes = [D, D, P]
    for name in ('TS_BesselJs', 'TS_BesselYs'):
        getattr(lib, name).argtypes = [ctypes.c_int32, D, P]
    return lib


def err(ours, ref, scale):
    if abs(ref) > HUGE:
        return 0.0 if ours == float(ref) else 1.0
    s = max(abs(ref), scale)
    if s < TINY:
        return 0.0 if abs(ours) < 2 * TINY else 1.0
    if not math.isfinite(ours):
        return 1.0
    return float(abs(mp.mpf(ours) - ref) / s)


def real_point(vx):
    v, x = vx
    j, y, sj, sy = reference(v, x)
    ours = (err(call(LIB.TS_BesselJr, v, x), j, sj), err(call(LIB.TS_BesselYr, v, x), y, sy))
    theirs = (err(float(sc.jv(v, x)), j, sj), err(float(sc.yv(v, x)), y, sy))
    return ours, theirs


def spherical_point(nx):
    n, x = nx
    k = mp.sqrt(mp.pi / (2 * mp.mpf(x)))
    j, y, sj, sy = [k * t for t in reference(n + 0.5, x)]
    ours = (err(call(LIB.TS_BesselJs, n, x), j, sj), err(call(LIB.TS_BesselYs, n, x), y, sy))
    if n >= 0:
        theirs = (err(float(sc.spherical_jn(n, x)), j, sj), err(float(sc.spherical_yn(n, x)), y, sy))
    else:
        theirs = (float('nan'), float('nan'))
    return ours, theirs


def pair_rows(pool, fn, pts, names, grid):
    """Rows of the first and the second kind over one grid."""
    res = pool.map(fn, pts, chunksize=16)
    for k, name in enumerate(names):
        ours = [r[0][k] for r in res]
        theirs = [r[1][k] for r in res if r[1][k] == r[1][k]]
        yield row(name, grid if k == 0 else 'as above', ours, theirs)


def j01_rows(pool):
    xs = with_breaks(logspace(1e-6, 1e4, 5000), [2.0, 8.0, 17.0, 25.0])
    pts = [(v, x) for v in (0.0, 1.0) for x in xs]
    grid = '%d (v, x), v in {0, 1}, x log-spaced in [1e-6, 1e4] + breaks' % len(pts)
    return pair_rows(pool, real_point, pts, ('BesselJ, orders 0 and 1', 'BesselY, orders 0 and 1'), grid)


def real_rows(pool):
    rng = np.random.RandomState(7)
    orders = [float(v) for v in rng.uniform(-100, 100, 60)] + [float(v) for v in range(-100, 101, 10)]
    orders += [n + d for n in (2, 5, 30, -3, -40) for d in (1e-6, -1e-3)]
    xs = with_breaks(logspace(1e-6, 1e4, 120), [2.0, 17.0, 25.0, 200.0])
    pts = [(v, x) for v in orders for x in xs + [abs(v), 3.6 * math.sqrt(abs(v)) or 1.0]]
    grid = ('%d (v, x), v in [-100, 100] (random, integers, near-integers), x log-spaced in [1e-6, 1e4] + breaks'
            % len(pts))
    return pair_rows(pool, real_point, pts, ('BesselJ, \\|v\\| <= 100', 'BesselY, \\|v\\| <= 100'), grid)


def large_rows(pool):
    rng = np.random.RandomState(8)
    pts = []
    for nu in (500.0, 700.5, 1000.0, 1500.25, 2000.0, 3000.5, 4000.0, 4999.7):
        pts += [(s * nu, nu * float(t)) for s in ((1, -1) if nu != int(nu) else (1,))
                for t in rng.uniform(0.5, 1.3, 60)]
    grid = '%d (v, x), \\|v\\| from 500 to 5000, x in [0.5 \\|v\\|, 1.3 \\|v\\|]' % len(pts)
    return pair_rows(pool, real_point, pts, ('BesselJ, large orders', 'BesselY, large orders'), grid)


def spherical_rows(pool):
    xs = with_breaks(logspace(1e-6, 1e4, 100), [2.0, 17.0, 25.0])
    pts = [(n, x) for n in list(range(-20, 21)) + list(range(25, 101, 5)) for x in xs]
    grid = '%d (n, x), n in [-20, 100], x log-spaced in [1e-6, 1e4] + breaks (scipy: n >= 0)' % len(pts)
    return pair_rows(pool, spherical_point, pts, ('SphericalBesselJ', 'SphericalBesselY'), grid)


def init(path):
    global LIB
    LIB = load(path)


def main():
    path = sys.argv[1] if len(sys.argv) > 1 else 'build/libtsmath.so'
    which = sys.argv[2:] or ['j01', 'real', 'large', 'spherical']
    with multiprocessing.Pool(2, initializer=init, initargs=(path,)) as pool:
        for name, rows in (('j01', j01_rows), ('real', real_rows), ('large', large_rows),
                           ('spherical', spherical_rows)):
            if name in which:
                for r in rows(pool):
                    print(r, flush=True)


if __name__ == '__main__':
    main()
