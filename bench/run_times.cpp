#include "run_times.h"

#include <benchmark/benchmark.h>

#include <cmath>
#include <vector>

namespace zmt::bench {
namespace {

class CollectingReporter : public benchmark::ConsoleReporter {
 public:
  explicit CollectingReporter(RunTimes& times) : times_(times) {}

  void ReportRuns(const std::vector<Run>& runs) override {
    for (const Run& run : runs) {
      const double nanoseconds =
          run.GetAdjustedCPUTime() * 1e9 / benchmark::GetTimeUnitMultiplier(run.time_unit);
      if (run.run_type == Run::RT_Iteration && run.repetitions <= 1) {
        times_[run.benchmark_name()] = nanoseconds;
      } else if (run.run_type == Run::RT_Aggregate && run.aggregate_name == "median") {
        times_[run.run_name.str()] = nanoseconds;
      }
    }
    ConsoleReporter::ReportRuns(runs);
  }

 private:
  RunTimes& times_;
};

}  // namespace

std::optional<RunTimes> RunAndCollectTimes(int& argc, char** argv) {
  benchmark::Initialize(&argc, argv);
  if (benchmark::ReportUnrecognizedArguments(argc, argv)) return std::nullopt;
  RunTimes times;
  CollectingReporter reporter(times);
  benchmark::RunSpecifiedBenchmarks(&reporter);
  benchmark::Shutdown();
  return times;
}

double TimeOf(const RunTimes& times, const std::string& name) {
  const auto found = times.find(name);
  return found == times.end() ? NAN : found->second;
}

}  // namespace zmt::bench
