// Uses the installed library through its umbrella header only: a timecode, a
// down-mix, a frame size, a MIME text, the default colour space and a script
// object.
#include <zebmediatypes/zebmediatypes.h>

#include <iostream>
#include <string>

int main() {
  using namespace zebmediatypes;
  Initialize();

  const zebcore::UTF16String timecode =
      TimeToTimecode(TickTime(1800, kFrameRate_Video29_97), kFrameRate_Video29_97,
                     TimeDisplay(kTimeDisplay_2997DropTimecode), {});
  ChannelConversionMatrix matrix;
  ComputeChannelConversionMatrix(Create51ChannelLayout(), CreateStereoChannelLayout(), matrix);
  const std::uint64_t frameBytes = PixelFormatSize(kPixelFormat_UYVY_422_8u, 1920, 1080);
  const std::string space =
      zebcore::string::ToStdString(color::GetDefaultColorSpace().baseColorProfile.colorProfileName);

  const zebscripting::ScriptObjectPtr script = scripting::CreateTickTimeObject(kTime_OneSecond, 0);
  Terminate();

  const bool ok = timecode == u"00;01;00;02" && matrix.size() == 2 && frameBytes == 4147200 &&
                  space == "BT.709 RGB Full" && kMimeType_Video_MP4 == "video/mp4" && script &&
                  script->GetClassName() == std::string("TickTime");
  std::cout << "consumer: 1800 frames at 29.97 drop-frame is "
            << zebcore::string::UTF16toNarrow(timecode) << "; 5.1 -> stereo has " << matrix.size()
            << " rows; UYVY 1920x1080 needs " << frameBytes << " bytes; default colour space "
            << space << " -> " << (ok ? "ok" : "WRONG") << "\n";
  return ok ? 0 : 1;
}
