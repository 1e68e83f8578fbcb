// automatically generated, do not edit
// regenerate from the repository root with: /usr/bin/python3 tools/gen_codelets.py
//
// The passes of every radix with codelets, generated into kwfft_passes_rN.cpp:
// for radix N, kwfft_cx_notw_N, kwfft_real_notw_N, kwfft_cx_tw_N and
// kwfft_real_tw_N, with the signatures and meaning of CxNotwPass, RealNotwPass,
// CxTwPass and RealTwPass (transforms/kwfft_passes.h).
#pragma once

#include <cstddef>

#include "frame/types.h"

namespace tsm {

void kwfft_cx_notw_2(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count);
void kwfft_real_notw_2(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_2(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_2(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_3(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count);
void kwfft_real_notw_3(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_3(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_3(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_4(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count);
void kwfft_real_notw_4(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_4(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_4(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_5(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count);
void kwfft_real_notw_5(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_5(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_5(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_7(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count);
void kwfft_real_notw_7(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_7(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_7(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_8(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count);
void kwfft_real_notw_8(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_8(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_8(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_9(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                     std::ptrdiff_t os, int32 count);
void kwfft_real_notw_9(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_9(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_9(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_10(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_10(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_10(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_10(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_11(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_11(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_11(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_11(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_13(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_13(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_13(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_13(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_14(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_14(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_14(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_14(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_16(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_16(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_16(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_16(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_17(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_17(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_17(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_17(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_18(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_18(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_18(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_18(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_19(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_19(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_19(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_19(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_29(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_29(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_29(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_29(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_31(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_31(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_31(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_31(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_32(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_32(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_32(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_32(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_37(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_37(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_37(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_37(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_41(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_41(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_41(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_41(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

void kwfft_cx_notw_43(const f64* in_re, const f64* in_im, f64* out_re, f64* out_im, std::ptrdiff_t is,
                      std::ptrdiff_t os, int32 count);
void kwfft_real_notw_43(const f64* in, f64* out, std::ptrdiff_t is, std::ptrdiff_t os, int32 count);
void kwfft_cx_tw_43(f64* re, f64* im, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);
void kwfft_real_tw_43(f64* data, const f64* tw_cos, const f64* tw_sin, std::ptrdiff_t stride, int32 m);

}  // namespace tsm
