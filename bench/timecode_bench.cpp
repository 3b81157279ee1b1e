// Timecode formatting and reading, side by side with libavutil's timecode
// functions on the same frames at 30000/1001 drop-frame (and at 25 fps).
//
// After the benchmarks, prints for each pair: ours, the peer's and the ratio
// (peer time / our time; above 1 means ours is faster). Our text is the
// returned UTF-16 string, its allocation included; the peer writes into a
// buffer on the stack.
#include <zebmediatypes/timecode.h>

extern "C" {
#include <libavutil/timecode.h>
}

#include <benchmark/benchmark.h>

#include <cmath>
#include <cstdint>
#include <cstdio>
#include <string>
#include <vector>

#include "alloc_counter.h"
#include "run_times.h"

namespace media = zebmediatypes;

namespace {

constexpr std::size_t kFrameCount = 4096;

// Frames spread over a day of 29.97 fps time, the same for every benchmark.
const std::vector<std::int64_t>& Frames() {
  static const std::vector<std::int64_t> frames = [] {
    std::vector<std::int64_t> out;
    std::uint64_t x = 88172645463325252ull;
    for (std::size_t i = 0; i < kFrameCount; ++i) {
      x ^= x << 13;
      x ^= x >> 7;
      x ^= x << 17;
      out.push_back(static_cast<std::int64_t>(x % 2589408));
    }
    return out;
  }();
  return frames;
}

struct Style {
  media::FrameRate rate;
  media::TimeDisplay display;
};

const Style kDrop{media::kFrameRate_Video29_97,
                  media::TimeDisplay(media::kTimeDisplay_2997DropTimecode)};
const Style k25{media::kFrameRate_Video25, media::TimeDisplay(media::kTimeDisplay_25Timecode)};
const Style k35mm{media::kFrameRate_Video24,
                  media::TimeDisplay(media::kTimeDisplay_35mmFeetFrames)};

void OursFormat(benchmark::State& state, const Style& style) {
  const auto& frames = Frames();
  std::size_t i = 0;
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    const media::TickTime time(frames[i++ % kFrameCount], style.rate);
    benchmark::DoNotOptimize(media::TimeToTimecode(time, style.rate, style.display, {}));
  }
  state.counters["allocs/iter"] = zmt::bench::AllocationsPerIteration(state, before);
}

void OursRead(benchmark::State& state, const Style& style) {
  std::vector<zebcore::UTF16String> texts;
  for (std::int64_t f : Frames()) {
    texts.push_back(
        media::TimeToTimecode(media::TickTime(f, style.rate), style.rate, style.display, {}));
  }
  std::size_t i = 0;
  for (auto _ : state) {
    const zebcore::UTF16String& text = texts[i++ % kFrameCount];
    benchmark::DoNotOptimize(media::TimecodeToTime(text, style.rate, style.display, {}));
  }
}

AVTimecode PeerTimecode(AVRational rate, int flags) {
  AVTimecode tc{};
  av_timecode_init(&tc, rate, flags, 0, nullptr);
  return tc;
}

void PeerFormat(benchmark::State& state, AVRational rate, int flags) {
  const AVTimecode tc = PeerTimecode(rate, flags);
  const auto& frames = Frames();
  std::size_t i = 0;
  for (auto _ : state) {
    char buffer[AV_TIMECODE_STR_SIZE];
    benchmark::DoNotOptimize(
        av_timecode_make_string(&tc, buffer, static_cast<int>(frames[i++ % kFrameCount])));
    benchmark::ClobberMemory();
  }
}

void PeerRead(benchmark::State& state, AVRational rate, int flags) {
  const AVTimecode tc = PeerTimecode(rate, flags);
  std::vector<std::string> texts;
  for (std::int64_t f : Frames()) {
    char buffer[AV_TIMECODE_STR_SIZE];
    texts.emplace_back(av_timecode_make_string(&tc, buffer, static_cast<int>(f)));
  }
  std::size_t i = 0;
  for (auto _ : state) {
    AVTimecode parsed;
    benchmark::DoNotOptimize(
        av_timecode_init_from_string(&parsed, rate, texts[i++ % kFrameCount].c_str(), nullptr));
    benchmark::DoNotOptimize(parsed);
  }
}

constexpr AVRational kPeer2997{30000, 1001};
constexpr AVRational kPeer25{25, 1};
constexpr int kPeerDrop = AV_TIMECODE_FLAG_DROPFRAME | AV_TIMECODE_FLAG_24HOURSMAX;

BENCHMARK_CAPTURE(OursFormat, 2997Drop, kDrop);
BENCHMARK_CAPTURE(PeerFormat, 2997Drop, kPeer2997, kPeerDrop);
BENCHMARK_CAPTURE(OursRead, 2997Drop, kDrop);
BENCHMARK_CAPTURE(PeerRead, 2997Drop, kPeer2997, kPeerDrop);
BENCHMARK_CAPTURE(OursFormat, 25, k25);
BENCHMARK_CAPTURE(PeerFormat, 25, kPeer25, AV_TIMECODE_FLAG_24HOURSMAX);
BENCHMARK_CAPTURE(OursRead, 25, k25);
BENCHMARK_CAPTURE(PeerRead, 25, kPeer25, AV_TIMECODE_FLAG_24HOURSMAX);
BENCHMARK_CAPTURE(OursFormat, 35mmFeetFrames, k35mm);
BENCHMARK_CAPTURE(OursRead, 35mmFeetFrames, k35mm);

}  // namespace

int main(int argc, char** argv) {
  const auto times = zmt::bench::RunAndCollectTimes(argc, argv);
  if (!times) return 1;
  const struct {
    const char* label;
    const char* ours;
    const char* peer;
  } kPairs[] = {
      {"format 29.97 drop-frame", "OursFormat/2997Drop", "PeerFormat/2997Drop"},
      {"read 29.97 drop-frame", "OursRead/2997Drop", "PeerRead/2997Drop"},
      {"format 25 fps", "OursFormat/25", "PeerFormat/25"},
      {"read 25 fps", "OursRead/25", "PeerRead/25"},
  };
  std::printf("\n");
  for (const auto& pair : kPairs) {
    const double ours = zmt::bench::TimeOf(*times, pair.ours);
    const double peer = zmt::bench::TimeOf(*times, pair.peer);
    if (std::isnan(ours) || std::isnan(peer) || ours <= 0) continue;
    std::printf("%-24s ours %6.1f ns, libavutil %6.1f ns, ratio %.2f\n", pair.label, ours, peer,
                peer / ours);
  }
  for (const char* name : {"OursFormat/35mmFeetFrames", "OursRead/35mmFeetFrames"}) {
    const double ours = zmt::bench::TimeOf(*times, name);
    if (!std::isnan(ours)) std::printf("%-24s ours %6.1f ns (no peer)\n", name, ours);
  }
  return 0;
}
