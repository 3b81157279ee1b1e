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

#include <boost/make_shared.hpp>
#include <climits>
#include <cmath>
#include <cstring>
#include <limits>
#include <random>
#include <sstream>
#include <string>
#include <vector>

namespace {

using zebcore::UTF16String;
using zebcore::UTF8String;
namespace zs = zebcore::string;

// ---- Localizer ----

class LocalizerTest : public ::testing::Test {
 protected:
  void TearDown() override { zebcore::config::Localizer::Get().ClearTranslations(); }
};

TEST_F(LocalizerTest, GivesTheTranslationOrTheDefault) {
  auto& localizer = zebcore::config::Localizer::Get();
  localizer.InstallTranslations({{"$$$/zebmediatypes/RenderQuality/Draft", u"Brouillon"}});
  struct Case {
    const char* key;
    const char16_t* text;
  };
  const Case kCases[] = {
      {"$$$/zebmediatypes/RenderQuality/Draft=Draft", u"Brouillon"},
      {"$$$/zebmediatypes/RenderQuality/High=High", u"High"},  // no translation
      {"$$$/zebmediatypes/RenderQuality/Draft", u""},          // no '='
      {"$$$/a/b=x=y", u"x=y"},                                 // the first '=' splits
      {"$$$/a/b=", u""},
      {"$$$/a/b=\xC3\xA9t\xC3\xA9 @0", u"\u00E9t\u00E9 @0"},       // UTF-8 default
      {"$$$/zebmediatypes/RenderQuality/Draft =Draft", u"Draft"},  // paths match exactly
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.key);
    EXPECT_EQ(localizer.Localize(c.key), UTF16String(c.text));
  }
  localizer.ClearTranslations();
  EXPECT_EQ(localizer.Localize("$$$/zebmediatypes/RenderQuality/Draft=Draft"),
            UTF16String(u"Draft"));
}

TEST_F(LocalizerTest, ThrowErrorCarriesTheLocalizedText) {
  try {
    zebcore::config::ThrowError(zebcore::config::kInputContractViolation);
    FAIL() << "no exception";
  } catch (const zebcore::config::Error& e) {
    EXPECT_STREQ(e.what(), "An input contract violation has occurred!");
    EXPECT_EQ(e.Key(), zebcore::config::kInputContractViolation);
  }
  zebcore::config::Localizer::Get().InstallTranslations(
      {{"$$$/zebcore/utility/Error/Contract/InputContractViolation", u"Vertrag verletzt \u00FC"}});
  try {
    zebcore::config::ThrowError(zebcore::config::kInputContractViolation);
  } catch (const std::runtime_error& e) {
    EXPECT_STREQ(e.what(), "Vertrag verletzt \xC3\xBC");
  }
}

// ---- Assertions ----

TEST(Assertion, CaptureSeesEveryField) {
  zebcore::debug::ScopedAssertionCapture capture;
  EXPECT_EQ(capture.LastMessage(), "");
  zebcore::debug::ReportAssertion("b != 0", "Attempt to divide by zero", "tick_time.cpp",
                                  "zebmediatypes::TickTime::operator /", 42);
  ASSERT_EQ(capture.Count(), 1u);
  const auto report = capture.Reports().front();
  EXPECT_EQ(report.at(zebcore::debug::kDebugExpression), "b != 0");
  EXPECT_EQ(report.at(zebcore::debug::kDebugMessage), "Attempt to divide by zero");
  EXPECT_EQ(report.at(zebcore::debug::kDebugSource), "tick_time.cpp");
  EXPECT_EQ(report.at(zebcore::debug::kDebugFunction), "zebmediatypes::TickTime::operator /");
  EXPECT_EQ(report.at(zebcore::debug::kDebugLine), "42");
  EXPECT_EQ(capture.LastMessage(), "Attempt to divide by zero");
  zebcore::debug::ReportAssertion(nullptr, nullptr, nullptr, nullptr, 0);  // null texts are empty
  EXPECT_EQ(capture.Count(), 2u);
  EXPECT_EQ(capture.LastMessage(), "");
  capture.Clear();
  EXPECT_EQ(capture.Count(), 0u);
}

TEST(Assertion, CapturesNestAndRestoreTheOuterOne) {
  zebcore::debug::ScopedAssertionCapture outer;
  {
    zebcore::debug::ScopedAssertionCapture inner;
    zebcore::debug::ReportAssertion("x", "inner", "", "", 1);
    EXPECT_EQ(inner.Count(), 1u);
  }
  zebcore::debug::ReportAssertion("x", "outer", "", "", 2);
  EXPECT_EQ(outer.Count(), 1u);
  EXPECT_EQ(outer.LastMessage(), "outer");
}

TEST(Assertion, WithoutAHookReportsOneLineToStandardError) {
  ::testing::internal::CaptureStderr();
  zebcore::debug::ReportAssertion("rate > 0", "No rate", "time.cpp", "Align", 7);
  EXPECT_EQ(::testing::internal::GetCapturedStderr(),
            "ASSERT: No rate (rate > 0) in Align [time.cpp:7]\n");
}

// ---- Logging ----

TEST(Logging, RecordsReachTheSinkAndTheStructuredTrace) {
  std::vector<zebcore::logging::LogRecord> logged;
  std::vector<std::string> traced;
  EXPECT_FALSE(zebcore::logging::LoggingIsEnabled());
  zebcore::logging::SetLogSink([&](const zebcore::logging::LogRecord& r) { logged.push_back(r); });
  zebcore::logging::SetTraceSink(
      [&](std::string_view category, int level, std::string_view text) {
        traced.push_back(std::string(category) + "/" + std::to_string(level) + "/" +
                         std::string(text));
      },
      4);
  EXPECT_TRUE(zebcore::logging::LoggingIsEnabled());
  EXPECT_TRUE(zebcore::logging::TraceEnabled("any", 4));
  EXPECT_FALSE(zebcore::logging::TraceEnabled("any", 5));

  zebcore::logging::LogRecord record;
  record.message = "Opened";
  record.fields = {
      {"frames", std::int64_t{25}}, {"name", zs::ToUTF8String("clip \"1\"")}, {"drop", true}};
  zebcore::logging::Log(record);
  ASSERT_EQ(logged.size(), 1u);
  EXPECT_EQ(logged[0].message, "Opened");
  ASSERT_EQ(traced.size(), 1u);
  EXPECT_EQ(traced[0],
            "zebcore.StructuredLogging/4/Opened, frames: 25, name: \"clip \\\"1\\\"\", drop: "
            "true\r\n");

  zebcore::logging::LogException("Reader", std::runtime_error("bad file"));
  ASSERT_EQ(logged.size(), 2u);
  EXPECT_EQ(logged[1].message, "bad file");
  EXPECT_EQ(logged[1].source, "Reader");

  zebcore::logging::Trace("x", 5, "too detailed");  // above the level: dropped
  EXPECT_EQ(traced.size(), 2u);

  zebcore::logging::SetLogSink({});
  zebcore::logging::SetTraceSink({}, 0);
  EXPECT_FALSE(zebcore::logging::LoggingIsEnabled());
  EXPECT_FALSE(zebcore::logging::TraceEnabled("any", 0));
  zebcore::logging::Log(record);  // dropped, no crash
  EXPECT_EQ(logged.size(), 2u);
}

TEST(UsageLogger, GivesNoneUntilOneIsInstalled) {
  struct Recorder final : zebcore::config::UsageLogger {
    std::vector<std::string> events;
    void LogEvent(std::string_view a, std::string_view c, std::string_view e) override {
      events.push_back(std::string(a) + "/" + std::string(c) + "/" + std::string(e));
    }
  };
  EXPECT_FALSE(zebcore::config::UsageLogger::Get());
  auto recorder = boost::make_shared<Recorder>();
  zebcore::config::UsageLogger::Set(recorder);
  zebcore::config::UsageLogger::Get()->LogEvent("ColorSpace", "Serialization", "Failed");
  EXPECT_EQ(recorder->events, std::vector<std::string>{"ColorSpace/Serialization/Failed"});
  EXPECT_EQ(zebcore::config::UsageLogger::Set(nullptr), recorder);
  EXPECT_FALSE(zebcore::config::UsageLogger::Get());
}

// ---- Locks ----

TEST(RecursiveMutex, IsRecursive) {
  zebcore::threads::RecursiveMutex mutex("test");
  EXPECT_EQ(mutex.Name(), "test");
  ASSERT_TRUE(mutex.Lock("outer", 100));
  {
    zebcore::threads::RecursiveLockGuard guard(mutex, "inner", 100);
    EXPECT_TRUE(guard);
  }
  mutex.Unlock();
  EXPECT_EQ(zebcore::threads::RecursiveMutex(nullptr).Name(), "");
}

TEST(RecursiveMutex, UnlockWithoutAHoldIsReportedAndIgnored) {
  zebcore::threads::RecursiveMutex mutex("unheld");
  zebcore::debug::ScopedAssertionCapture capture;
  mutex.Unlock();
  EXPECT_EQ(capture.Count(), 1u);
  ASSERT_TRUE(mutex.Lock("after", 0));  // still free
  mutex.Unlock();
  mutex.Unlock();  // one release too many
  EXPECT_EQ(capture.Count(), 2u);
  ASSERT_TRUE(mutex.Lock("again", 0));
  mutex.Unlock();
}

// ---- Console ----

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
  EXPECT_FALSE(registry.HasCommand(u"zebcore.test.None"));
  EXPECT_TRUE(registry.HasCommand(name));

  bool listed = false;
  for (const auto& entry : registry.Commands()) {
    if (entry.name == name) listed = entry.help == UTF16String(u"Echoes its arguments.");
  }
  EXPECT_TRUE(listed);

  std::ostringstream narrow;
  zebcore::console::ConsoleOutputStream out(narrow);
  EXPECT_TRUE(registry.Execute(name, u"\u00E9\U0001F3AC", out));
  EXPECT_EQ(narrow.str(), "echo \xC3\xA9\xF0\x9F\x8E\xAC 3\n");
  EXPECT_FALSE(registry.Execute(u"zebcore.test.Missing", u"", out));

  auto command = registry.UnregisterCommand(name);
  EXPECT_TRUE(command);
  EXPECT_EQ(command.use_count(), 1);  // the registry let go of it
  EXPECT_FALSE(registry.HasCommand(name));
  EXPECT_FALSE(registry.UnregisterCommand(name));
}

// ---- Start-up ----

std::vector<std::string>& Calls() {
  static std::vector<std::string> calls;
  return calls;
}
int gFlakyAttempts = 0;
bool InitA() {
  Calls().push_back("init A");
  return true;
}
void TermA() { Calls().push_back("term A"); }
bool InitB() {
  Calls().push_back("init B");
  return true;
}
void TermB() { Calls().push_back("term B"); }
bool InitC() {
  Calls().push_back("init C");
  return true;
}
void TermC() { Calls().push_back("term C"); }
bool InitFlaky() {
  Calls().push_back("init Flaky");
  return ++gFlakyAttempts > 1;
}
void TermFlaky() { Calls().push_back("term Flaky"); }

std::vector<std::string> OurCalls() {
  std::vector<std::string> ours;
  for (const auto& call : Calls()) {
    if (call.find(' ') != std::string::npos) ours.push_back(call);
  }
  return ours;
}

TEST(StartUp, InitializesInOrderAndShutDownReverses) {
  using namespace zebcore::config;
  Calls().clear();
  const InitializerDependency none[kMaxInitializerDependencies] = {};
  InitializerDependency needsA[kMaxInitializerDependencies] = {};
  needsA[0].name = "zebcore.test.A";
  {
    // C waits for A although it registered first; B comes after A.
    InitializerRegistrar c("zebcore.test.C", kInitializerContext_Core, InitC, TermC, nullptr,
                           needsA);
    InitializerRegistrar a("zebcore.test.A", kInitializerContext_Core, InitA, TermA, nullptr, none);
    InitializerRegistrar b("zebcore.test.B", kInitializerContext_Media, InitB, TermB, nullptr,
                           none);
    EXPECT_STREQ(b.Name(), "zebcore.test.B");
    EXPECT_EQ(b.Context(), kInitializerContext_Media);
    StartUp();
    EXPECT_EQ(OurCalls(), (std::vector<std::string>{"init A", "init C", "init B"}));
    Calls().clear();
    StartUp();  // nothing left to start
    EXPECT_TRUE(OurCalls().empty());
    ShutDown();
    EXPECT_EQ(OurCalls(), (std::vector<std::string>{"term B", "term C", "term A"}));
    Calls().clear();
    ShutDown();  // nothing left to stop
    EXPECT_TRUE(OurCalls().empty());
  }
  EXPECT_TRUE(OurCalls().empty());  // destroyed while stopped: no terminate
}

TEST(StartUp, AFailedInitializerIsRetriedAndNeverTerminated) {
  using namespace zebcore::config;
  Calls().clear();
  gFlakyAttempts = 0;
  const InitializerDependency none[kMaxInitializerDependencies] = {};
  InitializerDependency needsFlaky[kMaxInitializerDependencies] = {};
  needsFlaky[3].name = "zebcore.test.Flaky";
  InitializerRegistrar flaky("zebcore.test.Flaky", kInitializerContext_Core, InitFlaky, TermFlaky,
                             nullptr, none);
  InitializerRegistrar a("zebcore.test.A", kInitializerContext_Core, InitA, TermA, nullptr,
                         needsFlaky);
  EXPECT_FALSE(StartUp());
  EXPECT_EQ(OurCalls(), std::vector<std::string>{"init Flaky"});  // A waits on it
  ShutDown();
  EXPECT_EQ(OurCalls(), std::vector<std::string>{"init Flaky"});
  Calls().clear();
  EXPECT_TRUE(StartUp());
  EXPECT_EQ(OurCalls(), (std::vector<std::string>{"init Flaky", "init A"}));
  ShutDown();
}

TEST(StartUp, ARegistrarDestroyedWhileStartedTerminates) {
  using namespace zebcore::config;
  Calls().clear();
  const InitializerDependency none[kMaxInitializerDependencies] = {};
  {
    InitializerRegistrar a("zebcore.test.A", kInitializerContext_Core, InitA, TermA, nullptr, none);
    StartUp();
  }
  EXPECT_EQ(OurCalls(), (std::vector<std::string>{"init A", "term A"}));
  Calls().clear();
  ShutDown();
  EXPECT_TRUE(OurCalls().empty());
}

// ---- RationalApproximation ----

TEST(RationalApproximation, FindsTheIntendedFraction) {
  struct Case {
    double value;
    int numerator;
    int denominator;
  };
  const Case kCases[] = {
      {29.97002997002997, 30000, 1001},
      {29.97002997, 30000, 1001},
      {23.976023976023978, 24000, 1001},
      {59.94005994005994, 60000, 1001},
      {25.0, 25, 1},
      {0.5, 1, 2},
      {-0.75, -3, 4},
      {0.0, 0, 1},
      {1.0 / 3.0, 1, 3},
      {M_PI, 208341, 66317},  // the first convergent within 1e-10
      {1e-12, 0, 1},
      {4e9, INT_MAX, 1},
      {-4e9, -INT_MAX, 1},
      {HUGE_VAL, INT_MAX, 1},
      {-HUGE_VAL, -INT_MAX, 1},
      {std::numeric_limits<double>::quiet_NaN(), 0, 1},
      {2147483646.0, 2147483646, 1},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.value);
    const boost::rational<int> r = zebcore::utility::RationalApproximation(c.value);
    EXPECT_EQ(r.numerator(), c.numerator);
    EXPECT_EQ(r.denominator(), c.denominator);
  }
}

TEST(RationalApproximation, IsCloseForRandomValues) {
  std::mt19937_64 random(5);
  std::uniform_real_distribution<double> uniform(-1e6, 1e6);
  for (int i = 0; i < 10000; ++i) {
    const double value = uniform(random);
    SCOPED_TRACE(value);
    const boost::rational<int> r = zebcore::utility::RationalApproximation(value);
    ASSERT_GT(r.denominator(), 0);
    const double back = static_cast<double>(r.numerator()) / r.denominator();
    EXPECT_LE(std::fabs(back - value), std::fabs(value) * 1e-9 + 1e-9);
  }
}

// ---- Base64 ----

TEST(Base64, EncodesTheStandardVectors) {
  struct Case {
    const char* bytes;
    const char* text;
  };
  const Case kCases[] = {{"", ""},
                         {"f", "Zg=="},
                         {"fo", "Zm8="},
                         {"foo", "Zm9v"},
                         {"foob", "Zm9vYg=="},
                         {"fooba", "Zm9vYmE="},
                         {"foobar", "Zm9vYmFy"}};
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    const auto* data = reinterpret_cast<const unsigned char*>(c.bytes);
    const std::size_t size = std::strlen(c.bytes);
    EXPECT_EQ(zs::ToStdString(zebcore::utility::EncodeBinaryDataToUTF8String(data, size)), c.text);
    std::vector<unsigned char> out{1, 2, 3};
    EXPECT_TRUE(zebcore::utility::DecodeBinaryDataFromUTF8String(zs::ToUTF8String(c.text), out));
    EXPECT_EQ(out, std::vector<unsigned char>(data, data + size));
  }
}

TEST(Base64, EveryByteStringRoundTrips) {
  std::mt19937 random(11);
  for (std::size_t n = 0; n < 200; ++n) {
    SCOPED_TRACE(n);
    std::vector<unsigned char> bytes(n);
    for (auto& b : bytes) b = static_cast<unsigned char>(random());
    const UTF8String text = zebcore::utility::EncodeBinaryDataToUTF8String(bytes.data(), n);
    EXPECT_EQ(text.size(), (n + 2) / 3 * 4);
    std::vector<unsigned char> back;
    ASSERT_TRUE(zebcore::utility::DecodeBinaryDataFromUTF8String(text, back));
    EXPECT_EQ(back, bytes);
  }
}

TEST(Base64, RejectsBadTextAndKeepsTheGroupsBeforeIt) {
  struct Case {
    const char* text;
    std::size_t bytesKept;
  };
  const Case kCases[] = {
      {"Zm9", 0},  // bad length
      {"Zm9vY", 3},
      {"Zm9v!mFy", 3},   // outside the alphabet
      {"Zm9v Zm9v", 3},  // white space is not allowed
      {"Zg==Zm9v", 0},   // padding before the end
      {"Zm8=Zm9v", 0},
      {"Z===", 0},
      {"====", 0},
      {"Zg=v", 0},      // a data character after padding
      {"Zm9vZ-==", 3},  // the URL-safe alphabet is not this one
      {"\xC3\xA9\xC3\xA9", 0},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    std::vector<unsigned char> out{9};
    EXPECT_FALSE(zebcore::utility::DecodeBinaryDataFromUTF8String(zs::ToUTF8String(c.text), out));
    EXPECT_EQ(out.size(), c.bytesKept);
  }
  EXPECT_TRUE(zebcore::utility::EncodeBinaryDataToUTF8String(nullptr, 0).empty());
}

// ---- Small helpers ----

TEST(RecycledMemory, SharesZeroedBytes) {
  auto block = zebcore::allocator::RecycledMemory::Create(0);
  EXPECT_EQ(block->GetData(), nullptr);
  unsigned char* data = block->Allocate(16);
  ASSERT_NE(data, nullptr);
  EXPECT_EQ(block->GetSize(), 16u);
  for (std::size_t i = 0; i < 16; ++i) EXPECT_EQ(data[i], 0);
  data[0] = 7;
  auto shared = block;
  EXPECT_EQ(shared->GetData()[0], 7);
  block->Allocate(32);
  EXPECT_EQ(shared->GetData()[0], 7);   // kept
  EXPECT_EQ(shared->GetData()[31], 0);  // new bytes are zero
  EXPECT_EQ(block->Allocate(0), nullptr);
}

TEST(CachedSerializer, MapsBothWaysAndReplacesEitherSide) {
  zebcore::serialization::CachedSerializer<int> cache;
  cache.Add(zs::ToUTF8String("one"), 1);
  cache.Add(zs::ToUTF8String("two"), 2);
  EXPECT_EQ(cache.FindValue(zs::ToUTF8String("one")), 1);
  EXPECT_EQ(cache.FindText(2), zs::ToUTF8String("two"));
  cache.Add(zs::ToUTF8String("uno"), 1);  // the value's old text goes
  EXPECT_FALSE(cache.FindValue(zs::ToUTF8String("one")));
  EXPECT_EQ(cache.FindText(1), zs::ToUTF8String("uno"));
  EXPECT_EQ(cache.Size(), 2u);
  cache.Clear();
  EXPECT_EQ(cache.Size(), 0u);
  EXPECT_FALSE(cache.FindText(2));
}

}  // namespace
