#!/usr/bin/python3
"""Accuracy of the Bessel-family kernels on dense grids.

Calls the exported entries of libtsmath.so through ctypes and compares them,
and scipy.special on the same grid, with mpmath at 40 digits. Prints one
markdown row per kernel: grid, our max and median error, scipy's max and median.

Errors are relative to the function's envelope: for the oscillating side of
Airy (x < 0) the modulus sqrt(Ai^2 + Bi^2) (sqrt(Ai'^2 + Bi'^2) for the
derivatives); on (0, 2.09), where Ai and Ai' are a difference of terms of size
Bi/sqrt 3, that size.

Usage: /usr/bin/python3 tools/special/accuracy_bessel.py build/libtsmath.so
"""
import ctypes
import os
import sys

sys.path.insert(0, os.path.dirname(os.path.abspath(__file__)))
import mpmath as mp  # noqa: E402
import scipy.special as sc  # noqa: E402
from accuracy_integrals import call, err, logspace, row, with_breaks  # noqa: E402

mp.mp.dps = 40
D = ctypes.c_double
P = ctypes.POINTER(D)
TINY = 2.2250738585072014e-308


def lib_funcs(path):
    ctypes.CDLL(path.replace('libtsmath.so', 'host/libtsrt.so'), mode=ctypes.RTLD_GLOBAL)
    lib = ctypes.CDLL(path)
    lib.TS_Airy.argtypes = [D, P, P, P, P]
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


def main():
    lib = lib_funcs(sys.argv[1] if len(sys.argv) > 1 else 'build/libtsmath.so')
    for r in airy_rows(lib):
        print(r)


if __name__ == '__main__':
    main()
