// Modification events of the manufacturing assemblies, on the "QELMBomNodesCont" container.
#pragma once

#include "VOREventPublisher.h"
#include "VORHandle.h"
#include "VORNotification.h"
#include "VORString.h"

class QELIMfgAssemblyModificationEvents : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIMfgAssemblyModificationEvents)
 public:
  virtual VOREventPublisher* GetEventPublisher() = 0;
};
VOR_DECLARE_HANDLE(QELIMfgAssemblyModificationEvents);

class QELMfgNotificationDispatcher {
 public:
  // Event name under which QELMfgUpdateNotification is dispatched.
  static const char* GetMfgModified() { return "QELMfgModified"; }
};

// Sent before an assembly is deleted (event text "MADeleting", the assembly still linked),
// after it was created ("MACreated") and after its components changed ("MAModified").
class QELMfgUpdateNotification : public VORNotification {
  VOR_DECLARE_CLASS(QELMfgUpdateNotification, VORNotification)
 public:
  QELMfgUpdateNotification(VORBaseUnknown* assembly, const char* eventText)
      : _assembly(assembly), _event(eventText) {}
  VORBaseUnknown* GetModifiedAssembly() const { return _assembly.get(); }
  const VORString& GetEvent() const { return _event; }

 private:
  VORBaseUnknown_var _assembly;
  VORString _event;
};
