// Heap allocation counting for benchmarks: the benchmark binary replaces the
// global operator new, so a benchmark can say how many allocations its loop
// made.
//
//   const auto before = zmt::bench::AllocationCount();
//   for (auto _ : state) { ... }
//   state.counters["allocs/iter"] = zmt::bench::AllocationsPerIteration(state, before);
#pragma once

#include <benchmark/benchmark.h>

#include <cstdint>

namespace zmt::bench {

std::uint64_t AllocationCount() noexcept;

inline double AllocationsPerIteration(const benchmark::State& state, std::uint64_t before) {
  const auto iterations = static_cast<double>(state.iterations());
  return iterations > 0 ? static_cast<double>(AllocationCount() - before) / iterations : 0.0;
}

}  // namespace zmt::bench
