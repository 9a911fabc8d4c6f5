// The small controls: frame, label, editor, combo, check button, selector list, menus.
#include <algorithm>

#include "VORDlgCheckButton.h"
#include "VORDlgCombo.h"
#include "VORDlgContextualMenu.h"
#include "VORDlgEditor.h"
#include "VORDlgFrame.h"
#include "VORDlgSelectorList.h"

VORDlgFrame::VORDlgFrame(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style) {}

void VORDlgFrame::Attach4Sides(VORCommand* child) {
  if (child == nullptr || IsAttached4Sides(child))
    return;
  _attached.push_back(child);
  if (auto* control = dynamic_cast<VORDlgControl*>(child)) {
    VORDlgGridConstraints g = control->GetGridConstraints();
    g.attachment = VORDlgAttach4Sides;
    control->SetGridConstraints(g);
  }
}

void VORDlgFrame::ResetAttachment(VORCommand* child) {
  std::erase(_attached, child);
  if (auto* control = dynamic_cast<VORDlgControl*>(child)) {
    VORDlgGridConstraints g = control->GetGridConstraints();
    g.attachment = 0;
    control->SetGridConstraints(g);
  }
}

bool VORDlgFrame::IsAttached4Sides(VORCommand* child) const {
  return std::find(_attached.begin(), _attached.end(), child) != _attached.end();
}

VORDlgLabel::VORDlgLabel(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style) {}

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
  Changed();
}

bool VORDlgSelectorList::UserSelect(const std::vector<int>& rows) {
  if (!IsEffectivelySensitive())
    return false;
  SetSelect(rows);
  Send(new VORDlgListSelectNotification(this));
  return true;
}

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
