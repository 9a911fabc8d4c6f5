#include "VORDlgEditor.h"

VORDlgEditor::VORDlgEditor(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style) {}

std::vector<std::string> VORDlgEditor::GetNotificationNames() const {
  return {GetEditModifyNotification()};
}

void VORDlgEditor::SetText(const VORUnicodeString& text) {
  _text = text;
  Changed();
}

bool VORDlgEditor::UserSetText(const VORUnicodeString& text) {
  if (!IsEffectivelySensitive())
    return false;
  SetText(text);
  Send(new VORDlgEditModifyNotification(this));
  return true;
}
