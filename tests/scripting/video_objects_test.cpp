// The video and colour script classes from native code: the pixel-format
// constants against the formats they name, the definitions, and the factories.
#include <gtest/gtest.h>
#include <zebmediatypes/scripting/pixel_format_constants.h>
#include <zebmediatypes/scripting/video_objects.h>
#include <zebscripting/definition.h>
#include <zebscripting/javascript.h>

#include <array>
#include <set>
#include <string>

namespace zebmediatypes::scripting {
namespace {

using zebscripting::JavaScriptContext;
using zebscripting::definition::ScriptObjectDefinitionBase;

ScriptObjectPtr RunForObject(JavaScriptContext& context, const std::string& source) {
  const zebscripting::JavaScriptResult result = context.Evaluate(source, "test.js");
  EXPECT_TRUE(result.ok) << source << ": " << result.errorName << ": " << result.text;
  return result.value.GetObject();
}

TEST(PixelFormatObject, ConstantsAreTheFourCCsOfTheirFormats) {
  const auto context = JavaScriptContext::Create();
  const ScriptObjectDefinitionBase* definition = ScriptObjectDefinitionBase::Find("PixelFormat");
  ASSERT_NE(definition, nullptr);
  std::set<std::uint32_t> names;
  for (const PixelFormatConstant& constant : GetPixelFormatConstants()) {
    SCOPED_TRACE(constant.name);
    EXPECT_TRUE(names.insert(constant.format.fourCC).second);
    const auto* item = definition->FindItem(constant.name);
    ASSERT_NE(item, nullptr);
    EXPECT_EQ(item->GetDescription(), constant.description);
    const std::string text = PixelFormatFourCCText(constant.format.fourCC);
    EXPECT_EQ(context->Evaluate(std::string("PixelFormat.") + constant.name, "test.js").text, text);
    const ScriptObjectPtr object = RunForObject(
        *context, "PixelFormat.createPixelFormat(PixelFormat." + std::string(constant.name) + ")");
    ASSERT_TRUE(object);
    EXPECT_EQ(static_cast<const PixelFormatObject&>(*object).GetPixelFormat(), constant.format);
  }
}

TEST(PixelFormatObject, FourCCTextShowsOnlyPrintableBytes) {
  struct Case {
    std::uint32_t name;
    const char* text;
  };
  const Case kCases[] = {
      {MakePixelFormatName("bgra"), "bgra"},
      {0, "    "},
      {0x1F7F2080u, "? \x7F "},
      {0xFF80417Eu, "~A??"},
      {0xFFFFFFFFu, "????"},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.text);
    EXPECT_EQ(PixelFormatFourCCText(static_cast<PixelFormatName>(c.name)), c.text);
  }
}

TEST(ScriptVideoObjects, DefinitionsListTheirItemsInOrder) {
  struct Case {
    const char* className;
    const char* items;  // the pixel-format constants left out
    std::size_t namespaces;
  };
  const Case kCases[] = {
      {"PixelFormat", "createPixelFormat", 2},
      {"PixelAspectRatio", "createPixelAspectRatio numerator denominator", 2},
      {"ColorObject", " red green blue alpha", 1},
  };
  for (const Case& c : kCases) {
    SCOPED_TRACE(c.className);
    const ScriptObjectDefinitionBase* definition = ScriptObjectDefinitionBase::Find(c.className);
    ASSERT_NE(definition, nullptr);
    EXPECT_TRUE(definition->IsComplete());
    std::string items;
    bool first = true;
    for (const auto& item : definition->GetItems()) {
      if (item.GetName().rfind("PIXELFORMAT_", 0) == 0) continue;
      items += (first ? "" : " ") + item.GetName();
      first = false;
    }
    EXPECT_EQ(items, c.items);
    EXPECT_EQ(definition->GetNamespaces().size(), c.namespaces);
  }
}

TEST(ScriptVideoObjects, EqualityAndHash) {
  const auto context = JavaScriptContext::Create();
  const ScriptObjectPtr bgra = RunForObject(*context, "PixelFormat.createPixelFormat('bgra')");
  const ScriptObjectPtr same = CreatePixelFormatObject(kPixelFormat_BGRA_4444_8u, 0);
  const ScriptObjectPtr other = CreatePixelFormatObject(kPixelFormat_BGRX_4444_8u, 0);
  ASSERT_TRUE(bgra && same && other);
  EXPECT_TRUE(bgra->IsEqual(same));
  EXPECT_EQ(bgra->Hash(), same->Hash());
  EXPECT_FALSE(bgra->IsEqual(other));
  EXPECT_NE(bgra->Hash(), other->Hash());
  // The aspect-ratio and colour classes keep the host's identity.
  const ScriptObjectPtr ratio = CreatePixelAspectRatioObject(kPixelAspectRatio_DVNTSC, 0);
  const ScriptObjectPtr color = CreateColorObject(color::RGBA(1, 0, 0), 0);
  EXPECT_FALSE(ratio->IsEqual(CreatePixelAspectRatioObject(kPixelAspectRatio_DVNTSC, 0)));
  EXPECT_FALSE(color->IsEqual(CreateColorObject(color::RGBA(1, 0, 0), 0)));
}

TEST(ColorObject, TransformMakesAColorObjectInTheContext) {
  const auto context = JavaScriptContext::Create();
  const ScriptObjectPtr object =
      zebscripting::utility::TransformObjectIntoScriptingObject<color::RGBA>()(
          color::RGBA(0.25f, 0.5f, 0.75f, 0.125f), context->GetHandle());
  ASSERT_TRUE(object);
  EXPECT_EQ(object->GetContextHandle(), context->GetHandle());
  const color::RGBA rgba = static_cast<const ColorObject&>(*object).GetColorRGBA();
  EXPECT_EQ((std::array<float, 4>{rgba.Red(), rgba.Green(), rgba.Blue(), rgba.Alpha()}),
            (std::array<float, 4>{0.25f, 0.5f, 0.75f, 0.125f}));
}

}  // namespace
}  // namespace zebmediatypes::scripting
