#!/usr/bin/python3
"""Golden values for the convolution, correlation and chirp-Z tests.

Writes tests/data/conv_golden.txt. Operands come from fixed seeds; every
float64 is written as a hex float (float.hex()), so nothing is lost on the
way to the C++ test.

References:
  conv      numpy.convolve(x, y)
  corr      numpy.correlate(y, x, 'full'), i.e. out[k] = sum_i conj(x[n-1-i]) y[k-i],
            zero lag at index n-1; then the unbiased or biased scaling
  conv2d    scipy.signal.convolve2d in 'full' and 'valid'; 'same' is the
            r1 x c1 block of the full result from (r2//2, c2//2), checked
            against scipy's 'same' where the kernel sizes are odd
  corr2d    scipy.signal.correlate2d(y, x, 'full')
  czt       direct sum in mpmath at 40 digits of the exact float64 A and W,
            X[k] = sum_i x[i] A^-i W^(i k), cross-checked with scipy.signal.czt

Regenerate (Debian's python3 with python3-numpy, python3-scipy, python3-mpmath):
    /usr/bin/python3 tools/golden/conv_golden.py > tests/data/conv_golden.txt

Line format, whitespace-separated tokens:
    conv|cxconv N M x.. y.. out..                (cx: re im pairs)
    corr|cxcorr NORM N M x.. y.. out..
    conv2d|cxconv2d MODE R1 C1 R2 C2 x.. y.. RO CO out..
    corr2d|cxcorr2d R1 C1 R2 C2 x.. y.. out..
    czt N M Are Aim Wre Wim x(re im).. X(re im)..
"""
import mpmath
import numpy as np
from scipy import signal

mpmath.mp.dps = 40


def hx(v):
    return float(v).hex()


def real_tokens(a):
    return [hx(v) for v in np.ravel(a)]


def cx_tokens(a):
    out = []
    for v in np.ravel(a):
        out += [hx(v.real), hx(v.imag)]
    return out


def draw(rng, shape, complex_):
    a = rng.uniform(-1, 1, shape)
    if complex_:
        a = a + 1j * rng.uniform(-1, 1, shape)
    return a


def normalize(r, n, m, norm):
    r = r.copy()
    s, L = min(n, m), max(n, m)
    if norm == 1:
        for i in range(s - 1):
            r[i] /= i + 1
            r[L + i] /= s - 1 - i
        r[s - 1:L] /= s
    elif norm == 2:
        r /= L
    return r


def main():
    rng = np.random.default_rng(20261123)
    lines = []
    pairs = [(1, 1), (1, 6), (6, 1), (2, 2), (8, 5), (5, 8), (13, 13), (17, 64), (101, 30)]
    for cplx in (False, True):
        tok = cx_tokens if cplx else real_tokens
        tag = "cx" if cplx else ""
        for n, m in pairs:
            x, y = draw(rng, n, cplx), draw(rng, m, cplx)
            lines.append(" ".join([tag + "conv", str(n), str(m)] + tok(x) + tok(y) + tok(np.convolve(x, y))))
            for norm in (0, 1, 2):
                r = normalize(np.correlate(y, x, "full"), n, m, norm)
                lines.append(" ".join([tag + "corr", str(norm), str(n), str(m)] + tok(x) + tok(y) + tok(r)))

    shapes = [((1, 1), (1, 1)), ((3, 4), (2, 2)), ((5, 5), (3, 3)), ((4, 6), (4, 6)), ((2, 3), (5, 4)),
              ((7, 5), (2, 3)), ((9, 8), (4, 5)), ((13, 11), (7, 3))]
    for cplx in (False, True):
        tok = cx_tokens if cplx else real_tokens
        tag = "cx" if cplx else ""
        for (r1, c1), (r2, c2) in shapes:
            x, y = draw(rng, (r1, c1), cplx), draw(rng, (r2, c2), cplx)
            full = signal.convolve2d(x, y, "full")
            same = full[r2 // 2:r2 // 2 + r1, c2 // 2:c2 // 2 + c1]
            if r2 % 2 and c2 % 2:
                assert np.allclose(same, signal.convolve2d(x, y, "same"), rtol=0, atol=1e-13)
            results = [(0, full), (1, same)]
            if r1 >= r2 and c1 >= c2:
                results.append((2, signal.convolve2d(x, y, "valid")))
            for mode, res in results:
                lines.append(" ".join([tag + "conv2d", str(mode), str(r1), str(c1), str(r2), str(c2)] + tok(x) +
                                      tok(y) + [str(res.shape[0]), str(res.shape[1])] + tok(res)))
            corr = signal.correlate2d(y, x, "full")
            assert np.allclose(corr, signal.convolve2d(np.conj(x[::-1, ::-1]), y), rtol=0, atol=1e-13)
            lines.append(" ".join([tag + "corr2d", str(r1), str(c1), str(r2), str(c2)] + tok(x) + tok(y) +
                                  tok(corr)))

    spirals = [
        (16, 16, 1.0, np.exp(-2j * np.pi / 16)),
        (7, 7, 1.0, np.exp(-2j * np.pi / 7)),
        (1, 1, 1.0, np.exp(-0.5j)),
        (12, 20, 1.02 * np.exp(0.3j), 0.995 * np.exp(-0.07j)),
        (33, 9, 0.9 * np.exp(-0.2j), np.exp(0.11j)),
        (50, 64, np.exp(0.25j), 1.001 * np.exp(-2j * np.pi / 100)),
    ]
    for n, M, A, W in spirals:
        A, W = complex(A), complex(W)
        x = draw(rng, n, True)
        Am, Wm = mpmath.mpc(A.real, A.imag), mpmath.mpc(W.real, W.imag)
        X = []
        for k in range(M):
            acc = mpmath.mpc(0)
            for i in range(n):
                acc += mpmath.mpc(x[i].real, x[i].imag) * Am ** (-i) * Wm ** (i * k)
            X.append(complex(acc))
        X = np.array(X)
        assert np.allclose(X, signal.czt(x, M, W, A), rtol=0, atol=1e-9 * max(1, np.abs(X).max()))
        lines.append(" ".join(["czt", str(n), str(M), hx(A.real), hx(A.imag), hx(W.real), hx(W.imag)] +
                              cx_tokens(x) + cx_tokens(X)))
    print("\n".join(lines))


if __name__ == "__main__":
    main()
