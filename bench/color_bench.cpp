// Colour texts, identifiers and the colour-space cache.
#include <benchmark/benchmark.h>
#include <zebmediatypes/color/color_serialization.h>
#include <zebmediatypes/initialization.h>

#include <string>
#include <vector>

#include "alloc_counter.h"

namespace {

using zebmediatypes::color::ColorManagementSettings;
using zebmediatypes::color::ColorSpace;

ColorSpace MakeSpace(const std::string& name) {
  ColorSpace space;
  space.baseColorProfile.colorProfileName = zebcore::string::ToUTF8String(name);
  space.baseProfileType = zebmediatypes::color::kColorSpaceType_Model;
  return space;
}

// An ICC-sized profile (3 KiB of bytes) for the heavier cases.
ColorSpace MakeIccSpace() {
  ColorSpace space = MakeSpace("Custom ICC");
  space.baseProfileType = zebmediatypes::color::kColorSpaceType_ICC;
  auto block = zebcore::allocator::RecycledMemory::Create(0);
  unsigned char* data = block->Allocate(3072);
  for (std::size_t i = 0; i < 3072; ++i) data[i] = static_cast<unsigned char>(i * 31u);
  space.baseColorProfile.colorProfileData = block;
  return space;
}

ColorManagementSettings MakeSettings() {
  return ColorManagementSettings(zebmediatypes::color::kGraphicsWhiteLuminance_203,
                                 zebmediatypes::color::kLUTInterpolationMethod_Tetrahedral,
                                 zebcore::string::ToUTF8String("/opt/aces/config.ocio"),
                                 zebmediatypes::color::kColorManagementSystem_OCIO, true);
}

void CountAllocations(benchmark::State& state, std::uint64_t before) {
  state.counters["allocs/iter"] = zmt::bench::AllocationsPerIteration(state, before);
}

void BM_ColorSpaceWrite(benchmark::State& state) {
  const ColorSpace space = state.range(0) ? MakeIccSpace() : MakeSpace("BT.709 RGB Full");
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) benchmark::DoNotOptimize(space.ToSerializedString());
  CountAllocations(state, before);
}
BENCHMARK(BM_ColorSpaceWrite)->ArgName("icc")->Arg(0)->Arg(1);

void BM_ColorSpaceRead(benchmark::State& state) {
  zebmediatypes::Initialize();
  const zebcore::UTF8String text =
      (state.range(0) ? MakeIccSpace() : MakeSpace("BT.709 RGB Full")).ToSerializedString();
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    benchmark::DoNotOptimize(zebmediatypes::color::ColorSpaceFromSerializedString(text));
  }
  CountAllocations(state, before);
  zebmediatypes::Terminate();
}
BENCHMARK(BM_ColorSpaceRead)->ArgName("icc")->Arg(0)->Arg(1);

void BM_SettingsWrite(benchmark::State& state) {
  const ColorManagementSettings settings = MakeSettings();
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) benchmark::DoNotOptimize(settings.ToSerializedString());
  CountAllocations(state, before);
}
BENCHMARK(BM_SettingsWrite);

void BM_SettingsRead(benchmark::State& state) {
  const zebcore::UTF8String text = MakeSettings().ToSerializedString();
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    benchmark::DoNotOptimize(
        zebmediatypes::color::ColorManagementSettingsFromSerializedString(text));
  }
  CountAllocations(state, before);
}
BENCHMARK(BM_SettingsRead);

// The memo answers at once; without it the profile and the space are hashed.
void BM_ColorSpaceToGuid(benchmark::State& state) {
  const bool memo = state.range(0) != 0;
  const ColorSpace space = state.range(1) ? MakeIccSpace() : MakeSpace("BT.709 RGB Full");
  space.ToGuid();
  for (auto _ : state) {
    if (!memo) {
      space.cachedGuid = {};
      space.baseColorProfile.cachedGuid = {};
    }
    benchmark::DoNotOptimize(space.ToGuid());
  }
}
BENCHMARK(BM_ColorSpaceToGuid)->ArgNames({"memo", "icc"})->ArgsProduct({{1, 0}, {0, 1}});

void BM_SettingsToGuid(benchmark::State& state) {
  const ColorManagementSettings settings = MakeSettings();
  for (auto _ : state) benchmark::DoNotOptimize(settings.ToGuid());
}
BENCHMARK(BM_SettingsToGuid);

// Adding a space already in the cache (the common case: the same spaces are
// entered again and again) and adding fresh ones into a cache of `range` entries.
void BM_CacheAdd(benchmark::State& state) {
  zebmediatypes::Initialize();
  std::vector<ColorSpace> spaces;
  for (int i = 0; i < state.range(0); ++i)
    spaces.push_back(MakeSpace("space " + std::to_string(i)));
  for (const ColorSpace& s : spaces) zebmediatypes::color::AddColorSpaceToCache(s);
  std::size_t i = 0;
  for (auto _ : state) {
    benchmark::DoNotOptimize(zebmediatypes::color::AddColorSpaceToCache(spaces[i]));
    if (++i == spaces.size()) i = 0;
  }
  zebmediatypes::Terminate();
}
BENCHMARK(BM_CacheAdd)->Arg(16)->Arg(4096);

void BM_CacheRetrieve(benchmark::State& state) {
  zebmediatypes::Initialize();
  std::vector<zebcore::utility::Guid> ids;
  for (int i = 0; i < state.range(0); ++i) {
    ids.push_back(
        zebmediatypes::color::AddColorSpaceToCache(MakeSpace("space " + std::to_string(i))));
  }
  std::size_t i = 0;
  const auto before = zmt::bench::AllocationCount();
  for (auto _ : state) {
    benchmark::DoNotOptimize(zebmediatypes::color::RetrieveColorSpaceFromCache(ids[i]));
    if (++i == ids.size()) i = 0;
  }
  CountAllocations(state, before);
  zebmediatypes::Terminate();
}
BENCHMARK(BM_CacheRetrieve)->Arg(16)->Arg(4096);

}  // namespace

BENCHMARK_MAIN();
