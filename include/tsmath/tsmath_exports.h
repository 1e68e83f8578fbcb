/* Automatically generated from entries/exports.table, do not edit.
 * Regenerate: cmake -P tools/gen_exports.cmake
 * 211 exports. Included by tsmath.h inside its extern "C" block. */
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

/* Waveform generators */
TSM_API int32_t SineWaveCIN(F64ArrayHdl out, int32_t* n, double* amp, double* freq, double* phase, int32_t* err);
TSM_API int32_t SquareWaveCIN(F64ArrayHdl out, int32_t* n, double* amp, double* freq, double* phase, double* duty, int32_t* err);
TSM_API int32_t SawtoothWaveCIN(F64ArrayHdl out, int32_t* n, double* amp, double* freq, double* phase, int32_t* err);
TSM_API int32_t TriangleWaveCIN(F64ArrayHdl out, int32_t* n, double* amp, double* freq, double* phase, int32_t* err);
TSM_API int32_t ArbitraryWaveCIN(F64ArrayHdl out, int32_t* n, double* amp, double* freq, double* phase, F64ArrayHdl table, int32_t* interp, int32_t* err);
TSM_API int32_t ChirpCIN(F64ArrayHdl out, int32_t* n, double* amp, double* f1, double* f2, int32_t* err);
TSM_API int32_t SinePtrn(F64ArrayHdl out, int32_t* n, double* amp, double* phase, double* cycles, int32_t* err);
TSM_API int32_t Square(F64ArrayHdl out, int32_t* n, double* amp, double* duty, double* cycles, int32_t* err);
TSM_API int32_t RampPtrn(F64ArrayHdl out, int32_t* n, double* start, double* end, int32_t* err);
TSM_API int32_t ImpulsePtrn(F64ArrayHdl out, int32_t* n, double* amp, int32_t* delay, int32_t* err);
TSM_API int32_t PulsePtrn(F64ArrayHdl out, int32_t* n, double* amp, int32_t* delay, int32_t* width, int32_t* err);
TSM_API int32_t SincWave(F64ArrayHdl out, int32_t* n, double* amp, double* delay, double* dt, int32_t* err);
TSM_API int32_t RampPtrn85(F64ArrayHdl out, int32_t n, double start, double end, int32_t mode, uint32_t scale);
TSM_API int32_t RampPtrn80(F64ArrayHdl out, int32_t n, double start, double end, int32_t mode);
TSM_API int32_t AperiodTriangleH(F64ArrayHdl xy, int32_t n, double amp, double delay, double dt, double width, double skew);
TSM_API int32_t GaussMonopulseH(F64ArrayHdl xy, int32_t n, double dt, double delay, double fc, double amp);
TSM_API int32_t GaussPulseH(F64ArrayHdl xy, int32_t n, double amp, double delay, double dt, double fc, double bw, double att);
TSM_API int32_t PeriodicSincH(F64ArrayHdl xy, int32_t n, double amp, int32_t order, double dt, double delay);

/* Noise generators */
TSM_API int32_t white(F64ArrayHdl out, int32_t* n, double* amp, int32_t* seed, int32_t* err, NoiseState* state);
TSM_API int32_t Gauss(F64ArrayHdl out, int32_t* n, double* sd, int32_t* seed, int32_t* err, NoiseState* state, GaussSpare* spare);
TSM_API int32_t PeriodNoise(int32_t* n, double* amp, int32_t* seed, F64ArrayHdl out, int32_t* err, NoiseState* state);
TSM_API int32_t BinomialNoiseH(U32ArrayHdl out, int32_t n, int32_t trials, double p, int32_t seed, NoiseState* state, BinomialCache* cache);
TSM_API int32_t GammaNoiseH(F64ArrayHdl out, int32_t n, int32_t order, int32_t seed, NoiseState* state);
TSM_API int32_t PoissonNoiseH(F64ArrayHdl out, int32_t n, double mean, int32_t seed, NoiseState* state);
TSM_API int32_t RiffleArrayDBL2012_head(F64ArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state, uint32_t mode);
TSM_API int32_t RiffleArrayCDB2012_head(CxArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state, uint32_t mode);
TSM_API int32_t RiffleArrayInt2012_head(I32ArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state, uint32_t mode);
TSM_API int32_t RiffleIntNum2012_head(I32ArrayHdl out, int32_t n, int32_t seed, NoiseState* state, uint32_t mode);
TSM_API int32_t RiffleArrayDBL_head(F64ArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state);
TSM_API int32_t RiffleArrayCDB_head(CxArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state);
TSM_API int32_t RiffleArrayInt_head(I32ArrayHdl data, I32ArrayHdl indices, int32_t seed, NoiseState* state);
TSM_API int32_t RiffleIntNum_head(I32ArrayHdl out, int32_t n, int32_t seed, NoiseState* state);

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

/* Convolution and correlation */
TSM_API int32_t AutoCorrelation80(F64ArrayHdl x, int32_t normalization, int32_t* err);
TSM_API int32_t AutoCorrelation(F64ArrayHdl x, int32_t* err);
TSM_API int32_t Rxy80(F64ArrayHdl x, F64ArrayHdl y, F64ArrayHdl out, int32_t* algorithm, int32_t normalization, int32_t* err);
TSM_API int32_t Rxy(F64ArrayHdl x, F64ArrayHdl y, F64ArrayHdl out, int32_t* algorithm, int32_t* err);
TSM_API int32_t Convolution(F64ArrayHdl x, F64ArrayHdl y, F64ArrayHdl out, int32_t* algorithm, int32_t* err);
TSM_API int32_t CxConvolution(CxArrayHdl x, CxArrayHdl y, CxArrayHdl out, int32_t algorithm, int32_t correlate, int32_t normalization);
TSM_API int32_t Convolve_2DH(MatrixHdl x, MatrixHdl y, MatrixHdl out, int32_t outputSize, int32_t algorithm);
TSM_API int32_t CxConvolve_2DH(CxMatrixHdl x, CxMatrixHdl y, CxMatrixHdl out, int32_t outputSize, int32_t algorithm);
TSM_API int32_t Correlation_2DH(MatrixHdl x, MatrixHdl y, MatrixHdl out, int32_t algorithm);
TSM_API int32_t CxCorrelation_2DH(CxMatrixHdl x, CxMatrixHdl y, CxMatrixHdl out, int32_t algorithm);
TSM_API int32_t Deconvolution(F64ArrayHdl x, F64ArrayHdl y, int32_t* err);

/* Chirp-Z, zoom and 2-D FFT */
TSM_API int32_t ChirpZT_head(F64ArrayHdl x, cx* A, cx* W, int32_t outputSize, int32_t method, CxArrayHdl X);
TSM_API int32_t CxChirpZT_head(CxArrayHdl x, cx* A, cx* W, int32_t outputSize, int32_t method, CxArrayHdl X);
TSM_API int32_t InvChirpZT_head(CxArrayHdl X, cx* A, cx* W, int32_t outputSize, CxArrayHdl x);
TSM_API int32_t ReDZTH(F64ArrayHdl x, int32_t decimation, int32_t length, int32_t startBin, int32_t outputSize, CxArrayHdl X, PlanHolder** state);
TSM_API int32_t ReDZTH_IDP(F64ArrayHdl x, int32_t decimation, int32_t length, int32_t startBin, int32_t outputSize, CxArrayHdl X, ReservedTransformState** state);
TSM_API int32_t CxDZTH(CxArrayHdl x, int32_t decimation, int32_t length, int32_t startBin, int32_t outputSize, CxArrayHdl X, PlanHolder** state);
TSM_API int32_t CxDZTH_IDP(CxArrayHdl x, int32_t decimation, int32_t length, int32_t startBin, int32_t outputSize, CxArrayHdl X, ReservedTransformState** state);
TSM_API int32_t ReFFT2D_H(MatrixHdl x, int32_t rowOffset, int32_t colOffset, int32_t rows, int32_t cols, int32_t shift, CxMatrixHdl X, PlanHolder** stateCols, PlanHolder** stateRows);
TSM_API int32_t ReFFT2D_H_IDP(MatrixHdl x, int32_t rowOffset, int32_t colOffset, int32_t rows, int32_t cols, int32_t shift, CxMatrixHdl X, ReservedTransformState** state);
TSM_API int32_t CxFFT2D_H(CxMatrixHdl x, int32_t rowOffset, int32_t colOffset, int32_t rows, int32_t cols, int32_t shift, CxMatrixHdl X, PlanHolder** stateCols, PlanHolder** stateRows);
TSM_API int32_t CxFFT2D_H_IDP(CxMatrixHdl x, int32_t rowOffset, int32_t colOffset, int32_t rows, int32_t cols, int32_t shift, CxMatrixHdl X, ReservedTransformState** state);
TSM_API int32_t ReInvFFT2D_H(CxMatrixHdl X, int32_t shift, MatrixHdl x, PlanHolder** stateCols, PlanHolder** stateRows);
TSM_API int32_t ReInvFFT2D_H_IDP(CxMatrixHdl X, int32_t shift, MatrixHdl x, ReservedTransformState** state);
TSM_API int32_t CxInvFFT2D_H(CxMatrixHdl X, int32_t shift, CxMatrixHdl x, PlanHolder** stateCols, PlanHolder** stateRows);
TSM_API int32_t CxInvFFT2D_H_IDP(CxMatrixHdl X, int32_t shift, CxMatrixHdl x, ReservedTransformState** state);

/* Spectra and Hilbert */
TSM_API int32_t SpectrumH(F64ArrayHdl x, PlanHolder** state);
TSM_API int32_t SpectrumH_IDP(F64ArrayHdl x, ReservedTransformState** state);
TSM_API int32_t CxSpectrumH(CxArrayHdl x, F64ArrayHdl s, PlanHolder** state);
TSM_API int32_t CxSpectrumH_IDP(CxArrayHdl x, F64ArrayHdl s, ReservedTransformState** state);
TSM_API int32_t CrossSpectrumH(F64ArrayHdl x, F64ArrayHdl y, CxArrayHdl S, PlanHolder** state);
TSM_API int32_t CrossSpectrumH_IDP(F64ArrayHdl x, F64ArrayHdl y, CxArrayHdl S, ReservedTransformState** state);
TSM_API int32_t CxCrossSpectrumH(CxArrayHdl x, CxArrayHdl y, CxArrayHdl S, PlanHolder** state);
TSM_API int32_t CxCrossSpectrumH_IDP(CxArrayHdl x, CxArrayHdl y, CxArrayHdl S, ReservedTransformState** state);
TSM_API int32_t FastHilbertTransformH(F64ArrayHdl x, PlanHolder** state);
TSM_API int32_t FastHilbertTransformH_IDP(F64ArrayHdl x, ReservedTransformState** state);
TSM_API int32_t InvFastHilbertTransformH(F64ArrayHdl x, PlanHolder** state);
TSM_API int32_t InvFastHilbertTransformH_IDP(F64ArrayHdl x, ReservedTransformState** state);
TSM_API int32_t FHTH(F64ArrayHdl x, PlanHolder** state);
TSM_API int32_t FHTH_IDP(F64ArrayHdl x, ReservedTransformState** state);
TSM_API int32_t InvFHTH(F64ArrayHdl x, PlanHolder** state);
TSM_API int32_t InvFHTH_IDP(F64ArrayHdl x, ReservedTransformState** state);

/* DCT and DST */
TSM_API int32_t DCT_1DH(F64ArrayHdl x, F64ArrayHdl y, int32_t size, PlanHolder** state);
TSM_API int32_t DCT_1DH_IDP(F64ArrayHdl x, F64ArrayHdl y, int32_t size, ReservedTransformState** state);
TSM_API int32_t DST_1DH(F64ArrayHdl x, F64ArrayHdl y, int32_t size, PlanHolder** state);
TSM_API int32_t DST_1DH_IDP(F64ArrayHdl x, F64ArrayHdl y, int32_t size, ReservedTransformState** state);
TSM_API int32_t InvDCT_1DH(F64ArrayHdl y, F64ArrayHdl x, PlanHolder** state);
TSM_API int32_t InvDCT_1DH_IDP(F64ArrayHdl y, F64ArrayHdl x, ReservedTransformState** state);
TSM_API int32_t InvDST_1DH(F64ArrayHdl y, F64ArrayHdl x, PlanHolder** state);
TSM_API int32_t InvDST_1DH_IDP(F64ArrayHdl y, F64ArrayHdl x, ReservedTransformState** state);
TSM_API int32_t DCT_2DH(MatrixHdl x, MatrixHdl y, int32_t rows, int32_t cols, PlanHolder** stateRows, PlanHolder** stateCols);
TSM_API int32_t DCT_2DH_IDP(MatrixHdl x, MatrixHdl y, int32_t rows, int32_t cols, ReservedTransformState** state);
TSM_API int32_t DST_2DH(MatrixHdl x, MatrixHdl y, int32_t rows, int32_t cols, PlanHolder** stateRows, PlanHolder** stateCols);
TSM_API int32_t DST_2DH_IDP(MatrixHdl x, MatrixHdl y, int32_t rows, int32_t cols, ReservedTransformState** state);
TSM_API int32_t InvDCT_2DH(MatrixHdl y, MatrixHdl x, PlanHolder** stateRows, PlanHolder** stateCols);
TSM_API int32_t InvDCT_2DH_IDP(MatrixHdl y, MatrixHdl x, ReservedTransformState** state);
TSM_API int32_t InvDST_2DH(MatrixHdl y, MatrixHdl x, PlanHolder** stateRows, PlanHolder** stateCols);
TSM_API int32_t InvDST_2DH_IDP(MatrixHdl y, MatrixHdl x, ReservedTransformState** state);

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

/* Special functions: gamma, beta and error function */
TSM_API void TS_Fact(int32_t n, double* out);
TSM_API void TS_LnFact(int32_t n, double* out);
TSM_API void TS_Gamma(double a, double x, double* out);
TSM_API void TS_Gamma_85(double a, double x, double* out, int32_t mode);
TSM_API void TS_GammaC(double a, double x, double* out);
TSM_API void TS_LnGamma(double x, double* out);
TSM_API void TS_Psi(double x, double* out);
TSM_API void TS_Stirling(double x, double* out);
TSM_API void TS_Beta(double a, double b, double x, double* out);
TSM_API void TS_Beta_85(double a, double b, double x, double* out, int32_t mode);
TSM_API void TS_Erf(double x, double* out);
TSM_API void TS_ErfC(double x, double* out);
TSM_API void TS_Dawson(double x, double* out);
TSM_API void TS_Zeta(double x, double* out);

/* Special functions: integrals and elliptic functions */
TSM_API void TS_FresnelIntegrals(double x, double* s, double* c);
TSM_API void TS_ExpI(double x, int32_t n, double* result);
TSM_API void TS_SinI(double x, double* result);
TSM_API void TS_CosI(double x, double* result);
TSM_API void TS_SinhI(double x, double* result);
TSM_API void TS_CoshI(double x, double* result);
TSM_API void TS_Elliptic1(double m, double phi, double* result);
TSM_API void TS_Elliptic1_85(double m, double phi, double* result, int32_t mode);
TSM_API void TS_Elliptic2(double m, double phi, double* result);
TSM_API void TS_Elliptic2_85(double m, double phi, double* result, int32_t mode);
TSM_API void TS_EllipticJ(double u, double m, double* sn, double* cn, double* dn, double* phi);
TSM_API void TS_Diln(double x, double* result);

/* Special functions: Bessel family */
TSM_API void TS_Airy(double x, double* ai, double* aip, double* bi, double* bip);
TSM_API void TS_BesselKn(int32_t n, double x, double* result);
TSM_API void TS_KelvinI(double x, int32_t n, double* ber, double* bei);
TSM_API void TS_KelvinK(double x, int32_t n, double* ker, double* kei);
TSM_API void TS_BesselIr(double v, double x, double* result);
TSM_API void TS_ParabolicCylinder(double x, double v, double* result);
TSM_API void TS_BesselJr(double v, double x, double* result);
TSM_API void TS_BesselYr(double v, double x, double* result);
TSM_API void TS_BesselJs(int32_t n, double x, double* result);
TSM_API void TS_BesselYs(int32_t n, double x, double* result);
TSM_API void TS_Struve(double x, double v, double* result);

#endif
