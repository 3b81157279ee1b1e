// A program that uses the installed library: timecode written and read back,
// a frame size, and the default colour space. Exits 1 if a value is wrong.
#include <zebmediatypes/zebmediatypes.h>

#include <iostream>
#include <optional>

int main() {
  namespace zmt = zebmediatypes;

  // Times, rates, timecode, audio layouts and pixel formats are plain values:
  // they need no set-up. Display texts are UTF-16 (zebcore::UTF16String) and
  // print as UTF-8 on any std::ostream.
  const zmt::TickTime minute(1800, zmt::kFrameRate_Video29_97);
  const auto text = zmt::TimeToTimecode(minute, zmt::kFrameRate_Video29_97);
  std::cout << "1800 frames at 29.97 fps: " << text << "\n";  // 00;01;00;02

  // The Try readers say when text does not read; they take UTF-8 or UTF-16.
  const std::optional<zmt::TickTime> read =
      zmt::TryTimecodeToTime("00;01;00;02", zmt::kFrameRate_Video29_97);
  if (!read) return 1;
  std::cout << "00;01;00;02 is " << read->ToSeconds() << " s\n";  // 60.06 s

  const auto bytes = zmt::PixelFormatSize(zmt::kPixelFormat_UYVY_422_8u, 1920, 1080);
  std::cout << "a UYVY 1920x1080 frame: " << bytes << " bytes\n";  // 4147200

  // The default colour space is process-wide state: it exists between
  // Initialize() and the matching Terminate() (calls pair up, from any thread).
  zmt::Initialize();
  const auto space = zmt::color::GetDefaultColorSpace().baseColorProfile.colorProfileName;
  zmt::Terminate();
  std::cout << "default colour space: " << space << "\n";  // BT.709 RGB Full

  const bool ok = text == u"00;01;00;02" && *read == minute && bytes == 4147200 &&
                  zebcore::string::ToStdString(space) == "BT.709 RGB Full";
  return ok ? 0 : 1;
}
