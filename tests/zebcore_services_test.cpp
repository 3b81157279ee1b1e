// Localizer, assertions, start-up, rationals and base64.

#include <gtest/gtest.h>
#include <zebcore/assert.h>
#include <zebcore/binary_text.h>
#include <zebcore/initializer.h>
#include <zebcore/localizer.h>
#include <zebcore/rational.h>

#include <climits>
#include <cmath>
#include <random>
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

Strings& Calls() {
  static Strings calls;
  return calls;
}
template <char kName>
bool Init() {
  Calls().push_back(std::string("init ") + kName);
  return true;
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

}  // namespace
