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

try {
  t.ticksNumber = T.TIME_INVALID.ticksNumber;
} catch (e) {
  print("refused:", e.name, e.message);
}
if (scriptArgs.length > 0) print("arguments:", scriptArgs.join(", "));
