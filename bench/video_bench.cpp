// Video format benchmarks: frame and row sizes and plane layouts side by side
// with libavutil's av_image_get_buffer_size / av_image_get_linesize /
// av_image_fill_linesizes + av_image_fill_plane_sizes on the nearest equivalent
// formats, plus the catalogue lookups and format selection.
//
// After the benchmarks the program prints, for each pair, "ours X ns, peer Y
// ns, ratio Z" (ratio = ours / peer, per call).
#include <benchmark/benchmark.h>

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <iterator>
#include <map>
#include <string>

extern "C" {
#include <libavutil/imgutils.h>
#include <libavutil/pixfmt.h>
}

#include <zebmediatypes/pixel_format.h>
#include <zebmediatypes/pixel_format_selection.h>

#include "alloc_counter.h"

namespace {

using namespace zebmediatypes;

struct FormatPair {
  PixelFormat ours;
  AVPixelFormat peer;
};

// Nearest equivalents, one per layout family.
const FormatPair kFormats[] = {
    {kPixelFormat_BGRA_4444_8u, AV_PIX_FMT_BGRA},
    {kPixelFormat_ARGB_4444_8u, AV_PIX_FMT_ARGB},
    {kPixelFormat_XRGB_4444_8u, AV_PIX_FMT_0RGB},
    {kPixelFormat_BGRA_4444_15u, AV_PIX_FMT_BGRA64LE},
    {kPixelFormat_VUYA_4444_15u, AV_PIX_FMT_AYUV64LE},
    {kPixelFormat_ARGB_4444_32f_Planar, AV_PIX_FMT_GBRAPF32LE},
    {kPixelFormat_RGB_444_32f_Planar, AV_PIX_FMT_GBRPF32LE},
    {kPixelFormat_RGB_444_10u, AV_PIX_FMT_X2RGB10LE},
    {kPixelFormat_UYVY_422_8u, AV_PIX_FMT_UYVY422},
    {kPixelFormat_YUYV_422_8u, AV_PIX_FMT_YUYV422},
    {kPixelFormat_Y210_422_10u_as16u_709, AV_PIX_FMT_Y210LE},
    {kPixelFormat_YUV_422_BiPlanar_10u_as16u, AV_PIX_FMT_P210LE},
    {kPixelFormat_YUV_420_MPEG2_FRAME_PICTURE_PLANAR_8u_601, AV_PIX_FMT_YUV420P},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, AV_PIX_FMT_NV12},
    {kPixelFormat_YVU_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709, AV_PIX_FMT_NV21},
    {kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_10u_as16u_709, AV_PIX_FMT_P010LE},
};
static_assert(std::size(kFormats) == 16);

struct Size {
  int width;
  int height;
};
const Size kSizes[] = {{320, 240},   {479, 359},   {720, 480},   {1280, 720},
                       {1920, 1080}, {1921, 1081}, {3840, 2160}, {4096, 2160}};
static_assert(std::size(kSizes) == 8);

constexpr double kCallsPerIteration = std::size(kFormats) * std::size(kSizes);
constexpr int kPeerAlign = 32;

void SetPerCall(benchmark::State& state, std::uint64_t allocationsBefore) {
  state.counters["ns/call"] =
      benchmark::Counter(kCallsPerIteration * static_cast<double>(state.iterations()),
                         benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
  state.counters["allocs/iter"] = zmt::bench::AllocationsPerIteration(state, allocationsBefore);
}

void OursPixelFormatSize(benchmark::State& state) {
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    for (const FormatPair& f : kFormats) {
      PixelFormat pf = f.ours;
      benchmark::DoNotOptimize(pf);
      for (const Size& s : kSizes) benchmark::DoNotOptimize(PixelFormatSize(pf, s.width, s.height));
    }
  }
  SetPerCall(state, before);
}

void PeerPixelFormatSize(benchmark::State& state) {
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    for (const FormatPair& f : kFormats) {
      AVPixelFormat pf = f.peer;
      benchmark::DoNotOptimize(pf);
      for (const Size& s : kSizes) {
        benchmark::DoNotOptimize(av_image_get_buffer_size(pf, s.width, s.height, kPeerAlign));
      }
    }
  }
  SetPerCall(state, before);
}

void OursRowBytes(benchmark::State& state) {
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    for (const FormatPair& f : kFormats) {
      PixelFormat pf = f.ours;
      benchmark::DoNotOptimize(pf);
      for (const Size& s : kSizes) {
        benchmark::DoNotOptimize(UncompressedPixelFormatRowBytes(pf, s.width));
      }
    }
  }
  SetPerCall(state, before);
}

void PeerRowBytes(benchmark::State& state) {
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    for (const FormatPair& f : kFormats) {
      AVPixelFormat pf = f.peer;
      benchmark::DoNotOptimize(pf);
      for (const Size& s : kSizes) benchmark::DoNotOptimize(av_image_get_linesize(pf, s.width, 0));
    }
  }
  SetPerCall(state, before);
}

void OursPlaneLayout(benchmark::State& state) {
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    for (const FormatPair& f : kFormats) {
      PixelFormat pf = f.ours;
      benchmark::DoNotOptimize(pf);
      for (const Size& s : kSizes) {
        benchmark::DoNotOptimize(GetPixelFormatPlaneLayout(pf, s.width, s.height));
      }
    }
  }
  SetPerCall(state, before);
}

// The peer's strides and plane sizes: what it takes there to locate the planes.
void PeerPlaneLayout(benchmark::State& state) {
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    for (const FormatPair& f : kFormats) {
      AVPixelFormat pf = f.peer;
      benchmark::DoNotOptimize(pf);
      for (const Size& s : kSizes) {
        int lineSizes[4];
        av_image_fill_linesizes(lineSizes, pf, s.width);
        const std::ptrdiff_t strides[4] = {lineSizes[0], lineSizes[1], lineSizes[2], lineSizes[3]};
        std::size_t planeBytes[4];
        benchmark::DoNotOptimize(av_image_fill_plane_sizes(planeBytes, pf, s.height, strides));
        benchmark::DoNotOptimize(planeBytes);
      }
    }
  }
  SetPerCall(state, before);
}

void LookupPropertiesForNameAll(benchmark::State& state) {
  for (auto _ : state) {
    for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
      PixelFormatName name = pf->fourCC;
      benchmark::DoNotOptimize(name);
      benchmark::DoNotOptimize(LookupPropertiesForName(name));
    }
  }
  state.counters["ns/call"] =
      benchmark::Counter(112.0 * static_cast<double>(state.iterations()),
                         benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
}

void GuessNameForPropertiesAll(benchmark::State& state) {
  for (auto _ : state) {
    for (const PixelFormat* pf = AllPixelFormatsBegin(); pf != AllPixelFormatsEnd(); ++pf) {
      PixelFormatProperties p = pf->properties;
      benchmark::DoNotOptimize(p);
      benchmark::DoNotOptimize(GuessNameForProperties(p));
    }
  }
  state.counters["ns/call"] =
      benchmark::Counter(112.0 * static_cast<double>(state.iterations()),
                         benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
}

void SelectNearestPixelFormatTypical(benchmark::State& state) {
  // A decoder offering four formats and a consumer accepting six others.
  const PixelFormatVector available = {kPixelFormat_UYVY_422_8u, kPixelFormat_V210_422_10u,
                                       kPixelFormat_YUYV_422_8u_709,
                                       kPixelFormat_YUV_420_MPEG4_FRAME_PICTURE_BIPLANAR_8u_709};
  const PixelFormatVector accepted = {kPixelFormat_BGRA_4444_8u,     kPixelFormat_BGRA_4444_32f,
                                      kPixelFormat_VUYA_4444_8u,     kPixelFormat_VUYA_4444_32f,
                                      kPixelFormat_VUYA_4444_8u_709, kPixelFormat_ARGB_4444_8u};
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    benchmark::DoNotOptimize(SelectNearestPixelFormat(available, kPixelFormat_VUYA_4444_32f,
                                                      accepted, kRenderQuality_High, false));
  }
  state.counters["allocs/iter"] = zmt::bench::AllocationsPerIteration(state, before);
}

// Keeps each run's per-call time for the side-by-side summary.
class SummaryReporter : public benchmark::ConsoleReporter {
 public:
  SummaryReporter() : ConsoleReporter(OO_Tabular) {}

  void ReportRuns(const std::vector<Run>& runs) override {
    ConsoleReporter::ReportRuns(runs);
    for (const Run& run : runs) {
      const auto it = run.counters.find("ns/call");
      if (it != run.counters.end()) perCall_[run.benchmark_name()] = it->second.value * 1e9;
    }
  }

  void PrintPair(const char* title, const std::string& ours, const std::string& peer) const {
    const auto o = perCall_.find(ours);
    const auto p = perCall_.find(peer);
    if (o == perCall_.end() || p == perCall_.end()) return;
    std::printf("%s: ours %.2f ns, peer %.2f ns, ratio %.2f\n", title, o->second, p->second,
                o->second / p->second);
  }

 private:
  std::map<std::string, double> perCall_;
};

}  // namespace

int main(int argc, char** argv) {
  benchmark::RegisterBenchmark("PixelFormatSize/ours", OursPixelFormatSize);
  benchmark::RegisterBenchmark("PixelFormatSize/av_image_get_buffer_size", PeerPixelFormatSize);
  benchmark::RegisterBenchmark("UncompressedPixelFormatRowBytes/ours", OursRowBytes);
  benchmark::RegisterBenchmark("UncompressedPixelFormatRowBytes/av_image_get_linesize",
                               PeerRowBytes);
  benchmark::RegisterBenchmark("GetPixelFormatPlaneLayout/ours", OursPlaneLayout);
  benchmark::RegisterBenchmark("GetPixelFormatPlaneLayout/av_image_fill_plane_sizes",
                               PeerPlaneLayout);
  benchmark::RegisterBenchmark("LookupPropertiesForName", LookupPropertiesForNameAll);
  benchmark::RegisterBenchmark("GuessNameForProperties", GuessNameForPropertiesAll);
  benchmark::RegisterBenchmark("SelectNearestPixelFormat", SelectNearestPixelFormatTypical);
  benchmark::Initialize(&argc, argv);
  SummaryReporter reporter;
  benchmark::RunSpecifiedBenchmarks(&reporter);
  std::printf("\nPer call, 16 formats x 8 sizes (ratio = ours / peer; below 1 is faster):\n");
  reporter.PrintPair("PixelFormatSize vs av_image_get_buffer_size", "PixelFormatSize/ours",
                     "PixelFormatSize/av_image_get_buffer_size");
  reporter.PrintPair("UncompressedPixelFormatRowBytes vs av_image_get_linesize",
                     "UncompressedPixelFormatRowBytes/ours",
                     "UncompressedPixelFormatRowBytes/av_image_get_linesize");
  reporter.PrintPair("GetPixelFormatPlaneLayout vs av_image_fill_linesizes + plane_sizes",
                     "GetPixelFormatPlaneLayout/ours",
                     "GetPixelFormatPlaneLayout/av_image_fill_plane_sizes");
  benchmark::Shutdown();
  return 0;
}
