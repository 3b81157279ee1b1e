// The audio, video and colour script classes from native code: the constants
// against the tables they come from, the definitions, hashing, and the held
// layout's lifetime.
#include <gtest/gtest.h>
#include <zebmediatypes/audio_descriptions.h>
#include <zebmediatypes/scripting/audio_constants.h>
#include <zebmediatypes/scripting/audio_objects.h>
#include <zebmediatypes/scripting/pixel_format_constants.h>
#include <zebmediatypes/scripting/video_objects.h>
#include <zebscripting/definition.h>
#include <zebscripting/javascript.h>

#include <set>
#include <string>

namespace zebmediatypes::scripting {
namespace {

using zebscripting::definition::ScriptObjectDefinitionBase;

// One script context; Run gives the completion value of a program that must
// succeed, Object the native object it gives.
class Script {
 public:
  zebscripting::ScriptValue Run(const std::string& source) {
    const zebscripting::JavaScriptResult result = context_->Evaluate(source, "test.js");
    EXPECT_TRUE(result.ok) << source << ": " << result.errorName << ": " << result.text;
    return result.value;
  }
  template <class T>
  const T& Object(const std::string& source) {
    objects_.push_back(Run(source).GetObject());
    const T* object = dynamic_cast<const T*>(objects_.back().get());
    if (object == nullptr) throw std::runtime_error(source + " gives no such object");
    return *object;
  }
  int Handle() const { return context_->GetHandle(); }

 private:
  boost::intrusive_ptr<zebscripting::JavaScriptContext> context_ =
      zebscripting::JavaScriptContext::Create();
  std::vector<ScriptObjectPtr> objects_;
};

std::string Description(const char* className, const std::string& item) {
  const auto* definition = ScriptObjectDefinitionBase::Find(className);
  const auto* found = definition != nullptr ? definition->FindItem(item) : nullptr;
  return found != nullptr ? found->GetDescription() : "(no item " + item + ")";
}

// The constants are exactly the labels the library describes, but the
// higher-order ambisonic 143.
TEST(AudioChannelLayoutObject, LabelConstantsAreTheDescribedLabels) {
  Script script;
  std::set<double> values;
  for (const AudioChannelLabelConstant& constant : GetAudioChannelLabelConstants()) {
    SCOPED_TRACE(constant.name);
    const double value = script.Run(std::string("AudioChannelLayout.") + constant.name).GetNumber();
    EXPECT_EQ(value, static_cast<double>(constant.label));
    values.insert(value);
    EXPECT_EQ(Description("AudioChannelLayout", constant.name), constant.description);
  }
  EXPECT_EQ(values.size(), GetAudioChannelLabelConstants().size());
  for (int value = -1; value <= 300; ++value) {
    SCOPED_TRACE(value);
    EXPECT_EQ(!AudioChannelLabelDescription(
                   static_cast<AudioChannelLabel>(static_cast<std::uint32_t>(value)), false)
                   .empty(),
              values.count(value) == 1 || value == 143);
  }
}

TEST(AudioChannelLayoutObject, LayoutConstantsAreTheCatalogueEntries) {
  Script script;
  const auto& catalogue = GetCommonAudioChannelLayouts();
  for (std::size_t i = 0; i < catalogue.size(); ++i) {
    const CommonAudioChannelLayout& entry = catalogue[i];
    SCOPED_TRACE(entry.name);
    EXPECT_EQ(script.Run(std::string("AudioChannelLayout.") + entry.name).GetNumber(),
              static_cast<double>(i));
    EXPECT_EQ(Description("AudioChannelLayout", entry.name), entry.description);
    const AudioChannelLayout layout = entry.factory();
    EXPECT_EQ(
        script
            .Object<AudioChannelLayoutObject>("AudioChannelLayout.createCommonAudioChannelLayout(" +
                                              std::to_string(i) + ")")
            .GetAudioChannelLayout(),
        layout);
    std::string description = std::to_string(layout.size()) + " Channel Configuration";
    for (AudioChannelDescription channel : layout) {
      description += std::string(" ") + GetAudioChannelLabelConstantDescription(channel.label);
    }
    if (i == 3) description.insert(description.find("Front-Left") + 10, " ");  // BROADCAST51
    EXPECT_EQ(entry.description, description);
  }
}

TEST(PixelFormatObject, ConstantsAreTheFourCCsOfTheirFormats) {
  Script script;
  std::set<std::uint32_t> names;
  for (const PixelFormatConstant& constant : GetPixelFormatConstants()) {
    SCOPED_TRACE(constant.name);
    EXPECT_TRUE(names.insert(constant.format.fourCC).second);
    EXPECT_EQ(Description("PixelFormat", constant.name), constant.description);
    const std::string name = std::string("PixelFormat.") + constant.name;
    EXPECT_EQ(
        script.Run(name + " === '" + PixelFormatFourCCText(constant.format.fourCC) + "'").GetBool(),
        true);
    EXPECT_EQ(script.Object<PixelFormatObject>("PixelFormat.createPixelFormat(" + name + ")")
                  .GetPixelFormat(),
              constant.format);
  }
  // Bytes below 32 show as spaces, bytes from 128 as '?'.
  EXPECT_EQ(PixelFormatFourCCText(static_cast<PixelFormatName>(0xFF1F7E80u)), "?~ ?");
}

// Every class, its items in definition order; only constructors lack 0x80000.
TEST(ScriptDefinition, EveryClassListsItsItemsInOrder) {
  struct Case {
    const char* className;
    const char* items;  // constants of the label, layout and pixel-format tables left out
  };
  const Case kCases[] = {
      {"TickTime",
       " seconds equals ticks ticksNumber timecodeToTime timeToTimecode alignToNearestFrame "
       "alignToFrame TIME_ZERO TIME_ONE_SECOND TIME_ONE_MINUTE TIME_ONE_HOUR TIME_MAX TIME_MIN "
       "TIME_INVALID"},
      {"FrameRate", " ticksPerFrame createWithValue"},
      {"RatioTime", "createRatioTime value scale"},
      {"TimeDisplay", " type customFPS"},
      {"AudioChannelLayout",
       "length [] description label createCommonAudioChannelLayout createAudioChannelLayout"},
      {"AudioBusDescription", " name layout type TYPE_MAIN TYPE_AUXILIARY"},
      {"AudioChannelMap",
       " SOURCECHANNELINDEX_NOMATCH SOURCECHANNELINDEX_OUTOFRANGE channelCount getMapping "
       "setMapping"},
      {"AudioFormat",
       " sampleRate bitDepth channelLayout SAMPLETYPE_8 SAMPLETYPE_16 SAMPLETYPE_24 "
       "SAMPLETYPE_32"},
      {"PixelFormat", "createPixelFormat"},
      {"PixelAspectRatio", "createPixelAspectRatio numerator denominator"},
      {"ColorObject", " red green blue alpha"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.className);
    const ScriptObjectDefinitionBase* definition = ScriptObjectDefinitionBase::Find(c.className);
    ASSERT_NE(definition, nullptr);
    EXPECT_TRUE(definition->IsComplete());
    std::string items;  // names joined by spaces; a constructor's is empty
    bool first = true;
    for (const auto& item : definition->GetItems()) {
      const bool constructor = item.GetKind() == zebscripting::definition::ItemKind::kConstructor;
      EXPECT_EQ(item.GetFlags() & 0x80000u, constructor ? 0u : 0x80000u) << item.GetName();
      const std::string& name = item.GetName();
      if (name.rfind("AUDIOCHANNELLABEL_", 0) == 0 || name.rfind("CHANNELLAYOUT_", 0) == 0 ||
          name.rfind("PIXELFORMAT_", 0) == 0) {
        continue;
      }
      items += (first ? "" : " ") + item.GetName();
      first = false;
    }
    EXPECT_EQ(items, c.items);
  }
}

// Equal objects hash alike: each Hash feeds only what IsEqual compares.
TEST(ScriptMediaObjects, EqualObjectsHashAlike) {
  struct Case {
    const char* a;
    const char* b;
    bool equal;
  };
  const Case kCases[] = {
      {"AudioChannelLayout.createAudioChannelLayout([100, 101])",
       "AudioChannelLayout.createCommonAudioChannelLayout(1)", true},
      {"AudioChannelLayout.createAudioChannelLayout([100, 101])",
       "AudioChannelLayout.createAudioChannelLayout([101, 100])", false},
      {"new AudioFormat(48000, 24)", "new AudioFormat(48000, 20)", true},
      {"new AudioChannelMap([0, 1])", "new AudioChannelMap(new AudioChannelMap([0, 1]))", true},
      {"new AudioBusDescription()", "new AudioBusDescription()", true},
      {"PixelFormat.createPixelFormat('bgra')", "PixelFormat.createPixelFormat('bgra')", true},
      {"PixelFormat.createPixelFormat('bgra')", "PixelFormat.createPixelFormat('bgrx')", false},
  };
  Script script;
  for (const Case& c : kCases) {
    SCOPED_TRACE(std::string(c.a) + " / " + c.b);
    const ScriptObjectPtr a = script.Run(c.a).GetObject();
    const ScriptObjectPtr b = script.Run(c.b).GetObject();
    ASSERT_TRUE(a && b);
    EXPECT_EQ(a->IsEqual(b), c.equal);
    EXPECT_EQ(a->Hash() == b->Hash(), c.equal);
  }
}

TEST(AudioFormatObject, HeldLayoutIsUnlockedAndReleasedWithTheFormat) {
  const std::size_t before = zebscripting::ScriptObject::LiveObjectCount();
  {
    ScriptObjectPtr format =
        CreateAudioFormatObject(AudioFormat::CreateDefaultAudioFormat(6, 48000), 0);
    ASSERT_TRUE(format);
    ScriptObjectPtr held = static_cast<AudioFormatObject&>(*format).GetChannelLayout();
    ASSERT_TRUE(held);
    EXPECT_TRUE(held->IsLocked());
    EXPECT_EQ(static_cast<AudioChannelLayoutObject&>(*held).GetAudioChannelLayout().size(), 6u);
    format.reset();
    EXPECT_FALSE(held->IsLocked());
  }
  Script().Run(
      "var f = new AudioFormat(); f.channelLayout = f.channelLayout; f.channelLayout.length");
  EXPECT_EQ(zebscripting::ScriptObject::LiveObjectCount(), before);
}

// A format whose context is gone gets no layout object: nothing is held or
// locked, and a layout write still changes the format and reports it.
TEST(AudioFormatObject, WithoutALayoutObjectNothingIsHeld) {
  const int goneContext = Script().Handle();
  const AudioFormat stereo = AudioFormat::CreateDefaultAudioFormat(2, 48000);
  boost::intrusive_ptr<AudioFormatObject> initialized(new AudioFormatObject());
  initialized->SetContextHandle(goneContext);
  initialized->Initialize(stereo);
  EXPECT_EQ(initialized->GetAudioFormat(), stereo);
  EXPECT_FALSE(initialized->GetChannelLayout());

  boost::intrusive_ptr<AudioFormatObject> constructed(new AudioFormatObject());
  constructed->SetContextHandle(goneContext);
  EXPECT_TRUE(constructed->Construct(96000, 16, nullptr));
  EXPECT_FALSE(constructed->GetChannelLayout());
  EXPECT_TRUE(
      constructed->SetChannelLayout(CreateAudioChannelLayoutObject(CreateMonoChannelLayout(), 0)));
  EXPECT_EQ(constructed->GetAudioFormat().GetChannelLayout(), CreateMonoChannelLayout());
  EXPECT_FALSE(constructed->GetChannelLayout());
  EXPECT_EQ(CreateAudioFormatObject(stereo, goneContext), nullptr);
}

}  // namespace
}  // namespace zebmediatypes::scripting
