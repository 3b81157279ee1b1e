// Tick times and frame rates: arithmetic, alignment, rate matching and the JSON
// round trip. Each benchmark reports its heap allocations per iteration; the
// value operations must make none.
#include <benchmark/benchmark.h>
#include <zebcore/json.h>
#include <zebmediatypes/tick_time.h>

#include <cstdint>

#include "alloc_counter.h"

namespace {

using namespace zebmediatypes;

void SetAllocations(benchmark::State& state, std::uint64_t before) {
  state.counters["allocs/iter"] = zmt::bench::AllocationsPerIteration(state, before);
}

void BM_TickTimeArithmetic(benchmark::State& state) {
  TickTime t(12345, kFrameRate_Video29_97);
  const TickTime step = kTime_OneSecond / 7;
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    benchmark::DoNotOptimize(t);
    TickTime u = (t + step) * 3 - step;
    u = u / 2;
    u.AddFrames(5, kFrameRate_Video25);
    benchmark::DoNotOptimize(u);
  }
  SetAllocations(state, before);
}
BENCHMARK(BM_TickTimeArithmetic);

void BM_TickTimeDoubleArithmetic(benchmark::State& state) {
  TickTime t(12345, kFrameRate_Video29_97);
  double factor = 1.001;
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    benchmark::DoNotOptimize(t);
    benchmark::DoNotOptimize(factor);
    benchmark::DoNotOptimize(t * factor / 1.5);
  }
  SetAllocations(state, before);
}
BENCHMARK(BM_TickTimeDoubleArithmetic);

void BM_TickTimeAlign(benchmark::State& state) {
  const FrameRate kRates[] = {kFrameRate_Video29_97, kFrameRate_Video25, kFrameRate_Audio48000,
                              kFrameRate_Video23_976};
  std::int64_t ticks = 987654321987;
  std::size_t i = 0;
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    const FrameRate rate = kRates[i++ & 3];
    TickTime a(ticks), b(ticks), c(ticks);
    a.AlignToFrame(rate);
    b.AlignToFrameCeil(rate);
    c.AlignToNearestFrame(rate);
    benchmark::DoNotOptimize(a);
    benchmark::DoNotOptimize(b);
    benchmark::DoNotOptimize(c);
    ticks += 7777777;
  }
  SetAllocations(state, before);
}
BENCHMARK(BM_TickTimeAlign);

void BM_TickTimeToFrame(benchmark::State& state) {
  TickTime t(123456789, kFrameRate_Audio48000);
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    benchmark::DoNotOptimize(t);
    benchmark::DoNotOptimize(t.ToFrame64(kFrameRate_Video29_97));
  }
  SetAllocations(state, before);
}
BENCHMARK(BM_TickTimeToFrame);

void BM_MatchedFrameRateFromFloat(benchmark::State& state) {
  const double kFps[] = {29.97, 25.0, 44100.0, 59.94, 23.976, 48000.0, 30.0, 12.5};
  std::size_t i = 0;
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    benchmark::DoNotOptimize(MatchedFrameRateFromFloat(kFps[i++ & 7]));
  }
  SetAllocations(state, before);
}
BENCHMARK(BM_MatchedFrameRateFromFloat);

void BM_TickTimeJSONRoundTrip(benchmark::State& state) {
  using zebcore::serialization::JSONConvert;
  TickTime t(123456, kFrameRate_Video29_97);
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    const auto text = zebcore::serialization::ToJSONText(t);
    const auto parsed = zebcore::serialization::JSONParse(text);
    t = JSONConvert<TickTime>::FromJSON(*parsed);
    benchmark::DoNotOptimize(t);
  }
  SetAllocations(state, before);
}
BENCHMARK(BM_TickTimeJSONRoundTrip);

void BM_TickTimeJSONValue(benchmark::State& state) {
  using zebcore::serialization::JSONConvert;
  TickTime t(123456, kFrameRate_Video29_97);
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    t = JSONConvert<TickTime>::FromJSON(JSONConvert<TickTime>::ToJSON(t));
    benchmark::DoNotOptimize(t);
  }
  SetAllocations(state, before);
}
BENCHMARK(BM_TickTimeJSONValue);

}  // namespace

BENCHMARK_MAIN();
