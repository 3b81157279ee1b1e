// ComputeChannelConversionMatrix and ComputeDownmixMatrix against libswresample's
// matrix builder, side by side in one run. Prints, for each conversion, both
// times and the ratio. The peer always builds its down-mix; ours is a down-mix
// where the layouts allow one and the routing matrix otherwise (stereo->5.1).
#include <benchmark/benchmark.h>
#include <zebmediatypes/channel_conversion_matrix.h>

#include <cmath>
#include <cstdio>
#include <string>
#include <vector>

#include "alloc_counter.h"
#include "run_times.h"

extern "C" {
#include <libavutil/channel_layout.h>
#include <libswresample/swresample.h>
}

namespace {

using zebmediatypes::AudioChannelLayout;
using zebmediatypes::ChannelConversionMatrix;

struct Conversion {
  const char* name;
  AudioChannelLayout (*source)();
  AudioChannelLayout (*destination)();
  std::uint64_t peerSource;
  std::uint64_t peerDestination;
};

const Conversion kConversions[] = {
    {"5.1->stereo", &zebmediatypes::Create51ChannelLayout,
     &zebmediatypes::CreateStereoChannelLayout, AV_CH_LAYOUT_5POINT1_BACK, AV_CH_LAYOUT_STEREO},
    {"7.1->5.1", &zebmediatypes::Create7_1ItuChannelLayout, &zebmediatypes::Create51ChannelLayout,
     AV_CH_LAYOUT_7POINT1, AV_CH_LAYOUT_5POINT1_BACK},
    {"stereo->5.1", &zebmediatypes::CreateStereoChannelLayout,
     &zebmediatypes::Create51ChannelLayout, AV_CH_LAYOUT_STEREO, AV_CH_LAYOUT_5POINT1_BACK},
    {"7.1->stereo", &zebmediatypes::Create_L_R_C_LFE_Ls_Rs_Lsd_Rsd_ChannelLayout,
     &zebmediatypes::CreateStereoChannelLayout, AV_CH_LAYOUT_7POINT1, AV_CH_LAYOUT_STEREO},
};

// The caller keeps its matrix from call to call, as a mixer does.
void Ours(benchmark::State& state, const Conversion& conversion) {
  const AudioChannelLayout source = conversion.source();
  const AudioChannelLayout destination = conversion.destination();
  ChannelConversionMatrix matrix;
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    zebmediatypes::ComputeChannelConversionMatrix(source, destination, matrix);
    benchmark::DoNotOptimize(matrix.data());
    benchmark::ClobberMemory();
  }
  state.counters["allocs/iter"] = zmt::bench::AllocationsPerIteration(state, before);
}

// A new matrix on every call.
void OursFresh(benchmark::State& state, const Conversion& conversion) {
  const AudioChannelLayout source = conversion.source();
  const AudioChannelLayout destination = conversion.destination();
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    ChannelConversionMatrix matrix;
    zebmediatypes::ComputeChannelConversionMatrix(source, destination, matrix);
    benchmark::DoNotOptimize(matrix.data());
    benchmark::ClobberMemory();
  }
  state.counters["allocs/iter"] = zmt::bench::AllocationsPerIteration(state, before);
}

// The down-mix, into a matrix kept from call to call.
void OursDownmix(benchmark::State& state, const Conversion& conversion) {
  const AudioChannelLayout source = conversion.source();
  const AudioChannelLayout destination = conversion.destination();
  ChannelConversionMatrix matrix;
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    zebmediatypes::ComputeDownmixMatrix(source, destination, matrix);
    benchmark::DoNotOptimize(matrix.data());
    benchmark::ClobberMemory();
  }
  state.counters["allocs/iter"] = zmt::bench::AllocationsPerIteration(state, before);
}

// The peer writes 64 rows of the caller's stride whatever the layouts.
void Peer(benchmark::State& state, const Conversion& conversion) {
  AVChannelLayout source{};
  AVChannelLayout destination{};
  av_channel_layout_from_mask(&source, conversion.peerSource);
  av_channel_layout_from_mask(&destination, conversion.peerDestination);
  constexpr int kStride = 64;
  std::vector<double> matrix(64 * kStride);
  for (auto _ : state) {
    const int status = swr_build_matrix2(&source, &destination, M_SQRT1_2, M_SQRT1_2, 0.0, 1.0, 1.0,
                                         matrix.data(), kStride, AV_MATRIX_ENCODING_NONE, nullptr);
    benchmark::DoNotOptimize(status);
    benchmark::ClobberMemory();
  }
  av_channel_layout_uninit(&source);
  av_channel_layout_uninit(&destination);
}

}  // namespace

int main(int argc, char** argv) {
  for (const Conversion& conversion : kConversions) {
    const std::string name = conversion.name;
    benchmark::RegisterBenchmark(("ConversionMatrix/ours/" + name).c_str(), Ours, conversion);
    benchmark::RegisterBenchmark(("ConversionMatrix/ours-new-matrix/" + name).c_str(), OursFresh,
                                 conversion);
    benchmark::RegisterBenchmark(("ConversionMatrix/ours-downmix/" + name).c_str(), OursDownmix,
                                 conversion);
    benchmark::RegisterBenchmark(("ConversionMatrix/peer/" + name).c_str(), Peer, conversion);
  }
  const auto times = zmt::bench::RunAndCollectTimes(argc, argv);
  if (!times) return 1;

  std::printf(
      "\nComputeChannelConversionMatrix (ours, ours-new-matrix) and ComputeDownmixMatrix "
      "(ours-downmix) against swr_build_matrix2 (same run):\n");
  for (const Conversion& conversion : kConversions) {
    const std::string name = conversion.name;
    const double peer = zmt::bench::TimeOf(*times, "ConversionMatrix/peer/" + name);
    for (const char* variant : {"ours", "ours-new-matrix", "ours-downmix"}) {
      const double ours =
          zmt::bench::TimeOf(*times, std::string("ConversionMatrix/") + variant + "/" + name);
      if (std::isnan(ours) || std::isnan(peer)) continue;
      std::printf("  %-12s %-16s ours %8.1f ns, peer %8.1f ns, ratio %6.1fx\n", name.c_str(),
                  variant, ours, peer, peer / ours);
    }
  }
  return 0;
}
