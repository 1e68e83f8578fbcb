// Entries of the descriptive statistics.
#include <cstdlib>
#include <cstring>
#include <memory>

#include "frame/entry.h"
#include "stats/descriptive.h"
#include "stats/histogram.h"
#include "stats/mode.h"
#include "stats/order.h"

using namespace tsm;

extern "C" {

int32_t Mean_head(F64ArrayHdl x, double* mean, int32_t* err) {
  *err = 0;
  return ReportScalarA(MeanOfArray(Elems(x), Count(x), mean), FailOn::kNonZero, err, mean);
}

int32_t Median_head(F64ArrayHdl x, double* median, int32_t* err) {
  *err = 0;
  return ReportScalarA(MedianOfArray(Elems(x), Count(x), median), FailOn::kNonZero, err, median);
}

int32_t Moment_head(F64ArrayHdl x, int32_t* order, double* moment, int32_t* err) {
  *err = 0;
  return ReportScalarA(CentralMoment(Elems(x), Count(x), *order, moment), FailOn::kNonZero, err, moment);
}

int32_t MSE_head(F64ArrayHdl x, F64ArrayHdl y, double* mse, int32_t* err) {
  *err = 0;
  const ErrorCode code = MeanSquaredError(Elems(x), Count(x), Elems(y), Count(y), mse);
  return ReportScalarA(code, FailOn::kNegative, err, mse);
}

int32_t RMS_head(F64ArrayHdl x, double* rms, int32_t* err) {
  *err = 0;
  return ReportScalarA(RmsOfArray(Elems(x), Count(x), rms), FailOn::kNonZero, err, rms);
}

int32_t CxRMS_head(CxArrayHdl x, double* rms) { return CxRmsOfArray(Elems(x), Count(x), rms); }

int32_t ModeH(F64ArrayHdl x, int32_t intervals, F64ArrayHdl modes) {
  f64* found = nullptr;
  int32 m = 0;
  const ErrorCode code = ModeOfArray(Elems(x), Count(x), intervals, &found, &m);
  const std::unique_ptr<f64, decltype(&std::free)> hold(found, &std::free);
  if (code < 0 || m == 0) return FailB(code, modes);
  if (const int32 r = ResizeOutput(modes, m); r != 0) return FailB(r, modes);  // the host's result as it stands
  std::memcpy(Elems(modes), found, sizeof(f64) * static_cast<std::size_t>(m));
  return code;
}

int32_t histgran_head(F64ArrayHdl x, int32_t* bins, I32ArrayHdl counts, F64ArrayHdl centres, int32_t* err) {
  *err = 0;
  const int32 n = Count(x);
  const int32 nb = *bins;
  if (n < 1 || nb < 1) return FailA(err, TSM_ERR_EMPTY, centres, counts);
  int32 r = ResizeOutput(centres, nb);
  if (r == 0) r = ResizeOutput(counts, nb);
  if (r != 0) return HostFailA(err, r, centres, counts);
  const ErrorCode code = EqualWidthHistogram(Elems(x), n, Elems(counts), Elems(centres), nb);
  if (Failed(code, FailOn::kNonZero)) return FailA(err, code, centres, counts);
  return 0;
}

int32_t GenHistH(F64ArrayHdl x, GenHistIntervalHdl intervals, I32ArrayHdl counts, GenHistOutliers* outliers,
                 int32_t* err) {
  *err = 0;
  const int32 m = Count(intervals);
  const auto fail = [&](ErrorCode code, int32 result) {
    EmptyOutput(counts);
    *outliers = GenHistOutliers{0, 0, 0};
    *err = code;
    return result;
  };
  if (m < 0) return fail(TSM_ERR_SIZE_PAIR, 0);
  if (const int32 r = ResizeOutput(counts, m); r != 0) return fail(TSM_ERR_NO_MEMORY, r);
  // A private copy of the packed 20-byte records.
  const std::unique_ptr<HistInterval, decltype(&std::free)> own(
      static_cast<HistInterval*>(std::malloc(sizeof(HistInterval) * static_cast<std::size_t>(m > 0 ? m : 1))),
      &std::free);
  if (!own) return fail(TSM_ERR_NO_MEMORY, 0);
  const GenHistInterval* packed = Elems(intervals);
  for (int32 j = 0; j < m; ++j) {
    GenHistInterval rec;
    std::memcpy(&rec, packed + j, sizeof rec);
    own.get()[j] = HistInterval{rec.lower, rec.upper, rec.inclusion};
  }
  HistOutliers out{};
  const ErrorCode code = GeneralHistogram(Elems(x), Count(x), own.get(), m, Elems(counts), &out);
  if (Failed(code, FailOn::kNonZero)) return fail(code, 0);
  *outliers = GenHistOutliers{out.total, out.below, out.above};
  return 0;
}

}  // extern "C"
