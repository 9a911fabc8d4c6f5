// The editor's current set of objects: what the user has selected.
#pragma once

#include "VORSelectionSet.h"

class VORCSO : public VORSelectionSet {
  VOR_DECLARE_CLASS(VORCSO, VORSelectionSet)
 public:
  VORCSO() = default;

 protected:
  VORNotification* CreateChangeNotification(const VORListValVORBaseUnknown_var& added,
                                            const VORListValVORBaseUnknown_var& removed) override;
};

// Dispatched by the CSO after each change; subscribe to "VORCSOChangeNotification".
class VORCSOChangeNotification : public VORSOChangeNotification {
  VOR_DECLARE_CLASS(VORCSOChangeNotification, VORSOChangeNotification)
 public:
  using VORSOChangeNotification::VORSOChangeNotification;
};

VOR_DECLARE_HANDLE(VORCSO);
