// On the root process: the publisher of the whole activity tree. Every model change of an
// activity dispatches a VORSPPActivityNotification there under the views-change event.
#pragma once

#include "VOREventPublisher.h"
#include "VORHandle.h"

class VORISPPActivityModificationEvents : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPActivityModificationEvents)
 public:
  // The same publisher as the root's VORIModelEvents.
  virtual VOREventPublisher* GetEventPublisher() = 0;
};
VOR_DECLARE_HANDLE(VORISPPActivityModificationEvents);

class VORSPPActivityNotificationDispatcher {
 public:
  static const char* DISPATCHER_SPP_VIEWS_CHANGE() { return "VORSPPViewsChange"; }
};
