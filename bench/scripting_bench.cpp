// Script calls into the host. Each script benchmark runs a loop of kCalls
// calls and reports the time per call:
//   - reading "ticksNumber" (the host's cheapest item: receiver check, native
//     getter, number result) against calling a plain engine function that
//     returns a number (the engine's own cost of a native call);
//   - "timeToTimecode" from script against the native TimeToTimecode.
// After the runs, prints each pair and the ratio ours / floor.
#include <benchmark/benchmark.h>
#include <zebmediatypes/scripting/time_objects.h>
#include <zebmediatypes/timecode.h>
#include <zebscripting/javascript.h>

#include <cmath>
#include <cstdio>
#include <string>
#include <vector>

#include "run_times.h"

namespace {

constexpr int kCalls = 20000;

constexpr const char* kSetUp =
    "var T = zebmediatypes.TickTime, t = new T(), r = zebmediatypes.FrameRate.createWithValue(25);"
    "var d = new zebmediatypes.TimeDisplay(); d.type = 101; t.ticksNumber = 914457600000000;"
    "function readTicks(n) { var s = 0; for (var i = 0; i < n; ++i) s += t.ticksNumber; return s; }"
    "function callPlain(n) { var s = 0; for (var i = 0; i < n; ++i) s += plain(); return s; }"
    "function formatTimecode(n) { var s; for (var i = 0; i < n; ++i) s = T.timeToTimecode(t, r, d);"
    "  return s; }";

// Runs `call` (a script expression) once per iteration; the time is per call.
void RunScript(benchmark::State& state, const char* call) {
  const auto context = zebscripting::JavaScriptContext::Create();
  context->DefinePlainNumberFunction("plain", 1);
  context->Evaluate(kSetUp, "bench.js");
  for (auto _ : state) {
    const auto result = context->Evaluate(call, "bench.js");
    benchmark::DoNotOptimize(result.ok);
  }
  state.SetItemsProcessed(state.iterations() * kCalls);
}

void ScriptReadTicksNumber(benchmark::State& state) { RunScript(state, "readTicks(20000)"); }
void ScriptPlainFunction(benchmark::State& state) { RunScript(state, "callPlain(20000)"); }
void ScriptTimeToTimecode(benchmark::State& state) { RunScript(state, "formatTimecode(20000)"); }
void NativeTimeToTimecode(benchmark::State& state) {
  using namespace zebmediatypes;
  const TickTime time(914457600000000);
  const TimeDisplay display(kTimeDisplay_25Timecode);
  for (auto _ : state) {
    for (int i = 0; i < kCalls; ++i) {
      benchmark::DoNotOptimize(TimeToTimecode(time, kFrameRate_Video25, display, {}));
    }
  }
  state.SetItemsProcessed(state.iterations() * kCalls);
}

BENCHMARK(ScriptReadTicksNumber)->Unit(benchmark::kMillisecond);
BENCHMARK(ScriptPlainFunction)->Unit(benchmark::kMillisecond);
BENCHMARK(ScriptTimeToTimecode)->Unit(benchmark::kMillisecond);
BENCHMARK(NativeTimeToTimecode)->Unit(benchmark::kMillisecond);

}  // namespace

int main(int argc, char** argv) {
  const auto times = zmt::bench::RunAndCollectTimes(argc, argv);
  if (!times) return 1;
  const struct {
    const char* label;
    const char* ours;
    const char* floor;
    const char* floorName;
  } kPairs[] = {
      {"read ticksNumber", "ScriptReadTicksNumber", "ScriptPlainFunction", "plain engine call"},
      {"timeToTimecode", "ScriptTimeToTimecode", "NativeTimeToTimecode", "native call"},
  };
  std::printf("\n");
  for (const auto& pair : kPairs) {
    const double ours = zmt::bench::TimeOf(*times, pair.ours);
    const double floor = zmt::bench::TimeOf(*times, pair.floor);
    if (std::isnan(ours) || std::isnan(floor) || floor <= 0) continue;
    std::printf("%-18s script %7.1f ns/call, %s %7.1f ns/call, ratio %.2f\n", pair.label,
                ours / kCalls, pair.floorName, floor / kCalls, ours / floor);
  }
  return 0;
}
