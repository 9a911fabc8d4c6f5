#include "VORDlgCheckButton.h"

VORDlgCheckButton::VORDlgCheckButton(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style) {}

VORUnicodeString VORDlgCheckButton::GetValueText() const {
  return IsChecked() ? "checked" : "unchecked";
}

std::vector<std::string> VORDlgCheckButton::GetNotificationNames() const {
  return {GetChkBModifyNotification()};
}

void VORDlgCheckButton::SetState(int state) {
  if (state != VORDlgCheck && state != VORDlgUncheck)
    return;
  _state = state;
  Changed();
}

bool VORDlgCheckButton::UserToggle() {
  if (!IsEffectivelySensitive())
    return false;
  SetState(IsChecked() ? VORDlgUncheck : VORDlgCheck);
  Send(new VORDlgCheckButtonModifyNotification(this));
  return true;
}
