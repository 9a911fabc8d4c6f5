// Every model object carries a notification dispatcher (the kernel's event publisher).
#pragma once

#include "VOREventPublisher.h"
#include "VORHandle.h"

class VORIModelEvents : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIModelEvents)
 public:
  // The object's dispatcher; owned by the object, never null.
  virtual VOREventPublisher* GetEventPublisher() = 0;
  // Dispatches notification (under its class name) on this object's dispatcher.
  virtual int Dispatch(VORNotification* notification) = 0;
};
VOR_DECLARE_HANDLE(VORIModelEvents);
