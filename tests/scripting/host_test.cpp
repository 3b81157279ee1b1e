// The script-object host: definitions, parameter validation, the JavaScript
// adapter's error mapping, lifetime, limits, strings and contexts.
#include <gtest/gtest.h>
#include <zebmediatypes/scripting/time_objects.h>
#include <zebmediatypes/scripting/video_objects.h>
#include <zebscripting/zebscripting.h>

#include <cmath>
#include <limits>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

using zebscripting::JavaScriptContext;
using zebscripting::ParameterErrorException;
using zebscripting::ParameterType;
using zebscripting::PropertyType;
using zebscripting::ScriptArguments;
using zebscripting::ScriptObject;
using zebscripting::ScriptObjectPtr;
using zebscripting::ScriptValue;
namespace def = zebscripting::definition;

// A list of numbers with every item kind the time classes lack: an element
// count, an indexed getter, a constant and a refusing constructor. Its definition
// throws after its items, so it also stands for a half-defined class.
class NumberListObject : public ScriptObject {
 public:
  NumberListObject() : ScriptObject(GetClassname()) {}
  static const char* GetClassname() { return "NumberList"; }
  static const char* GetDescription() { return "numbers"; }
  static void DefineObject() {
    def::ScriptObjectDefinitionBase& d = *def::ScriptObjectDefinitionBase::sCurrent;
    d.AddOrModifyNamespace("testing", 0);
    d.AddProperty(def::Constructor(&NumberListObject::Construct, "from an array", 0,
                                   ParameterType<std::vector<int>>("values", {})));
    d.AddProperty(def::ElementCount(PropertyType<int>(), &NumberListObject::GetLength, "count",
                                    def::kItemFlag_Host));
    d.AddProperty(def::IndexedGetter(PropertyType<int>(), &NumberListObject::GetByIndex,
                                     ParameterType<int>("index"), "element", def::kItemFlag_Host));
    d.AddProperty(def::Constant("ANSWER", 42, "an integer", def::kItemFlag_Host));
    throw std::runtime_error("left half-defined on purpose");
  }
  bool Construct(std::vector<int> values) {
    values_ = std::move(values);
    return values_.size() < 100;
  }
  int GetLength() const { return static_cast<int>(values_.size()); }
  int GetByIndex(int index) const {
    return index >= 0 && index < GetLength() ? values_[static_cast<std::size_t>(index)] : -1;
  }

 private:
  std::vector<int> values_;
};

const zebscripting::factory::ScriptObjectDefinitionRegistrar kNumberListRegistrar(
    new zebscripting::factory::ScriptObjectDefinitionInitiator<NumberListObject>());

TEST(ScriptDefinition, ConstructorsTakeOnlyTheFurtherFlags) {
  EXPECT_EQ(def::MakeConstructorFlags(0xFFFFFFFFu), 0x60080u);
  EXPECT_EQ(def::MakeItemFlags(def::kItemFlag_Method, true, 0xFFFFFFFFu, 0xFFFFFFFFu), 0x5E0044u);
}

TEST(ScriptDefinition, AThrowingDefinitionKeepsWhatItDefined) {
  const auto* definition = def::ScriptObjectDefinitionBase::Find("NumberList");
  ASSERT_NE(definition, nullptr);
  EXPECT_FALSE(definition->IsComplete());
  EXPECT_EQ(definition->GetItems().size(), 4u);
  EXPECT_EQ(def::ScriptObjectDefinitionBase::Find("NoSuchClass"), nullptr);
}

// What validating `value` as a T gives: "ok <value as text>" or the error kind.
template <class T>
std::string Outcome(const ScriptValue& value,
                    const ParameterType<T>& type = ParameterType<T>("p")) {
  try {
    const T result = type.Validate(0, ScriptArguments(&value, 1));
    if constexpr (std::is_same_v<T, zebcore::UTF16String>) {
      std::string units;
      for (char16_t unit : result) units += std::to_string(static_cast<unsigned>(unit)) + ",";
      return "ok " + units;
    } else if constexpr (std::is_same_v<T, zebcore::UTF8String>) {
      return "ok " + zebcore::string::ToStdString(result);
    } else {
      return "ok " + std::to_string(result);
    }
  } catch (const ParameterErrorException& error) {
    const char* kinds[] = {"wrong type", "out of range", "missing"};
    return kinds[error.GetKind()];
  }
}

TEST(ParameterType, ValidateConvertsOrRefusesEveryHostileValue) {
  const double nan = std::numeric_limits<double>::quiet_NaN();
  const double inf = std::numeric_limits<double>::infinity();
  const double two63 = 9223372036854775808.0;
  const struct {
    const char* label;
    std::string got;
    const char* want;
  } cases[] = {
      {"int NaN", Outcome<int>(nan), "out of range"},
      {"int inf", Outcome<int>(inf), "out of range"},
      {"int 1.5", Outcome<int>(1.5), "out of range"},
      {"int -0", Outcome<int>(-0.0), "ok 0"},
      {"int 2^31", Outcome<int>(2147483648.0), "out of range"},
      {"int -2^31", Outcome<int>(-2147483648.0), "ok -2147483648"},
      {"int text", Outcome<int>(u"1"), "wrong type"},
      {"int missing", Outcome<int>(ScriptValue()), "missing"},
      {"int default", Outcome<int>(ScriptValue::Null(), ParameterType<int>("i", 7)), "ok 7"},
      {"unsigned -1", Outcome<unsigned int>(-1.0), "out of range"},
      {"unsigned max", Outcome<unsigned int>(4294967295.0), "ok 4294967295"},
      {"int64 2^53+1", Outcome<std::int64_t>(9007199254740993.0), "ok 9007199254740992"},
      {"int64 2^63", Outcome<std::int64_t>(two63), "ok 9223372036854775807"},
      {"int64 -2^63", Outcome<std::int64_t>(-two63), "ok -9223372036854775808"},
      {"int64 2^64", Outcome<std::int64_t>(two63 * 2), "out of range"},
      {"int64 -inf", Outcome<std::int64_t>(-inf), "out of range"},
      {"float 1e300", Outcome<float>(1e300), "out of range"},
      {"float NaN", Outcome<float>(nan), "ok nan"},
      {"double bool", Outcome<double>(true), "wrong type"},
      {"bool number", Outcome<bool>(1.0), "wrong type"},
      {"UTF-16 lone surrogate", Outcome<zebcore::UTF16String>(u"\xD800x"), "ok 55296,120,"},
      {"UTF-8 lone surrogate", Outcome<zebcore::UTF8String>(u"\xD800"), "ok \xEF\xBF\xBD"},
      {"UTF-8 number", Outcome<zebcore::UTF8String>(1.0), "wrong type"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.label);
    EXPECT_EQ(c.got, c.want);
  }
}

// Runs `source` in a fresh context and gives "ok <text>" or "<ErrorName>: <message> @<line>".
std::string RunScript(const std::string& source) {
  const auto context = JavaScriptContext::Create();
  const zebscripting::JavaScriptResult result = context->Evaluate(source, "test.js");
  if (result.ok) return "ok " + result.text;
  return result.errorName + ": " + result.text + " @" + std::to_string(result.lineNumber);
}

TEST(JavaScriptContext, NativeFailuresBecomeScriptErrorsAtTheCallingLine) {
  struct Case {
    const char* source;
    const char* want;
  };
  const Case cases[] = {
      {"var t = new zebmediatypes.TickTime();\nt.ticksNumber = -101606400000000000;",
       "RangeError: TickTime.ticksNumber: the value was refused @2"},
      {"new zebmediatypes.TickTime().ticksNumber = 0.5;",
       "RangeError: TickTime.ticksNumber: argument 1 must be an integer in [-2^63, 2^63] @1"},
      {"\n\nzebmediatypes.TickTime.timeToTimecode(1);",
       "TypeError: TickTime.timeToTimecode: argument 1 must be a TickTime, not number @3"},
      {"RatioTime.createRatioTime(1, 0);",
       "Error: RatioTime.createRatioTime: bad rational: zero denominator @1"},
      {"new testing.NumberList([1, 1.5]);",
       "RangeError: NumberList constructor: argument 1 must be an array of integers in "
       "[-2147483648, 2147483647] @1"},
      {"var a = []; for (var i = 0; i < 200; ++i) a.push(i);\nnew testing.NumberList(a);",
       "RangeError: NumberList constructor: the constructor refused its arguments @2"},
      {"zebmediatypes.TickTime.TIME_ZERO = 1; 'ignored outside strict mode'",
       "TypeError: TickTime.TIME_ZERO is read-only @1"},
      {"testing.NumberList.ANSWER = 1; testing.NumberList.ANSWER", "ok 42"},
      {"var l = new testing.NumberList([5, 6]); [l.length, l[0], l[1], l[2], l[-1]].join()",
       "ok 2,5,6,-1,-1"},
      {"new testing.NumberList([5])[4294967296]",
       "RangeError: NumberList[]: argument 1 must be an integer in [-2147483648, 2147483647] @1"},
      {"(", "SyntaxError: parse error (line 1, end of input) @1"},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.source);
    EXPECT_EQ(RunScript(c.source), c.want);
  }
}

TEST(JavaScriptContext, ErrorsUnwindNativeFramesAndReleaseEverything) {
  const std::size_t before = ScriptObject::LiveObjectCount();
  {
    const auto context = JavaScriptContext::Create();
    // The TypeError is thrown while a native frame holds the object argument.
    const auto result = context->Evaluate(
        "var t = new zebmediatypes.TickTime(); var kept = [t, t.TIME_MAX];"
        "var cycle = {}; cycle.self = cycle; cycle.t = t.TIME_MIN;"
        "for (var i = 0; i < 100; ++i) { try { t.alignToFrame(t.TIME_ZERO); } catch (e) {} }"
        "undefined;",
        "test.js");
    EXPECT_TRUE(result.ok) << result.text;
    context->CollectGarbage();
    EXPECT_EQ(context->WrapperCount(), 3u);
    EXPECT_EQ(ScriptObject::LiveObjectCount(), before + 3);
    context->Evaluate("kept = null; cycle = null;", "test.js");
    context->CollectGarbage();
    EXPECT_EQ(context->WrapperCount(), 1u);
    EXPECT_EQ(ScriptObject::LiveObjectCount(), before + 1);
  }
  EXPECT_EQ(ScriptObject::LiveObjectCount(), before);
}

TEST(JavaScriptContext, HostileScriptsHitTheMemoryCapAndTheTimeLimit) {
  zebscripting::JavaScriptLimits limits;
  limits.memoryBytes = std::size_t{8} << 20;
  limits.timeoutSeconds = 0.2;
  const auto context = JavaScriptContext::Create(limits);
  const struct {
    const char* source;
    const char* errorName;
  } cases[] = {
      {"var a = [], s = 'x'; while (true) { s += s; a.push(s + a.length); }", "Error"},
      {"while (true) {}", "RangeError"},
      {"for (;;) { try { while (true) {} } catch (e) {} }", "RangeError"},
      {"(function f() { f(); })();", "RangeError"},
      {"var b = []; Object.defineProperty(b, 0, {get: function () { for (;;) {} }}); b",
       "RangeError"},
      {"throw {toString: function () { for (;;) {} }};", "Error"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.source);
    const auto result = context->Evaluate(c.source, "hostile.js");
    EXPECT_FALSE(result.ok);
    EXPECT_EQ(result.errorName, c.errorName);
    EXPECT_LE(context->MemoryInUse(), limits.memoryBytes);
    EXPECT_EQ(context->Evaluate("a = null; 1 + 1", "after.js").text, "2");
  }
}

TEST(JavaScriptContext, StringsCrossUnitForUnit) {
  const auto context = JavaScriptContext::Create();
  std::u16string seen;
  context->DefineFunction("echo", [&seen](const ScriptArguments& arguments) {
    seen = arguments[0].GetString();
    return arguments[0];
  });
  const std::u16string text = u"a\u00e9\u20ac\xD83D\xDE00\xD800\xDC00x\xDC00";
  context->DefineGlobal("text", ScriptValue(text));
  const auto result = context->Evaluate(
      "var s = '\\ud83d\\ude00\\ud800'; echo(s) === s && text.length === 9 && echo(text) === text",
      "strings.js");
  EXPECT_EQ(result.text, "true");
  EXPECT_EQ(seen, text);
  EXPECT_EQ(context->Evaluate("'\xF0\x9F\x98\x80'.length", "utf8.js").text, "2");
}

TEST(ScriptContext, StaticItemsMakeTheirObjectsInTheCallingContext) {
  const auto context = JavaScriptContext::Create();
  std::vector<ScriptObjectPtr> made;
  context->DefineFunction("capture", [&made](const ScriptArguments& arguments) {
    made.push_back(arguments[0].GetObject());
    return ScriptValue();
  });
  const auto result = context->Evaluate(
      "var Z = zebmediatypes; capture(Z.TickTime.TIME_ONE_HOUR);"
      "capture(Z.FrameRate.createWithValue(25)); capture(RatioTime.createRatioTime(1, 2));"
      "capture(Z.TickTime.timecodeToTime('1', null, null)); capture(new Z.TimeDisplay());",
      "context.js");
  ASSERT_TRUE(result.ok) << result.text;
  ASSERT_EQ(made.size(), 5u);
  for (const ScriptObjectPtr& object : made) {
    SCOPED_TRACE(object->GetClassName());
    EXPECT_EQ(object->GetContextHandle(), context->GetHandle());
  }
  const ScriptObjectPtr rate =
      zebscripting::utility::TransformObjectIntoScriptingObject<zebmediatypes::FrameRate>()(
          zebmediatypes::kFrameRate_Video25, context->GetHandle());
  zebmediatypes::FrameRate back;
  EXPECT_TRUE(zebscripting::CastScriptObject(rate, back));
  EXPECT_EQ(back, zebmediatypes::kFrameRate_Video25);
  const ScriptObjectPtr color =
      zebscripting::utility::TransformObjectIntoScriptingObject<zebmediatypes::color::RGBA>()(
          zebmediatypes::color::RGBA(0.25f, 0.5f, 0.75f, 0.125f), context->GetHandle());
  ASSERT_TRUE(color);
  EXPECT_EQ(color->GetContextHandle(), context->GetHandle());
  EXPECT_EQ(
      static_cast<const zebmediatypes::scripting::ColorObject&>(*color).GetColorRGBA().Alpha(),
      0.125f);
}

TEST(ScriptContext, ObjectsAreNotMadeForAContextThatIsGone) {
  int handle = 0;
  {
    const auto context = JavaScriptContext::Create();
    handle = context->GetHandle();
    EXPECT_EQ(zebscripting::ScriptContext::FromHandle(handle), context);
    EXPECT_NE(zebmediatypes::scripting::CreateTickTimeObject({}, handle), nullptr);
  }
  EXPECT_EQ(zebscripting::ScriptContext::FromHandle(handle), nullptr);
  EXPECT_EQ(zebmediatypes::scripting::CreateTickTimeObject({}, handle), nullptr);
  EXPECT_NE(zebmediatypes::scripting::CreateTickTimeObject({}, 0), nullptr);
}

TEST(ScriptObject, TimeHashesAreFnv1aOfTheValueBytes) {
  // FNV-1a of eight zero bytes.
  EXPECT_EQ(zebmediatypes::scripting::CreateTickTimeObject({}, 0)->Hash(), 0xa8c7f832281a39c5ull);
}

}  // namespace

namespace {

TEST(RefCountedObjectWithWeakPtr, WeakPointersSeeTheObjectUntilItGoes) {
  zebcore::utility::WeakPtr<ScriptObject> weak;
  {
    const ScriptObjectPtr time = zebmediatypes::scripting::CreateTickTimeObject({}, 0);
    weak = zebcore::utility::WeakPtr<ScriptObject>(time.get());
    EXPECT_EQ(weak.Lock(), time);
    EXPECT_EQ(time->UseCount(), 1u);
    time->LockObject();
    time->LockObject();
    EXPECT_EQ(time->UseCount(), 3u);
    time->UnlockObject();
    time->UnlockObject();
    time->UnlockObject();  // one too many: ignored
    EXPECT_EQ(time->UseCount(), 1u);
  }
  EXPECT_TRUE(weak.Expired());
  EXPECT_EQ(weak.Lock(), nullptr);
}

}  // namespace
