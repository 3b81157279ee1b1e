// Making script objects from native code.
#pragma once

#include <zebscripting/export.h>
#include <zebscripting/script_object.h>

#include <functional>

namespace zebscripting {

namespace utils {

// CreateScriptObject()
//
// A new object of the registered class `className` for the script context
// `contextHandle` (0 for none), passed through `initializer` (which may be
// empty) before it is returned. Null for a class that is not registered
// (logged) and for a context that is gone. Exceptions of the initializer pass
// through. Callers must be ready for null.
//
//   return zebscripting::utils::CreateScriptObject(
//       handle, TickTimeObject::GetClassname(), [&](const ScriptObjectPtr& object) {
//         static_cast<TickTimeObject&>(*object).Initialize(time);
//       });
ZEBSCRIPTING_API ScriptObjectPtr
CreateScriptObject(int contextHandle, const char* className,
                   const std::function<void(const ScriptObjectPtr&)>& initializer);

}  // namespace utils

namespace utility {

// TransformObjectIntoScriptingObject<T>()(value, contextHandle): the script
// object for a native value of type T. Specialized by the library that owns
// the script class of T; there is no general definition.
template <class T>
struct TransformObjectIntoScriptingObject;

}  // namespace utility

}  // namespace zebscripting
