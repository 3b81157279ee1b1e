// The binding storm: every item of every registered class called, read and
// written with hostile values and wrong receivers. Anything may be refused;
// what is thrown must be an Error. `classCount` (set by the caller) is the
// number of registered classes, all of which live in `zebmediatypes`.
var hostile = [undefined, null, NaN, Infinity, -Infinity, -0, 0, 1, -1, 2.5,
               Math.pow(2, 31), Math.pow(2, 32), Math.pow(2, 53) + 1, Math.pow(2, 63),
               -Math.pow(2, 63), 1e300, -1e300, "", "\ud800", "12", "abcd", [], [1, 2],
               [100, 101, 1.5], {}, function () {}, true];
var receivers = [undefined, null, {}, 5, "x"];
var calls = 0;

function attempt(run) {
  calls++;
  try {
    return run();
  } catch (e) {
    if (!(e instanceof Error)) throw new Error("a non-Error was thrown: " + String(e));
  }
  return undefined;
}
function isScriptObject(v) {
  return v !== null && typeof v === "object" && typeof v.isEqual === "function";
}

// The classes, and a few objects of each: made by `new` and by static methods.
var constructors = Object.getOwnPropertyNames(zebmediatypes).map(function (name) {
  return zebmediatypes[name];
});
if (constructors.length !== classCount) throw new Error(constructors.length + " classes reached");
var samples = [];
var perClass = {};
function keep(v) {
  if (!isScriptObject(v)) return;
  var name = String(v);
  perClass[name] = (perClass[name] || 0) + 1;
  if (perClass[name] <= 3) samples.push(v);
}
constructors.forEach(function (C) {
  keep(attempt(function () { return new C(); }));
  attempt(function () { return C(); });
  hostile.forEach(function (h) {
    keep(attempt(function () { return new C(h); }));
    attempt(function () { return new C(h, h, h, h, h); });
  });
  Object.getOwnPropertyNames(C).forEach(function (name) {
    var d = Object.getOwnPropertyDescriptor(C, name);
    if (typeof d.value === "function" && name !== "constructor") {
      keep(attempt(function () { return d.value.call(C, 1, 1); }));
      keep(attempt(function () { return d.value.call(C, "bgra"); }));
      keep(attempt(function () { return d.value.call(C, [100, 101]); }));
      keep(attempt(function () { return d.value.call(C, 25); }));
    } else if (d.get) {
      keep(attempt(function () { return d.get.call(C); }));
    }
  });
});
var values = hostile.concat(samples.slice(0, 60));
var targets = receivers.concat(samples);

// Every own item of every prototype and constructor, with every receiver.
function storm(holder) {
  Object.getOwnPropertyNames(holder).forEach(function (name) {
    if (name === "constructor" || name === "prototype") return;
    var d = Object.getOwnPropertyDescriptor(holder, name);
    targets.forEach(function (self) {
      if (d.get) attempt(function () { return d.get.call(self); });
      if (d.set) {
        values.forEach(function (v) {
          attempt(function () { d.set.call(self, v); });
        });
      }
      if (typeof d.value === "function") {
        attempt(function () { return d.value.call(self); });
        values.forEach(function (v) {
          attempt(function () { return d.value.call(self, v); });
          attempt(function () { return d.value.call(self, v, v, v); });
        });
      } else if (!d.get && !d.set) {
        attempt(function () { holder[name] = 1; });
      }
    });
  });
}
constructors.forEach(function (C) {
  storm(C.prototype);
  storm(C);
  storm(Object.getPrototypeOf(C.prototype));
});

// Indexes and lengths of every object.
samples.forEach(function (s) {
  [-1, 0, 1, 2, 1e10, -1e10, 0.5, "x", "01", "-0"].forEach(function (i) {
    attempt(function () { return s[i]; });
    attempt(function () { s[i] = 1; });
  });
  attempt(function () { return s.length; });
  attempt(function () { return String(s); });
  attempt(function () { return JSON.stringify(s); });
  attempt(function () { return Object.keys(s); });
  attempt(function () { return delete s.length; });
  samples.forEach(function (other) {
    attempt(function () { return s.isEqual(other); });
  });
});
[calls, samples.length].join(" ");
