// The audio script classes seen from script: the label and layout constants
// against the library's label descriptions and layout factories, the edge
// cases of each class, and what they refuse.
var Layout = zebmediatypes.AudioChannelLayout;

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
function constantsOf(prefix) {
  return Object.getOwnPropertyNames(Layout).filter(function (n) { return n.indexOf(prefix) === 0; });
}
function common(name) { return Layout.createCommonAudioChannelLayout(Layout["CHANNELLAYOUT_" + name]); }
function filled(count, value) {
  var array = [];
  while (array.length < count) array.push(value);
  return array;
}

// Label constants: 37 distinct values, exactly the labels the library
// describes but the higher-order ambisonic 143.
var labelNames = constantsOf("AUDIOCHANNELLABEL_");
var labelValues = {};
labelNames.forEach(function (name) { labelValues[Layout[name]] = name; });
expectEqual(labelNames.length + "/" + Object.keys(labelValues).length, "37/37", "label constants");
for (var value = -1; value <= 300; ++value) {
  expectEqual(Layout.label(value) !== "", value in labelValues || value === 143, "label " + value);
}

// Layout constants: 0 to 90 in definition order, each layout with the channels
// its name spells: a channel list, a surround count (51, 7_1, 10_2), a number
// of discrete channels, or the count its word stands for.
var channels = {
  L: 100, R: 101, C: 102, LFE: 103, LS: 104, RS: 105, CS: 106, LC: 107, RC: 108, LSD: 109,
  RSD: 110, TS: 111, VHL: 112, VHR: 113, VHC: 114, TBL: 115, TBR: 116, TSL: 127, TSR: 128,
  RLS: 129, RRS: 130, BFL: 138, BFC: 139, BFR: 140, PL: 141, PR: 142
};
var words = {
  MONO: 1, STEREO: 2, MATRIXSTEREO: 2, QUADRAPHONIC: 4, AMBISONICSBFORMAT: 4, PENTAGONAL: 5,
  HEXAGONAL: 6, OCTAGONAL: 8, CUBE: 8, SMPTEDTV: 8, VST10_2_PLUS: 14
};
var layoutNames = constantsOf("CHANNELLAYOUT_");
expectEqual(layoutNames.length, 91, "layout constants");
layoutNames.forEach(function (constant, index) {
  expectEqual(Layout[constant], index, constant);
  var name = constant.substring("CHANNELLAYOUT_".length);
  var layout = Layout.createCommonAudioChannelLayout(index);
  var tokens = name.split("_");
  var discrete = /^(\d+)_DISCRETE_CHANNELS$/.exec(name);
  var surround = /^(?:LEGACY|BROADCAST|VST_?)?(\d+)_?(\d)[A-Z_]*$/.exec(name);
  if (tokens.every(function (t) { return t in channels; })) {
    var spelled = tokens.map(function (t) { return channels[t]; });
    // With Cs and the full top layer the layouts carry a top back centre
    // (117) between Tbl and Tbr that their names leave out.
    if (/_CS_TS_VHL_VHC_VHR_TBL_TBR$/.test(name)) spelled.splice(spelled.length - 1, 0, 117);
    expectEqual(labelsOf(layout), spelled.join(" "), constant);
  } else if (name in words) {
    expectEqual(layout.length, words[name], constant);
  } else if (discrete) {
    expectEqual(labelsOf(layout), filled(+discrete[1], 0).join(" "), constant);
  } else if (/^SMPTEDIGITALCINEMA\d$/.test(name)) {
    expectEqual(layout.length, 16, constant);
  } else {
    expectEqual(layout.length, +surround[1] + +surround[2], constant);
  }
});

// AudioChannelLayout.
var stereo = common("STEREO");
expectEqual(Layout.CHANNELLAYOUT_51, 4, "CHANNELLAYOUT_51");
expectEqual(labelsOf(Layout.createCommonAudioChannelLayout(4)), "100 101 102 103 104 105", "5.1");
[91, -1, 2147483647].forEach(function (index) {
  expectEqual(Layout.createCommonAudioChannelLayout(index), null, "common layout " + index);
});
[[[100, 101], true], [[101, 100], false], [[100, 101, 0], false]].forEach(function (c) {
  expectEqual(Layout.createAudioChannelLayout(c[0]).isEqual(stereo), c[1], "isEqual " + c[0]);
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
[[12, 16], [20, 24], [0, 8], [9, 16], [16, 16], [17, 24], [25, 32], [4294967295, 32]].forEach(
    function (d) {
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
expectEqual(new AudioFormat(48000, 24, layout51).isEqual(format), true, "equal formats");
expectEqual(new AudioFormat(44100, 24, layout51).isEqual(format), false, "other rate");
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
var same = new AudioBusDescription();
same.name = bus.name;
same.layout = bus.layout;
same.type = 7;
expectEqual(same.isEqual(bus), true, "equal buses");

// AudioChannelMap.
var map = new AudioChannelMap([4, 5]);
expectEqual(new AudioChannelMap().channelCount + "/" + map.channelCount, "0/2", "channel counts");
expectEqual(new AudioChannelMap(map).isEqual(map) && new AudioChannelMap(map) !== map, true, "copy");
[[0, 4], [1, 5], [2, -1], [-1, -1]].forEach(function (r) {
  expectEqual(map.getMapping(r[0]), r[1], "getMapping " + r[0]);
});
[[0, true], [2, false], [-1, false], [-2147483648, false]].forEach(function (w) {
  expectEqual(map.setMapping(w[0], 9), w[1], "setMapping " + w[0]);
});
expectEqual(map.getMapping(0) + " " + map.getMapping(1), "9 5", "after setMapping");
expectEqual(new AudioChannelMap(filled(1024, 0)).channelCount, 1024, "1024 mappings");

// Refusals: the value stays (checked after each by `stays`).
var sparse = [];
sparse.length = 4294967295;
var rate = new AudioFormat(48000);
var refusals = [
  [function () { Layout.createAudioChannelLayout(filled(1025, 100)); }, RangeError, "1025 labels"],
  [function () { Layout.createAudioChannelLayout(sparse); }, Error, "sparse array"],
  [function () { Layout.createAudioChannelLayout([100, 1.5]); }, RangeError, "label 1.5"],
  [function () { Layout.createAudioChannelLayout("LR"); }, TypeError, "labels as text"],
  [function () { Layout.createAudioChannelLayout(); }, TypeError, "no labels"],
  [function () { rate.sampleRate = 0; }, RangeError, "sampleRate 0"],
  [function () { rate.sampleRate = 2147483648; }, RangeError, "sampleRate 2^31"],
  [function () { rate.sampleRate = 4294967295; }, RangeError, "sampleRate 2^32 - 1"],
  [function () { new AudioFormat(2147483648); }, RangeError, "new AudioFormat(2^31)"],
  [function () { new AudioFormat(4294967295); }, RangeError, "new AudioFormat(2^32 - 1)"],
  [function () { new AudioFormat(48000, 24, map); }, TypeError, "a map as layout"],
  [function () { format.channelLayout = null; }, RangeError, "channelLayout null"],
  [function () { format.channelLayout = undefined; }, RangeError, "channelLayout undefined"],
  [function () { format.channelLayout = map; }, RangeError, "channelLayout a map"],
  [function () { format.channelLayout = "L R"; }, TypeError, "channelLayout text"],
  [function () { bus.layout = null; }, RangeError, "bus layout null"],
  [function () { bus.layout = format; }, RangeError, "bus layout a format"],
  [function () { map.getMapping(3); }, RangeError, "getMapping 3"],
  [function () { map.setMapping(3, 0); }, RangeError, "setMapping 3"],
  [function () { new AudioChannelMap(filled(1025, 0)); }, RangeError, "1025 mappings"],
  [function () { new AudioChannelMap([0.5]); }, RangeError, "mapping 0.5"],
  [function () { new AudioChannelMap(["0"]); }, TypeError, "mapping text"],
  [function () { new AudioChannelMap(format); }, TypeError, "a format as map"]
];
refusals.forEach(function (r) { expectThrows(r[0], r[1], r[2]); });
var stays = [rate.sampleRate, labelsOf(format.channelLayout), bus.layout.length, map.channelCount];
expectEqual(stays.join("/"), "48000/0/6/2", "values after the refusals");
