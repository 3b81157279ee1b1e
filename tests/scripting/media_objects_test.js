// The audio, video and colour script classes seen from script: the layout
// constants against what their names spell, the edge cases of each class, and
// what they refuse. The constants against their native tables are checked by
// media_objects_test.cpp.
var Layout = zebmediatypes.AudioChannelLayout;
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
function labelsOf(layout) {
  var labels = [];
  for (var i = 0; i < layout.length; ++i) labels.push(layout[i]);
  return labels.join(" ");
}
function common(name) {
  return Layout.createCommonAudioChannelLayout(Layout["CHANNELLAYOUT_" + name]);
}
function filled(count, value) {
  var array = [];
  while (array.length < count) array.push(value);
  return array;
}
function components(c) {
  return [c.red, c.green, c.blue, c.alpha].join(" ");
}

// Layout constants: 0 to 90 in definition order, each layout with the channel
// count its name spells: a channel list, a surround count (51, 7_1, 10_2), a
// number of discrete channels, or the count its word stands for.
var channels = "L R C LFE LS RS CS LC RC LSD RSD TS VHL VHR VHC TBL TBR TSL TSR RLS RRS BFL BFC BFR PL PR";
var words = {
  MONO: 1,
  STEREO: 2,
  MATRIXSTEREO: 2,
  QUADRAPHONIC: 4,
  AMBISONICSBFORMAT: 4,
  PENTAGONAL: 5,
  HEXAGONAL: 6,
  OCTAGONAL: 8,
  CUBE: 8,
  SMPTEDTV: 8,
  VST10_2_PLUS: 14
};
var layoutNames = Object.getOwnPropertyNames(Layout).filter(function (n) {
  return /^CHANNELLAYOUT_/.test(n);
});
expectEqual(layoutNames.length, 91, "layout constants");
layoutNames.forEach(function (constant, index) {
  expectEqual(Layout[constant], index, constant);
  var name = constant.substring("CHANNELLAYOUT_".length);
  var count = Layout.createCommonAudioChannelLayout(index).length;
  var tokens = name.split("_");
  var discrete = /^(\d+)_DISCRETE_CHANNELS$/.exec(name);
  var surround = /^(?:LEGACY|BROADCAST|VST_?)?(\d+)_?(\d)[A-Z_]*$/.exec(name);
  if (tokens.every(function (t) { return channels.split(" ").indexOf(t) >= 0; })) {
    // With Cs and the full top layer the layouts carry a top back centre
    // that their names leave out.
    expectEqual(count, tokens.length + (/_CS_TS_VHL_VHC_VHR_TBL_TBR$/.test(name) ? 1 : 0), constant);
  } else if (name in words) {
    expectEqual(count, words[name], constant);
  } else if (discrete) {
    expectEqual(labelsOf(Layout.createCommonAudioChannelLayout(index)), filled(+discrete[1], 0).join(" "), constant);
  } else if (/^SMPTEDIGITALCINEMA\d$/.test(name)) {
    expectEqual(count, 16, constant);
  } else {
    expectEqual(count, +surround[1] + +surround[2], constant);
  }
});

// AudioChannelLayout.
var stereo = common("STEREO");
[91, -1, 2147483647].forEach(function (index) {
  expectEqual(Layout.createCommonAudioChannelLayout(index), null, "common layout " + index);
});
expectEqual(Layout.createAudioChannelLayout([]), null, "empty label array");
[-1, 2, -2147483649, 2147483648, Math.pow(2, 53)].forEach(function (index) {
  expectEqual(stereo[index], -1, "stereo[" + index + "]");
});
expectEqual(labelsOf(Layout.createAudioChannelLayout([5, -1, 2147483647])), "5 -1 2147483647",
            "values that are no label are kept");
expectEqual(Layout.createAudioChannelLayout(filled(1024, 100)).length, 1024, "1024 labels");
expectEqual(stereo.description + "/" + Layout.label(104), "Stereo/Left Surround", "texts");

// AudioFormat.
var format = new AudioFormat();
expectEqual([format.sampleRate, format.bitDepth].join(" "), "44100 32", "defaults");
expectEqual(format.channelLayout.isEqual(stereo), true, "default layout");
[
  [12, 16],
  [20, 24],
  [0, 8],
  [9, 16],
  [16, 16],
  [17, 24],
  [25, 32],
  [4294967295, 32],
].forEach(function (d) {
  format.bitDepth = d[0];
  expectEqual(format.bitDepth, d[1], "bitDepth " + d[0]);
});
expectEqual(new AudioFormat(0).sampleRate, 0, "constructed with rate 0");
format.sampleRate = 2147483647;
expectEqual(format.sampleRate, 2147483647, "sampleRate 2^31 - 1");
var layout51 = common("51");
format = new AudioFormat(48000, 24, layout51);
var held = format.channelLayout;
expectEqual(held === format.channelLayout && held !== layout51, true, "one held object");
expectEqual(held.isEqual(layout51), true, "holding the given labels");
format.channelLayout = common("MONO");
expectEqual(format.channelLayout === held && labelsOf(held), "0", "held object updated in place");
format.channelLayout = format.channelLayout;
expectEqual(labelsOf(format.channelLayout), "0", "own layout written back");

// AudioBusDescription.
var bus = new AudioBusDescription();
expectEqual(bus.layout !== bus.layout && bus.layout.isEqual(bus.layout), true, "new layouts");
bus.layout = layout51;
bus.name = "Side \ud83c\udfb5";
bus.type = 7;
expectEqual([labelsOf(bus.layout), bus.name, bus.type].join("/"),
            "100 101 102 103 104 105/Side \ud83c\udfb5/7", "bus written");

// AudioChannelMap.
var map = new AudioChannelMap([4, 5]);
expectEqual(new AudioChannelMap().channelCount + "/" + map.channelCount, "0/2", "channel counts");
expectEqual(new AudioChannelMap(map).isEqual(map) && new AudioChannelMap(map) !== map, true, "copy");
[
  [0, 4],
  [1, 5],
  [2, -1],
  [-1, -1],
].forEach(function (r) {
  expectEqual(map.getMapping(r[0]), r[1], "getMapping " + r[0]);
});
[
  [0, true],
  [2, false],
  [-1, false],
  [-2147483648, false],
].forEach(function (w) {
  expectEqual(map.setMapping(w[0], 9), w[1], "setMapping " + w[0]);
});
expectEqual(map.getMapping(0) + " " + map.getMapping(1), "9 5", "after setMapping");
expectEqual(new AudioChannelMap(filled(1024, 0)).channelCount, 1024, "1024 mappings");

// PixelFormat: exactly four printable ASCII characters; unknown printable FourCCs too.
expectEqual(PixelFormat === PF && PixelAspectRatio === PAR, true, "globals");
expectEqual(typeof ColorObject, "undefined", "ColorObject is no global");
[
  ["bgra", true],
  ["zzzz", true],
  ["    ", true],
  ["~~~~", true],
  ["bgr", false],
  ["bgrab", false],
  ["", false],
  ["\u0000\u0000\u0000\u0000", false],  // FourCC 0, the wildcard
  ["bgr\u001f", false],
  ["bgr\u007f", false],
  ["bgr\u00e9", false],
  ["b\ud800ra", false],
].forEach(function (t) {
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

// Refusals: the values stay (checked after them all).
var sparse = [];
sparse.length = 4294967295;
var rate = new AudioFormat(48000);
[
  ["Layout.createAudioChannelLayout(filled(1025, 100))", RangeError],
  ["Layout.createAudioChannelLayout(sparse)", Error],
  ["Layout.createAudioChannelLayout([100, 1.5])", RangeError],
  ["Layout.createAudioChannelLayout()", TypeError],
  ["rate.sampleRate = 0", RangeError],
  ["rate.sampleRate = 2147483648", RangeError],
  ["rate.sampleRate = 4294967295", RangeError],
  ["new AudioFormat(2147483648)", RangeError],
  ["new AudioFormat(4294967295)", RangeError],
  ["new AudioFormat(48000, 24, map)", TypeError],
  ["format.channelLayout = null", RangeError],
  ["format.channelLayout = undefined", RangeError],
  ["format.channelLayout = map", RangeError],
  ["bus.layout = null", RangeError],
  ["bus.layout = format", RangeError],
  ["map.getMapping(3)", RangeError],
  ["map.setMapping(3, 0)", RangeError],
  ["new AudioChannelMap(filled(1025, 0))", RangeError],
  ["new AudioChannelMap(format)", TypeError],
  ["PF.createPixelFormat(1650946657)", TypeError],
  ["ratio.numerator = 2147483648", RangeError],
  ["ratio.denominator = 4294967295", RangeError],
  ["PAR.createPixelAspectRatio(2147483648, 1)", RangeError],
  ["PAR.createPixelAspectRatio(1, 2147483648)", RangeError],
  ["color.red = NaN", RangeError],
  ["color.green = 1e39", RangeError],
  ["color.blue = -1e300", RangeError],
  ["new Color(NaN)", RangeError],
  ["new Color(0, 0, 0, NaN)", RangeError],
  ["new Color(1e39)", RangeError],
].forEach(function (r) {
  expectThrows(function () { eval(r[0]); }, r[1], r[0]);
});
var stays = [rate.sampleRate, labelsOf(format.channelLayout), bus.layout.length, map.channelCount,
             ratio.numerator + ":" + ratio.denominator, components(color)];
expectEqual(stays.join("/"), "48000/0/6/2/2147483647:0/0.5 0.5 0.5 0.5", "values after the refusals");
