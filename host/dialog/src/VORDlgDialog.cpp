#include "VORDlgDialog.h"

#include <algorithm>

namespace {
std::vector<VORDlgDialog*>& Alive() {
  static auto* alive = new std::vector<VORDlgDialog*>();  // never destroyed
  return *alive;
}
}  // namespace

VORDlgDialog::VORDlgDialog(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style, false) {
  SetVisibility(false);
  Alive().push_back(this);
  VORDlg::GetGlobalPublisher()->Dispatch("VORDlgDialogCreated");
}

VORDlgDialog::~VORDlgDialog() {
  std::erase(Alive(), this);
  VORDlg::GetGlobalPublisher()->Dispatch("VORDlgDialogDestroyed");
}

std::vector<std::string> VORDlgDialog::GetNotificationNames() const {
  std::vector<std::string> names{GetWindCloseNotification()};
  if (HasOKButton())
    names.emplace_back(GetDiaOKNotification());
  if (HasCancelButton())
    names.emplace_back(GetDiaCANCELNotification());
  return names;
}

void VORDlgDialog::SetOKSensitivity(bool on) {
  _okSensitive = on;
  Changed();
}

bool VORDlgDialog::UserPressOK() {
  if (!GetVisibility() || !HasOKButton() || !_okSensitive || !IsEffectivelySensitive())
    return false;
  Send(new VORDlgDiaOKNotification(this));
  return true;
}

bool VORDlgDialog::UserPressCancel() {
  if (!GetVisibility() || !HasCancelButton() || !IsEffectivelySensitive())
    return false;
  Send(new VORDlgDiaCANCELNotification(this));
  return true;
}

bool VORDlgDialog::UserCloseWindow() {
  if (!GetVisibility())
    return false;
  Send(new VORDlgWindCloseNotification(this));
  return true;
}

std::vector<VORDlgDialog*> VORDlgDialog::GetDialogs() {
  return Alive();
}

VORDlgDialog* VORDlgDialog::FindShown(const std::string& name) {
  for (auto it = Alive().rbegin(); it != Alive().rend(); ++it) {
    if ((*it)->GetVisibility() && (name.empty() || (*it)->GetName().str() == name))
      return *it;
  }
  return nullptr;
}
