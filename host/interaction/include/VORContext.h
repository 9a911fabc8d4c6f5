// Context notification: dispatched by a viewer or window on a context click (right button), so
// that subscribers add items to the contextual menu it carries. The menu is a dialog object of
// the dialog layer, attached by whoever first needs it.
#pragma once

#include "VORCommand.h"

class VORContext : public VORNotification {
  VOR_DECLARE_CLASS(VORContext, VORNotification)
 public:
  VORContext(VORBaseUnknown* sender, double x, double y) : _sender(sender), _x(x), _y(y) {}
  VORBaseUnknown* GetSender() const { return _sender; }
  // Where the click happened, in the sender's coordinates.
  double GetX() const { return _x; }
  double GetY() const { return _y; }
  VORCommand* GetContextualMenu() const { return _menu.get(); }
  void SetContextualMenu(VORCommand* menu) { _menu = menu; }

 private:
  VORBaseUnknown* _sender;
  double _x;
  double _y;
  VORCommand_var _menu;
};
