/* tsmath: numerical analysis library, public C interface.
 *
 * Arrays cross the boundary as handles: a pointer to a pointer to a block that
 * the host owns and may move at every resize. A 1-D block is an int32 count
 * followed by the elements with no padding, so float64 elements stand at
 * offset 4 of the block; a 2-D block is int32 rows, int32 cols, then the
 * row-major elements at offset 8. The block structs below are packed to say
 * exactly that. Entries resize outputs through the host's NumericArrayResize
 * and write the dimension fields themselves. */
#ifndef TSMATH_H
#define TSMATH_H

#include <stdint.h>

#include "tsmath_codes.h"

#if defined(TSM_BUILDING_LIBRARY)
#define TSM_API __attribute__((visibility("default")))
#else
#define TSM_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* Type codes that NumericArrayResize receives. */
enum {
  TSM_TYPE_I32 = 3,
  TSM_TYPE_U8 = 5,
  TSM_TYPE_U32 = 7,
  TSM_TYPE_F32 = 9,
  TSM_TYPE_F64 = 10,
  TSM_TYPE_CX64 = 12,
  TSM_TYPE_CX128 = 13
};

/* A complex number: real part, then imaginary part. */
typedef struct cx {
  double re;
  double im;
} cx;

#pragma pack(push, 1)
typedef struct F64Array { int32_t count; double elt[1]; } F64Array;
typedef struct F32Array { int32_t count; float elt[1]; } F32Array;
typedef struct I32Array { int32_t count; int32_t elt[1]; } I32Array;
typedef struct U8Array { int32_t count; uint8_t elt[1]; } U8Array;
typedef struct U32Array { int32_t count; uint32_t elt[1]; } U32Array;
typedef struct CxArray { int32_t count; cx elt[1]; } CxArray;
typedef struct Matrix { int32_t rows; int32_t cols; double elt[1]; } Matrix;
typedef struct CxMatrix { int32_t rows; int32_t cols; cx elt[1]; } CxMatrix;

/* Error cluster of the workspace entries: the host's record goes on behind
 * these two fields, which are all the library touches. */
typedef struct ErrorCluster { uint8_t status; int32_t code; } ErrorCluster;

/* One interval of the general histogram, 20 bytes. inclusion: 0 lower in and
 * upper out, 1 lower out and upper in, 2 both in, 3 both out, any other value
 * takes every sample as inside. */
typedef struct GenHistInterval { double lower; double upper; int32_t inclusion; } GenHistInterval;
typedef struct GenHistIntervalArray { int32_t count; GenHistInterval elt[1]; } GenHistIntervalArray;

/* Constants of a window: equivalent noise bandwidth in bins, then coherent
 * gain (the window's mean). */
typedef struct WinConsts { double enbw; double cg; } WinConsts;

/* Reference levels of the pulse and transition measurements, high, middle and
 * low; with percent non-zero they are percentages of the amplitude above the
 * low state, otherwise signal units. 26 bytes. */
typedef struct ReferenceLevels { double highRef; double midRef; double lowRef; uint16_t percent; } ReferenceLevels;

/* How the state levels are found. method: 0 histogram, 1 minimum and maximum,
 * 2 histogram where populated, else the extremes. bins: histogram bins. */
typedef struct LevelMethod { uint32_t method; int32_t bins; } LevelMethod;

/* The random source's three generator words, kept by the caller between
 * calls: the same record passed again continues one stream. */
typedef struct NoiseState { int32_t s1; int32_t s2; int32_t s3; } NoiseState;

/* The second deviate of a Gaussian pair, kept for the next output. */
typedef struct GaussSpare { int32_t valid; double value; } GaussSpare;

/* Set-up of the binomial rejection method for the last trials and
 * probability, so that repeated calls skip the logarithms. */
typedef struct BinomialCache {
  double pold; double pc; double plog; double pclog; double en; double oldg; int32_t nold;
} BinomialCache;
#pragma pack(pop)

/* Histogram counters kept between calls of a measurement entry in a variable
 * of the caller's (null at first). The entry makes the record, gives it new
 * counters when the bin count changes, and registers its release with the
 * host's RTSetCleanupProc (mode 2) when it makes it. */
typedef struct HistogramBuffer { int32_t bins; int32_t* counts; } HistogramBuffer;

/* Samples of the general histogram that fell in no interval (total), below the
 * first interval (below) and beyond the last (above). */
typedef struct GenHistOutliers { int32_t total; int32_t below; int32_t above; } GenHistOutliers;

/* Opaque records of the FFT engine: a cached plan, the holder of a plan kept
 * between calls by a plain transform entry, and the two-slot record kept by
 * an _IDP entry (released by TransformUnreserveProc). */
typedef struct kwfft_table kwfft_table;
typedef struct PlanHolder PlanHolder;
typedef struct ReservedTransformState ReservedTransformState;

typedef F64Array** F64ArrayHdl;
typedef F32Array** F32ArrayHdl;
typedef I32Array** I32ArrayHdl;
typedef U8Array** U8ArrayHdl;
typedef U32Array** U32ArrayHdl;
typedef CxArray** CxArrayHdl;
typedef Matrix** MatrixHdl;
typedef CxMatrix** CxMatrixHdl;
typedef GenHistIntervalArray** GenHistIntervalHdl;

#include "tsmath_exports.h"

#ifdef __cplusplus
}
#endif

#endif
