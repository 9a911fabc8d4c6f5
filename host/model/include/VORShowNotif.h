// A product was shown or hidden (dispatched on the product and on its ancestors).
#pragma once

#include "VORHandle.h"
#include "VORNotification.h"

class VORShowNotif : public VORNotification {
  VOR_DECLARE_CLASS(VORShowNotif, VORNotification)
 public:
  VORShowNotif(VORBaseUnknown* object, bool shown) : _object(object), _shown(shown) {}
  VORBaseUnknown* GetObject() const { return _object.get(); }
  bool IsShown() const { return _shown; }

 private:
  VORBaseUnknown_var _object;
  bool _shown;
};
