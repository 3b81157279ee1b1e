// ScriptContext: one place where script runs, known to native code by an
// integer handle.
//
// Handles are positive, unique in the process and never reused. Objects made
// for a context carry its handle (ScriptObject::GetContextHandle); items
// receive the handle of the context that calls them (ScriptCall). The
// JavaScript engine's context is JavaScriptContext (javascript.h).
#pragma once

#include <zebcore/ref_counted.h>
#include <zebscripting/export.h>

#include <boost/intrusive_ptr.hpp>

namespace zebscripting {

class ZEBSCRIPTING_API ScriptContext : public zebcore::utility::RefCountedObjectWithWeakPtr {
 public:
  int GetHandle() const noexcept { return handle_; }

  // The live context of `handle`; null when there is none (any more).
  static boost::intrusive_ptr<ScriptContext> FromHandle(int handle);
  // Whether the context of `handle` is alive (0, "no context", counts as alive).
  static bool Exists(int handle);

 protected:
  ScriptContext();
  ~ScriptContext() override;

 private:
  int handle_;
};

}  // namespace zebscripting
