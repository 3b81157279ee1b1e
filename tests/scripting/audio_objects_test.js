// The audio script classes seen from script: the label and layout constants
// against the library's own label descriptions and layout factories, the edge
// cases of each class, and the writes and arguments they refuse.
var Layout = zebmediatypes.AudioChannelLayout;
var Format = zebmediatypes.AudioFormat;
var Bus = zebmediatypes.AudioBusDescription;
var ChannelMap = zebmediatypes.AudioChannelMap;

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
function constantsOf(cls, prefix) {
  return Object.getOwnPropertyNames(cls).filter(function (name) {
    return name.indexOf(prefix) === 0;
  });
}
function common(name) { return Layout.createCommonAudioChannelLayout(Layout["CHANNELLAYOUT_" + name]); }

// Label constants: 37 distinct values, and exactly the values the library can
// describe, but for the higher-order ambisonic label 143, which has none.
(function () {
  var names = constantsOf(Layout, "AUDIOCHANNELLABEL_");
  expectEqual(names.length, 37, "label constants");
  var values = {};
  names.forEach(function (name) { values[Layout[name]] = name; });
  for (var value = -1; value <= 300; ++value) {
    var described = Layout.label(value) !== "";
    expectEqual(described, value in values || value === 143, "label " + value + " " + values[value]);
  }
})();

// Layout constants: 0 to 90 in definition order, and every layout has the
// channels its name spells: its channel list, a surround count (51, 7_1,
// 10_2), a number of discrete channels, or the layout its word names.
(function () {
  var channels = {
    L: 100, R: 101, C: 102, LFE: 103, LS: 104, RS: 105, CS: 106, LC: 107, RC: 108, LSD: 109,
    RSD: 110, TS: 111, VHL: 112, VHR: 113, VHC: 114, TBL: 115, TBR: 116, TSL: 127, TSR: 128,
    RLS: 129, RRS: 130, BFL: 138, BFC: 139, BFR: 140, PL: 141, PR: 142
  };
  var words = {
    MONO: 1, STEREO: 2, MATRIXSTEREO: 2, QUADRAPHONIC: 4, AMBISONICSBFORMAT: 4, PENTAGONAL: 5,
    HEXAGONAL: 6, OCTAGONAL: 8, CUBE: 8, SMPTEDTV: 8, VST10_2_PLUS: 14
  };
  var names = constantsOf(Layout, "CHANNELLAYOUT_");
  expectEqual(names.length, 91, "layout constants");
  names.forEach(function (constant, index) {
    var name = constant.substring("CHANNELLAYOUT_".length);
    expectEqual(Layout[constant], index, constant);
    var layout = Layout.createCommonAudioChannelLayout(index);
    var tokens = name.split("_");
    var surround = /^(?:LEGACY|BROADCAST|VST_?)?(\d+)_?(\d)[A-Z_]*$/.exec(name);
    var discrete = /^(\d+)_DISCRETE_CHANNELS$/.exec(name);
    if (tokens.every(function (t) { return t in channels; })) {
      var expected = tokens.map(function (t) { return channels[t]; });
      // Layouts with Cs and a full top layer carry a top back centre (117)
      // between Tbl and Tbr that their names leave out.
      if (/_CS_TS_VHL_VHC_VHR_TBL_TBR$/.test(name)) expected.splice(expected.length - 1, 0, 117);
      expectEqual(labelsOf(layout), expected.join(" "), constant);
    } else if (name in words) {
      expectEqual(layout.length, words[name], constant);
    } else if (discrete) {
      expectEqual(labelsOf(layout), Array(+discrete[1] + 1).join("0 ").trim(), constant);
    } else if (/^SMPTEDIGITALCINEMA\d$/.test(name)) {
      expectEqual(layout.length, 16, constant);
    } else {
      expectEqual(layout.length, +surround[1] + +surround[2], constant);
    }
  });
})();

// AudioChannelLayout edge cases.
(function () {
  expectEqual(Layout.CHANNELLAYOUT_51, 4, "CHANNELLAYOUT_51");
  expectEqual(labelsOf(Layout.createCommonAudioChannelLayout(4)), "100 101 102 103 104 105", "5.1");
  [91, -1, 2147483647].forEach(function (index) {
    expectEqual(Layout.createCommonAudioChannelLayout(index), null, "common layout " + index);
  });
  var stereo = common("STEREO");
  var cases = [
    [[100, 101], true],
    [[101, 100], false],
    [[100], false],
    [[100, 101, 0], false]
  ];
  cases.forEach(function (c) {
    expectEqual(Layout.createAudioChannelLayout(c[0]).isEqual(stereo), c[1], "isEqual " + c[0]);
  });
  expectEqual(Layout.createAudioChannelLayout([]), null, "empty label array");
  [-1, 2, 3, -2147483648, 2147483647].forEach(function (index) {
    expectEqual(stereo[index], -1, "stereo[" + index + "]");
  });
  // Values that are no label are kept as they are.
  expectEqual(labelsOf(Layout.createAudioChannelLayout([5, -1, 2147483647, 143])),
              "5 -1 2147483647 143", "unknown labels");
  expectEqual(stereo.description, "Stereo", "description");
  expectEqual(Layout.label(104), "Left Surround", "label 104");
})();

// "createAudioChannelLayout" checks the length before reading an element: at
// most 1024 channels, and a huge sparse array is refused at once.
(function () {
  var most = [];
  for (var i = 0; i < 1024; ++i) most.push(100);
  expectEqual(Layout.createAudioChannelLayout(most).length, 1024, "1024 labels");
  most.push(100);
  expectThrows(function () { Layout.createAudioChannelLayout(most); }, RangeError, "1025 labels");
  var sparse = [];
  sparse.length = 4294967295;
  expectThrows(function () { Layout.createAudioChannelLayout(sparse); }, Error, "sparse array");
  expectThrows(function () { Layout.createAudioChannelLayout([100, 1.5]); }, RangeError, "1.5");
  expectThrows(function () { Layout.createAudioChannelLayout("LR"); }, TypeError, "text");
  expectThrows(function () { Layout.createAudioChannelLayout(); }, TypeError, "no argument");
})();

// AudioFormat: defaults, bit depths, sample rates.
(function () {
  var format = new Format();
  expectEqual(format.sampleRate, 44100, "default rate");
  expectEqual(format.bitDepth, 32, "default bit depth");
  expectEqual(format.channelLayout.isEqual(common("STEREO")), true, "default layout");
  var depths = [[12, 16], [20, 24], [0, 8], [8, 8], [9, 16], [16, 16], [17, 24], [24, 24],
                [25, 32], [4294967295, 32]];
  depths.forEach(function (d) {
    format.bitDepth = d[0];
    expectEqual(format.bitDepth, d[1], "bitDepth " + d[0]);
  });
  expectEqual(new Format(0).sampleRate, 0, "constructed with rate 0");
  expectEqual(new Format(2147483647).sampleRate, 2147483647, "largest rate");
  // Rates beyond the native int would turn negative (4294967295 into the
  // invalid rate -1): refused by the setter, a parameter error when built.
  [0, 2147483648, 4294967295].forEach(function (rate) {
    var f = new Format(48000);
    expectThrows(function () { f.sampleRate = rate; }, RangeError, "sampleRate = " + rate);
    expectEqual(f.sampleRate, 48000, "after sampleRate = " + rate);
  });
  [2147483648, 4294967295, -1, 4294967296].forEach(function (rate) {
    expectThrows(function () { new Format(rate); }, RangeError, "new AudioFormat(" + rate + ")");
  });
  format.sampleRate = 2147483647;
  expectEqual(format.sampleRate, 2147483647, "sampleRate = 2^31 - 1");
})();

// AudioFormat: the held layout object.
(function () {
  var layout51 = common("51");
  var format = new Format(48000, 24, layout51);
  var held = format.channelLayout;
  expectEqual(held === format.channelLayout, true, "the same held object on every read");
  expectEqual(held === layout51, false, "a layout object of its own");
  expectEqual(held.isEqual(layout51), true, "holding the given labels");
  expectEqual(new Format(48000, 24, layout51).isEqual(format), true, "equal formats");
  expectEqual(new Format(44100, 24, layout51).isEqual(format), false, "other rate");
  // A write updates the held object in place.
  format.channelLayout = common("MONO");
  expectEqual(format.channelLayout === held, true, "still the held object");
  expectEqual(labelsOf(held), "0", "held object updated");
  // Writing the format's own layout back keeps it.
  format.channelLayout = format.channelLayout;
  expectEqual(labelsOf(format.channelLayout), "0", "own layout written back");
  // Anything but a layout object is refused and changes nothing.
  var refused = [[null, RangeError], [new ChannelMap(), RangeError], [new Format(), RangeError],
                 [undefined, RangeError], ["stereo", TypeError], [[100, 101], TypeError]];
  refused.forEach(function (r) {
    expectThrows(function () { format.channelLayout = r[0]; }, r[1], "channelLayout = " + r[0]);
    expectEqual(labelsOf(format.channelLayout), "0", "after channelLayout = " + r[0]);
  });
  expectThrows(function () { new Format(48000, 24, new ChannelMap()); }, TypeError, "map as layout");
})();

// AudioBusDescription.
(function () {
  var bus = new Bus();
  expectEqual(bus.layout !== bus.layout, true, "each read a new object");
  expectEqual(bus.layout.isEqual(bus.layout), true, "with equal content");
  expectEqual(bus.layout.length, 0, "empty at first");
  bus.layout = common("51");
  expectEqual(labelsOf(bus.layout), "100 101 102 103 104 105", "layout written");
  [null, new ChannelMap(), new Format()].forEach(function (other) {
    expectThrows(function () { bus.layout = other; }, RangeError, "layout = " + other);
    expectEqual(bus.layout.length, 6, "after layout = " + other);
  });
  bus.name = "Side \ud83c\udfb5 chain";
  expectEqual(bus.name, "Side \ud83c\udfb5 chain", "name");
  bus.type = 7;
  expectEqual(bus.type, 7, "type unchecked");
  var same = new Bus();
  same.name = bus.name;
  same.layout = bus.layout;
  same.type = 7;
  expectEqual(same.isEqual(bus), true, "equal buses");
  same.type = Bus.TYPE_AUXILIARY;
  expectEqual(same.isEqual(bus), false, "other type");
})();

// AudioChannelMap: construction, mappings, and the index checks.
(function () {
  expectEqual(new ChannelMap().channelCount, 0, "empty map");
  var map = new ChannelMap([0, 1, -1]);
  expectEqual(map.channelCount, 3, "from mappings");
  expectEqual([0, 1, 2].map(function (i) { return map.getMapping(i); }).join(" "), "0 1 -1",
              "mappings");
  var copy = new ChannelMap(map);
  expectEqual(copy !== map && copy.isEqual(map), true, "copy");
  expectEqual(new ChannelMap([]).channelCount, 0, "no mappings");
  var two = new ChannelMap([4, 5]);
  var reads = [[0, 4], [1, 5], [2, -1], [-1, -1], [-2147483648, -1]];
  reads.forEach(function (r) { expectEqual(two.getMapping(r[0]), r[1], "getMapping " + r[0]); });
  expectThrows(function () { two.getMapping(3); }, RangeError, "getMapping 3");
  // setMapping reports whether it set anything.
  var writes = [[0, 9, true], [2, 9, false], [-1, 9, false], [-2147483648, 9, false]];
  writes.forEach(function (w) { expectEqual(two.setMapping(w[0], w[1]), w[2], "setMapping " + w[0]); });
  expectEqual(two.getMapping(0) + " " + two.getMapping(1), "9 5", "after setMapping");
  expectThrows(function () { two.setMapping(3, 0); }, RangeError, "setMapping 3");
  var tooMany = [];
  for (var i = 0; i < 1025; ++i) tooMany.push(i);
  var bad = [[tooMany, RangeError], [[0.5], RangeError], [["0"], TypeError],
             [new Format(), TypeError], ["map", TypeError]];
  bad.forEach(function (b) {
    expectThrows(function () { new ChannelMap(b[0]); }, b[1], "new AudioChannelMap(" + b[0] + ")");
  });
  tooMany.pop();
  expectEqual(new ChannelMap(tooMany).channelCount, 1024, "1024 mappings");
})();
