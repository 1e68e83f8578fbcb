/* Automatically generated from entries/exports.table, do not edit.
 * Regenerate: cmake -P tools/gen_exports.cmake
 * 17 exports. Included by tsmath.h inside its extern "C" block. */
#ifndef TSMATH_EXPORTS_H
#define TSMATH_EXPORTS_H

/* Workspace */
TSM_API int32_t InitializeAnalysisWorkspaceH(uint32_t size, ErrorCluster* error);
TSM_API int32_t EnableAnalysisWorkspaceH(ErrorCluster* error);
TSM_API int32_t DisableAnalysisWorkspaceH(ErrorCluster* error);
TSM_API int32_t UninitializeAnalysisWorkspaceH(ErrorCluster* error);

/* Host binding */
TSM_API void SetTSRTModule(void* module);
TSM_API void SetTSRTTLSIndex(int32_t index);
TSM_API void SetTSRTModuleHook(void* module);
TSM_API void SetTSRTTLSIndexHook(int32_t index);

/* Descriptive statistics */
TSM_API int32_t Mean_head(F64ArrayHdl x, double* mean, int32_t* err);
TSM_API int32_t Median_head(F64ArrayHdl x, double* median, int32_t* err);
TSM_API int32_t ModeH(F64ArrayHdl x, int32_t intervals, F64ArrayHdl modes);
TSM_API int32_t Moment_head(F64ArrayHdl x, int32_t* order, double* moment, int32_t* err);
TSM_API int32_t MSE_head(F64ArrayHdl x, F64ArrayHdl y, double* mse, int32_t* err);
TSM_API int32_t RMS_head(F64ArrayHdl x, double* rms, int32_t* err);
TSM_API int32_t CxRMS_head(CxArrayHdl x, double* rms);
TSM_API int32_t GenHistH(F64ArrayHdl x, GenHistIntervalHdl intervals, I32ArrayHdl counts, GenHistOutliers* outliers, int32_t* err);
TSM_API int32_t histgran_head(F64ArrayHdl x, int32_t* bins, I32ArrayHdl counts, F64ArrayHdl centres, int32_t* err);

#endif
