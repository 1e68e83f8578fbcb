#!/usr/bin/python3
"""Golden streams of the Wichmann-Hill source for the noise tests (tests/noise).

An implementation written from the generator's definition: three words, each
step s1 := 171 s1 mod 30269, s2 := 172 s2 mod 30307, s3 := 170 s3 mod 30323,
and the uniform is the fractional part of s1/30269 + s2/30307 + s3/30323, here
in exact rational arithmetic and rounded once to float64. Seeding: s1 := seed,
s2 := (seed 8191) and 0x3FFF, s3 := (s2 8191) and 0x3FFF, with 32-bit
products wrapping as two's complement and remainders taking the sign of the
dividend (a large seed can make s1 negative).

The 15-bit integer of a step is the fractional part by truncation times 32768,
truncated.

Regenerate: /usr/bin/python3 tools/golden/noise_golden.py > tests/data/noise_golden.txt

Line format, '#' starts a comment line:
    uniform SEED U1 .. U40     (hex floats)
    int15 SEED K1 .. K40
    words SEED S1 S2 S3        (the words after the 40 steps)
"""
from fractions import Fraction
import math

STEPS = 40
SEEDS = [1, 12345, 30268, 2000000000, 2147483647]


def wrap32(v):
    v &= 0xFFFFFFFF
    return v - (1 << 32) if v >= (1 << 31) else v


def cmod(a, m):
    r = abs(a) % m
    return -r if a < 0 else r


def seeded(seed):
    s2 = wrap32(seed * 8191) & 0x3FFF
    return [seed, s2, wrap32(s2 * 8191) & 0x3FFF]


def step(s):
    s[0] = cmod(wrap32(171 * s[0]), 30269)
    s[1] = cmod(wrap32(172 * s[1]), 30307)
    s[2] = cmod(wrap32(170 * s[2]), 30323)
    return Fraction(s[0], 30269) + Fraction(s[1], 30307) + Fraction(s[2], 30323)


def main():
    print("# Wichmann-Hill streams, exact rational reference; see tools/golden/noise_golden.py")
    for seed in SEEDS:
        s = seeded(seed)
        us = []
        for _ in range(STEPS):
            x = step(s)
            us.append(float(x - math.floor(x)).hex())
        print("uniform", seed, *us)
        print("words", seed, *s)
        s = seeded(seed)
        ks = []
        for _ in range(STEPS):
            x = step(s)
            ks.append(math.trunc((x - math.trunc(x)) * 32768))
        print("int15", seed, *ks)


main()
