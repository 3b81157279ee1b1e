// The video and colour script classes seen from script: the pixel-format
// constants, the FourCC texts "createPixelFormat" takes and refuses, aspect
// ratio terms, and colour components.
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

// The namespaces: PixelFormat and PixelAspectRatio are globals too, the
// colour class is not.
expectEqual(PixelFormat === PF && PixelAspectRatio === PAR, true, "globals");
expectEqual(typeof ColorObject, "undefined", "ColorObject global");

// Every constant is a distinct FourCC text that gives its format back.
(function () {
  var names = Object.getOwnPropertyNames(PF).filter(function (n) {
    return n.indexOf("PIXELFORMAT_") === 0;
  });
  expectEqual(names.length, 37, "pixel-format constants");
  var seen = {};
  names.forEach(function (name) {
    var text = PF[name];
    expectEqual(text.length === 4 && !(text in seen), true, name + " " + text);
    seen[text] = name;
    expectEqual(PF.createPixelFormat(text).isEqual(PF.createPixelFormat(text)), true, name);
  });
  expectEqual(PF.PIXELFORMAT_YUYV_422_8U, "yuy2", "YUYV 4:2:2 8-bit");
  expectEqual(PF.createPixelFormat("bgra").isEqual(PF.createPixelFormat("BGRA")), false, "case");
})();

// "createPixelFormat" takes exactly four printable ASCII characters; unknown
// printable FourCCs are accepted.
(function () {
  var texts = [
    ["bgra", true], ["zzzz", true], ["    ", true], ["~~~~", true],
    ["bgr", false], ["bgrab", false], ["", false],
    ["\u0000\u0000\u0000\u0000", false],  // FourCC 0, the wildcard
    ["bgr\u001f", false], ["bgr\u007f", false], ["bgr\u00e9", false],
    ["b\ud800ra", false], ["\u00e9\u00e9", false]
  ];
  texts.forEach(function (t) {
    expectEqual(PF.createPixelFormat(t[0]) !== null, t[1], "createPixelFormat " + JSON.stringify(t[0]));
  });
  expectThrows(function () { PF.createPixelFormat(1650946657); }, TypeError, "a number");
  var format = PF.createPixelFormat("uyvy");
  expectEqual(format.isEqual(PF.createPixelFormat("uyvy")), true, "equal formats");
  expectEqual(format.isEqual(PAR.createPixelAspectRatio(1, 1)), false, "another class");
  expectEqual(format.isEqual(null), false, "null");
})();

// PixelAspectRatio: terms from 0 to 2^31 - 1.
(function () {
  var ratio = PAR.createPixelAspectRatio(10, 11);
  expectEqual(ratio.numerator + ":" + ratio.denominator, "10:11", "10:11");
  ratio.denominator = 0;
  expectEqual(ratio.denominator, 0, "denominator 0 accepted");
  ratio.numerator = 2147483647;
  expectEqual(ratio.numerator, 2147483647, "largest term");
  [["numerator", 2147483648], ["denominator", 4294967295]].forEach(function (w) {
    expectThrows(function () { ratio[w[0]] = w[1]; }, RangeError, w[0] + " = " + w[1]);
  });
  expectEqual(ratio.numerator + ":" + ratio.denominator, "2147483647:0", "after refusals");
  [[2147483648, 1], [1, 2147483648], [-1, 1], [1, 4294967296]].forEach(function (a) {
    expectThrows(function () { PAR.createPixelAspectRatio(a[0], a[1]); }, RangeError, "" + a);
  });
  expectEqual(PAR.createPixelAspectRatio(0, 0).numerator, 0, "0:0");
})();

// ColorObject: any number but NaN, as given; beyond the float range an error.
(function () {
  var color = new Color();
  expectEqual([color.red, color.green, color.blue, color.alpha].join(" "), "0 0 0 1", "default");
  expectEqual([0.5, 0.25, 0.125, 0.75].join(" "),
              (function (c) { return [c.red, c.green, c.blue, c.alpha].join(" "); })(
                  new Color(0.5, 0.25, 0.125, 0.75)), "constructed");
  var kept = [2.5, -1, 0, Infinity, -Infinity, 3.4028234663852886e38];
  ["red", "green", "blue", "alpha"].forEach(function (component) {
    kept.forEach(function (value) {
      color[component] = value;
      expectEqual(color[component], value, component + " = " + value);
    });
    color[component] = 0.5;
    [[NaN, RangeError], [1e39, RangeError], [-1e300, RangeError], ["1", TypeError]].forEach(
        function (r) {
          expectThrows(function () { color[component] = r[0]; }, r[1], component + " = " + r[0]);
          expectEqual(color[component], 0.5, "after " + component + " = " + r[0]);
        });
  });
  [[NaN], [0, NaN], [0, 0, 0, NaN], [1e39], [0, 0, -1e300]].forEach(function (a) {
    expectThrows(function () { new Color(a[0], a[1], a[2], a[3]); }, RangeError, "new " + a);
  });
})();
