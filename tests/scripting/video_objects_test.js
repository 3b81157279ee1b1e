// The video and colour script classes seen from script: the pixel-format
// constants, the FourCC texts "createPixelFormat" takes, aspect-ratio terms and
// colour components, and what they refuse.
var PF = zebmediatypes.PixelFormat;
var PAR = zebmediatypes.PixelAspectRatio;
var Color = zebmediatypes.ColorObject;

function expectEqual(actual, expected, what) {
  if (actual !== expected) throw new Error(what + ": got " + actual + ", expected " + expected);
}
function expectThrows(run, errorType, what) {
  try {
    run();
  } catch (e) {
    if (!(e instanceof errorType)) throw new Error(what + ": threw " + e);
    return;
  }
  throw new Error(what + ": did not throw");
}
function components(c) { return [c.red, c.green, c.blue, c.alpha].join(" "); }

expectEqual(PixelFormat === PF && PixelAspectRatio === PAR, true, "globals");
expectEqual(typeof ColorObject, "undefined", "ColorObject is no global");

// Every constant is a distinct four-character text that makes a format.
var names = Object.getOwnPropertyNames(PF).filter(function (n) { return /^PIXELFORMAT_/.test(n); });
var texts = {};
names.forEach(function (name) {
  expectEqual(PF[name].length === 4 && !(PF[name] in texts), true, name + " " + PF[name]);
  texts[PF[name]] = name;
  expectEqual(PF.createPixelFormat(PF[name]).isEqual(PF.createPixelFormat(PF[name])), true, name);
});
expectEqual(names.length + " " + PF.PIXELFORMAT_YUYV_422_8U, "37 yuy2", "constants");

// Exactly four printable ASCII characters; unknown printable FourCCs too.
var fourCCs = [
  ["bgra", true], ["zzzz", true], ["    ", true], ["~~~~", true],
  ["bgr", false], ["bgrab", false], ["", false],
  ["\u0000\u0000\u0000\u0000", false],  // FourCC 0, the wildcard
  ["bgr\u001f", false], ["bgr\u007f", false], ["bgr\u00e9", false], ["b\ud800ra", false]
];
fourCCs.forEach(function (t) {
  expectEqual(PF.createPixelFormat(t[0]) !== null, t[1], "createPixelFormat " + JSON.stringify(t[0]));
});
var bgra = PF.createPixelFormat("bgra");
expectEqual([bgra.isEqual(PF.createPixelFormat("BGRA")), bgra.isEqual(null),
             bgra.isEqual(PAR.createPixelAspectRatio(1, 1))].join(" "), "false false false",
            "not equal");

// PixelAspectRatio: terms 0 to 2^31 - 1.
var ratio = PAR.createPixelAspectRatio(10, 11);
expectEqual(ratio.numerator + ":" + ratio.denominator, "10:11", "10:11");
ratio.denominator = 0;
ratio.numerator = 2147483647;
expectEqual(ratio.numerator + ":" + ratio.denominator, "2147483647:0", "largest term, 0");
expectEqual(PAR.createPixelAspectRatio(0, 0).denominator, 0, "0:0");

// ColorObject: as given, outside [0, 1] and infinities included.
var color = new Color();
expectEqual(components(color), "0 0 0 1", "default colour");
expectEqual(components(new Color(0.5, 0.25, 0.125, 0.75)), "0.5 0.25 0.125 0.75", "constructed");
["red", "green", "blue", "alpha"].forEach(function (component) {
  [2.5, -1, Infinity, -Infinity, 3.4028234663852886e38, 0.5].forEach(function (value) {
    color[component] = value;
    expectEqual(color[component], value, component + " = " + value);
  });
});

// Refusals: the values stay.
var refusals = [
  [function () { PF.createPixelFormat(1650946657); }, TypeError, "FourCC as a number"],
  [function () { ratio.numerator = 2147483648; }, RangeError, "numerator 2^31"],
  [function () { ratio.denominator = 4294967295; }, RangeError, "denominator 2^32 - 1"],
  [function () { PAR.createPixelAspectRatio(2147483648, 1); }, RangeError, "numerator 2^31"],
  [function () { PAR.createPixelAspectRatio(1, 2147483648); }, RangeError, "denominator 2^31"],
  [function () { PAR.createPixelAspectRatio(-1, 1); }, RangeError, "numerator -1"],
  [function () { color.red = NaN; }, RangeError, "red NaN"],
  [function () { color.green = 1e39; }, RangeError, "green beyond float"],
  [function () { color.blue = -1e300; }, RangeError, "blue beyond float"],
  [function () { color.alpha = NaN; }, RangeError, "alpha NaN"],
  [function () { color.alpha = "1"; }, TypeError, "alpha text"],
  [function () { new Color(NaN); }, RangeError, "new ColorObject(NaN)"],
  [function () { new Color(0, 0, 0, NaN); }, RangeError, "alpha NaN"],
  [function () { new Color(1e39); }, RangeError, "red beyond float"]
];
refusals.forEach(function (r) { expectThrows(r[0], r[1], r[2]); });
expectEqual(ratio.numerator + ":" + ratio.denominator + " " + components(color),
            "2147483647:0 0.5 0.5 0.5 0.5", "values after the refusals");
