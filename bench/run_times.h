// Running a benchmark binary and keeping its times, so that main() can print
// ours against the peer's from the same run:
//
//   const auto times = zmt::bench::RunAndCollectTimes(argc, argv);
//   if (!times) return 1;
//   std::printf("ratio %.2f\n", times->at("Peer/25") / times->at("Ours/25"));
#pragma once

#include <map>
#include <optional>
#include <string>

namespace zmt::bench {

// Each run's CPU time per iteration, in nanoseconds whatever the benchmark's
// display unit, by benchmark name; with repetitions, the median. CPU time
// rather than wall time, as the machine may be shared.
using RunTimes = std::map<std::string, double>;

// Runs every registered benchmark with the console reporter and returns the
// times; nullopt when the command line holds an argument Google Benchmark does
// not know (it has already said so).
std::optional<RunTimes> RunAndCollectTimes(int& argc, char** argv);

// The time of `name` in `times`, or NaN when it did not run (filtered out).
double TimeOf(const RunTimes& times, const std::string& name);

}  // namespace zmt::bench
