// Native audio rates and audio descriptions.
#include <alloc_counter.h>
#include <benchmark/benchmark.h>
#include <zebmediatypes/audio_descriptions.h>
#include <zebmediatypes/audio_frame_rate_utils.h>

#include <cstdint>
#include <vector>

namespace zebmediatypes {
namespace {

constexpr std::int64_t kTicksPerSecond = 254016000000;

// A mix of native rates, whole fractions of them and rates in between.
std::vector<FrameRate> SampleRates() {
  std::vector<FrameRate> rates;
  for (std::int64_t hz : {8000, 11025, 12000, 22000, 24000, 30000, 44100, 47000, 48000, 7350, 88500,
                          96000, 176400, 192000, 400, 6000}) {
    rates.push_back(FrameRate(kTicksPerSecond / hz));
  }
  return rates;
}

void BM_FindBestNativeAudioRate(benchmark::State& state) {
  const std::vector<FrameRate> rates = SampleRates();
  std::size_t i = 0;
  for (auto _ : state) {
    benchmark::DoNotOptimize(FindBestNativeAudioRate(rates[i]));
    i = (i + 1) % rates.size();
  }
}
BENCHMARK(BM_FindBestNativeAudioRate);

void LayoutDescription(benchmark::State& state, AudioChannelLayout (*factory)()) {
  const AudioChannelLayout layout = factory();
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) benchmark::DoNotOptimize(AudioChannelLayoutDescription(layout));
  state.counters["allocs/iter"] = zmt::bench::AllocationsPerIteration(state, before);
}
BENCHMARK_CAPTURE(LayoutDescription, Stereo, CreateStereoChannelLayout);
BENCHMARK_CAPTURE(LayoutDescription, Surround51, CreateBroadcast51ChannelLayout);
BENCHMARK_CAPTURE(LayoutDescription, SmpteDtv, CreateSmpteDtvChannelLayout);
BENCHMARK_CAPTURE(LayoutDescription, Vst102, CreateVST10_2ChannelLayout);

void BM_AudioChannelConfigurationDescription(benchmark::State& state) {
  const AudioChannelLayoutList layouts = {CreateBroadcast51ChannelLayout(),
                                          CreateStereoChannelLayout()};
  for (auto _ : state) benchmark::DoNotOptimize(AudioChannelConfigurationDescription(layouts));
}
BENCHMARK(BM_AudioChannelConfigurationDescription);

void BM_GetChannelMappingLabels(benchmark::State& state) {
  const ChannelMap map = ChannelMap::CreateDefaultChannelMap(6);
  const AudioChannelLayout layout = CreateBroadcast51ChannelLayout();
  for (auto _ : state) benchmark::DoNotOptimize(GetChannelMappingLabels(map, 8, layout));
}
BENCHMARK(BM_GetChannelMappingLabels);

}  // namespace
}  // namespace zebmediatypes

BENCHMARK_MAIN();
