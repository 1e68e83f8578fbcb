/* libtsrt: the reference host runtime.
 *
 * A real provider of the two host services that tsmath calls, with the exact
 * block layouts (1-D: int32 count then the elements, so float64 data stands
 * at offset 4 and is misaligned; 2-D: int32 rows, int32 cols, then the
 * elements), plus controls for tests: fail a chosen resize, move every block
 * at every resize, count live blocks and bytes, end a host run. Thread-safe. */
#ifndef TSRT_H
#define TSRT_H

#include <stdint.h>

#ifdef __cplusplus
extern "C" {
#endif

#define TSRT_API __attribute__((visibility("default")))

/* Results of NumericArrayResize besides 0. */
enum { TSRT_ARG_ERROR = 1, TSRT_MEMORY_FULL = 2 };

typedef int32_t (*TsrtCleanupProc)(void* arg);

/* Host services. A handle is the address of a master pointer that points to
 * the block; *handleAddress null makes a new handle. The service never
 * writes a block's dimension fields: new elements and new dimension fields
 * are filled with 0xFF bytes (NaN for floats, -1 for integers). */
TSRT_API int32_t NumericArrayResize(int32_t typeCode, int32_t numDims, void* handleAddress, int32_t totalElements);
/* A non-zero mode registers proc(arg) (again: the mode is updated), 0 withdraws it. */
TSRT_API int32_t RTSetCleanupProc(TsrtCleanupProc proc, void* arg, int32_t mode);
TSRT_API extern const uint32_t gTSRTVersion;

/* Element size of a type code, 0 for codes the host does not know. */
TSRT_API int32_t tsrt_element_size(int32_t typeCode);

/* Handles for callers: a 1-D array of `count` elements (copied from `data`
 * when not null, else zeroed), a 2-D array likewise, and their disposal. */
TSRT_API void* tsrt_new_array(int32_t typeCode, int32_t count, const void* data);
TSRT_API void* tsrt_new_matrix(int32_t typeCode, int32_t rows, int32_t cols, const void* data);
TSRT_API void tsrt_dispose(void* handle);

/* Test controls. */
TSRT_API void tsrt_fail_resize_at(int64_t k);   /* the k-th resize from now fails (1 = the next); 0: none */
TSRT_API int64_t tsrt_resize_calls(void);       /* resizes since the process started */
TSRT_API void tsrt_always_move(int32_t on);     /* every resize moves the block and poisons the old one */
TSRT_API int64_t tsrt_live_blocks(void);
TSRT_API int64_t tsrt_live_bytes(void);

/* Registrations of RTSetCleanupProc now held, and the mode of one (0: none). */
TSRT_API int32_t tsrt_cleanup_count(void);
TSRT_API int32_t tsrt_cleanup_mode(TsrtCleanupProc proc, void* arg);
/* Ends a host run: runs every registered clean-up, newest first, and forgets
 * them. Returns how many ran. */
TSRT_API int32_t tsrt_end_run(void);

#ifdef __cplusplus
}
#endif

#endif
