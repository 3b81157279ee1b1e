// The binding storm (binding_storm.js) over every registered script class:
// nothing may crash or throw a non-Error, and every native object is released
// with the context.
#include <gtest/gtest.h>
#include <zebscripting/zebscripting.h>

#include <fstream>
#include <sstream>

namespace {

TEST(BindingStorm, EveryItemOfEveryClassSurvivesHostileValues) {
  std::ifstream file(ZMT_SCRIPT_TEST_DIR "/binding_storm.js");
  std::ostringstream source;
  source << file.rdbuf();
  ASSERT_FALSE(source.str().empty());
  const std::size_t classCount =
      zebscripting::definition::ScriptObjectDefinitionBase::GetAll().size();
  // The library is linked for its registrars: the time classes at least.
  ASSERT_GE(classCount, 4u);
  const std::size_t before = zebscripting::ScriptObject::LiveObjectCount();
  {
    zebscripting::JavaScriptLimits limits;
    limits.timeoutSeconds = 600;
    const auto context = zebscripting::JavaScriptContext::Create(limits);
    context->DefineGlobal("classCount", zebscripting::ScriptValue(static_cast<double>(classCount)));
    const zebscripting::JavaScriptResult result = context->Evaluate(source.str(), "storm.js");
    EXPECT_TRUE(result.ok) << result.fileName << ":" << result.lineNumber << ": "
                           << result.errorName << ": " << result.text;
    std::cout << "storm: " << result.text << " (calls, objects)\n";
  }
  EXPECT_EQ(zebscripting::ScriptObject::LiveObjectCount(), before);
}

}  // namespace
