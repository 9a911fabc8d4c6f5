#include "VORDlgCombo.h"

VORDlgCombo::VORDlgCombo(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style) {}

std::vector<std::string> VORDlgCombo::GetNotificationNames() const {
  return {GetComboSelectNotification()};
}

void VORDlgCombo::SetLine(const VORUnicodeString& line) {
  _lines.Append(line);
  if (_selected < 0)
    _selected = 0;
  Changed();
}

void VORDlgCombo::ClearLine() {
  _lines.RemoveAll();
  _selected = -1;
  Changed();
}

VORUnicodeString VORDlgCombo::GetLine(int index) const {
  if (index < 0 || index >= _lines.Size())
    return VORUnicodeString();
  return _lines[index + 1];
}

void VORDlgCombo::SetSelect(int index) {
  if (index < 0 || index >= _lines.Size())
    return;
  _selected = index;
  Changed();
}

bool VORDlgCombo::UserSelect(int index) {
  if (index < 0 || index >= _lines.Size() || !IsEffectivelySensitive())
    return false;
  SetSelect(index);
  Send(new VORDlgComboSelectNotification(this));
  return true;
}

bool VORDlgCombo::UserSelect(const VORUnicodeString& line) {
  const int position = _lines.Locate(line);
  return position != 0 && UserSelect(position - 1);
}
