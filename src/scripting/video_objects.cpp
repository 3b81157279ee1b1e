// Script classes of the video and colour values.
#include <zebmediatypes/scripting/pixel_format_constants.h>
#include <zebmediatypes/scripting/video_objects.h>
#include <zebscripting/definition.h>
#include <zebscripting/factory.h>

#include <cmath>
#include <string>

#include "scripting/script_hash.h"

namespace zebmediatypes::scripting {
namespace {

using zebscripting::ParameterErrorException;
using zebscripting::ParameterType;
using zebscripting::PropertyType;
using zebscripting::definition::kItemFlag_Host;
using zebscripting::definition::kNamespaceFlag_Global;
using zebscripting::definition::ScriptObjectDefinitionBase;
namespace def = zebscripting::definition;

ScriptObjectDefinitionBase& Current() { return *ScriptObjectDefinitionBase::sCurrent; }

bool IsPrintableAscii(unsigned char c) noexcept { return c >= 0x20 && c <= 0x7E; }

void CheckRatioTerm(unsigned int term, std::size_t index) {
  if (term > kScriptPixelAspectRatioTerm_Max) {
    throw ParameterErrorException(ParameterErrorException::kOutOfRange, index,
                                  "argument " + std::to_string(index + 1) + " is above " +
                                      std::to_string(kScriptPixelAspectRatioTerm_Max));
  }
}

// Colour components: every number but NaN (the host has already refused
// numbers beyond the float range).
bool SetComponent(color::RGBA& color, void (color::RGBA::*set)(float), float value) noexcept {
  if (std::isnan(value)) return false;
  (color.*set)(value);
  return true;
}

}  // namespace

// ---------------------------------------------------------------------------
// PixelFormat

PixelFormatObject::PixelFormatObject() : ScriptObject(GetClassname()) {}

void PixelFormatObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  if (definition.IsDefinitionOf(GetClassname())) {
    definition.AddOrModifyNamespace("zebmediatypes", 0);
    definition.AddOrModifyNamespace(GetClassname(), kNamespaceFlag_Global);
  }
  definition.AddProperty(def::StaticMethod("createPixelFormat", PropertyType<ScriptObjectPtr>(),
                                           &PixelFormatObject::CreatePixelFormat,
                                           "Construct a supported PixelFormat", kItemFlag_Host,
                                           ParameterType<zebcore::UTF8String>("formatFourCC")));
  for (const PixelFormatConstant& constant : GetPixelFormatConstants()) {
    definition.AddProperty(def::Constant(
        constant.name, zebcore::string::ToUTF8String(PixelFormatFourCCText(constant.format.fourCC)),
        constant.description, kItemFlag_Host));
  }
}

bool PixelFormatObject::IsEqual(const ScriptObjectPtr& other) const {
  const auto* same = dynamic_cast<const PixelFormatObject*>(other.get());
  return same != nullptr && same->format_ == format_;
}

std::uint64_t PixelFormatObject::Hash() const {
  Fnv1aHash hash;
  hash.Add(static_cast<std::uint32_t>(format_.fourCC), 4);
  hash.Add(format_.properties.Word(), 4);
  return hash.Value();
}

ScriptObjectPtr PixelFormatObject::CreatePixelFormat(int contextHandle,
                                                     const zebcore::UTF8String& text) {
  if (text.size() != 4) return nullptr;
  for (unsigned char c : text) {
    if (!IsPrintableAscii(c)) return nullptr;
  }
  const PixelFormatName name =
      MakePixelFormatName(static_cast<char>(text[0]), static_cast<char>(text[1]),
                          static_cast<char>(text[2]), static_cast<char>(text[3]));
  return CreatePixelFormatObject(PixelFormat(name, LookupPropertiesForName(name)), contextHandle);
}

ScriptObjectPtr CreatePixelFormatObject(const PixelFormat& format, int contextHandle) {
  return zebscripting::utils::CreateScriptObject(
      contextHandle, PixelFormatObject::GetClassname(), [&format](const ScriptObjectPtr& object) {
        static_cast<PixelFormatObject&>(*object).Initialize(format);
      });
}

// ---------------------------------------------------------------------------
// PixelAspectRatio

PixelAspectRatioObject::PixelAspectRatioObject() : ScriptObject(GetClassname()) {}

void PixelAspectRatioObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  if (definition.IsDefinitionOf(GetClassname())) {
    definition.AddOrModifyNamespace("zebmediatypes", 0);
    definition.AddOrModifyNamespace(GetClassname(), kNamespaceFlag_Global);
  }
  using Self = PixelAspectRatioObject;
  definition.AddProperty(def::StaticMethod(
      "createPixelAspectRatio", PropertyType<ScriptObjectPtr>(), &Self::CreatePixelAspectRatio,
      "Construct a pixel aspect ratio.", kItemFlag_Host, ParameterType<unsigned int>("numerator"),
      ParameterType<unsigned int>("denominator")));
  definition.AddProperty(def::Property("numerator", PropertyType<unsigned int>(""),
                                       &Self::GetNumerator, &Self::SetNumerator,
                                       "Pixel aspect ratio numerator.", kItemFlag_Host));
  definition.AddProperty(def::Property("denominator", PropertyType<unsigned int>(""),
                                       &Self::GetDenominator, &Self::SetDenominator,
                                       "Pixel aspect ration denominator.", kItemFlag_Host));
}

ScriptObjectPtr PixelAspectRatioObject::CreatePixelAspectRatio(int contextHandle,
                                                               unsigned int numerator,
                                                               unsigned int denominator) {
  CheckRatioTerm(numerator, 0);
  CheckRatioTerm(denominator, 1);
  return CreatePixelAspectRatioObject(PixelAspectRatio(numerator, denominator), contextHandle);
}

bool PixelAspectRatioObject::SetNumerator(unsigned int numerator) noexcept {
  if (numerator > kScriptPixelAspectRatioTerm_Max) return false;
  ratio_.SetValue(numerator, ratio_.GetDenominator());
  return true;
}

bool PixelAspectRatioObject::SetDenominator(unsigned int denominator) noexcept {
  if (denominator > kScriptPixelAspectRatioTerm_Max) return false;
  ratio_.SetValue(ratio_.GetNumerator(), denominator);
  return true;
}

ScriptObjectPtr CreatePixelAspectRatioObject(const PixelAspectRatio& ratio, int contextHandle) {
  return zebscripting::utils::CreateScriptObject(
      contextHandle, PixelAspectRatioObject::GetClassname(),
      [&ratio](const ScriptObjectPtr& object) {
        static_cast<PixelAspectRatioObject&>(*object).Initialize(ratio);
      });
}

// ---------------------------------------------------------------------------
// ColorObject

ColorObject::ColorObject() : ScriptObject(GetClassname()) {}

void ColorObject::DefineObject() {
  ScriptObjectDefinitionBase& definition = Current();
  if (definition.IsDefinitionOf(GetClassname())) {
    definition.AddOrModifyNamespace("zebmediatypes", 0);
  }
  using Self = ColorObject;
  definition.AddProperty(def::Constructor(
      &Self::Construct,
      "Construct a Color Object with parameters for Red, Green, Blue, and Alpha values which are "
      "in range [0.0-1.0] ",
      0, ParameterType<float>("Red", 0.0f), ParameterType<float>("Green", 0.0f),
      ParameterType<float>("Blue", 0.0f), ParameterType<float>("Alpha", 1.0f)));
  definition.AddProperty(
      def::Property("red", PropertyType<float>("inRed"), &Self::GetRed, &Self::SetRed,
                    "Read/Write property to get/set red value of color object", kItemFlag_Host));
  definition.AddProperty(
      def::Property("green", PropertyType<float>("inGreen"), &Self::GetGreen, &Self::SetGreen,
                    "Read/Write property to get/set green value of color object", kItemFlag_Host));
  definition.AddProperty(
      def::Property("blue", PropertyType<float>("inBlue"), &Self::GetBlue, &Self::SetBlue,
                    "Read/Write property to get/set blue value of color object", kItemFlag_Host));
  definition.AddProperty(
      def::Property("alpha", PropertyType<float>("inAlpha"), &Self::GetAlpha, &Self::SetAlpha,
                    "Read/Write property to get/set alpha value of color object", kItemFlag_Host));
}

bool ColorObject::Construct(float red, float green, float blue, float alpha) noexcept {
  if (std::isnan(red) || std::isnan(green) || std::isnan(blue) || std::isnan(alpha)) return false;
  color_ = color::RGBA(red, green, blue, alpha);
  return true;
}

bool ColorObject::SetRed(float red) noexcept {
  return SetComponent(color_, &color::RGBA::SetRed, red);
}
bool ColorObject::SetGreen(float green) noexcept {
  return SetComponent(color_, &color::RGBA::SetGreen, green);
}
bool ColorObject::SetBlue(float blue) noexcept {
  return SetComponent(color_, &color::RGBA::SetBlue, blue);
}
bool ColorObject::SetAlpha(float alpha) noexcept {
  return SetComponent(color_, &color::RGBA::SetAlpha, alpha);
}

ScriptObjectPtr CreateColorObject(const color::RGBA& color, int contextHandle) {
  return zebscripting::utils::CreateScriptObject(
      contextHandle, ColorObject::GetClassname(), [&color](const ScriptObjectPtr& object) {
        static_cast<ColorObject&>(*object).Initialize(color);
      });
}

namespace {

using zebscripting::factory::ScriptObjectDefinitionInitiator;
using zebscripting::factory::ScriptObjectDefinitionRegistrar;

// The classes are registered with the host when the library loads.
const ScriptObjectDefinitionRegistrar kPixelFormatRegistrar(
    new ScriptObjectDefinitionInitiator<PixelFormatObject>());
const ScriptObjectDefinitionRegistrar kPixelAspectRatioRegistrar(
    new ScriptObjectDefinitionInitiator<PixelAspectRatioObject>());
const ScriptObjectDefinitionRegistrar kColorRegistrar(
    new ScriptObjectDefinitionInitiator<ColorObject>());

}  // namespace
}  // namespace zebmediatypes::scripting
