#!/usr/bin/python3
"""Golden values for the descriptive statistics tests (tests/stats).

Writes data sets made from fixed seeds and the results expected of the
statistics entries to tests/data/stats_golden.txt. Every float64 is written as
a hex float (float.hex()), so nothing is lost on the way to the C++ test.

References are exact: sums, moments and mean squared errors in integer
arithmetic on the scaled binary values (every double is an integer times a
power of two) and rounded once to double; square roots by mpmath at 50 digits;
medians by sorting; histogram bins by rational arithmetic, with data redrawn
from the next seed if a sample lies within a few ulps of a bin edge (where the
float64 binning may rightly fall either way), and cross-checked with
numpy.histogram.

Regenerate (Debian's python3 with python3-numpy and python3-mpmath):
    /usr/bin/python3 tools/golden/stats_golden.py > tests/data/stats_golden.txt

Line format, whitespace-separated tokens, '#' starts a comment line:
    set NAME N x1 .. xN
    mean|median|rms|cxrms SET VALUE
    moment SET K VALUE
    mse XSET YSET VALUE
    hist SET BINS LOWER UPPER COUNT1..COUNTB CENTRE1..CENTREB
    mode SET INTERVALS M MODE1..MODEM
    genhist SET M (LOWER UPPER INCLUSION)*M COUNT1..COUNTM TOTAL BELOW ABOVE
"""
import math
import sys
from collections import Counter
from fractions import Fraction

import mpmath
import numpy as np

mpmath.mp.dps = 50
EPS = 2.220446049250313e-16
EDGE_MARGIN_ULPS = 64  # keep-out zone around a bin edge, in units of eps*bins


def hx(v):
    return float(v).hex()


# ---- exact arithmetic on doubles ---------------------------------------------

def scaled(xs):
    """Integers X and a power P with x = X / 2**P for every x."""
    fr = [Fraction(x) for x in xs]
    p = max(f.denominator.bit_length() - 1 for f in fr)
    return [f.numerator << (p - (f.denominator.bit_length() - 1)) for f in fr], p


def exact_mean(xs):
    X, p = scaled(xs)
    return Fraction(sum(X), len(xs) << p)


def exact_rms(xs, count):
    X, p = scaled(xs)
    ms = Fraction(sum(v * v for v in X), count << (2 * p))
    return float(mpmath.sqrt(mpmath.mpf(ms.numerator) / ms.denominator))


def exact_moment(xs, k):
    """(1/n) sum (x - mean)^k, the mean being exact."""
    X, p = scaled(xs)
    n, s = len(X), sum(X)
    d = sum((n * v - s) ** k for v in X)  # (x - mean) = (n X - S) / (n 2^p)
    return float(Fraction(d, n ** (k + 1) << (p * k)))


def exact_mse(xs, ys):
    m = min(len(xs), len(ys))
    D, p = scaled([v for pair in zip(xs[:m], ys[:m]) for v in pair])
    return float(Fraction(sum((D[2 * i] - D[2 * i + 1]) ** 2 for i in range(m)), m << (2 * p)))


def median(xs):
    s = sorted(xs)
    n = len(s)
    if n % 2:
        return s[n // 2]
    return float((Fraction(s[n // 2 - 1]) + Fraction(s[n // 2])) / 2)


# ---- histograms by rational bin arithmetic -------------------------------------

def bin_positions(xs, bins):
    """Exact position (s - lower) * bins / (upper - lower) of each sample."""
    lo, hi = Fraction(min(xs)), Fraction(max(xs))
    return [(Fraction(s) - lo) * bins / (hi - lo) for s in xs]


def near_edge(xs, bins):
    lo, hi = min(xs), max(xs)
    if lo == hi:
        return False
    margin = Fraction(EDGE_MARGIN_ULPS * bins) * Fraction(EPS)
    for s, t in zip(xs, bin_positions(xs, bins)):
        if s in (lo, hi):
            continue  # exact: the first bin, and the upper bound's rule
        if abs(t - round(t)) <= margin:
            return True
    return False


def exact_hist(xs, bins):
    lo, hi = min(xs), max(xs)
    counts = [0] * bins
    for t in bin_positions(xs, bins):
        counts[min(math.floor(t), bins - 1)] += 1
    w = (Fraction(hi) - Fraction(lo)) / bins
    centres = [float(Fraction(lo) + (b + Fraction(1, 2)) * w) for b in range(bins)]
    ref, _ = np.histogram(np.array(xs), bins=bins, range=(lo, hi))
    assert list(ref) == counts, "numpy.histogram disagrees away from the edges"
    return lo, hi, counts, centres


def exact_modes(xs):
    c = Counter(xs)
    best = max(c.values())
    return sorted(v for v, k in c.items() if k == best) if best > 1 else []


def binned_modes(xs, bins):
    lo, hi, counts, centres = exact_hist(xs, bins)
    best = max(counts)
    return [centres[b] for b in range(bins) if counts[b] == best] if best > 1 else []


# ---- general histogram by the definition of its intervals ---------------------

def inside(s, iv):
    lo, up, inc = iv
    if inc not in (0, 1, 2, 3):
        return True
    if math.isnan(s):
        return False
    lower_ok = s >= lo if inc in (0, 2) else s > lo
    upper_ok = s <= up if inc in (1, 2) else s < up
    return lower_ok and upper_ok


def below(s, iv):
    lo, _, inc = iv
    return not math.isnan(s) and (s < lo or (s == lo and inc in (1, 3)))


def general_hist(xs, ivs):
    counts = [0] * len(ivs)
    total = low = high = 0
    for s in xs:
        if ivs and not inside(s, ivs[0]) and below(s, ivs[0]):
            total += 1  # below the first interval: no later interval is tried
            low += 1
            continue
        hit = [inside(s, iv) for iv in ivs]
        for j, h in enumerate(hit):
            counts[j] += h
        if any(hit) or not ivs:
            continue
        total += 1
        if not below(s, ivs[-1]):
            high += 1  # beyond the last interval; between two intervals counts in the total only
    return counts, total, low, high


# ---- data sets ---------------------------------------------------------------

def draw(kind, n, seed, hist_bins=()):
    """Data of the given kind; the next seed while a sample sits on a bin edge."""
    while True:
        g = np.random.default_rng(seed)
        if kind == "normal":
            x = g.normal(0.0, 1.0, n)
        elif kind == "normal53":
            x = g.normal(3.0, 0.5, n)
        elif kind == "normal5":
            x = g.normal(5.0, 2.0, n)
        elif kind == "uniform":
            x = g.uniform(-1.0, 1.0, n)
        elif kind == "uniform10":
            x = g.uniform(0.0, 10.0, n)
        elif kind == "offset":  # large offset: sums and moments must survive cancellation
            x = 1e8 + g.normal(0.0, 1.0, n)
        elif kind == "wide":  # magnitudes from 1e-10 to 1e10, both signs
            x = g.choice([-1.0, 1.0], n) * 10.0 ** g.uniform(-10, 10, n)
        elif kind == "ties":  # small integers, many ties
            x = g.binomial(20, 0.5, n).astype(float)
        else:
            raise ValueError(kind)
        xs = [float(v) for v in x]
        if not any(near_edge(xs, b) for b in hist_bins):
            return xs
        seed += 1000


def main():
    out = sys.stdout
    out.write("# automatically generated by tools/golden/stats_golden.py, do not edit\n")
    out.write("# regenerate: /usr/bin/python3 tools/golden/stats_golden.py > tests/data/stats_golden.txt\n")

    hist_plan = {"u3": [1, 2], "n101": [1, 10], "u1000": [7, 64], "n10000": [25, 100], "ties500": [7], "wide": [3]}
    sets = {}
    for name, kind, n, seed in [
        ("n1", "normal", 1, 11), ("n2", "normal", 2, 12), ("u3", "uniform", 3, 13), ("n4", "normal53", 4, 14),
        ("n101", "normal5", 101, 15), ("u1000", "uniform10", 1000, 16), ("n10000", "normal", 10000, 17),
        ("off1001", "offset", 1001, 18), ("ties500", "ties", 500, 19), ("wide", "wide", 257, 20),
    ]:
        sets[name] = draw(kind, n, seed, hist_plan.get(name, ()))
    # A second offset set close to the first: the mean squared error of nearly equal data.
    g = np.random.default_rng(21)
    sets["off1001b"] = [float(v) for v in np.array(sets["off1001"]) + g.normal(0.0, 1e-3, 1001)]

    for name, xs in sets.items():
        out.write(f"set {name} {len(xs)}\n")
        for i in range(0, len(xs), 4):
            out.write(" ".join(hx(v) for v in xs[i:i + 4]) + "\n")

    for name, xs in sets.items():
        a = np.array(xs)
        mean = float(exact_mean(xs))
        rms = exact_rms(xs, len(xs))
        # numpy as a sanity check of the exact references, not as the reference
        assert math.isclose(mean, float(np.mean(a)), rel_tol=1e-9, abs_tol=1e-9 * float(np.mean(np.abs(a))))
        assert math.isclose(rms, float(np.sqrt(np.mean(a * a))), rel_tol=1e-12)
        assert median(xs) == float(np.median(a))
        out.write(f"mean {name} {hx(mean)}\n")
        out.write(f"median {name} {hx(median(xs))}\n")
        out.write(f"rms {name} {hx(rms)}\n")
        if len(xs) % 2 == 0:  # consecutive pairs as (re, im)
            out.write(f"cxrms {name} {hx(exact_rms(xs, len(xs) // 2))}\n")
        for k in range(1, 7):
            mk = exact_moment(xs, k)
            if len(xs) > 1 and k > 1:
                ref = float(np.mean((a - np.mean(a, dtype=np.longdouble)) ** k))
                assert abs(mk - ref) <= 1e-6 * float(np.mean(np.abs(a - np.mean(a)) ** k)), (name, k)
            out.write(f"moment {name} {k} {hx(mk)}\n")

    for xn, yn in [("n101", "u1000"), ("u1000", "n101"), ("n4", "u3"), ("off1001", "off1001b"),
                   ("u1000", "ties500"), ("wide", "n101"), ("n1", "n2")]:
        out.write(f"mse {xn} {yn} {hx(exact_mse(sets[xn], sets[yn]))}\n")

    for name, plan in hist_plan.items():
        for bins in plan:
            lo, hi, counts, centres = exact_hist(sets[name], bins)
            out.write(f"hist {name} {bins} {hx(lo)} {hx(hi)} " + " ".join(map(str, counts)) + " "
                      + " ".join(hx(c) for c in centres) + "\n")

    for name, intervals in [("ties500", 0), ("ties500", 7), ("ties500", 3), ("u1000", 0), ("n10000", 25),
                            ("n101", 10)]:
        modes = exact_modes(sets[name]) if intervals <= 0 else binned_modes(sets[name], intervals)
        out.write(f"mode {name} {intervals} {len(modes)} " + " ".join(hx(v) for v in modes) + "\n")

    for name, ivs in [
        ("ties500", [(5.0, 8.0, 0), (8.0, 10.0, 1), (9.0, 12.0, 2), (14.0, 16.0, 3), (16.0, 17.0, 2)]),
        ("ties500", [(10.0, 10.0, 2), (10.0, 11.0, 3), (3.0, 30.0, 0)]),
        ("n10000", [(-3.0, -1.0, 0), (-1.0, 1.0, 2), (0.5, 2.0, 3), (2.5, 10.0, 1)]),
    ]:
        counts, total, low, high = general_hist(sets[name], ivs)
        out.write(f"genhist {name} {len(ivs)} " + " ".join(f"{hx(l)} {hx(u)} {c}" for l, u, c in ivs) + " "
                  + " ".join(map(str, counts)) + f" {total} {low} {high}\n")


if __name__ == "__main__":
    main()
