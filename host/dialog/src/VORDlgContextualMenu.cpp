#include "VORDlgContextualMenu.h"

VORDlgContextualMenu::VORDlgContextualMenu(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style) {}

VORDlgContextualMenu* VORDlgContextualMenu::FromContext(VORContext* context) {
  if (context == nullptr)
    return nullptr;
  if (auto* menu = dynamic_cast<VORDlgContextualMenu*>(context->GetContextualMenu()))
    return menu;
  auto menu =
      VORHandle<VORDlgContextualMenu>::Adopt(new VORDlgContextualMenu(nullptr, "ContextualMenu"));
  context->SetContextualMenu(menu);
  return menu.get();
}

int VORDlgContextualMenu::RemoveAllItems() {
  int removed = 0;
  for (VORDlgControl* item : GetControls())
    removed += RemoveControl(item) ? 1 : 0;
  return removed;
}

bool VORDlgContextualMenu::RemoveItem(const std::string& name) {
  for (VORDlgControl* item : GetControls()) {
    if (item->GetName().str() == name)
      return RemoveControl(item);
  }
  return false;
}

VORDlgPushItem::VORDlgPushItem(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style) {}

std::vector<std::string> VORDlgPushItem::GetNotificationNames() const {
  return {GetMenuIActivateNotification()};
}

bool VORDlgPushItem::UserActivate() {
  if (!IsEffectivelySensitive())
    return false;
  VORDlgControl_var keep(this);
  Send(new VORDlgPushItemActivateNotification(this));
  if (_header)
    _header->StartCommand();
  return true;
}
