#!/usr/bin/python3
"""Golden values for the Bessel I and parabolic cylinder tests (tests/special_bessel_i).

mpmath at 40 digits. Arguments are random draws from a fixed seed, log-uniform
where the range is wide, plus the break points of the kernels and their
neighbours. Every float64 is written as a hex float (float.hex()).

Regenerate (Debian's python3 with python3-mpmath and python3-numpy):
    /usr/bin/python3 tools/golden/special_bessel_i_golden.py tests/data

Files, one case a line, whitespace-separated (normal results only):
    special_bessel_i_iv.txt     v x I_v(x) envelope
    special_bessel_i_pcfd.txt   v x D_v(x) envelope

The envelope is the scale an error is judged against. I_v: |I_v| itself, and
for a negative non-integer order, whose I_v has zeros, I_|v| + (2/pi)
|sin(pi v)| K_|v| (the two terms of I_-u = I_u + (2/pi) sin(pi u) K_u).
D_v: |D_v| where it is monotone; for x < 0 the sum of the magnitudes of the
two terms of D_v(-x) = cos(pi v) D_v(x) + pi/Gamma(-v) V(-v-1/2, x); in the
oscillating region x^2 < 4v + 2 also the largest |D_v| within half a local
period, pi/k with k = sqrt(v + 1/2 - x^2/4) (at most 1), of x.
"""
import math
import os
import sys

import mpmath as mp
import numpy as np

sys.path.insert(0, os.path.dirname(os.path.abspath(__file__)))
from special_bessel_golden import around, hx  # noqa: E402

mp.mp.dps = 40
rng = np.random.RandomState(20261123)
TINY, HUGE = 2.2250738585072014e-308, 1.7976931348623157e308


def write(dirname, name, header, rows):
    with open(os.path.join(dirname, 'special_bessel_i_%s.txt' % name), 'w') as f:
        f.write('# %s\n' % header)
        for r in rows:
            f.write(' '.join(hx(v) for v in r) + '\n')


def iv_envelope(v, x, ref):
    if v < 0 and v != math.floor(v):
        u = -mp.mpf(v)
        return mp.besseli(u, x) + 2 / mp.pi * abs(mp.sinpi(u)) * mp.besselk(u, x)
    return abs(ref)


def iv(dirname):
    pts = []
    orders = [float(v) for v in rng.uniform(-50, 100, 60)] + [float(v) for v in rng.uniform(-5, 10, 30)]
    orders += [0.0, 1.0, 2.0, 7.0, 30.0, 100.0, -1.0, -13.0, -50.0, 0.5, -0.5, -2.5]
    for v in orders:
        xs = [float(x) for x in np.exp(rng.uniform(math.log(1e-6), math.log(720.0), 30))]
        xs += around([2.0, 20.0] + ([v * v / 2] if 20 < v * v / 2 < 720 else []))
        if v == math.floor(v):
            xs += [-x for x in xs[:10]]
        pts += [(v, x) for x in xs]
    big = [float(v) for v in rng.uniform(100, 1000, 300)]
    pts += [(v, float(x)) for v, x in zip(big, np.exp(rng.uniform(0, math.log(1e4), 300)))]
    rows = []
    for v, x in pts:
        ref = mp.re(mp.besseli(v, x, zeroprec=1200, infprec=1200))
        if TINY < abs(ref) < HUGE:
            rows.append([v, x, ref, iv_envelope(v, x, ref)])
    write(dirname, 'iv', 'v x I_v(x) envelope', rows)


def pcfd_envelope(v, x, ref):
    env = abs(ref)
    if x < 0 and not (v >= 0 and v == math.floor(v)):
        m = mp.mpf(-x)
        env = abs(mp.cospi(v) * mp.pcfd(v, m)) + abs(mp.pi / mp.gamma(-v) * mp.pcfv(-v - 0.5, m))
    if x * x < 4 * v + 2:
        k = mp.sqrt(v + 0.5 - mp.mpf(x) ** 2 / 4)
        w = min(mp.pi / k, 1)
        env = max([env] + [abs(mp.pcfd(v, x + w * t / 8)) for t in range(-8, 9)])
    return env


def pcfd(dirname):
    pts = [(float(v), float(x)) for v, x in zip(rng.uniform(-30, 30, 2000), rng.uniform(-30, 30, 2000))]
    pts += [(float(v), float(x)) for v, x in zip(rng.uniform(-3, 3, 500), rng.uniform(-10, 10, 500))]
    pts += [(float(v), float(x)) for v, x in zip(rng.uniform(-100, 100, 300), rng.uniform(-60, 60, 300))]
    near = [n + d for n in (0, 1, 2, 5, 12, 29) for d in (-1e-9, 1e-12, 1e-6, 0.5)] + [-7.0, -1.0, -0.5]
    for v in [float(n) for n in range(0, 31, 3)] + near:
        pts += [(v, float(x)) for x in rng.uniform(-30, 30, 25)]
        pts += [(v, x) for x in around([7.0, -7.0]) + [0.0, -2.0, 2.0]]
    rows = []
    for v, x in pts:
        ref = mp.pcfd(v, x)
        if TINY < abs(ref) < HUGE:
            rows.append([v, x, ref, pcfd_envelope(v, x, ref)])
    write(dirname, 'pcfd', 'v x D_v(x) envelope', rows)


def main():
    dirname = sys.argv[1] if len(sys.argv) > 1 else 'tests/data'
    iv(dirname)
    pcfd(dirname)


if __name__ == '__main__':
    main()
