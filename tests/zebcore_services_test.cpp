// Localizer, errors, assertions, logging, console, start-up, rationals, base64
// and the small value helpers.

#include <gtest/gtest.h>
#include <zebcore/allocator.h>
#include <zebcore/assert.h>
#include <zebcore/binary_text.h>
#include <zebcore/cached_serializer.h>
#include <zebcore/console.h>
#include <zebcore/error.h>
#include <zebcore/initializer.h>
#include <zebcore/json.h>
#include <zebcore/localizer.h>
#include <zebcore/logging.h>
#include <zebcore/mutex.h>
#include <zebcore/rational.h>

#include <climits>
#include <cmath>
#include <random>
#include <sstream>
#include <string>
#include <vector>

namespace {

using zebcore::UTF16String;
using zebcore::UTF8String;
namespace zs = zebcore::string;
using Strings = std::vector<std::string>;

TEST(Localizer, GivesTheTranslationOrTheDefault) {
  auto& localizer = zebcore::config::Localizer::Get();
  localizer.InstallTranslations({{"$$$/zebmediatypes/RenderQuality/Draft", u"Brouillon"}});
  struct Case {
    const char* key;
    const char16_t* text;
  };
  const Case kCases[] = {
      {"$$$/zebmediatypes/RenderQuality/Draft=Draft", u"Brouillon"},
      {"$$$/zebmediatypes/RenderQuality/Draft", u""},              // no '='
      {"$$$/zebmediatypes/RenderQuality/Draft =Draft", u"Draft"},  // paths match exactly
      {"$$$/a/b=x=y", u"x=y"},                                     // the first '=' splits
      {"$$$/a/b=\xC3\xA9t\xC3\xA9 @0", u"\u00E9t\u00E9 @0"},       // UTF-8 default
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.key);
    EXPECT_EQ(localizer.Localize(c.key), UTF16String(c.text));
  }
  localizer.ClearTranslations();
}

TEST(Localizer, ThrowErrorCarriesTheLocalizedText) {
  using namespace zebcore::config;
  auto what = [] {
    try {
      ThrowError(kInputContractViolation);
    } catch (const Error& e) {
      return std::string(e.Key() == kInputContractViolation ? e.what() : "another key");
    }
    return std::string("no exception");
  };
  EXPECT_EQ(what(), "An input contract violation has occurred!");
  Localizer::Get().InstallTranslations(
      {{"$$$/zebcore/utility/Error/Contract/InputContractViolation", u"Vertrag verletzt \u00FC"}});
  EXPECT_EQ(what(), "Vertrag verletzt \xC3\xBC");
  Localizer::Get().ClearTranslations();
}

TEST(Assertion, CaptureSeesEveryFieldAndANestedCaptureRestoresTheOuterOne) {
  namespace zd = zebcore::debug;
  zd::ScopedAssertionCapture capture;
  zd::ReportAssertion("b != 0", "Attempt to divide by zero", "tick_time.cpp", "Divide", 42);
  EXPECT_EQ(capture.Reports().at(0),
            (zd::DebugDictionary{{zd::kDebugExpression, "b != 0"},
                                 {zd::kDebugMessage, "Attempt to divide by zero"},
                                 {zd::kDebugSource, "tick_time.cpp"},
                                 {zd::kDebugFunction, "Divide"},
                                 {zd::kDebugLine, "42"}}));
  {
    zd::ScopedAssertionCapture inner;
    zd::ReportAssertion(nullptr, nullptr, nullptr, nullptr, 0);  // null texts are empty
    EXPECT_EQ(inner.Reports().at(0).at(zd::kDebugExpression), "");
  }
  zd::ReportAssertion("x", "outer", "", "", 2);
  EXPECT_EQ(capture.Count(), 2u);
}

TEST(Assertion, WithoutAHookReportsOneLineToStandardError) {
  ::testing::internal::CaptureStderr();
  zebcore::debug::ReportAssertion("rate > 0", "No rate", "time.cpp", "Align", 7);
  EXPECT_EQ(::testing::internal::GetCapturedStderr(),
            "ASSERT: No rate (rate > 0) in Align [time.cpp:7]\n");
}

TEST(Logging, RecordsReachTheSinkAndTheStructuredTrace) {
  namespace zl = zebcore::logging;
  std::vector<zl::LogRecord> logged;
  Strings traced;
  zl::SetLogSink([&](const zl::LogRecord& r) { logged.push_back(r); });
  zl::SetTraceSink(
      [&](std::string_view category, int level, std::string_view text) {
        traced.push_back((std::string(category) + "/" + std::to_string(level) + "/").append(text));
      },
      4);
  zl::LogRecord record;
  record.message = "Opened";
  record.fields = {
      {"frames", std::int64_t{25}}, {"name", zs::ToUTF8String("clip \"1\"")}, {"drop", true}};
  zl::Log(record);
  zl::LogException("Reader", std::runtime_error("bad file"));
  zl::Trace("x", 5, "too detailed");  // above the level: dropped
  zl::SetLogSink({});
  zl::SetTraceSink({}, 0);
  zl::Log(record);  // dropped, no crash
  ASSERT_EQ(logged.size(), 2u);
  EXPECT_EQ(logged[0].message + "|" + logged[1].source + ": " + logged[1].message,
            "Opened|Reader: bad file");
  ASSERT_EQ(traced.size(), 2u);
  EXPECT_EQ(traced[0],
            "zebcore.StructuredLogging/4/Opened, frames: 25, name: \"clip \\\"1\\\"\", drop: "
            "true\r\n");
}

TEST(RecursiveMutex, IsRecursiveAndReportsAnUnlockWithoutAHold) {
  zebcore::threads::RecursiveMutex mutex(nullptr);
  EXPECT_EQ(mutex.Name(), "");  // a null name is empty
  zebcore::debug::ScopedAssertionCapture capture;
  mutex.Unlock();  // never held
  EXPECT_EQ(capture.Count(), 1u);
  ASSERT_TRUE(mutex.Lock("outer", 100));
  EXPECT_TRUE(zebcore::threads::RecursiveLockGuard(mutex, "inner", 100));  // held and let go
  mutex.Unlock();
  mutex.Unlock();  // one release too many
  EXPECT_EQ(capture.Count(), 2u);
  ASSERT_TRUE(mutex.Lock("again", 0));  // still free
  mutex.Unlock();
}

class EchoCommand final : public zebcore::console::Command {
 public:
  void Execute(const UTF16String& arguments, zs::UTF16OStream& out) override {
    out << u"echo " << arguments << ' ' << 3 << zs::endl;
  }
};

TEST(CommandRegistry, RegistersRunsAndUnregisters) {
  auto& registry = zebcore::console::CommandRegistry::Get();
  const UTF16String name = u"zebcore.test.Echo";
  auto factory = [] { return std::make_shared<EchoCommand>(); };
  ASSERT_TRUE(registry.RegisterCommand(name, u"Echoes its arguments.", factory));
  EXPECT_FALSE(registry.RegisterCommand(name, u"again", factory));  // taken
  EXPECT_FALSE(registry.RegisterCommand(
      u"zebcore.test.None", u"", [] { return std::shared_ptr<zebcore::console::Command>(); }));
  EXPECT_FALSE(registry.RegisterCommand(u"zebcore.test.Empty", u"", {}));
  EXPECT_TRUE(registry.HasCommand(name) && !registry.HasCommand(u"zebcore.test.None"));

  std::ostringstream narrow;
  zebcore::console::ConsoleOutputStream out(narrow);
  EXPECT_TRUE(registry.Execute(name, u"\u00E9\U0001F3AC", out));
  EXPECT_EQ(narrow.str(), "echo \xC3\xA9\xF0\x9F\x8E\xAC 3\n");
  EXPECT_FALSE(registry.Execute(u"zebcore.test.Missing", u"", out));

  EXPECT_EQ(registry.UnregisterCommand(name).use_count(), 1);  // the registry let go of it
  EXPECT_FALSE(registry.HasCommand(name) || registry.UnregisterCommand(name));
}

Strings& Calls() {
  static Strings calls;
  return calls;
}
int gFlakyAttempts = 0;
template <char kName>
bool Init() {
  Calls().push_back(std::string("init ") + kName);
  return kName != 'F' || ++gFlakyAttempts > 1;  // 'F' fails its first attempt
}
template <char kName>
void Term() {
  Calls().push_back(std::string("term ") + kName);
}
using Registrar = zebcore::config::InitializerRegistrar;
using zebcore::config::kInitializerContext_Core;
using zebcore::config::kMaxInitializerDependencies;
using Dependencies = zebcore::config::InitializerDependency[kMaxInitializerDependencies];
const Dependencies kNone = {};

TEST(StartUp, InitializesInOrderAndShutDownReverses) {
  using namespace zebcore::config;
  Calls().clear();
  const Dependencies needsA = {{"zebcore.test.A"}};
  {
    // C waits for A although it registered first; B comes after A.
    Registrar c("zebcore.test.C", kInitializerContext_Core, Init<'C'>, Term<'C'>, nullptr, needsA);
    Registrar a("zebcore.test.A", kInitializerContext_Core, Init<'A'>, Term<'A'>, nullptr, kNone);
    Registrar b("zebcore.test.B", kInitializerContext_Media, Init<'B'>, Term<'B'>, nullptr, kNone);
    StartUp();
    StartUp();  // nothing left to start
    ShutDown();
    ShutDown();  // nothing left to stop
  }              // destroyed while stopped: no terminate
  EXPECT_EQ(Calls(), (Strings{"init A", "init C", "init B", "term B", "term C", "term A"}));
}

TEST(StartUp, AFailedInitializerIsRetriedAndOnlyAStartedOneTerminates) {
  using namespace zebcore::config;
  Calls().clear();
  gFlakyAttempts = 0;
  const Dependencies needsF = {{}, {}, {}, {"zebcore.test.F"}};  // any slot counts
  {
    Registrar f("zebcore.test.F", kInitializerContext_Core, Init<'F'>, Term<'F'>, nullptr, kNone);
    Registrar a("zebcore.test.A", kInitializerContext_Core, Init<'A'>, Term<'A'>, nullptr, needsF);
    EXPECT_FALSE(StartUp());
    ShutDown();
    EXPECT_EQ(Calls(), Strings{"init F"});  // A waits on it; F never started
    EXPECT_TRUE(StartUp());
  }  // destroyed while started: each terminates
  ShutDown();
  EXPECT_EQ(Calls(), (Strings{"init F", "init F", "init A", "term A", "term F"}));
}

TEST(RationalApproximation, FindsTheIntendedFraction) {
  struct Case {
    double value;
    int numerator;
    int denominator;
  };
  const Case kCases[] = {
      {29.97002997, 30000, 1001}, {-0.75, -3, 4},           {1e-12, 0, 1},
      {M_PI, 208341, 66317},  // the first convergent within 1e-10
      {4e9, INT_MAX, 1},          {-HUGE_VAL, -INT_MAX, 1}, {std::nan(""), 0, 1},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.value);
    EXPECT_EQ(zebcore::utility::RationalApproximation(c.value),
              boost::rational<int>(c.numerator, c.denominator));
  }
  std::mt19937_64 random(5);
  std::uniform_real_distribution<double> uniform(-1e6, 1e6);
  for (int i = 0; i < 10000; ++i) {  // random values come back close
    const double value = uniform(random);
    EXPECT_NEAR(boost::rational_cast<double>(zebcore::utility::RationalApproximation(value)), value,
                std::fabs(value) * 1e-9 + 1e-9);
  }
}

TEST(Base64, EncodesTheStandardVectorsAndEveryByteStringRoundTrips) {
  using namespace zebcore::utility;
  const char* const kTexts[] = {"", "Zg==", "Zm8=", "Zm9v", "Zm9vYg==", "Zm9vYmE=", "Zm9vYmFy"};
  for (std::size_t n = 0; n < std::size(kTexts); ++n) {
    SCOPED_TRACE(kTexts[n]);
    const auto* foobar = reinterpret_cast<const unsigned char*>("foobar");
    EXPECT_EQ(zs::ToStdString(EncodeBinaryDataToUTF8String(foobar, n)), kTexts[n]);
  }
  std::mt19937 random(11);
  for (std::size_t n = 0; n < 200; ++n) {
    SCOPED_TRACE(n);
    std::vector<unsigned char> bytes(n), back{1, 2, 3};
    for (auto& b : bytes) b = static_cast<unsigned char>(random());
    const UTF8String text = EncodeBinaryDataToUTF8String(bytes.data(), n);
    EXPECT_EQ(text.size(), (n + 2) / 3 * 4);
    ASSERT_TRUE(DecodeBinaryDataFromUTF8String(text, back));
    EXPECT_EQ(back, bytes);
  }
  EXPECT_TRUE(EncodeBinaryDataToUTF8String(nullptr, 0).empty());
}

TEST(Base64, RejectsBadTextAndKeepsTheGroupsBeforeIt) {
  struct Case {
    const char* text;
    std::size_t bytesKept;
  };
  const Case kCases[] = {
      {"Zm9vY", 3},      // bad length
      {"Zm9v!mFy", 3},   // outside the alphabet
      {"Zm9v Zm9v", 3},  // white space is not allowed
      {"Zg==Zm9v", 0},   // padding before the end
      {"Zg=v", 0},       // a data character after padding
      {"Zm9vZ-==", 3},   // the URL-safe alphabet is not this one
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    std::vector<unsigned char> out{9};
    EXPECT_FALSE(zebcore::utility::DecodeBinaryDataFromUTF8String(zs::ToUTF8String(c.text), out));
    EXPECT_EQ(out.size(), c.bytesKept);
  }
}

TEST(RecycledMemory, SharesZeroedBytes) {
  auto block = zebcore::allocator::RecycledMemory::Create(0);
  EXPECT_EQ(block->GetData(), nullptr);
  ASSERT_NE(block->Allocate(16), nullptr);
  block->GetData()[0] = 7;
  const auto shared = block;
  const unsigned char* data = block->Allocate(32);
  // The first byte is kept; all others are zero.
  EXPECT_EQ(std::string(data, data + shared->GetSize()), "\x07" + std::string(31, '\0'));
  EXPECT_EQ(block->Allocate(0), nullptr);
}

TEST(CachedSerializer, MapsBothWaysAndReplacesEitherSide) {
  zebcore::serialization::CachedSerializer<int> cache;
  auto u8 = [](const char* s) { return zs::ToUTF8String(s); };
  cache.Add(u8("one"), 1);
  cache.Add(u8("two"), 2);
  EXPECT_EQ(cache.FindValue(u8("two")), 2);
  cache.Add(u8("uno"), 1);  // the value's old text goes
  EXPECT_FALSE(cache.FindValue(u8("one")));
  EXPECT_EQ(cache.FindText(1), u8("uno"));
  EXPECT_EQ(cache.Size(), 2u);
}

}  // namespace
