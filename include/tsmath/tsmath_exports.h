/* Automatically generated from entries/exports.table, do not edit.
 * Regenerate: cmake -P tools/gen_exports.cmake
 * 75 exports. Included by tsmath.h inside its extern "C" block. */
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

/* Windows */
TSM_API int32_t AllCosWinH(F64ArrayHdl x, int32_t selector, int32_t normalise);
TSM_API int32_t CxAllCosWinH(CxArrayHdl x, int32_t selector, int32_t normalise);
TSM_API int32_t GenCosWinH(F64ArrayHdl x, F64ArrayHdl coefs);
TSM_API int32_t CxGenCosWinH(CxArrayHdl x, F64ArrayHdl coefs);
TSM_API int32_t ScaledGenCosWinH(F64ArrayHdl x, F64ArrayHdl coefs);
TSM_API int32_t ScaledCxGenCosWinH(CxArrayHdl x, F64ArrayHdl coefs);
TSM_API int32_t BartHannWinH(F64ArrayHdl x);
TSM_API int32_t CxBartHannWinH(CxArrayHdl x);
TSM_API int32_t BohmanWinH(F64ArrayHdl x);
TSM_API int32_t CxBohmanWinH(CxArrayHdl x);
TSM_API int32_t ParzenWinH(F64ArrayHdl x);
TSM_API int32_t CxParzenWinH(CxArrayHdl x);
TSM_API int32_t WelchWinH(F64ArrayHdl x);
TSM_API int32_t CxWelchWinH(CxArrayHdl x);
TSM_API int32_t TriangleWinH(F64ArrayHdl x);
TSM_API int32_t CxTriangleWinH(CxArrayHdl x);
TSM_API int32_t TriangleWin(F64ArrayHdl x, int32_t* err);
TSM_API int32_t CosTaperedH(F64ArrayHdl x, double ratio);
TSM_API int32_t CxCosTaperedH(CxArrayHdl x, double ratio);
TSM_API int32_t CosTapered(F64ArrayHdl x, int32_t* err);
TSM_API int32_t DolChebyWinH(F64ArrayHdl x, double ratio, int32_t form);
TSM_API int32_t CxDolChebyWinH(CxArrayHdl x, double ratio, int32_t form);
TSM_API int32_t ExpWinH(F64ArrayHdl x, double final_value);
TSM_API int32_t CxExpWinH(CxArrayHdl x, double final_value);
TSM_API int32_t ExpWindCIN(F64ArrayHdl x, double* final_value, int32_t* err);
TSM_API int32_t ForceWinH(F64ArrayHdl x, double duty);
TSM_API int32_t CxForceWinH(CxArrayHdl x, double duty);
TSM_API int32_t ForceWindCIN(F64ArrayHdl x, double* duty, int32_t* err);
TSM_API int32_t GaussWinH(F64ArrayHdl x, double sigma, int32_t form);
TSM_API int32_t CxGaussWinH(CxArrayHdl x, double sigma, int32_t form);
TSM_API int32_t KaiserH(F64ArrayHdl x, double beta);
TSM_API int32_t CxKaiserH(CxArrayHdl x, double beta);
TSM_API int32_t Kaiser_Bessel(F64ArrayHdl x, double* beta, int32_t* err);
TSM_API int32_t ScaledWinH(F64ArrayHdl x, int32_t selector, double param, WinConsts* consts);
TSM_API int32_t CxScaledWinH(CxArrayHdl x, int32_t selector, double param, WinConsts* consts);
TSM_API int32_t SymmWinH(F64ArrayHdl x, int32_t selector, double param);
TSM_API int32_t CxSymmWinH(CxArrayHdl x, int32_t selector, double param);
TSM_API int32_t WinConstByNameH(int32_t n, int32_t selector, double param, WinConsts* consts);
TSM_API int32_t NumWinConstH(F64ArrayHdl w, WinConsts* consts);

#endif
