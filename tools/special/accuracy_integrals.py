#!/usr/bin/python3
"""Accuracy of the integral, elliptic and dilogarithm kernels on dense grids.

Calls the exported entries of libtsmath.so through ctypes and compares them,
and scipy.special on the same grid, with mpmath at 40 digits. Prints one
markdown row per kernel: grid, our max and median error, scipy's max and median.

Errors are relative, except: Ci and Chi near their zeros are measured against
the envelope max(|f|, min(1, 1/x)) resp. max(|f|, 1); the Jacobi functions
sn, cn, dn absolutely (all lie in [-1, 1]).

Usage: /usr/bin/python3 tools/special/accuracy_integrals.py build/libtsmath.so
"""
import ctypes
import math
import statistics
import sys

import mpmath as mp
import numpy as np
import scipy.special as sc

mp.mp.dps = 40
D = ctypes.c_double
P = ctypes.POINTER(D)
TINY = 2.2250738585072014e-308  # smallest normal double
HUGE = 1.7976931348623157e308


def lib_funcs(path):
    ctypes.CDLL(path.replace('libtsmath.so', 'host/libtsrt.so'), mode=ctypes.RTLD_GLOBAL)
    lib = ctypes.CDLL(path)
    sig = {
        'TS_FresnelIntegrals': [D, P, P], 'TS_ExpI': [D, ctypes.c_int32, P],
        'TS_SinI': [D, P], 'TS_CosI': [D, P], 'TS_SinhI': [D, P], 'TS_CoshI': [D, P],
        'TS_Elliptic1_85': [D, D, P, ctypes.c_int32], 'TS_Elliptic2_85': [D, D, P, ctypes.c_int32],
        'TS_EllipticJ': [D, D, P, P, P, P], 'TS_Diln': [D, P],
    }
    for name, args in sig.items():
        getattr(lib, name).argtypes = args
    return lib


def call(fn, *args, outs=1, tail=()):
    r = [D() for _ in range(outs)]
    fn(*args, *[ctypes.byref(v) for v in r], *tail)
    return [v.value for v in r] if outs > 1 else r[0].value


def err(ours, ref, scale=None):
    ref = mp.mpf(ref)
    s = abs(ref) if scale is None else max(abs(ref), mp.mpf(scale))
    if s == 0:
        return 0.0 if ours == 0 else float('inf')
    return float(abs(mp.mpf(ours) - ref) / s)


def ref_expn(n, x):
    if n > 4000:
        # the defining integral; mpmath's expint is very slow for such orders
        nodes = mp.linspace(1, 1 + mp.mpf(60) / (x + n), 30) + [mp.inf]
        return mp.quad(lambda s: mp.exp(-x * (s - 1)) * s ** (-n), nodes) * mp.exp(-x)
    # mpmath's E_n loses about x/2.3 digits to cancellation: carry them.
    with mp.workdps(40 + int(x / 2) + 3 * int(math.log10(n + 1))):
        return +mp.expint(n, mp.mpf(x))


def logspace(a, b, n):
    return [float(v) for v in np.logspace(math.log10(a), math.log10(b), n)]


def with_breaks(xs, breaks):
    out = list(xs)
    for b in breaks:
        v = b
        for _ in range(3):
            v = math.nextafter(v, -math.inf)
        for _ in range(7):
            out.append(v)
            v = math.nextafter(v, math.inf)
    return out


def row(name, grid, ours, theirs):
    sys.stderr.write('%s: max %.3g at index %d\n' % (name, max(ours), ours.index(max(ours))))
    def fmt(v):
        return '%.2g' % v
    return '| %s | %s | %s | %s | %s | %s |' % (name, grid, fmt(max(ours)), fmt(statistics.median(ours)),
                                             fmt(max(theirs)), fmt(statistics.median(theirs)))


def main():
    lib = lib_funcs(sys.argv[1] if len(sys.argv) > 1 else 'build/libtsmath.so')
    rows = []

    xs = [x for x in with_breaks(logspace(1e-8, 36974, 10000), [1.6, 36974.0]) if x <= 36974.0]
    o, t = [], []
    for x in xs:
        s, c = call(lib.TS_FresnelIntegrals, x, outs=2)
        ss, cc = sc.fresnel(x)
        rs, rc = mp.fresnels(x), mp.fresnelc(x)
        o.append(max(err(s, rs), err(c, rc)))
        t.append(max(err(ss, rs), err(cc, rc)))
    rows.append(row('FresnelIntegrals (S, C)', '%d x log-spaced in [1e-8, 36974] + breaks (above 36974 the rule gives 0.5)' % len(xs), o, t))

    o, t, count = [], [], 0
    for n in (0, 1, 2, 3, 5, 10, 30, 100, 1000, 5000, 5001, 20000):
        for x in with_breaks(logspace(1e-8, 700, 900), [1.0]):
            r = ref_expn(n, x)
            if abs(r) < 2.2250738585072014e-308:
                continue  # subnormal results carry no relative accuracy
            o.append(err(call(lib.TS_ExpI, x, n), r))
            t.append(err(sc.expn(n, x), r))
            count += 1
    rows.append(row('ExpIntegralN', '%d: n in {0..20000} (12 orders) x x log-spaced, normal results only, in [1e-8, 700]' % count, o, t))

    xs = with_breaks(logspace(1e-8, 1e6, 10000), [4.0, 8.0])
    osi, tsi, oci, tci = [], [], [], []
    for x in xs:
        rs, rc = mp.si(x), mp.ci(x)
        env = min(1.0, 1.0 / x)
        ssi, sci = sc.sici(x)
        osi.append(err(call(lib.TS_SinI, x), rs))
        tsi.append(err(ssi, rs))
        oci.append(err(call(lib.TS_CosI, x), rc, env))
        tci.append(err(sci, rc, env))
    rows.append(row('Si', '%d x log-spaced in [1e-8, 1e6] + breaks' % len(xs), osi, tsi))
    rows.append(row('Ci (envelope)', 'as Si', oci, tci))

    xs = with_breaks(logspace(1e-8, 715, 10000), [8.0, 18.0, 88.0])
    osh, tsh, och, tch = [], [], [], []
    for x in xs:
        rs, rc = mp.shi(x), mp.chi(x)
        ssh, sch = sc.shichi(x)
        osh.append(err(call(lib.TS_SinhI, x), rs))
        tsh.append(err(ssh, rs))
        och.append(err(call(lib.TS_CoshI, x), rc, 1.0 if x < 1 else None))
        tch.append(err(sch, rc, 1.0 if x < 1 else None))
    rows.append(row('Shi', '%d x log-spaced in [1e-8, 715] + breaks' % len(xs), osh, tsh))
    rows.append(row('Chi (envelope below 1)', 'as Shi', och, tch))

    ok2, tk2 = [], []
    for q in logspace(1e-16, 7e-6, 200):
        m = 1 - q
        if 1 - m < 7e-6:
            rk = mp.ellipk(m)
            ok2.append(err(call(lib.TS_Elliptic1_85, m, 0.0, tail=(1,)), rk))
            tk2.append(err(sc.ellipk(m), rk))
    ms = [float(v) for v in np.linspace(0, 1, 5000, endpoint=False)] + [1 - q for q in logspace(7e-6, 1, 5000)]
    ok, tk, oe, te = [], [], [], []
    for m in ms:
        rk, re = mp.ellipk(m), mp.ellipe(m)
        ok.append(err(call(lib.TS_Elliptic1_85, m, 0.0, tail=(1,)), rk))
        tk.append(err(sc.ellipk(m), rk))
        oe.append(err(call(lib.TS_Elliptic2_85, m, 0.0, tail=(1,)), re))
        te.append(err(sc.ellipe(m), re))
    main_k = [i for i, m in enumerate(ms) if 1 - m >= 7e-6]
    rows.append(row('EllipticK', '%d m: linear in [0, 1) and 1 - log-spaced q in [7e-6, 1]' % len(main_k),
                    [ok[i] for i in main_k], [tk[i] for i in main_k]))
    rows.append(row('EllipticK, q = 1 - m below 7e-6 (two-term form)', '%d m: 1 - log-spaced q in [1e-16, 7e-6)' % len(ok2),
                    ok2, tk2))
    rows.append(row('EllipticE', '%d m as EllipticK' % len(ms), oe, te))

    phis = [float(v) for v in np.linspace(-10, 10, 101)] + with_breaks([], [math.pi / 2, math.pi, 3 * math.pi / 2])
    mgrid = [float(v) for v in np.linspace(0, 1, 60, endpoint=False)] + [1 - q for q in logspace(1e-12, 0.1, 40)]
    of, tf, oei, tei = [], [], [], []
    for phi in phis:
        for m in mgrid:
            rf, rei = mp.ellipf(phi, m), mp.ellipe(phi, m)
            of.append(err(call(lib.TS_Elliptic1_85, m, phi, tail=(0,)), rf))
            tf.append(err(sc.ellipkinc(phi, m), rf))
            oei.append(err(call(lib.TS_Elliptic2_85, m, phi, tail=(0,)), rei))
            tei.append(err(sc.ellipeinc(phi, m), rei))
    grid = '%d: phi in [-10, 10] x m in [0, 1 - 1e-12]' % len(of)
    rows.append(row('EllipticF', grid, of, tf))
    rows.append(row('EllipticEInc', grid, oei, tei))

    us = [float(v) for v in np.linspace(-10, 10, 101)]
    mgrid = [float(v) for v in np.linspace(0, 1, 60, endpoint=False)] + [1 - q for q in logspace(1e-12, 0.1, 40)] + [1e-10, 1.0]
    oj, tj, oj1, tj1 = [], [], [], []
    for u in us:
        for m in mgrid:
            sn, cn, dn, _ = call(lib.TS_EllipticJ, u, m, outs=4)
            s2, c2, d2, _ = sc.ellipj(u, m)
            refs = [mp.ellipfun(k, u, m=m) for k in ('sn', 'cn', 'dn')]
            o_, t_ = (oj, tj) if m < 0.999999999 else (oj1, tj1)
            o_.append(max(err(v, r, 1.0) for v, r in zip((sn, cn, dn), refs)))
            t_.append(max(err(v, r, 1.0) for v, r in zip((s2, c2, d2), refs)))
    rows.append(row('JacobiElliptic (sn, cn, dn absolute), m < 0.999999999', '%d: u in [-10, 10] x m in [0, 1)' % len(oj), oj, tj))
    rows.append(row('JacobiElliptic, m >= 0.999999999 (first-order form)', '%d: u in [-10, 10] x m in [1 - 1e-9, 1]' % len(oj1), oj1, tj1))

    xs = with_breaks([float(v) for v in np.linspace(0, 3, 3000)] + logspace(1e-10, 1e10, 7000), [0.5, 1.5, 2.0])
    od, td = [], []
    for x in xs:
        r = mp.polylog(2, 1 - mp.mpf(x))
        od.append(err(call(lib.TS_Diln, x), r))
        td.append(err(sc.spence(x), r))
    rows.append(row('Dilogarithm', '%d x: linear in [0, 3], log-spaced in [1e-10, 1e10] + breaks' % len(xs), od, td))

    print('| kernel | grid | our max | our median | scipy max | scipy median |')
    print('|---|---|---|---|---|---|')
    print('\n'.join(rows))


if __name__ == '__main__':
    main()
