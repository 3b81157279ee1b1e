// The binding storm (binding_storm.js) over every registered script class:
// nothing may crash or throw a non-Error, and every native object is released
// with the context.
#include <gtest/gtest.h>
#include <zebscripting/zebscripting.h>

#include <fstream>
#include <sstream>
#include <string>
#include <vector>

namespace {

using zebscripting::ScriptValue;
namespace def = zebscripting::definition;

std::u16string Wide(const std::string& text) { return std::u16string(text.begin(), text.end()); }

// [class name, expression reaching the class] for every registered class.
ScriptValue ClassList() {
  std::vector<ScriptValue> classes;
  for (const def::ScriptObjectDefinitionBase* definition :
       def::ScriptObjectDefinitionBase::GetAll()) {
    std::string path;
    for (const def::NamespaceEntry& entry : definition->GetNamespaces()) {
      if (!path.empty()) break;
      path = (entry.flags & def::kNamespaceFlag_Global) != 0
                 ? entry.name
                 : entry.name + "." + definition->GetClassName();
    }
    classes.emplace_back(std::vector<ScriptValue>{ScriptValue(Wide(definition->GetClassName())),
                                                  ScriptValue(Wide(path))});
  }
  return ScriptValue(std::move(classes));
}

TEST(BindingStorm, EveryItemOfEveryClassSurvivesHostileValues) {
  std::ifstream file(ZMT_SCRIPT_TEST_DIR "/binding_storm.js");
  std::ostringstream source;
  source << file.rdbuf();
  ASSERT_FALSE(source.str().empty());
  // The time classes at least (the library is linked for its registrars).
  ASSERT_GE(def::ScriptObjectDefinitionBase::GetAll().size(), 4u);
  const std::size_t before = zebscripting::ScriptObject::LiveObjectCount();
  {
    zebscripting::JavaScriptLimits limits;
    limits.timeoutSeconds = 600;
    const auto context = zebscripting::JavaScriptContext::Create(limits);
    context->DefineGlobal("classes", ClassList());
    const zebscripting::JavaScriptResult result = context->Evaluate(source.str(), "storm.js");
    EXPECT_TRUE(result.ok) << result.fileName << ":" << result.lineNumber << ": "
                           << result.errorName << ": " << result.text;
    std::cout << "storm: " << result.text << " (calls, objects)\n";
  }
  EXPECT_EQ(zebscripting::ScriptObject::LiveObjectCount(), before);
}

}  // namespace
