// Runs fuzz-built scripts against every registered script class, in a fresh
// context with a small memory cap and time limit.
//
// Input: text starting with "//" is run as it is (the seeds are the script
// tests). Anything else is read as a sequence of calls, four bytes each: the
// item (over the items of every class, in definition order), the receiver and
// two arguments, each drawn from the hostile values and the objects made so
// far; the script is built from them, one guarded call a line.
//
// What must hold: nothing crashes; in built scripts whatever is thrown is an
// Error; every native object is released with the context.
#include <zebscripting/zebscripting.h>

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <vector>

namespace {

namespace def = zebscripting::definition;

struct Item {
  std::string classPath;  // expression reaching the class
  std::string name;
  def::ItemKind kind;
  bool isStatic;
};

const std::vector<Item>& Items() {
  static const std::vector<Item> items = [] {
    std::vector<Item> all;
    for (const def::ScriptObjectDefinitionBase* definition :
         def::ScriptObjectDefinitionBase::GetAll()) {
      // Every registered class lives in `zebmediatypes` (the binding storm checks it).
      const std::string path = "zebmediatypes." + definition->GetClassName();
      for (const def::ScriptItemDefinitionBase& item : definition->GetItems()) {
        all.push_back({path, item.GetName(), item.GetKind(), item.IsStatic()});
      }
    }
    return all;
  }();
  return items;
}

constexpr const char* kHostile[] = {"undefined",
                                    "null",
                                    "NaN",
                                    "Infinity",
                                    "-Infinity",
                                    "-0",
                                    "0",
                                    "1",
                                    "-1",
                                    "2.5",
                                    "Math.pow(2, 31)",
                                    "Math.pow(2, 53) + 1",
                                    "Math.pow(2, 63)",
                                    "-Math.pow(2, 63)",
                                    "1e300",
                                    "''",
                                    "'\\ud800'",
                                    "'12'",
                                    "'bgra'",
                                    "[]",
                                    "[100, 101]",
                                    "{}",
                                    "function () {}",
                                    "true"};
constexpr std::size_t kHostileCount = sizeof(kHostile) / sizeof(kHostile[0]);

// A value: a hostile literal, or one of the objects kept so far.
std::string Value(std::uint8_t byte) {
  if (byte < kHostileCount) return kHostile[byte];
  return "O[" + std::to_string(byte % 16) + "]";
}

std::string BuildScript(const std::uint8_t* data, std::size_t size) {
  const std::vector<Item>& items = Items();
  std::string script =
      "var O = [];\n"
      "function keep(v) { if (v !== null && typeof v === 'object') O.push(v); return v; }\n"
      "function guard(run) { try { keep(run()); } catch (e) {"
      " if (!(e instanceof Error)) throw 'non-Error'; } }\n";
  for (std::size_t at = 0; at + 4 <= size && !items.empty(); at += 4) {
    const Item& item = items[data[at] % items.size()];
    const std::string self = item.isStatic ? item.classPath : Value(data[at + 1]);
    const std::string a = Value(data[at + 2]);
    const std::string b = Value(data[at + 3]);
    std::string call;
    switch (item.kind) {
      case def::ItemKind::kConstructor:
        call = "new " + item.classPath + "(" + a + ", " + b + ")";
        break;
      case def::ItemKind::kMethod:
        call = self + "['" + item.name + "'](" + a + ", " + b + ")";
        break;
      case def::ItemKind::kReadWriteProperty:
        call = (data[at + 3] & 1) != 0 ? self + "['" + item.name + "'] = " + a
                                       : self + "['" + item.name + "']";
        break;
      case def::ItemKind::kIndexedGetter:
        call = self + "[" + a + "]";
        break;
      case def::ItemKind::kElementCount:
        call = self + ".length";
        break;
      default:
        call = self + "['" + item.name + "']";
        break;
    }
    script += "guard(function () { return " + call + "; });\n";
    if ((data[at + 1] & 0x3F) == 0) script += "O[0] && O[0].isEqual(" + b + ");\n";
  }
  return script;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  if (size > 1 << 16) return 0;
  const bool isScript = size >= 2 && data[0] == '/' && data[1] == '/';
  const std::string source =
      isScript ? std::string(reinterpret_cast<const char*>(data), size) : BuildScript(data, size);
  const std::size_t before = zebscripting::ScriptObject::LiveObjectCount();
  {
    zebscripting::JavaScriptLimits limits;
    limits.memoryBytes = std::size_t{16} << 20;
    limits.timeoutSeconds = 1;
    const auto context = zebscripting::JavaScriptContext::Create(limits);
    context->DefineFunction(
        "print", [](const zebscripting::ScriptArguments&) { return zebscripting::ScriptValue(); });
    const zebscripting::JavaScriptResult result = context->Evaluate(source, "fuzz.js");
    if (!isScript && !result.ok && result.text == "uncaught non-Error") std::abort();
  }
  if (zebscripting::ScriptObject::LiveObjectCount() != before) std::abort();
  return 0;
}
