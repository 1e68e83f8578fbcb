#!/usr/bin/python3
"""Generator of the straight-line DFT codelets and passes of the FFT engine.

Writes, for every radix N of the engine, transforms/generated/kwfft_rN.cpp with
the complex codelet kwfft_cx_codelet_N and the real codelet
kwfft_real_codelet_N (HalfComplex output) declared in
transforms/kwfft_codelets.h, and transforms/generated/kwfft_passes_rN.cpp with
the four passes of the radix (kwfft_cx_notw_N, kwfft_real_notw_N,
kwfft_cx_tw_N, kwfft_real_tw_N; see transforms/kwfft_passes.h), declared in
transforms/generated/kwfft_codelet_passes.h. It prints the operation counts it
measured against the budget of each radix and exits with status 1 if a
codelet exceeds its budget by more than 10 %, or if a codelet or pass body
fails its numerical check.

    /usr/bin/python3 tools/gen_codelets.py

Needs only the standard library and python3-mpmath.

How the code is made. A transform is written once, over complex values, as an
expression DAG whose nodes are the loads, two-operand additions and
multiplications by a positive constant; a reference to a node carries a sign,
so negations cost nothing until a value is stored. Building a node looks it up
first (common subexpressions are shared), and zeros, multiplications by 1 and
x - x vanish on the way. The real codelet is the same construction with the
imaginary inputs set to zero, keeping only what HalfComplex stores; what is not
reachable from a store is never emitted. A last pass chooses, for every
addition, whether it computes its value or its negative, so that no
subtraction needs an extra negation and every store takes a value as it is.

The passes loop over blocks (leaf passes) or positions (twiddle passes) around
the same DAG, with the loads of a twiddle pass multiplied by the twiddles of
their row as they are made; the real twiddle pass has two more bodies of its
own, for the pair of positions k, m - k and for the middle position (see Body).
The pass bodies are emitted in an order that keeps few values live (see
Body.schedule): GCC on x86-64 assigns registers about in the order of the
source, and with 16 registers a loads-first order spills heavily.

Methods, by radix:
  2, 4, 8, 16  split radix: the even outputs by the half-length transform of
               x[n] + x[n + N/2], the outputs 1 and 3 mod 4 by quarter-length
               transforms of (x[n] - x[n + N/2]) -/+ i (x[n + N/4] - x[n + 3N/4])
               rotated by exp(-2 pi i n / N) resp. exp(-6 pi i n / N); the
               rotations by odd multiples of pi/8 take three multiplications.
               With real input the outputs 3 mod 4 are conjugates of outputs
               1 mod 4 and are not computed.
  32           two radix-16 transforms of the even and odd samples and one
               radix-2 level with the 15 twiddles exp(-2 pi i k / 32).
  odd primes   the short prime form (below).
  9            the short form over the units modulo 9 (a length-3 cosine and
               sine convolution, whose residues modulo z - 1 and z + 1 vanish),
               with the samples 3 and 6 in the place of those residues, and a
               radix-3 short form on the sums over the residue classes mod 3.
  10, 14, 18   Good-Thomas 2 by m: the transforms A of the samples 0, 2, 4, ..
               and B of the samples m, m + 2, ... (mod 2m); X[k] = A[k mod m]
               + (-1)^k B[k mod m].

The short prime form for a prime p, L = (p - 1)/2 and a primitive root g:
s[j], d[j] = x[g^-j] +/- x[-g^-j]; X[0] = x[0] + sum s; with
R[k] = sum_j s[j] cos(2 pi g^(k-j) / p) (a cyclic convolution, modulo z^L - 1)
and S[k] = sum_j d[j] sin(2 pi g^(k-j) / p) (negacyclic, modulo z^L + 1),
X[g^k] = x[0] + R[k] - i S[k] and X[-g^k] = x[0] + R[k] + i S[k]. Each
convolution is split by the Chinese remainder theorem into its cyclotomic
factors, through a tensor form (z -> u (x) v1 (x) ..., one axis per prime power
of L; for z^L + 1 the 2-power axis is u^(2^a) + 1) whose axes are reduced by
sums and differences. The product modulo a factor of degree e is a linear
product of length e by Karatsuba (2 -> 3 products, a0 b0, a1 b1 and
(a0 - a1)(b0 - b1)) and Toom-3 (3 -> 5 products
at 0, 1, -1, +-2 and infinity) steps, nested over the axes of the factor: 1, 3, 9,
15, 27, 45 and 81 multiplications for e = 1, 2, 4, 6, 8, 12 and 16. The
convolution is used in its transposed form: the trilinear form
tau(h x w) (tau the constant coefficient) of the ring is symmetric, so that an
algorithm y = C (B h .* B x) for the product gives y = J B^T (mu .* (B x)) with
mu = C^T J h, B the reductions and evaluations, J: z^k -> z^-k. The data see
only sums, differences and the constant multiplications; the rational
reconstruction and interpolation go into the constants. The residue modulo z - 1
of the cosine side is x[0] - (sum s)/(p - 1), computed as X[0] + c0 sum s with
c0 = -p/(p - 1).
"""

import itertools
import math
import os
import random
import sys
import time
from decimal import Decimal
from fractions import Fraction

from mpmath import mp, mpf

mp.dps = 50
TINY = mpf(10) ** -40
PI = mp.pi

RADICES = (2, 3, 4, 5, 7, 8, 9, 10, 11, 13, 14, 16, 17, 18, 19, 29, 31, 32, 37, 41, 43)

# Budget per radix: complex adds, complex muls, real adds, real muls.
BUDGET = {
    2: (4, 0, 2, 0), 3: (12, 4, 4, 2), 4: (16, 0, 6, 0), 5: (34, 10, 13, 5), 7: (72, 16, 30, 8),
    8: (52, 4, 20, 2), 9: (88, 20, 36, 10), 10: (88, 20, 36, 10), 11: (168, 40, 74, 20),
    13: (188, 40, 82, 20), 16: (148, 20, 60, 10), 17: (274, 82, 121, 41), 19: (404, 76, 184, 38),
    29: (836, 160, 390, 80), 31: (776, 160, 358, 80), 37: (990, 190, 459, 95),
    41: (1140, 280, 530, 140), 43: (1440, 256, 678, 128),
}
# 14 and 18: the butterflies plus two codelets of radix 7 resp. 9.
for _r, _m, _n in ((14, 7, 14), (18, 9, 18)):
    BUDGET[_r] = (2 * _n + 2 * BUDGET[_m][0], 2 * BUDGET[_m][1], _n + 2 * BUDGET[_m][2], 2 * BUDGET[_m][3])

# Constants with a name of their own (by value); the others are named by role.
KNOWN_CONSTANTS = (
    ("kSqrtHalf", mp.sqrt(mpf(1) / 2)),
    ("kCosPi8", mp.cos(PI / 8)),
    ("kSinPi8", mp.sin(PI / 8)),
    ("kCosMinusSinPi8", mp.cos(PI / 8) - mp.sin(PI / 8)),
    ("kCosPlusSinPi8", mp.cos(PI / 8) + mp.sin(PI / 8)),
    ("kSqrt3Half", mp.sqrt(3) / 2),
    ("kHalf", mpf(1) / 2),
    ("kThreeHalves", mpf(3) / 2),
)


def const_key(c):
    return mp.nstr(abs(c), 30)


KNOWN_NAMES = {const_key(v): n for n, v in KNOWN_CONSTANTS}


# ---- expression DAG ---------------------------------------------------------


class Node:
    __slots__ = ("id", "op", "a", "b", "sb", "key", "hint", "where")

    def __init__(self, id_, op, a=None, b=None, sb=1, key=None, hint=None, where=None):
        self.id, self.op, self.a, self.b, self.sb = id_, op, a, b, sb
        self.key, self.hint, self.where = key, hint, where


class Expr:
    """A signed reference to a DAG node; the node None is the constant 0."""

    __slots__ = ("sign", "node")

    def __init__(self, sign, node):
        self.sign, self.node = sign, node

    def __neg__(self):
        return self if self.node is None else Expr(-self.sign, self.node)

    def __add__(self, other):
        return DAG.add(self, other)

    def __sub__(self, other):
        return DAG.add(self, -other)

    def is_zero(self):
        return self.node is None


ZERO = Expr(1, None)


class Dag:
    """Nodes: 'load'; 'add' a + sb*b with a.id <= b.id; 'mul' by a positive constant."""

    def __init__(self):
        self.nodes, self.table, self.consts = [], {}, {}

    def _node(self, ident, **kw):
        n = self.table.get(ident)
        if n is None:
            n = Node(len(self.nodes), ident[0], **kw)
            self.nodes.append(n)
            self.table[ident] = n
        return n

    def load(self, array, index):
        return Expr(1, self._node(("load", array, index), where=(array, index)))

    def add(self, x, y):
        if x.node is None:
            return y
        if y.node is None:
            return x
        if x.node is y.node and x.sign != y.sign:
            return ZERO
        if x.node.id > y.node.id:
            x, y = y, x
        sb = x.sign * y.sign
        n = self._node(("add", x.node.id, y.node.id, sb), a=x.node, b=y.node, sb=sb)
        return Expr(x.sign, n)

    def mul(self, c, x, hint):
        if x.node is None or abs(c) < TINY:
            return ZERO
        if abs(abs(c) - 1) < TINY:
            return x if c > 0 else -x
        key = const_key(c)
        self.consts.setdefault(key, abs(c))
        n = self._node(("mul", key, x.node.id), a=x.node, key=key, hint=hint)
        return Expr(x.sign if c > 0 else -x.sign, n)


DAG = Dag()


def sgn(s, v):
    return v if s > 0 else -v


# ---- linear programs of sums and differences ---------------------------------


class Prog:
    """A traced program of two-term signed sums: the data side of a convolution.

    Runs forward on any values with + and -, and transposed on DAG expressions."""

    def __init__(self, n_in):
        self.n_in = self.n_vars = n_in
        self.ops, self.outputs = [], []

    def inputs(self):
        return [Var(self, 1, i) for i in range(self.n_in)]

    def apply(self, xs):
        env = list(xs) + [None] * (self.n_vars - self.n_in)
        for d, ((s1, v1), (s2, v2)) in self.ops:
            env[d] = sgn(s1, env[v1]) + sgn(s2, env[v2])
        return [sgn(s, env[v]) for s, v in self.outputs]

    def apply_transposed(self, ys):
        adj = {}

        def acc(v, val):
            if not val.is_zero():
                adj[v] = adj[v] + val if v in adj else val

        for (s, v), y in zip(self.outputs, ys):
            acc(v, sgn(s, y))
        for d, terms in reversed(self.ops):
            a = adj.pop(d, None)
            if a is not None:
                for s, v in terms:
                    acc(v, sgn(s, a))
        return [adj.get(i, ZERO) for i in range(self.n_in)]


class Var:
    __slots__ = ("prog", "sign", "var")

    def __init__(self, prog, sign, var):
        self.prog, self.sign, self.var = prog, sign, var

    def __neg__(self):
        return Var(self.prog, -self.sign, self.var)

    def __add__(self, other):
        p = self.prog
        p.ops.append((p.n_vars, ((self.sign, self.var), (other.sign, other.var))))
        p.n_vars += 1
        return Var(p, 1, p.n_vars - 1)

    def __sub__(self, other):
        return self + (-other)


class Vec:
    """An integer row vector: runs the same code to get its matrix."""

    __slots__ = ("c",)

    def __init__(self, c):
        self.c = tuple(c)

    def __add__(self, o):
        return Vec(a + b for a, b in zip(self.c, o.c))

    def __sub__(self, o):
        return Vec(a - b for a, b in zip(self.c, o.c))

    def __neg__(self):
        return Vec(-a for a in self.c)


def unit_vectors(n):
    return [Vec(int(i == j) for j in range(n)) for i in range(n)]


# ---- polynomial products ------------------------------------------------------


def cyclotomic(n):
    """Coefficients of Phi_n, lowest first."""
    num = [-1] + [0] * (n - 1) + [1]
    for d in range(1, n):
        if n % d == 0:
            den = cyclotomic(d)
            q = [0] * (len(num) - len(den) + 1)
            for i in range(len(q) - 1, -1, -1):
                q[i] = num[i + len(den) - 1]
                for j, c in enumerate(den):
                    num[i + j] -= q[i] * c
            num = q
    return num


def remainder_matrix(f, m):
    """e x m matrix whose column k holds z^k mod f (f monic of degree e)."""
    e = len(f) - 1
    cols, cur = [], [1] + [0] * (e - 1)
    for _ in range(m):
        cols.append(cur[:])
        top = cur[-1]
        cur = [0] + cur[:-1]
        cur = [c - top * fc for c, fc in zip(cur, f[:e])]
    return [[cols[k][i] for k in range(m)] for i in range(e)]


def euler_phi(n):
    return sum(1 for k in range(1, n + 1) if math.gcd(k, n) == 1)


# Splits of a linear product of length e: Toom-3 first (it is the costly
# evaluation, and the later Karatsuba steps act on fewer, shorter blocks).
LINEAR_SPLITS = {1: (), 2: (2,), 3: (3,), 4: (2, 2), 6: (3, 2), 8: (2, 2, 2), 16: (2, 2, 2, 2)}

# Toom-3 evaluates at 0, 1, -1, t and infinity. The point t of each factor of
# degree 6 (Phi7 and Phi9 on their axis) and the Karatsuba form
# (a0 - a1)(b0 - b1) are the choices of smallest rounding error among t = +-2,
# +-1/2 and (a0 +/- a1)(b0 +/- b1), measured on the codelets of 19, 29, 37, 43.
TOOM_POINT = {7: -2, 9: 2}


def base_eval(k, a, t):
    if k == 2:
        return [a[0], a[1], a[0] - a[1]]
    e = a[0] + a[2]
    p1, m1 = e + a[1], e - a[1]
    u = (p1 if t > 0 else m1) + a[2]
    return [a[0], p1, m1, (u + u) - a[0], a[2]]  # a(0), a(1), a(-1), a(t), a(infinity)


def base_interp(k, t):
    if k == 2:
        return [[1, 0, 0], [1, 1, -1], [0, 1, 0]]
    v = [[0, 0, 0, 0, 1] if p is None else [p ** i for i in range(5)] for p in (0, 1, -1, t, None)]
    return fraction_inverse(v)


def linear_eval(splits, t, xs):
    """Evaluation side of a linear product: Kronecker product of the splits."""
    if not splits:
        return list(xs)
    k = splits[0]
    n = len(xs) // k
    outer = [base_eval(k, [xs[i * n + v] for i in range(k)], t) for v in range(n)]
    out = []
    for mo in range(len(outer[0])):
        out.extend(linear_eval(splits[1:], t, [outer[v][mo] for v in range(n)]))
    return out


def linear_interp(splits, t):
    """(2e - 1) x M matrix C with conv(a, b) = C (Ba .* Bb)."""
    if not splits:
        return [[Fraction(1)]]
    k = splits[0]
    co, ci = base_interp(k, t), linear_interp(splits[1:], t)
    n = math.prod(splits[1:])
    mo, mi = len(co[0]), len(ci[0])
    c = [[Fraction(0)] * (mo * mi) for _ in range(2 * k * n - 1)]
    for u in range(2 * k - 1):
        for v in range(2 * n - 1):
            for a in range(mo):
                if co[u][a]:
                    for b in range(mi):
                        c[n * u + v][a * mi + b] += co[u][a] * ci[v][b]
    return c


def fraction_inverse(a):
    n = len(a)
    m = [[Fraction(x) for x in row] + [Fraction(int(i == j)) for j in range(n)] for i, row in enumerate(a)]
    for c in range(n):
        p = next(r for r in range(c, n) if m[r][c] != 0)
        m[c], m[p] = m[p], m[c]
        pv = m[c][c]
        m[c] = [x / pv for x in m[c]]
        for r in range(n):
            if r != c and m[r][c] != 0:
                f = m[r][c]
                m[r] = [x - f * y for x, y in zip(m[r], m[c])]
    return [row[n:] for row in m]


class Linear:
    """The product modulo Phi_label on one axis: evaluation of a linear product
    of length e = deg Phi_label (M products), and C, its interpolation followed
    by the reduction modulo Phi_label (e x M), checked on random products."""

    def __init__(self, label):
        e = euler_phi(label)
        self.splits, self.t = LINEAR_SPLITS[e], TOOM_POINT.get(label, 2)
        b = [v.c for v in self.evaluate(unit_vectors(e))]
        c = linear_interp(self.splits, self.t)
        rng = random.Random(label)
        for _ in range(3):
            x = [rng.randint(-9, 9) for _ in range(e)]
            y = [rng.randint(-9, 9) for _ in range(e)]
            conv = [sum(x[i] * y[k - i] for i in range(e) if 0 <= k - i < e) for k in range(2 * e - 1)]
            bx = [sum(r[i] * x[i] for i in range(e)) for r in b]
            by = [sum(r[i] * y[i] for i in range(e)) for r in b]
            assert [sum(row[m] * bx[m] * by[m] for m in range(len(b))) for row in c] == conv, label
        self.c = [[mpf(x.numerator) / x.denominator for x in row]
                  for row in matmul(remainder_matrix(cyclotomic(label), 2 * e - 1), c)]
        self.e, self.m = e, len(b)
        prog = Prog(e)
        self.evaluate(prog.inputs())
        self.adds = len(prog.ops)

    def evaluate(self, xs):
        return linear_eval(self.splits, self.t, xs)


LINEAR = {}


def linear_for(label):
    if label not in LINEAR:
        LINEAR[label] = Linear(label)
    return LINEAR[label]


# ---- convolutions in the transposed CRT form --------------------------------------


def prime_factors(n):
    out, q = [], 2
    while n > 1:
        if n % q == 0:
            out.append(q)
            n //= q
        else:
            q += 1
    return out


class Conv:
    """y = h * x modulo z^L - sigma, for a fixed h, as y = J B^T (mu .* (B x))."""

    def __init__(self, length, sigma, h, hint):
        self.L, self.sigma, self.hint = length, sigma, hint
        two = 1
        while length % (2 * two) == 0:
            two *= 2
        self.axes = [("u", two)] if two > 1 or sigma < 0 else []
        for q in sorted(set(prime_factors(length // two))):
            qb = q
            while (length // two) % (qb * q) == 0:
                qb *= q
            self.axes.append(("v", qb))
        prog = Prog(length)
        comps = self._reduce(prog.inputs())
        outs, self.components = [], []
        for labels, degs, block in comps:
            outs.extend(self._evaluate(block, labels))
            self.components.append((labels, degs))
        prog.outputs = [(v.sign, v.var) for v in outs]
        self.prog = prog
        # The first component, when of degree 1 (the residue modulo z - 1, or
        # z + 1 for odd L), may take a value of the caller in place of its product.
        first_deg = math.prod(comps[0][1])
        self.slot = 0 if first_deg == 1 and (sigma > 0 or length % 2) else None
        self.mu = self._constants(h)

    # z^j -> sigma^(j div 2^a) u^(j mod 2^a) (x) v1^(j mod n1) (x) ...
    def _reduce(self, vals):
        shape = [n for _, n in self.axes]
        data = {}
        for j, v in enumerate(vals):
            if self.sigma < 0 and (j // shape[0]) % 2:
                v = -v
            data[tuple(j % n for n in shape)] = v
        layouts = []
        for ax, (kind, n) in enumerate(self.axes):
            new, layout = {}, None
            others = [range(m) if i != ax else [0] for i, m in enumerate(shape)]
            for pos in itertools.product(*others):
                fiber = [data[pos[:ax] + (i,) + pos[ax + 1:]] for i in range(n)]
                layout, off = [], 0
                for label, coeffs in reduce_axis(kind, n, self.sigma if kind == "u" else 1, fiber):
                    assert len(coeffs) == euler_phi(label)
                    layout.append((label, off, len(coeffs)))
                    for i, c in enumerate(coeffs):
                        new[pos[:ax] + (off + i,) + pos[ax + 1:]] = c
                    off += len(coeffs)
            data = new
            layouts.append(layout)
        comps = []
        for combo in itertools.product(*layouts):
            degs = tuple(d for _, _, d in combo)
            block = [data[tuple(off + j for (_, off, _), j in zip(combo, idx))]
                     for idx in itertools.product(*[range(d) for d in degs])]
            comps.append((tuple(label for label, _, _ in combo), degs, block))
        return comps

    @staticmethod
    def _order(labels):
        """Axis order of the nested evaluation with the fewest additions."""
        lins = [linear_for(label) for label in labels]
        best = None
        for order in itertools.permutations([i for i, lin in enumerate(lins) if lin.e > 1]):
            dims, cost = [lin.e for lin in lins], 0
            for ax in order:
                cost += lins[ax].adds * math.prod(dims) // dims[ax]
                dims[ax] = lins[ax].m
            if best is None or cost < best[0]:
                best = (cost, order)
        return best[1]

    def _evaluate(self, block, labels):
        shape, data = [euler_phi(label) for label in labels], list(block)
        for ax in self._order(labels):
            lin = linear_for(labels[ax])
            new_shape = shape[:]
            new_shape[ax] = lin.m
            new = [None] * math.prod(new_shape)
            others = [range(n) if i != ax else [0] for i, n in enumerate(shape)]
            for pos in itertools.product(*others):
                fiber = [data[flat(pos, ax, i, shape)] for i in range(shape[ax])]
                for i, v in enumerate(lin.evaluate(fiber)):
                    new[flat(pos, ax, i, new_shape)] = v
            shape, data = new_shape, new
        return data

    def _constants(self, h):
        length = self.L
        jh = [h[(-k) % length] if self.sigma > 0 else (h[0] if k == 0 else -h[length - k]) for k in range(length)]
        comps = self._reduce(unit_vectors(length))
        red = [v.c for _, _, block in comps for v in block]
        w = mp.lu_solve(mp.matrix([list(row) for row in red]).T, mp.matrix(jh))
        mu, pos = [], 0
        for (labels, degs, block) in comps:
            shape = list(degs)
            data = [w[pos + i] for i in range(len(block))]
            pos += len(block)
            for ax, label in enumerate(labels):
                lin = linear_for(label)
                new_shape = shape[:]
                new_shape[ax] = lin.m
                new = [mpf(0)] * math.prod(new_shape)
                others = [range(n) if i != ax else [0] for i, n in enumerate(shape)]
                for p in itertools.product(*others):
                    for mm in range(lin.m):
                        new[flat(p, ax, mm, new_shape)] = mp.fsum(
                            lin.c[j][mm] * data[flat(p, ax, j, shape)] for j in range(lin.e) if lin.c[j][mm])
                shape, data = new_shape, new
            mu.extend(data)
        # The whole identity J B^T diag(mu) B = H, in float64.
        bmat = [v.c for v in self.prog.apply(unit_vectors(length))]
        for j in range(length):
            t = [0.0] * length
            for m, row in enumerate(bmat):
                if row[j]:
                    f = float(mu[m]) * row[j]
                    for i in range(length):
                        t[i] += f * row[i]
            for k in range(length):
                got = t[(-k) % length] if self.sigma > 0 else (t[0] if k == 0 else -t[length - k])
                want = h[k - j] if k >= j else self.sigma * h[k - j + length]
                assert abs(got - float(want)) < 1e-12, (length, self.sigma, k, j)
        return mu

    def forward(self, xs):
        return self.prog.apply(xs)

    def backward(self, bx, slot=None):
        ys = [DAG.mul(mu, v, f"{self.hint}{m}") for m, (mu, v) in enumerate(zip(self.mu, bx))]
        if slot is not None:
            ys[self.slot] = slot
        t = self.prog.apply_transposed(ys)
        n = self.L
        if self.sigma > 0:
            return [t[(-k) % n] for k in range(n)]
        return [t[0]] + [-t[n - k] for k in range(1, n)]


def flat(pos, ax, i, shape):
    idx = 0
    for a, n in enumerate(shape):
        idx = idx * n + (i if a == ax else pos[a])
    return idx


def matmul(a, b):
    return [[sum(Fraction(a[i][k]) * b[k][j] for k in range(len(b))) for j in range(len(b[0]))] for i in range(len(a))]


def reduce_axis(kind, n, sigma, vals):
    """Residues of sum vals[i] w^i modulo the cyclotomic factors of w^n - sigma:
    a list of (l, coefficients of the residue modulo Phi_l(w))."""
    if n == 1:
        return [(1 if sigma > 0 else 2, list(vals))]
    if kind == "u":
        if sigma < 0:
            return [(2 * n, list(vals))]
        h = n // 2
        return (reduce_axis("u", h, 1, [a + b for a, b in zip(vals[:h], vals[h:])]) +
                [(n, [a - b for a, b in zip(vals[:h], vals[h:])])])
    q = prime_factors(n)[0]
    k = n // q
    blocks = [vals[t * k:(t + 1) * k] for t in range(q)]
    total = blocks[0]
    for b in blocks[1:]:
        total = [x + y for x, y in zip(total, b)]
    diffs = [x - y for t in range(q - 1) for x, y in zip(blocks[t], blocks[q - 1])]
    return reduce_axis("v", k, 1, total) + [(n, diffs)]


CONVS = {}


def conv_for(length, sigma, h, hint):
    key = (length, sigma, tuple(const_key(x) + ("-" if x < 0 else "") for x in h))
    if key not in CONVS:
        CONVS[key] = Conv(length, sigma, h, hint)
    return CONVS[key]


# ---- transforms over complex values (pairs of expressions) -----------------------


def cadd(x, y):
    return (x[0] + y[0], x[1] + y[1])


def csub(x, y):
    return (x[0] - y[0], x[1] - y[1])


def times_minus_i(x):
    return (x[1], -x[0])


def conj(x):
    return (x[0], -x[1])


def is_real(xs):
    return all(x[1].is_zero() for x in xs)


def rotate(x, k, n, gauss):
    """x exp(-2 pi i k / n); odd multiples of pi/4 by sqrt(1/2) after the sum, and
    with gauss the general rotations in three multiplications:
    c(a + b) - (c - s) b and c(a + b) - (c + s) a for (a + ib)(c - is)."""
    k %= n
    a, b = x
    if (8 * k) % n == 0:
        t = 8 * k // n
        if t % 2 == 0:
            for _ in range(t // 2):
                x = times_minus_i(x)
            return x
        sc = 1 if t in (1, 7) else -1
        ss = 1 if t in (1, 3) else -1
        return (DAG.mul(SQRT_HALF, sgn(sc, a) + sgn(ss, b), "kSqrtHalf"),
                DAG.mul(SQRT_HALF, sgn(sc, b) - sgn(ss, a), "kSqrtHalf"))
    c, s = mp.cos(2 * PI * k / n), mp.sin(2 * PI * k / n)
    angle = Fraction(2 * k, n)
    tag = f"{angle.numerator if angle.numerator > 1 else ''}Pi{angle.denominator}"
    if gauss and not a.is_zero() and not b.is_zero():
        k1 = DAG.mul(c, a + b, "kCos" + tag)
        return (k1 - DAG.mul(c - s, b, "kCosMinusSin" + tag), k1 - DAG.mul(c + s, a, "kCosPlusSin" + tag))
    return (DAG.mul(c, a, "kCos" + tag) + DAG.mul(s, b, "kSin" + tag),
            DAG.mul(c, b, "kCos" + tag) - DAG.mul(s, a, "kSin" + tag))


SQRT_HALF = mp.sqrt(mpf(1) / 2)


def dft_split_radix(xs):
    n = len(xs)
    if n == 1:
        return list(xs)
    if n == 2:
        return [cadd(xs[0], xs[1]), csub(xs[0], xs[1])]
    h, q = n // 2, n // 4
    real = is_real(xs)
    out = [None] * n
    for k, v in enumerate(dft_split_radix([cadd(xs[i], xs[i + h]) for i in range(h)])):
        out[2 * k] = v
    d = [csub(xs[i], xs[i + h]) for i in range(h)]
    e1 = [rotate(cadd(d[i], times_minus_i(d[i + q])), i, n, True) for i in range(q)]
    for j, v in enumerate(dft_split_radix(e1)):
        out[1 + 4 * j] = v
    if real:
        for j in range(q):
            out[3 + 4 * j] = conj(out[n - 3 - 4 * j])
    else:
        e3 = [rotate(csub(d[i], times_minus_i(d[i + q])), 3 * i, n, True) for i in range(q)]
        for j, v in enumerate(dft_split_radix(e3)):
            out[3 + 4 * j] = v
    return out


def dft_radix2_level(xs):
    n, h = len(xs), len(xs) // 2
    even, odd = dft(xs[0::2]), dft(xs[1::2])
    out = [None] * n
    for k in range(h):
        t = rotate(odd[k], k, n, False)
        out[k], out[k + h] = cadd(even[k], t), csub(even[k], t)
    return out


def primitive_root(p):
    return next(g for g in range(2, p) if all(pow(g, (p - 1) // q, p) != 1 for q in set(prime_factors(p - 1))))


def dft_prime(xs):
    p = len(xs)
    length, g = (p - 1) // 2, primitive_root(p)
    gi = pow(g, -1, p)
    idx = [pow(gi, j, p) for j in range(length)]
    s = [cadd(xs[i], xs[p - i]) for i in idx]
    d = [csub(xs[i], xs[p - i]) for i in idx]
    angles = [2 * PI * pow(g, i, p) / p for i in range(length)]
    cos_side = conv_for(length, 1, [mp.cos(a) for a in angles], "kCos")
    sin_side = conv_for(length, -1, [mp.sin(a) for a in angles], "kSin")
    c0 = -mpf(p) / (p - 1)
    x0, re_part, im_part = [], [], []
    for part in (0, 1):
        fw = cos_side.forward([v[part] for v in s])
        total = fw[cos_side.slot]
        x0.append(xs[0][part] + total)
        base = x0[part] + DAG.mul(c0, total, "kBase")
        re_part.append(cos_side.backward(fw, base))
        im_part.append(sin_side.backward(sin_side.forward([v[part] for v in d])))
    return assemble(p, g, tuple(x0), re_part, im_part)


def assemble(p, g, x0, r, s):
    """X[g^k] = R[k] - i S[k], X[-g^k] = R[k] + i S[k], over complex R and S."""
    out = [None] * p
    out[0] = x0
    for k in range(len(r[0])):
        m = pow(g, k, p)
        out[m] = (r[0][k] + s[1][k], r[1][k] - s[0][k])
        out[p - m] = (r[0][k] - s[1][k], r[1][k] + s[0][k])
    return out


def dft9(xs):
    g, gi = 2, 5
    idx = [pow(gi, j, 9) for j in range(3)]
    s = [cadd(xs[i], xs[9 - i]) for i in idx]
    d = [csub(xs[i], xs[9 - i]) for i in idx]
    angles = [2 * PI * pow(g, i, 9) / 9 for i in range(3)]
    cos_side = conv_for(3, 1, [mp.cos(a) for a in angles], "kCos")
    sin_side = conv_for(3, -1, [mp.sin(a) for a in angles], "kSin")
    sum1 = cadd(cadd(xs[1], xs[4]), xs[7])
    sum2 = cadd(cadd(xs[2], xs[5]), xs[8])
    p36, m36 = cadd(xs[3], xs[6]), csub(xs[3], xs[6])
    a, b = cadd(sum1, sum2), csub(sum1, sum2)
    x0 = cadd(cadd(xs[0], p36), a)
    rt3 = mp.sqrt(3) / 2
    half = mpf(1) / 2
    r, sn, base3 = [], [], []
    for part in (0, 1):
        base3.append(x0[part] - DAG.mul(3 * half, a[part], "kThreeHalves"))
        # x[0] + x[3] w^3m + x[6] w^6m = x[0] - (x[3] + x[6])/2 - i (sqrt(3)/2) chi(m) (x[3] - x[6])
        r.append(cos_side.backward(cos_side.forward([v[part] for v in s]),
                                   xs[0][part] - DAG.mul(half, p36[part], "kHalf")))
        sn.append(sin_side.backward(sin_side.forward([v[part] for v in d]), DAG.mul(rt3, m36[part], "kSqrt3Half")))
    out = assemble(9, g, x0, r, sn)
    b3 = (DAG.mul(rt3, b[0], "kSqrt3Half"), DAG.mul(rt3, b[1], "kSqrt3Half"))
    out[3] = (base3[0] + b3[1], base3[1] - b3[0])
    out[6] = (base3[0] - b3[1], base3[1] + b3[0])
    return out


def dft_good_thomas(xs):
    r = len(xs)
    m = r // 2
    a = dft([xs[(2 * t) % r] for t in range(m)])
    b = dft([xs[(m + 2 * t) % r] for t in range(m)])
    return [cadd(a[k % m], b[k % m]) if k % 2 == 0 else csub(a[k % m], b[k % m]) for k in range(r)]


def is_prime(n):
    return n > 1 and all(n % q for q in range(2, int(n ** 0.5) + 1))


def dft(xs):
    n = len(xs)
    if n & (n - 1) == 0:
        return dft_split_radix(xs) if n <= 16 else dft_radix2_level(xs)
    if n == 9:
        return dft9(xs)
    if is_prime(n):
        return dft_prime(xs)
    assert n % 4 == 2
    return dft_good_thomas(xs)


def method(r):
    if r in (2, 4, 8, 16):
        return ("split radix: the even outputs by the half-length transform, the outputs 1 and 3 mod 4 by "
                "quarter-length transforms after the rotations; rotations by odd multiples of pi/8 in three "
                "multiplications")
    if r == 32:
        return ("two radix-16 transforms of the even and odd samples, then one radix-2 level with the "
                "twiddles exp(-2 pi i k / 32)")
    if r == 9:
        return ("short form over the units mod 9: a cosine convolution modulo z^2 + z + 1 and a sine "
                "convolution modulo z^2 - z + 1 (their residues modulo z - 1 and z + 1 vanish), with "
                "x[0] - (x[3] + x[6])/2 and (sqrt(3)/2)(x[3] - x[6]) in their place; X[0], X[3], X[6] by the "
                "radix-3 short form over the sums of the residue classes mod 3")
    if r % 2 == 0:
        return f"Good-Thomas 2 by {r // 2}, no twiddles"
    length = (r - 1) // 2
    text = f"short prime form, primitive root {primitive_root(r)}"
    for sigma, side in ((1, "cosine"), (-1, "sine")):
        conv = next(c for (ln, sg, _), c in CONVS.items() if ln == length and sg == sigma)
        factors = " ".join(f"Phi{math.prod(labels)}" for labels, _ in conv.components)
        muls = " + ".join(str(math.prod(linear_for(label).m for label in labels)) for labels, _ in conv.components)
        text += f"; {side} side modulo z^{length} {'-' if sigma > 0 else '+'} 1 = {factors} (products: {muls})"
    return text + (f"; base X[0] - kBase (x[1] + ... + x[{r - 1}]) with kBase = {r}/{r - 1}; kCos and kSin: "
                   "the products of the two convolutions")


def comment_wrap(text, width=100):
    lines, cur = [], "//"
    for word in text.split():
        if len(cur) + 1 + len(word) > width:
            lines.append(cur)
            cur = "//  "
        cur += " " + word
    return lines + [cur]


# ---- bodies: build, fix signs, count, check ------------------------------------

# A body is one DFT of radix r as straight-line code: which inputs are real, and
# which outputs are stored where. Each store names the bin it holds, as
# (bin t, part 0 for Re or 1 for Im, sign).
#   cx    r complex inputs, all outputs: the complex codelet and passes.
#   real  r real inputs, HalfComplex outputs: the real codelet and leaf pass.
#   pair  the real twiddle pass at positions k and m - k, 0 < k < m/2. Output t
#         is bin q = k + t m of the block of r m; q < r m / 2 exactly when
#         2t < r, so the pattern is fixed: then Re X[t] goes to position k of
#         block t ("lo" slot t) and Im X[t] to position m - k of block r - 1 - t
#         ("hi" slot r - 1 - t); otherwise Re X[t] to hi slot r - 1 - t and
#         -Im X[t] to lo slot t.
#   mid   the middle position m/2 of the real twiddle pass for even m: x[0] is
#         real; for 2t + 1 < r Re X[t] goes to slot t and Im X[t] to slot
#         r - 1 - t, for 2t + 1 = r only Re X[t] to slot t; the rest is the
#         conjugate half, not stored.


class Body:
    def __init__(self, r, shape):
        global DAG
        DAG = Dag()
        self.r, self.shape = r, shape
        self.real = shape == "real"
        if shape == "real":
            xs = [(DAG.load("in", k), ZERO) for k in range(r)]
        elif shape == "mid":
            xs = [(DAG.load("in_re", 0), ZERO)] + [(DAG.load("in_re", k), DAG.load("in_im", k)) for k in range(1, r)]
        else:
            xs = [(DAG.load("in_re", k), DAG.load("in_im", k)) for k in range(r)]
        out = dft(xs)
        stores = []
        if shape == "real":
            stores = [("out", k, out[k][0], (k, 0, 1)) for k in range(r // 2 + 1)]
            stores += [("out", r - k, out[k][1], (k, 1, 1)) for k in range(1, (r + 1) // 2)]
            stores.sort(key=lambda t: t[1])
        elif shape == "cx":
            stores = [(arr, k, out[k][part], (k, part, 1))
                      for k in range(r) for part, arr in enumerate(("out_re", "out_im"))]
        elif shape == "pair":
            for t in range(r):
                if 2 * t < r:
                    stores += [("lo", t, out[t][0], (t, 0, 1)), ("hi", r - 1 - t, out[t][1], (t, 1, 1))]
                else:
                    stores += [("hi", r - 1 - t, out[t][0], (t, 0, 1)), ("lo", t, -out[t][1], (t, 1, -1))]
        else:
            for t in range((r + 1) // 2):
                stores.append(("mid", t, out[t][0], (t, 0, 1)))
                if 2 * t + 1 < r:
                    stores.append(("mid", r - 1 - t, out[t][1], (t, 1, 1)))
        self.stores = [(arr, k, e) for arr, k, e, _ in stores]
        self.wants = [w for _, _, _, w in stores]
        self.dag = DAG
        self.live = self._live()
        self._choose_signs()
        self.check()

    def _live(self):
        seen = set()
        stack = [e.node for _, _, e in self.stores]
        while stack:
            n = stack.pop()
            if n.id in seen:
                continue
            seen.add(n.id)
            stack.extend(c for c in (n.a, n.b) if c is not None)
        return [n for n in self.dag.nodes if n.id in seen]

    # Every addition may compute its value or its negative (flip 1); a
    # multiplication follows its operand. An addition whose two operands both
    # enter with a minus, and the store of a negated value, would cost a
    # negation each: a local search over the flips (WalkSAT-like, seeded, so
    # the output is reproducible) removes them.
    def _root(self, n):
        while n.op == "mul":
            n = n.a
        return n.id if n.op == "add" else None

    def _fsign(self, node):
        """Sign of the computed value of node relative to its value."""
        r = self._root(node)
        return -1 if r is not None and self.flip[r] else 1

    def _coeffs(self, n):
        own = -1 if self.flip[n.id] else 1
        return own * self._fsign(n.a), own * self._fsign(n.b) * n.sb

    def _choose_signs(self):
        self.flip = {n.id: 0 for n in self.live if n.op == "add"}
        cons = [("add", n, 1) for n in self.live if n.op == "add"]
        cons += [("store", e.node, e.sign) for _, _, e in self.stores]
        variables = []
        touches = {v: [] for v in self.flip}
        for ci, (kind, n, _) in enumerate(cons):
            vs = [self._root(n)] if kind == "store" else [n.id, self._root(n.a), self._root(n.b)]
            vs = sorted({v for v in vs if v is not None})
            variables.append(vs)
            for v in vs:
                touches[v].append(ci)

        def bad(ci):
            kind, n, s = cons[ci]
            if kind == "store":
                return s * self._fsign(n) < 0
            return max(self._coeffs(n)) < 0

        violated = {ci for ci in range(len(cons)) if bad(ci)}
        rng = random.Random(12345)
        best = (len(violated), dict(self.flip))
        for _ in range(20000):
            if not violated or not best[0]:
                break
            ci = rng.choice(sorted(violated))
            cand = []
            for v in variables[ci]:
                before = sum(1 for c in touches[v] if c in violated)
                self.flip[v] ^= 1
                cand.append((sum(1 for c in touches[v] if bad(c)) - before, rng.random(), v))
                self.flip[v] ^= 1
            if not cand:
                continue
            v = min(cand)[2] if rng.random() > 0.2 else rng.choice(cand)[2]
            self.flip[v] ^= 1
            for c in touches[v]:
                if bad(c):
                    violated.add(c)
                else:
                    violated.discard(c)
            if len(violated) < best[0]:
                best = (len(violated), dict(self.flip))
        self.negations, self.flip = best

    def counts(self):
        adds = sum(1 for n in self.live if n.op == "add") + self.negations
        muls = sum(1 for n in self.live if n.op == "mul")
        consts = len({n.key for n in self.live if n.op == "mul"})
        loads = sum(1 for n in self.live if n.op == "load")
        return adds, muls, consts, loads, len(self.stores)

    def run(self, inputs):
        """The emitted program on float inputs (dict (array, k) -> float)."""
        val = {}
        for n in self.live:
            if n.op == "load":
                val[n.id] = inputs[n.where]
            elif n.op == "mul":
                val[n.id] = float(self.dag.consts[n.key]) * val[n.a.id]
            else:
                sa, sb = self._coeffs(n)
                val[n.id] = sa * val[n.a.id] + sb * val[n.b.id]
        return {(arr, k): e.sign * self._fsign(e.node) * val[e.node.id] for arr, k, e in self.stores}

    def check(self):
        rng = random.Random(f"{self.r} {self.shape}")
        r = self.r
        for _ in range(2):
            x = [complex(rng.uniform(-1, 1), 0 if self.real else rng.uniform(-1, 1)) for _ in range(r)]
            if self.shape == "mid":
                x[0] = complex(x[0].real, 0)
            inputs = {}
            for k in range(r):
                if self.real:
                    inputs[("in", k)] = x[k].real
                else:
                    inputs[("in_re", k)], inputs[("in_im", k)] = x[k].real, x[k].imag
            got = self.run(inputs)
            for (arr, k, _), (t, part, sign) in zip(self.stores, self.wants):
                want = sum(x[u] * complex(math.cos(2 * math.pi * t * u / r), -math.sin(2 * math.pi * t * u / r))
                           for u in range(r))
                want = sign * (want.imag if part else want.real)
                if abs(got[(arr, k)] - want) > 1e-12 * r:
                    sys.exit(f"radix {r} {self.shape}: output {arr}[{k}] is wrong")

    # Stores write over the inputs of the same slot when a body runs in place.
    SLOT_LOADS = {"out_re": "in_re", "out_im": "in_im", "out": "in", "lo": "in_re", "hi": "in_im", "mid": "in_re"}

    def schedule(self, grouped):
        """An order of loads, operations and stores that keeps few values live,
        since GCC assigns registers about in the order of the source. List
        scheduling: take the ready operation that ends the most live values,
        ties going to the one whose operands were made last; when each ready
        operation would only add a value, load the inputs of the operation that
        needs the fewest new values instead, if that is cheaper. A store follows
        its value at once, but never precedes the load of its own slot. With
        grouped, x[j] (j > 0) is loaded as one (both parts, twiddled).

        Returns a list of ("load", key), ("op", node) and ("store", index)."""
        def ops(n):
            return () if n.op == "load" else tuple({n.a.id: 0, n.b.id: 0}) if n.op == "add" else (n.a.id,)

        byid = {n.id: n for n in self.live}
        cons = {n.id: [] for n in self.live}
        for n in self.live:
            for o in ops(n):
                cons[o].append(n)
        pending = {n.id: len(cons[n.id]) for n in self.live}
        stores_of = {}
        for i, (_, _, e) in enumerate(self.stores):
            pending[e.node.id] += 1
            stores_of.setdefault(e.node.id, []).append(i)
        load_of = {n.where: n.id for n in self.live if n.op == "load"}
        slot_load = [load_of.get((self.SLOT_LOADS[arr], k)) for arr, k, _ in self.stores]
        members = {}
        for n in self.live:
            if n.op == "load":
                arr, j = n.where
                key = ("x", j) if grouped and j > 0 and arr != "in" else n.where
                members.setdefault(key, []).append(n.id)
        group_of = {i: key for key, ids in members.items() for i in ids}

        seq, made, waiting, ready = [], {}, {}, set()

        def make(n):
            made[n.id] = len(made)
            for o in ops(n):
                pending[o] -= 1
            for c in cons[n.id]:
                if all(o in made for o in ops(c)):
                    ready.add(c.id)
            for i in stores_of.get(n.id, []):
                if slot_load[i] is None or slot_load[i] in made:
                    seq.append(("store", i))
                    pending[n.id] -= 1
                else:
                    waiting.setdefault(slot_load[i], []).append(i)
            for i in waiting.pop(n.id, []):
                seq.append(("store", i))
                pending[self.stores[i][2].node.id] -= 1

        def load(key):
            seq.append(("load", key))
            for i in members[key]:
                make(byid[i])

        left = sum(1 for n in self.live if n.op != "load")
        while left:
            best = None
            for i in ready:
                n = byid[i]
                cost = 1 - sum(1 for o in ops(n) if pending[o] == 1)
                rank = (cost, -max(made[o] for o in ops(n)), n.id)
                if best is None or rank < best[0]:
                    best = (rank, n)
            if best is None or best[0][0] > 0:
                cand = None
                for n in self.live:
                    if n.op == "load" or n.id in made or n.id in ready:
                        continue
                    missing = [o for o in ops(n) if o not in made]
                    if any(byid[o].op != "load" for o in missing):
                        continue
                    groups = {group_of[o] for o in missing}
                    cost = sum(len(members[g]) for g in groups) + 1 - sum(
                        1 for o in ops(n) if o in made and pending[o] == 1)
                    recent = max([made[o] for o in ops(n) if o in made] or [-1])
                    rank = (cost, -recent, n.id)
                    if cand is None or rank < cand[0]:
                        cand = (rank, groups)
                if cand is not None and (best is None or cand[0][0] < best[0][0]):
                    for g in sorted(cand[1]):
                        load(g)
                    continue
            seq.append(("op", best[1]))
            ready.discard(best[1].id)
            make(best[1])
            left -= 1
        assert not waiting and len([x for x in seq if x[0] == "store"]) == len(self.stores)
        return seq

    def emit_scheduled(self, names, load_lines, target, indent, grouped):
        """The body in the order of schedule(): load_lines(key) gives the lines
        of a load (or of a twiddled x[j]), target(array, k) a store's place."""
        lines, var, temps = [], {}, 0
        for n in self.live:
            if n.op == "load":
                var[n.id] = self.load_name(n)
        for kind, x in self.schedule(grouped):
            if kind == "load":
                lines += load_lines(x)
            elif kind == "store":
                arr, k, e = self.stores[x]
                s = e.sign * self._fsign(e.node)
                lines.append(f"{indent}{target(arr, k)} = {'' if s > 0 else '-'}{var[e.node.id]};")
            else:
                n = x
                var[n.id] = f"t{temps}"
                temps += 1
                if n.op == "mul":
                    rhs = f"{names[n.key]} * {var[n.a.id]}"
                else:
                    sa, sb = self._coeffs(n)
                    a, b = var[n.a.id], var[n.b.id]
                    rhs = {(1, 1): f"{a} + {b}", (1, -1): f"{a} - {b}", (-1, 1): f"{b} - {a}",
                           (-1, -1): f"-({a} + {b})"}[(sa, sb)]
                lines.append(f"{indent}const double {var[n.id]} = {rhs};")
        return lines

    def load_name(self, n):
        arr, k = n.where
        return f"x{k}" if arr == "in" else f"x{k}{arr[-2]}"

    def emit_core(self, names, target, indent):
        """The arithmetic and the stores, after the loads into x<k>, x<k>r, x<k>i."""
        lines, var, temps = [], {}, 0
        for n in self.live:
            if n.op == "load":
                var[n.id] = self.load_name(n)
                continue
            var[n.id] = f"t{temps}"
            temps += 1
            if n.op == "mul":
                rhs = f"{names[n.key]} * {var[n.a.id]}"
            else:
                sa, sb = self._coeffs(n)
                a, b = var[n.a.id], var[n.b.id]
                rhs = {(1, 1): f"{a} + {b}", (1, -1): f"{a} - {b}", (-1, 1): f"{b} - {a}",
                       (-1, -1): f"-({a} + {b})"}[(sa, sb)]
            lines.append(f"{indent}const double {var[n.id]} = {rhs};")
        for arr, k, e in self.stores:
            s = e.sign * self._fsign(e.node)
            lines.append(f"{indent}{target(arr, k)} = {'' if s > 0 else '-'}{var[e.node.id]};")
        return lines

    def live_loads(self):
        return {n.where for n in self.live if n.op == "load"}

    def emit(self, names):
        """The codelet: loads at stride is, stores at stride os."""
        r = self.r
        if self.real:
            head = f"void kwfft_real_codelet_{r}(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os) {{"
        else:
            head = (f"void kwfft_cx_codelet_{r}(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im,\n"
                    + " " * (len(f"void kwfft_cx_codelet_{r}(")) + "std::ptrdiff_t is, std::ptrdiff_t os) {")
        lines = [head]
        for n in self.live:
            if n.op == "load":
                arr, k = n.where
                lines.append(f"  const double {self.load_name(n)} = {arr}[{index(k, 'is')}];")
        lines += self.emit_core(names, lambda arr, k: f"{arr}[{index(k, 'os')}]", "  ")
        lines.append("}")
        return lines


def index(k, stride):
    return "0" if k == 0 else stride if k == 1 else f"{k} * {stride}"


def decimal17(c):
    d = Decimal(mp.nstr(c, 45))
    d = d.quantize(Decimal(1).scaleb(d.adjusted() - 16))
    text = format(d, "f") if -5 <= d.adjusted() < 17 else format(d, ".16e")
    return text


def constant_names(bodies):
    names, used = {}, set()
    for cl in bodies:
        for n in cl.live:
            if n.op == "mul" and n.key not in names:
                name = n.hint if n.hint == "kBase" else KNOWN_NAMES.get(n.key, n.hint)
                base, i = name, 2
                while name in used:
                    name = f"{base}_{i}"
                    i += 1
                names[n.key] = name
                used.add(name)
    return names


def natural(name):
    stem = name.rstrip("0123456789")
    return (stem, int(name[len(stem):] or -1))


COMMAND = "/usr/bin/python3 tools/gen_codelets.py"
GENERATED_HEAD = [
    "// automatically generated, do not edit",
    f"// regenerate from the repository root with: {COMMAND}",
]


def constant_lines(names, consts):
    if not names:
        return []
    lines = ["namespace {", ""]
    for key, name in sorted(names.items(), key=lambda kv: natural(kv[1])):
        lines.append(f"constexpr double {name} = {decimal17(consts[key])};")
    return lines + ["", "}  // namespace"]


def write_file(path, r, cx, re_):
    names = constant_names((cx, re_))
    consts = cx.dag.consts | re_.dag.consts
    lines = GENERATED_HEAD + [
        "//",
        f"// DFT of length {r}, X[k] = sum_t x[t] exp(-2 pi i k t / {r}), unscaled.",
    ]
    lines += comment_wrap(f"Method: {method(r)}.")
    lines += [
        "//",
        "// Operations measured by the generator (additions include subtractions and",
        "// negations; constants are the distinct multipliers):",
    ]
    for cl in (cx, re_):
        a, m, c, ld, st = cl.counts()
        fn = f"kwfft_{'real' if cl.real else 'cx'}_codelet_{r}"
        lines.append(f"//   {fn:<24} {a:5d} additions {m:4d} multiplications {c:4d} constants "
                     f"{ld:3d} loads {st:3d} stores")
    lines += ["", "#include <cstddef>", "", '#include "transforms/kwfft_codelets.h"', "", "namespace tsm {"]
    lines += constant_lines(names, consts)
    lines.append("")
    lines += cx.emit(names)
    lines.append("")
    lines += re_.emit(names)
    lines += ["", "}  // namespace tsm", ""]
    with open(path, "w") as fh:
        fh.write("\n".join(lines))


# ---- passes: the bodies in loops over blocks and positions ---------------------

# Signatures of the four passes (those of transforms/kwfft_passes.h).
def pass_signatures(r):
    sig = {
        "cx_notw": "(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is, "
                   "std::ptrdiff_t os, int32 count)",
        "real_notw": "(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count)",
        "cx_tw": "(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m)",
        "real_tw": "(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m)",
    }
    return [(f"kwfft_{kind}_{r}", args) for kind, args in sig.items()]


def declaration(name, args, tail, width=118):
    """void name(args)tail, wrapped after a comma with the arguments aligned."""
    first = f"void {name}("
    lines, cur = [], first
    for i, part in enumerate(args[1:-1].split(", ")):
        piece = part + (", " if i < args.count(",") else ")" + tail)
        if len(cur) + len(piece.rstrip()) > width and cur.strip() != first.strip():
            lines.append(cur.rstrip())
            cur = " " * len(first)
        cur += piece
    return lines + [cur]


def twiddled_load(body, at, row, indent):
    """Lines of one load of a twiddle pass: x[0] as it is, x[j] (key ("x", j))
    times the twiddle j - 1 of the row: (a + i b)(c + i d), d the stored
    negative sine; in the middle body x[j] = a is real."""
    live = body.live_loads()

    def lines(key):
        arr, j = key
        if arr != "x":
            part = 0 if arr == "in_re" else 1
            return [f"{indent}const double x0{'ri'[part]} = {at(part, 0)};"]
        want_re, want_im = ("in_re", j) in live, ("in_im", j) in live
        if body.shape == "mid":
            out = [f"{indent}const double a{j} = {at(0, j)};"]
            if want_re:
                out.append(f"{indent}const double x{j}r = a{j} * {row[0]}[{j - 1}];")
            if want_im:
                out.append(f"{indent}const double x{j}i = a{j} * {row[1]}[{j - 1}];")
            return out
        out = [f"{indent}const double a{j} = {at(0, j)}, b{j} = {at(1, j)};",
               f"{indent}const double c{j} = {row[0]}[{j - 1}], d{j} = {row[1]}[{j - 1}];"]
        if want_re:
            out.append(f"{indent}const double x{j}r = a{j} * c{j} - b{j} * d{j};")
        if want_im:
            out.append(f"{indent}const double x{j}i = a{j} * d{j} + b{j} * c{j};")
        return out
    return lines


def pass_counts(body, twiddled):
    """Additions, multiplications, loads (data and twiddles) and stores of one
    iteration of a pass around body."""
    a, m, _, ld, st = body.counts()
    if twiddled:
        live = body.live_loads()
        for j in range(1, body.r):
            parts = (("in_re", j) in live) + (("in_im", j) in live)
            if body.shape == "mid":  # one real load a times the twiddle loads c, d
                m, ld = m + parts, ld + (parts > 0)
            else:
                a, m, ld = a + parts, m + 2 * parts, ld + 2
    return a, m, ld, st


def write_pass_file(path, r, cx, re_, pair, mid):
    names = constant_names((cx, re_, pair, mid))
    consts = cx.dag.consts | re_.dag.consts | pair.dag.consts | mid.dag.consts
    rows = [
        (f"kwfft_cx_notw_{r}", "per block", pass_counts(cx, False)),
        (f"kwfft_real_notw_{r}", "per block", pass_counts(re_, False)),
        (f"kwfft_cx_tw_{r}", "per position k > 0", pass_counts(cx, True)),
        (f"kwfft_real_tw_{r}", "per pair k, m - k", pass_counts(pair, True)),
        (f"kwfft_real_tw_{r}", "middle, even m", pass_counts(mid, True)),
    ]
    lines = GENERATED_HEAD + [
        "//",
        f"// The four passes of radix {r} (see transforms/kwfft_passes.h): the DFT bodies",
        f"// of kwfft_r{r}.cpp in loops over blocks (leaf passes) and positions (twiddle",
        "// passes), with the twiddle products taken as the values are loaded.",
        "//",
        "// Operations measured by the generator, per iteration (twiddle products",
        "// included; loads include the twiddles):",
    ]
    for fn, what, (a, m, ld, st) in rows:
        lines.append(f"//   {fn:<19} {what:<19} {a:5d} additions {m:4d} multiplications "
                     f"{ld:3d} loads {st:3d} stores")
    lines += ["", "#include <cstddef>", "", '#include "transforms/generated/kwfft_codelet_passes.h"',
              '#include "transforms/kwfft_codelets.h"', "", "namespace tsm {"]
    lines += constant_lines(names, consts)
    sigs = dict((name.split("_", 1)[1].rsplit("_", 1)[0], (name, args)) for name, args in pass_signatures(r))
    w = r - 1
    ind = "    "

    def plain(arr):
        return lambda a, k: f"{arr}[{index(k, 'os')}]"

    # Leaf passes: block i reads at in + i is with stride is * count and writes
    # r outputs at out + i r os.
    name, args = sigs["cx_notw"]
    lines += [""] + declaration(name, args, " {") + [
        "  const std::ptrdiff_t s = is * count;",
        f"  for (int32 i = 0; i < count; ++i, in_re += is, in_im += is, out_re += {r} * os, out_im += {r} * os) {{",
    ]
    lines += cx.emit_scheduled(names, lambda key: [f"{ind}const double x{key[1]}{key[0][-2]} = "
                                                   f"{key[0]}[{index(key[1], 's')}];"],
                               lambda arr, k: f"{arr}[{index(k, 'os')}]", ind, False) + ["  }", "}"]

    name, args = sigs["real_notw"]
    lines += [""] + declaration(name, args, " {") + [
        "  const std::ptrdiff_t s = is * count;",
        f"  for (int32 i = 0; i < count; ++i, in += is, out += {r} * os) {{",
    ]
    lines += re_.emit_scheduled(names, lambda key: [f"{ind}const double x{key[1]} = in[{index(key[1], 's')}];"],
                                lambda arr, k: f"out[{index(k, 'os')}]", ind, False) + ["  }", "}"]

    # Complex twiddle pass: position 0 by the codelet, then position k of the
    # r blocks (s apart) with the twiddles of row k.
    name, args = sigs["cx_tw"]
    lines += [""] + declaration(name, args, " {") + [
        "  const std::ptrdiff_t s = stride * m;",
        f"  kwfft_cx_codelet_{r}(re, im, re, im, s, s);",
        "  const f64* wc = tw_cos;",
        "  const f64* ws = tw_sin;",
        f"  for (int32 k = 1; k < m; ++k, wc += {w}, ws += {w}) {{",
        f"{ind}f64* const pr = re + k * stride;",
        f"{ind}f64* const pi = im + k * stride;",
    ]
    lines += cx.emit_scheduled(
        names, twiddled_load(cx, lambda part, j: f"{('pr', 'pi')[part]}[{index(j, 's')}]", ("wc", "ws"), ind),
        lambda arr, k: f"{'pr' if arr == 'out_re' else 'pi'}[{index(k, 's')}]", ind, True)
    lines += ["  }", "}"]

    # Real twiddle pass over r HalfComplex blocks of m: position 0 by the real
    # codelet; the pair k, m - k holds complex element j as (position k,
    # position m - k) of block j; the middle position of an even m holds real
    # values.
    name, args = sigs["real_tw"]
    lines += [""] + declaration(name, args, " {") + [
        "  const std::ptrdiff_t s = stride * m;",
        f"  kwfft_real_codelet_{r}(data, data, s, s);",
        "  const f64* wc = tw_cos;",
        "  const f64* ws = tw_sin;",
        f"  for (int32 k = 1; 2 * k < m; ++k, wc += {w}, ws += {w}) {{",
        f"{ind}f64* const lo = data + k * stride;",
        f"{ind}f64* const hi = data + (m - k) * stride;",
    ]
    lines += pair.emit_scheduled(
        names, twiddled_load(pair, lambda part, j: f"{('lo', 'hi')[part]}[{index(j, 's')}]", ("wc", "ws"), ind),
        lambda arr, k: f"{arr}[{index(k, 's')}]", ind, True)
    lines += ["  }", "  if (m % 2 == 0) {",
              f"{ind}f64* const mid = data + (m / 2) * stride;",
              f"{ind}const f64* const wc_mid = tw_cos + static_cast<std::ptrdiff_t>(m / 2 - 1) * {w};",
              f"{ind}const f64* const ws_mid = tw_sin + static_cast<std::ptrdiff_t>(m / 2 - 1) * {w};"]
    lines += mid.emit_scheduled(
        names, twiddled_load(mid, lambda part, j: f"mid[{index(j, 's')}]", ("wc_mid", "ws_mid"), ind),
        lambda arr, k: f"mid[{index(k, 's')}]", ind, True)
    lines += ["  }", "}", "", "}  // namespace tsm", ""]
    with open(path, "w") as fh:
        fh.write("\n".join(lines))
    return rows


def write_pass_header(path):
    lines = GENERATED_HEAD + [
        "//",
        "// The passes of every radix with codelets, generated into kwfft_passes_rN.cpp:",
        "// for radix N, kwfft_cx_notw_N, kwfft_real_notw_N, kwfft_cx_tw_N and",
        "// kwfft_real_tw_N, with the signatures and meaning of CxNotwPass, RealNotwPass,",
        "// CxTwPass and RealTwPass (transforms/kwfft_passes.h).",
        "#pragma once",
        "",
        "#include <cstddef>",
        "",
        '#include "frame/types.h"',
        "",
        "namespace tsm {",
    ]
    for r in RADICES:
        lines.append("")
        for name, args in pass_signatures(r):
            lines += declaration(name, args, ";")
    lines += ["", "}  // namespace tsm", ""]
    with open(path, "w") as fh:
        fh.write("\n".join(lines))


def main():
    start = time.time()
    root = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))
    outdir = os.path.join(root, "transforms", "generated")
    os.makedirs(outdir, exist_ok=True)
    rows, over, pass_rows = [], [], []
    for r in RADICES:
        cx, re_ = Body(r, "cx"), Body(r, "real")
        write_file(os.path.join(outdir, f"kwfft_r{r}.cpp"), r, cx, re_)
        pair, mid = Body(r, "pair"), Body(r, "mid")
        pass_rows.append((r, write_pass_file(os.path.join(outdir, f"kwfft_passes_r{r}.cpp"), r, cx, re_, pair, mid)))
        ca, cm, cc, _, _ = cx.counts()
        ra, rm, rc, _, _ = re_.counts()
        budget = BUDGET.get(r)
        rows.append((r, (ca, cm, ra, rm), budget, rc, cx.negations + re_.negations))
        if budget:
            for got, want, what in zip((ca, cm, ra, rm), budget, ("cx adds", "cx muls", "real adds", "real muls")):
                if got > want * 1.1:
                    over.append(f"radix {r}: {what} {got} > 110% of {want}")
    write_pass_header(os.path.join(outdir, "kwfft_codelet_passes.h"))
    print("radix   cx adds   (budget)  cx muls  (budget)  real adds (budget)  real muls (budget)  consts  negations")
    for r, got, budget, consts, negs in rows:
        cells = []
        for i, g in enumerate(got):
            cells.append(f"{g:6d} ({budget[i]:5d})" if budget else f"{g:6d} (    -)")
        print(f"{r:5d}  " + "   ".join(cells) + f"  {consts:6d}  {negs:4d}")
    print("\nradix   adds/muls per iteration: cx tw      real tw pair    real tw middle")
    for r, prow in pass_rows:
        print(f"{r:5d}  " + "".join(f"{a:14d}/{m:<4d}" for _, _, (a, m, _, _) in prow[2:]))
    print(f"generated {2 * len(RADICES) + 1} files in {outdir} in {time.time() - start:.1f} s")
    if over:
        print("\n".join(over))
        sys.exit(1)


if __name__ == "__main__":
    main()
