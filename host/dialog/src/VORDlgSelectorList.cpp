#include "VORDlgSelectorList.h"

#include <algorithm>

VORDlgSelectorList::VORDlgSelectorList(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style) {}

VORUnicodeString VORDlgSelectorList::GetValueText() const {
  VORUnicodeString text;
  for (int row : _selected) {
    if (!text.IsEmpty())
      text += ", ";
    text += GetLine(row);
  }
  return text;
}

std::vector<std::string> VORDlgSelectorList::GetNotificationNames() const {
  return {GetListSelectNotification()};
}

void VORDlgSelectorList::SetLine(const VORUnicodeString& line) {
  _lines.Append(line);
  Changed();
}

void VORDlgSelectorList::ClearLine() {
  _lines.RemoveAll();
  _selected.clear();
  Changed();
}

VORUnicodeString VORDlgSelectorList::GetLine(int index) const {
  if (index < 0 || index >= _lines.Size())
    return VORUnicodeString();
  return _lines[index + 1];
}

void VORDlgSelectorList::SetSelect(const std::vector<int>& rows) {
  _selected.clear();
  for (int row : rows) {
    if (row >= 0 && row < _lines.Size())
      _selected.push_back(row);
  }
  std::sort(_selected.begin(), _selected.end());
  _selected.erase(std::unique(_selected.begin(), _selected.end()), _selected.end());
  // A single-selection list keeps the first of the rows asked for.
  if ((GetStyle() & VORDlgLstSingleSelection) != 0 && _selected.size() > 1)
    _selected.resize(1);
  Changed();
}

bool VORDlgSelectorList::UserSelect(const std::vector<int>& rows) {
  if (!IsEffectivelySensitive())
    return false;
  SetSelect(rows);
  Send(new VORDlgListSelectNotification(this));
  return true;
}
