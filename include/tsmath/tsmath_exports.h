/* Automatically generated from entries/exports.table, do not edit.
 * Regenerate: cmake -P tools/gen_exports.cmake
 * 45 exports. Included by tsmath.h inside its extern "C" block. */
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

/* FFT plans and 1-D transforms */
TSM_API kwfft_table* create_kwfft_table(int32_t n);
TSM_API void destroy_kwfft_table(kwfft_table* plan);
TSM_API int32_t TransformUnreserveProc(ReservedTransformState** state);
TSM_API int32_t ReKWFFTH80(F64ArrayHdl x, CxArrayHdl X, PlanHolder** state, int32_t offset, int32_t fftSize, int32_t shift);
TSM_API int32_t ReKWFFTH80_IDP(F64ArrayHdl x, CxArrayHdl X, ReservedTransformState** state, int32_t offset, int32_t fftSize, int32_t shift);
TSM_API int32_t CxKWFFTH80(CxArrayHdl x, CxArrayHdl X, PlanHolder** state, int32_t offset, int32_t fftSize, int32_t shift);
TSM_API int32_t CxKWFFTH80_IDP(CxArrayHdl x, CxArrayHdl X, ReservedTransformState** state, int32_t offset, int32_t fftSize, int32_t shift);
TSM_API int32_t InvReKWFFTH80(CxArrayHdl X, F64ArrayHdl x, PlanHolder** state, int32_t shift);
TSM_API int32_t InvReKWFFTH80_IDP(CxArrayHdl X, F64ArrayHdl x, ReservedTransformState** state, int32_t shift);
TSM_API int32_t InvCxKWFFTH80(CxArrayHdl X, CxArrayHdl x, PlanHolder** state, int32_t shift);
TSM_API int32_t InvCxKWFFTH80_IDP(CxArrayHdl X, CxArrayHdl x, ReservedTransformState** state, int32_t shift);
TSM_API int32_t ReKWFFTHCH(F64ArrayHdl x, F64ArrayHdl y, PlanHolder** state);
TSM_API int32_t ReKWFFTHCH_IDP(F64ArrayHdl x, F64ArrayHdl y, ReservedTransformState** state);
TSM_API int32_t InvReKWFFTHCH(F64ArrayHdl y, F64ArrayHdl x, PlanHolder** state);
TSM_API int32_t InvReKWFFTHCH_IDP(F64ArrayHdl y, F64ArrayHdl x, ReservedTransformState** state);
TSM_API int32_t ReKWFFTH(F64ArrayHdl x, CxArrayHdl X, PlanHolder** state);
TSM_API int32_t CxKWFFTH(CxArrayHdl x, CxArrayHdl X, PlanHolder** state);
TSM_API int32_t InvReKWFFTH(CxArrayHdl X, F64ArrayHdl x, PlanHolder** state);
TSM_API int32_t InvCxKWFFTH(CxArrayHdl X, CxArrayHdl x, PlanHolder** state);

/* Pulse measurement */
TSM_API int32_t StateLevels(F64ArrayHdl x, double t0, double dt, uint32_t method, int32_t bins, HistogramBuffer** histogram, double* high, double* low, double* amplitude, int32_t option);
TSM_API int32_t PulseMeasEx(F64ArrayHdl x, double t0, double dt, uint16_t polarity, uint8_t ignorePeriod, int32_t pulseNumber, const ReferenceLevels* refs, const LevelMethod* levels, HistogramBuffer** histogram, double* period, double* width, double* dutyCycle, double* center, double* lowLevel, double* midLevel, double* highLevel, int32_t option);
TSM_API int32_t PulseMeas(F64ArrayHdl x, double t0, double dt, uint16_t polarity, int32_t pulseNumber, const ReferenceLevels* refs, const LevelMethod* levels, HistogramBuffer** histogram, double* period, double* width, double* dutyCycle, double* center, double* lowLevel, double* midLevel, double* highLevel, int32_t option);
TSM_API int32_t CycleRMSAverage(F64ArrayHdl x, double t0, double dt, int32_t cycleNumber, const ReferenceLevels* refs, const LevelMethod* levels, HistogramBuffer** histogram, double* mean, double* rms, double* start, double* end, double* lowLevel, double* midLevel, double* highLevel, int32_t option);
TSM_API int32_t TransMeas(F64ArrayHdl x, double t0, double dt, uint16_t polarity, int32_t transitionNumber, const ReferenceLevels* refs, const LevelMethod* levels, HistogramBuffer** histogram, double* slope, double* duration, double* start, double* end, double* lowLevel, double* midLevel, double* highLevel, double* preshootUnder, double* preshootOver, double* postshootUnder, double* postshootOver, int32_t option);
TSM_API int32_t measurements_fetch(void* reserved, int32_t selector, const ReferenceLevels* refs, const LevelMethod* levels, int32_t pulseNumber, double t0, double dt, const double* data, int32_t n, double* result, double* times);
TSM_API int32_t measurements_create(void* object);
TSM_API int32_t measurements_clear(void* object);
TSM_API int32_t measurements_destroy(void* object);

#endif
