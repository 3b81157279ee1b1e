// Registering script classes with the host.
//
// Each script class C (derived from ScriptObject, default-constructible) has
//   static const char* GetClassname();   // the script class name
//   static const char* GetDescription();
//   static void DefineObject();          // fills ScriptObjectDefinitionBase::sCurrent
// and is registered once, at library load, by a static registrar:
//
//   static zebscripting::factory::ScriptObjectDefinitionRegistrar sRegistrar(
//       new zebscripting::factory::ScriptObjectDefinitionInitiator<TickTimeObject>());
//
// The host builds the definitions later, on first use (ScriptObjectDefinitionBase::
// Find or GetAll, and every new script context), once and under a lock: for each
// class it makes the definition current and calls DefineObject. An exception
// derived from std::exception thrown by DefineObject is logged
// (zebcore::logging::LogException) and the class keeps the items it had by then.
#pragma once

#include <zebcore/ref_counted.h>
#include <zebscripting/definition.h>
#include <zebscripting/export.h>
#include <zebscripting/script_object.h>

#include <boost/intrusive_ptr.hpp>

namespace zebscripting::factory {

class ZEBSCRIPTING_API ScriptObjectDefinitionInitiatorBase
    : public zebcore::utility::RefCountedObjectWithWeakPtr {
 public:
  virtual const char* GetClassName() const = 0;
  virtual const char* GetDescription() const = 0;
  // Calls the class's DefineObject (the definition is current).
  virtual void DefineObject() const = 0;
  // A new default object of the class.
  virtual ScriptObjectPtr CreateInstance() const = 0;

 protected:
  ~ScriptObjectDefinitionInitiatorBase() override;
};

template <class T>
class ScriptObjectDefinitionInitiator final : public ScriptObjectDefinitionInitiatorBase {
 public:
  const char* GetClassName() const override { return T::GetClassname(); }
  const char* GetDescription() const override { return T::GetDescription(); }
  void DefineObject() const override { T::DefineObject(); }
  ScriptObjectPtr CreateInstance() const override { return ScriptObjectPtr(new T()); }
};

// Registers an initiator for as long as it lives. A second registration of a
// class name already registered is ignored (and logged).
class ZEBSCRIPTING_API ScriptObjectDefinitionRegistrar {
 public:
  explicit ScriptObjectDefinitionRegistrar(
      boost::intrusive_ptr<ScriptObjectDefinitionInitiatorBase> initiator);
  // Unregisters the class. Script contexts made afterwards no longer have it;
  // it must not be unregistered while a context that has it is in use.
  ~ScriptObjectDefinitionRegistrar();
  ScriptObjectDefinitionRegistrar(const ScriptObjectDefinitionRegistrar&) = delete;
  ScriptObjectDefinitionRegistrar& operator=(const ScriptObjectDefinitionRegistrar&) = delete;

 private:
  boost::intrusive_ptr<ScriptObjectDefinitionInitiatorBase> initiator_;
  bool registered_ = false;
};

}  // namespace zebscripting::factory
