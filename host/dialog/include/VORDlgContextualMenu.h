// Contextual menu built on a context notification (VORContext), with push items. A push item
// may carry a command header, started when the user chooses the item.
#pragma once

#include "VORCommandHeader.h"
#include "VORContext.h"
#include "VORDlgControl.h"

class VORDlgContextualMenu : public VORDlgControl {
  VOR_DECLARE_CLASS(VORDlgContextualMenu, VORDlgControl)
 public:
  VORDlgContextualMenu(VORCommand* parent, const VORString& name, int style = 0);
  const char* GetKind() const override { return "ContextualMenu"; }
  // The menu of a context notification, created (without parent, held by the notification) on
  // first use. Null for a null notification.
  static VORDlgContextualMenu* FromContext(VORContext* context);
  // Takes every entry out of the menu (a receiver that replaces what others offered); returns
  // how many were removed.
  int RemoveAllItems();
  // Takes the entry of that name out; false when there is none.
  bool RemoveItem(const std::string& name);
};

class VORDlgPushItem : public VORDlgControl {
  VOR_DECLARE_CLASS(VORDlgPushItem, VORDlgControl)
 public:
  VORDlgPushItem(VORCommand* parent, const VORString& name, int style = 0);
  const char* GetKind() const override { return "PushItem"; }
  std::vector<std::string> GetNotificationNames() const override;
  static const char* GetMenuIActivateNotification() { return "VORDlgPushItemActivateNotification"; }
  void SetCommandHeader(VORCommandHeader* header) { _header = header; }
  VORCommandHeader* GetCommandHeader() const { return _header.get(); }

  // The user chooses the item: the activate notification, then the header's command.
  bool UserActivate();

 private:
  VORCommandHeader_var _header;
};
