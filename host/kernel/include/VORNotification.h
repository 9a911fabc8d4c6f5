// Base of every notification. Subscribers may ask for a notification class name and receive
// every notification that IsAKindOf it.
#pragma once

#include "VORBaseUnknown.h"

class VORNotification : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORNotification, VORBaseUnknown)
 public:
  VORNotification() = default;
};
