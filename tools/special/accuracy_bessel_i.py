#!/usr/bin/python3
"""Accuracy of BesselI and ParabolicCylinderD on dense grids.

Calls the exported entries of libtsmath.so through ctypes and compares them,
and scipy.special (iv, pbdv) on the same grid, with mpmath at 40 digits.
Prints one markdown row per region: grid, our max and median error, scipy's
max and median. Only cases whose value is a normal float64 count.

Errors are relative to the envelopes of tools/golden/special_bessel_i_golden.py:
|f| where the function is monotone; for I of negative non-integer order
I_|v| + (2/pi) |sin(pi v)| K_|v|; for D_v at x < 0 the sum of the magnitudes of
the two terms of the connection formula, and in the oscillating region the
largest |D_v| within a local period.

Usage: /usr/bin/python3 tools/special/accuracy_bessel_i.py build/libtsmath.so [iv|pcfd ...]
"""
import ctypes
import math
import os
import sys

import numpy as np

here = os.path.dirname(os.path.abspath(__file__))
sys.path.insert(0, here)
sys.path.insert(0, os.path.join(here, '..', 'golden'))
import mpmath as mp  # noqa: E402
import scipy.special as sc  # noqa: E402
from accuracy_integrals import D, HUGE, P, TINY, call, err, logspace, row  # noqa: E402
from special_bessel_i_golden import iv_envelope, pcfd_envelope  # noqa: E402

mp.mp.dps = 40
rng = np.random.RandomState(7)


def lib_funcs(path):
    ctypes.CDLL(path.replace('libtsmath.so', 'host/libtsrt.so'), mode=ctypes.RTLD_GLOBAL)
    lib = ctypes.CDLL(path)
    lib.TS_BesselIr.argtypes = [D, D, P]
    lib.TS_ParabolicCylinder.argtypes = [D, D, P]
    return lib


def measure(pts, ref_fn, env_fn, ours_fn, theirs_fn):
    o, t = [], []
    for v, x in pts:
        ref = ref_fn(v, x)
        if not TINY < abs(ref) < HUGE:
            continue
        env = env_fn(v, x, ref)
        o.append(err(ours_fn(v, x), ref, env))
        t.append(err(float(theirs_fn(v, x)), ref, env))
    return o, t


def iv_rows(lib):
    def ref(v, x):
        return mp.re(mp.besseli(v, x, zeroprec=1200, infprec=1200))

    def ours(v, x):
        return call(lib.TS_BesselIr, v, x)

    xs = logspace(1e-6, 720, 240)
    regions = [
        ('v in [0, 100]', 'v: 40 uniform + 10 integers in [0, 100]; x: 240 log-spaced in [1e-6, 720]',
         [float(v) for v in rng.uniform(0, 100, 40)] + [0.0, 1.0, 2.0, 5.0, 10, 20, 37, 50, 77, 100], xs),
        ('v in [-50, 0), non-integer', 'v: 50 uniform in [-50, 0); x: 240 log-spaced in [1e-6, 720]',
         [float(v) for v in rng.uniform(-50, 0, 50)], xs),
        ('v in [100, 1000]', 'v: 25 uniform in [100, 1000]; x: 400 log-spaced in [1, 1e4]',
         [float(v) for v in rng.uniform(100, 1000, 25)], logspace(1, 1e4, 400)),
    ]
    for label, grid, orders, args in regions:
        pts = [(v, x) for v in orders for x in args]
        breaks = [(v, b) for v in orders for b in (2.0, 20.0, v * v / 2) if b <= args[-1]]
        pts += [(v, x) for v, b in breaks for x in (math.nextafter(b, 0), b, math.nextafter(b, math.inf))]
        o, t = measure(pts, ref, iv_envelope, ours, sc.iv)
        yield row('BesselI, %s' % label, '%s + breaks; %d normal results' % (grid, len(o)), o, t)


def pcfd_rows(lib):
    def ours(v, x):
        return call(lib.TS_ParabolicCylinder, x, v)

    def theirs(v, x):
        return sc.pbdv(v, x)[0]

    for vmax, xmax, n in ((30, 30, 100), (100, 60, 40)):
        vs = [float(v) for v in np.linspace(-vmax, vmax, n) + rng.uniform(-0.3, 0.3, n)]
        vs += [float(k) for k in range(0, min(vmax, 30) + 1, 3)]
        xs = [float(x) for x in np.linspace(-xmax, xmax, n)] + [-7.0, 7.0]
        o, t = measure([(v, x) for v in vs for x in xs], lambda v, x: mp.pcfd(v, x), pcfd_envelope, ours, theirs)
        grid = 'v: %d evenly spaced and jittered in [-%d, %d] + integers; x: %d evenly spaced in [-%d, %d] + 7, -7; %d normal results' % (
            n, vmax, vmax, n, xmax, xmax, len(o))
        yield row('ParabolicCylinderD, \\|v\\| <= %d, \\|x\\| <= %d' % (vmax, xmax), grid, o, t)


def main():
    lib = lib_funcs(sys.argv[1] if len(sys.argv) > 1 else 'build/libtsmath.so')
    which = sys.argv[2:] or ['iv', 'pcfd']
    for name, rows in (('iv', iv_rows), ('pcfd', pcfd_rows)):
        if name in which:
            for r in rows(lib):
                print(r, flush=True)


if __name__ == '__main__':
    main()
