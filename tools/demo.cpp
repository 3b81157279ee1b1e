// A short look at the library at work: tick times, frame rates and what a time
// is in frames of a rate.
#include <zebmediatypes/zebmediatypes.h>

#include <iostream>

namespace zmt = zebmediatypes;

int main() {
  struct Example {
    const char* label;
    zmt::TickTime time;
    zmt::FrameRate rate;
  };
  const Example kExamples[] = {
      {"one second at 24 fps", zmt::kTime_OneSecond, zmt::kFrameRate_Video24},
      {"30 frames at 29.97 fps", zmt::TickTime(30, zmt::kFrameRate_Video29_97),
       zmt::kFrameRate_Video29_97},
      {"one minute at 23.976 fps", zmt::kTime_OneMinute, zmt::kFrameRate_Video23_976},
      {"one hour at 59.94 fps", zmt::kTime_OneHour, zmt::kFrameRate_Video59_94},
      {"half a second of 48 kHz audio", zmt::kTime_OneSecond / 2, zmt::kFrameRate_Audio48000},
      {"1.5 seconds with no rate", zmt::kTime_OneSecond * 1.5, zmt::kFrameRate_Invalid},
  };
  std::cout << "zebmediatypes: one tick is 1/" << zmt::kTime_OneSecond.GetTicks()
            << " of a second\n\n";
  for (const Example& e : kExamples) {
    std::cout << e.label << ": " << e.time.GetTicks() << " ticks, " << e.time << " s, "
              << zmt::details::ExplainTickTimeWithFrameRate(e.time, e.rate) << "\n";
  }

  zmt::TickTime between(3 * zmt::kFrameRate_Video60.GetTicksPerFrame() + 1);
  zmt::TickTime down = between, up = between, nearest = between;
  down.AlignToFrame(zmt::kFrameRate_Video60);
  up.AlignToFrameCeil(zmt::kFrameRate_Video60);
  nearest.AlignToNearestFrame(zmt::kFrameRate_Video60);
  std::cout << "\n3 frames and 1 tick at 60 fps aligns down to frame "
            << down.ToFrame64(zmt::kFrameRate_Video60) << ", up to frame "
            << up.ToFrame64(zmt::kFrameRate_Video60) << ", to the nearest frame "
            << nearest.ToFrame64(zmt::kFrameRate_Video60) << "\n";

  const double kTyped[] = {23.976, 25.0, 29.97, 44100.0, 59.94};
  for (double fps : kTyped) {
    const zmt::FrameRate rate = zmt::MatchedFrameRateFromFloat(fps);
    std::cout << fps << " fps matches " << rate.GetTicksPerFrame() << " ticks per frame (" << rate
              << (zmt::IsFrameRateAudio(rate) ? " Hz, audio" : " fps") << ")\n";
  }
  return 0;
}
