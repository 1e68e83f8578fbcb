#!/usr/bin/python3
"""Golden values for the Bessel-family tests (tests/special_bessel).

mpmath at 40 digits. Arguments are random draws from fixed seeds, log-uniform
where the range is wide, plus the break points of the kernels and their
neighbours. Every float64 is written as a hex float (float.hex()).

Regenerate (Debian's python3 with python3-mpmath and python3-numpy):
    /usr/bin/python3 tools/golden/special_bessel_golden.py tests/data [airy kelvin kn struve]

Files, one case a line, whitespace-separated:
    special_bessel_airy.txt     x Ai Ai' Bi Bi'
    special_bessel_kelvin.txt   n x ber bei ker kei I_n(|x|)  (ker, kei 0 for x < 0)
    special_bessel_kn.txt       n x K_n(x)  (normal results only)
    special_bessel_struve.txt   v x H_v(x) envelope  (normal results only; the
                                envelope is sqrt(J_v^2 + Y_v^2) where x >= |v|
                                and H oscillates with Y_v, else |H_v|)
"""
import math
import os
import sys

import mpmath as mp
import numpy as np

mp.mp.dps = 40
rng = np.random.RandomState(20261124)


def hx(v):
    return float(v).hex()


def loguni(a, b, n, gen=None):
    return [float(v) for v in np.exp((gen or rng).uniform(math.log(a), math.log(b), n))]


def around(points):
    out = []
    for p in points:
        out += [math.nextafter(p, -math.inf), p, math.nextafter(p, math.inf)]
    return out


def write(dirname, name, header, rows):
    with open(os.path.join(dirname, 'special_bessel_%s.txt' % name), 'w') as f:
        f.write('# %s\n' % header)
        for r in rows:
            f.write(' '.join(hx(v) for v in r) + '\n')


def airy(dirname):
    xs = [float(v) for v in rng.uniform(-2.09, 2.09, 1500)]
    xs += loguni(2.09, 103.892, 1500)
    xs += [-v for v in loguni(2.09, 200.0, 2000)]
    xs += around([-2.09, 2.09, 8.3203353, 103.892]) + [0.0]
    rows = []
    for x in sorted(v for v in xs if v <= 103.892):  # above: the limits, tested apart
        m = mp.mpf(x)
        rows.append([x, mp.airyai(m), mp.airyai(m, 1), mp.airybi(m), mp.airybi(m, 1)])
    write(dirname, 'airy', 'x Ai Ai\' Bi Bi\'', rows)


KELVIN_ORDERS = (0, 1, 2, 3, 4, 5, 7, 10, 20, -1, -2, -3)


def kelvin(dirname):
    rows = []
    for n in KELVIN_ORDERS:
        xs = loguni(1e-6, 30.0, 300) + [-v for v in loguni(1e-3, 20.0, 60)] + [1.0, 2.0, 8.0]
        for x in sorted(xs):
            m = mp.mpf(x)
            kk = [mp.ker(n, m), mp.kei(n, m)] if x > 0 else [0, 0]
            rows.append([n, x, mp.re(mp.ber(n, m)), mp.re(mp.bei(n, m))] + kk + [mp.besseli(n, abs(m))])
    write(dirname, 'kelvin', 'n x ber bei ker kei I_n(|x|)', rows)


def kn(dirname):
    rows = []
    for n in (0, 1, 2, 3, 5, 10, 20, 50, 100, -1, -7):
        for x in sorted(loguni(1e-6, 700.0, 300) + around([2.0])):
            v = mp.besselk(n, mp.mpf(x))
            if 2.2250738585072014e-308 < v < 1.7976931348623157e308:
                rows.append([n, x, v])
    write(dirname, 'kn', 'n x K_n(x)', rows)


def struve_envelope(v, x, h):
    if x < abs(v):
        return abs(h)
    return max(abs(h), mp.hypot(mp.besselj(v, x), mp.bessely(v, x)))


def struve(dirname):
    g = np.random.RandomState(20261125)  # its own stream: regenerated alone
    pts = [(float(v), x) for v, x in zip(g.uniform(-20, 100, 1200), loguni(1e-3, 1e4, 1200, g))]
    pts += [(float(n), x) for n, x in zip(g.randint(-10, 60, 400), loguni(1e-3, 1e4, 400, g))]
    pts += [(float(v), x) for v in (0.0, 1.0, 2.5, 10.3) for x in around([18.0, 30.0])]
    pts += [(float(n), -x) for n, x in zip(g.randint(-5, 20, 100), loguni(1e-2, 100.0, 100, g))]
    pts += [(-(n + 0.5), x) for n, x in zip(g.randint(0, 15, 60), loguni(1e-2, 100.0, 60, g))]
    rows = []
    for v, x in pts:
        h = mp.struveh(v, mp.mpf(x))
        if 2.2250738585072014e-308 < abs(h) < 1.7976931348623157e308:
            rows.append([v, x, h, struve_envelope(v, abs(x), h)])
    write(dirname, 'struve', 'v x H_v(x) envelope', rows)


def main():
    dirname = sys.argv[1] if len(sys.argv) > 1 else 'tests/data'
    which = sys.argv[2:] or ['airy', 'kelvin', 'kn', 'struve']
    for name in which:
        globals()[name](dirname)


if __name__ == '__main__':
    main()
