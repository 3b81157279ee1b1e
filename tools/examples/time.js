// Times, rates and timecode from script:
//   zebmediatypes-script time.js [words...]
var T = zebmediatypes.TickTime;
var rate = zebmediatypes.FrameRate.createWithValue(30000 / 1001);
var display = new zebmediatypes.TimeDisplay();
display.type = 102; // 29.97 drop-frame timecode

var t = new T();
t.seconds = 60.06;
print("60.06 s is", t.ticks, "ticks, timecode", T.timeToTimecode(t, rate, display));

var back = T.timecodeToTime("00;10;00;00", rate, display);
print("00;10;00;00 is", back.seconds, "s");

var field = RatioTime.createRatioTime(2002, 120000);
print("a 59.94 field lasts", field.value + "/" + field.scale, "s");

var L = zebmediatypes.AudioChannelLayout;
var surround = L.createCommonAudioChannelLayout(L.CHANNELLAYOUT_51);
var format = new zebmediatypes.AudioFormat(48000, 24, surround);
print("audio:", format.sampleRate, "Hz,", format.bitDepth, "bit,", format.channelLayout.description);

var P = zebmediatypes.PixelFormat;
var pixels = P.createPixelFormat(P.PIXELFORMAT_UYVY_422_8U);
print("video: pixel format", P.PIXELFORMAT_UYVY_422_8U, pixels.isEqual(P.createPixelFormat("uyvy")));

try {
  t.ticksNumber = T.TIME_INVALID.ticksNumber;
} catch (e) {
  print("refused:", e.name, e.message);
}
if (scriptArgs.length > 0) print("arguments:", scriptArgs.join(", "));
