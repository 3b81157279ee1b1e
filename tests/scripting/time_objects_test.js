// The time script classes as script sees them: the edge cases of their
// items, refused writes, error kinds, and the faults mended over the item
// descriptions. Runs to its end when every case holds; throws otherwise.
var Z = zebmediatypes;
var failures = [];

function same(a, b) {
  return a === b || (a !== a && b !== b);
}
function check(label, actual, expected) {
  if (!same(actual, expected)) failures.push(label + ": got " + actual + ", want " + expected);
}
// The name of the error `run` throws, or "none".
function thrown(run) {
  try {
    run();
  } catch (e) {
    return e.name;
  }
  return "none";
}
function ticksOf(seconds) {
  var t = new Z.TickTime();
  t.seconds = seconds;
  return t.ticksNumber;
}
function rate(fps) {
  return Z.FrameRate.createWithValue(fps);
}
function time(ticks) {
  var t = new Z.TickTime();
  t.ticksNumber = ticks;
  return t;
}

// "seconds" writes: rounded to the nearest tick, exact for 1.5 s.
[
  [0, 0],
  [-0, 0],
  [1.5, 381024000000],
  [1.001, 254270016000],
  [-1.001, -254270016000],
  [1 / 254016000000, 1],
  [0.4 / 254016000000, 0],
  [36000000, 36000000 * 254016000000],
].forEach(function (c) {
  check("seconds " + c[0], ticksOf(c[0]), c[1]);
});

// Refused "seconds" writes leave the value.
[NaN, Infinity, -Infinity, 1e300, -1e300, 37000000, -37000000].forEach(function (value) {
  var t = time(7);
  check("seconds refused " + value, thrown(function () { t.seconds = value; }), "RangeError");
  check("seconds kept " + value, t.ticksNumber, 7);
});

// "ticks" writes: classic decimal text, refusals beyond 64 bits and at kTime_Invalid.
[
  ["0", "0", "none"],
  ["  -123abc", "-123", "none"],
  ["+42", "42", "none"],
  ["letters", "0", "none"],
  ["", "0", "none"],
  ["-", "0", "none"],
  ["9223372036854775807", "9223372036854775807", "none"],
  ["-9223372036854775808", "-9223372036854775808", "none"],
  ["9223372036854775808", "5", "RangeError"],
  ["-9223372036854775809", "5", "RangeError"],
  ["99999999999999999999", "5", "RangeError"],
  ["-101606400000000000", "5", "RangeError"],
  ["1,000", "1", "none"],
  ["\u00a012", "0", "none"],
].forEach(function (c) {
  var t = time(5);
  check("ticks write " + c[0], thrown(function () { t.ticks = c[0]; }), c[2]);
  check("ticks read " + c[0], t.ticks, c[1]);
});

// "ticksNumber": kTime_Invalid refused; 64-bit writes checked, 2^63 meaning 2^63 - 1.
[
  [-101606400000000000, "5", "RangeError"],
  [Math.pow(2, 63), "9223372036854775807", "none"],
  [-Math.pow(2, 63), "-9223372036854775808", "none"],
  ["12", "5", "TypeError"],
  [Math.pow(2, 53) + 2, "9007199254740994", "none"],
].forEach(function (c) {
  var t = time(5);
  check("ticksNumber write " + c[0], thrown(function () { t.ticksNumber = c[0]; }), c[2]);
  check("ticksNumber read " + c[0], t.ticks, c[1]);
});

// A new TickTime, and the constants: each read a new object in the caller's context.
var fresh = new Z.TickTime();
check("new seconds", fresh.seconds, 0);
check("new ticks", fresh.ticks, "0");
[
  ["TIME_ZERO", 0],
  ["TIME_ONE_SECOND", 254016000000],
  ["TIME_ONE_MINUTE", 15240960000000],
  ["TIME_ONE_HOUR", 914457600000000],
  ["TIME_MAX", 91445760000000000],
  ["TIME_MIN", -91445760000000000],
  ["TIME_INVALID", -101606400000000000],
].forEach(function (c) {
  check(c[0] + " from the class", Z.TickTime[c[0]].ticksNumber, c[1]);
  check(c[0] + " is new each read", Z.TickTime[c[0]] === Z.TickTime[c[0]], false);
});

// "equals" and isEqual: same class and value only; null and other classes are false.
var five = time(5);
[
  ["same value", time(5), true],
  ["other value", time(6), false],
  ["FrameRate of the same number", (function () { var r = new Z.FrameRate(); r.ticksPerFrame = 5; return r; })(), false],
  ["null", null, false],
  ["undefined", undefined, false],
].forEach(function (c) {
  check("equals " + c[0], five.equals(c[1]), c[2]);
  check("isEqual " + c[0], five.isEqual(c[1]), c[2]);
});
check("equals a number", thrown(function () { five.equals(5); }), "TypeError");

// Alignment: a new object; the original keeps its value.
var oneAndAHalf = time(15240960000);
[
  ["alignToFrame", oneAndAHalf.alignToFrame(rate(25)), 10160640000],
  ["alignToNearestFrame", oneAndAHalf.alignToNearestFrame(rate(25)), 20321280000],
  ["alignToFrame without a rate", oneAndAHalf.alignToFrame(null), 15240960000],
].forEach(function (c) {
  check(c[0], c[1].ticksNumber, c[2]);
});
check("aligned original", oneAndAHalf.ticksNumber, 15240960000);
check("align with a TickTime", thrown(function () { oneAndAHalf.alignToFrame(five); }), "TypeError");

// Timecode from script (the runner test runs the drop-frame example).
var display = new Z.TimeDisplay();
display.type = 102;
[
  ["no rate", Z.TickTime.timeToTimecode(time(254016000000), null, null), "00;00;00;00"],
  ["read back", Z.TickTime.timecodeToTime("00;01;00;02", rate(30000 / 1001), display).ticksNumber, 1800 * 8475667200],
  ["unreadable", Z.TickTime.timecodeToTime("x", rate(25), null).ticksNumber, -101606400000000000],
].forEach(function (c) {
  check(c[0], c[1], c[2]);
});

// "createWithValue": invalid for no rate and for rates below one tick per frame.
[
  [25, 10160640000],
  [30000 / 1001, 8475667200],
  [0, 9223372036854775807],
  [-25, 9223372036854775807],
  [NaN, 9223372036854775807],
  [Infinity, 9223372036854775807],
  [-Infinity, 9223372036854775807],
  [254016000000, 1],
  [254016000001, 9223372036854775807],
  [1e300, 9223372036854775807],
  [1e-300, 9223372036854775807],
].forEach(function (c) {
  check("createWithValue " + c[0], rate(c[0]).ticksPerFrame, c[1]);
});
var anyRate = new Z.FrameRate();
check("new FrameRate", anyRate.ticksPerFrame, 9223372036854775807);
[0, -1, 12].forEach(function (v) {
  anyRate.ticksPerFrame = v;
  check("ticksPerFrame " + v, anyRate.ticksPerFrame, v);
});

// RatioTime: lowest terms, refusals, the 64-bit limits, no constructor.
var MIN = -Math.pow(2, 63);
[
  ["2/4", 2, 4, "none", 1, 2],
  ["3/-6", 3, -6, "none", -1, 2],
  ["0/7", 0, 7, "none", 0, 1],
  ["zero scale", 1, 0, "Error", 0, 0],
  ["min/-1", MIN, -1, "Error", 0, 0],
  ["min/min", MIN, MIN, "none", 1, 1],
  ["1/min", 1, MIN, "Error", 0, 0],
  ["min/1", MIN, 1, "Error", 0, 0],
  ["min/2", MIN, 2, "none", -Math.pow(2, 62), 1],
].forEach(function (c) {
  var made = null;
  check("createRatioTime " + c[0], thrown(function () { made = RatioTime.createRatioTime(c[1], c[2]); }), c[3]);
  if (made !== null) {
    check("createRatioTime value " + c[0], made.value, c[4]);
    check("createRatioTime scale " + c[0], made.scale, c[5]);
  }
});
[
  ["scale 0", "scale", 0, "RangeError", 1, 2],
  ["scale min", "scale", MIN, "RangeError", 1, 2],
  ["scale -4", "scale", -4, "none", -1, 4],
  ["value 2 against scale 2", "value", 2, "none", 1, 1],
  ["value min against scale 2", "value", MIN, "none", -Math.pow(2, 62), 1],
  ["value 3", "value", 3, "none", 3, 2],
].forEach(function (c) {
  var r = RatioTime.createRatioTime(1, 2);
  check(c[0], thrown(function () { r[c[1]] = c[2]; }), c[3]);
  check(c[0] + " value", r.value, c[4]);
  check(c[0] + " scale", r.scale, c[5]);
});
check("RatioTime has no constructor", thrown(function () { return new RatioTime(); }), "TypeError");
check("TickTime without new", thrown(function () { return Z.TickTime(); }), "TypeError");

// TimeDisplay: type keeps the low 32 bits; customFPS 0 refused.
var td = new Z.TimeDisplay();
check("new type", td.type, 999);
check("new customFPS", td.customFPS, 0);
td.customFPS = 24;
check("custom type", td.type, 998);
check("custom fps", td.customFPS, 24);
check("customFPS 0", thrown(function () { td.customFPS = 0; }), "RangeError");
check("customFPS kept", td.customFPS, 24);
check("customFPS -1", thrown(function () { td.customFPS = -1; }), "RangeError");
td.type = 4294967296 + 101;
check("type low bits", td.type, 101);
td.type = -1;
check("type sign-extended", td.type, -1);

// Items refuse a receiver of another class.
check("wrong receiver", thrown(function () {
  Object.getOwnPropertyDescriptor(Z.TickTime.prototype, "ticks").get.call(rate(25));
}), "TypeError");

if (failures.length > 0) throw new Error(failures.length + " failures:\n" + failures.join("\n"));
print("time objects: all cases hold");
