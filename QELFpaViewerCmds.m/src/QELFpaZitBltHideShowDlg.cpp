#include "QELFpaZitBltHideShowDlg.h"

#include "QELFpaViewerCmdsTrace.h"
#include "QELIZitBltMgr.h"
#include "VORApplicationFrame.h"
#include "VORDlgStyles.h"
#include "VORMsgCatalog.h"

namespace {
void Trace(const char* text) {
  QELFpaViewerCmdsTrace().TraPrint(text);
}

const char* const kAll = "All";

int StateOf(bool checked) {
  return checked ? VORDlgCheck : VORDlgUncheck;
}
}  // namespace

QELFpaZitBltHideShowDlg::QELFpaZitBltHideShowDlg(VORListValVORBaseUnknown_var* activities)
    : VORDlgDialog(VORApplicationFrame::GetApplicationFrame()->GetMainWindow(),
                   "QELFpaZitBltHideShowDlg", 0x40401) {
  // The window's title, as the host's dialog resources would give it.
  SetTitle(VORMsgCatalog::BuildMessage("QELFpaZitBltHideShowDlg", "Title", "Show/Hide ZitBlts"));
  if (activities != nullptr)
    _activities = *activities;
  Build();
}

QELFpaZitBltHideShowDlg::~QELFpaZitBltHideShowDlg() {
  Trace(" \n  QELFpaZitBltHideShowDlg::~QELFpaZitBltHideShowDlg -->");
  if (_allButton != nullptr)
    RemoveCallbacksOn(_allButton->GetEventPublisher());
  for (int i = 0; _nameButtons != nullptr && i < _numberOfNames; ++i) {
    if (_nameButtons[i] != nullptr)
      RemoveCallbacksOn(_nameButtons[i]->GetEventPublisher());
  }
  delete[] _nameButtons;
  _nameButtons = nullptr;
  delete _zitBltNames;
  _zitBltNames = nullptr;
  Trace(" \n  QELFpaZitBltHideShowDlg::~QELFpaZitBltHideShowDlg <--");
}

VORDlgCheckButton* QELFpaZitBltHideShowDlg::GetNameButton(int index) const {
  if (_nameButtons == nullptr || index < 1 || index > _numberOfNames)
    return nullptr;
  return _nameButtons[index - 1];
}

void QELFpaZitBltHideShowDlg::Build() {
  Trace(" \n  QELFpaZitBltHideShowDlg::Build -->");
  if (_activities.Size() == 0 || _frame != nullptr)
    return;
  QELIZitBltMgr_var manager(_activities[1]);
  if (manager)
    manager->GetZitBltNames(_zitBltNames);
  _frame = new VORDlgFrame(this, "ZitBlts");  // the dialog owns its controls
  _frame->SetTitle("ZitBlts");
  _frame->SetGridConstraints(0, 0, 1, 1, VORDlgAttach4Sides);
  _numberOfNames = _zitBltNames != nullptr ? _zitBltNames->Size() : 0;
  if (_numberOfNames > 1) {
    _allButton = new VORDlgCheckButton(_frame, kAll);
    _allButton->SetTitle(kAll);
    _allButton->SetGridConstraints(0, 0, 1, 1, VORDlgAttach4Sides);
    unsigned char all = 0;
    manager->GetZitBltStatus(kAll, all);
    _allButton->SetState(StateOf(all != 0));
    AddCallback(_allButton->GetEventPublisher(), VORDlgCheckButton::GetChkBModifyNotification(),
                &QELFpaZitBltHideShowDlg::AllZitBltModif);
  }
  _nameButtons = new VORDlgCheckButton*[static_cast<size_t>(_numberOfNames)];
  for (int i = 1; i <= _numberOfNames; ++i) {
    const VORUnicodeString& name = (*_zitBltNames)[i];
    // A name button has only its title: a ZitBlt may be called anything, "All" included.
    auto* button = new VORDlgCheckButton(_frame, "");
    button->SetTitle(name);
    button->SetGridConstraints(i, 0, 1, 1, VORDlgAttach4Sides);
    unsigned char status = 0;
    manager->GetZitBltStatus(name, status);
    button->SetState(StateOf(status != 0));
    AddCallback(button->GetEventPublisher(), VORDlgCheckButton::GetChkBModifyNotification(),
                &QELFpaZitBltHideShowDlg::OtherZitModif, button);
    _nameButtons[i - 1] = button;
  }
  Trace(" \n  QELFpaZitBltHideShowDlg::Build <--");
}

void QELFpaZitBltHideShowDlg::SetStatusOnEveryActivity(const VORUnicodeString& name, bool visible) {
  for (VORBaseUnknown_var& activity : _activities) {
    if (QELIZitBltMgr_var manager(activity); manager)
      manager->SetZitBltStatus(name, visible ? 1 : 0);
  }
}

void QELFpaZitBltHideShowDlg::AllZitBltModif(VORCommand*, VORNotification*, void*) {
  Trace(" \n  QELFpaZitBltHideShowDlg::AllZitBltModif -->");
  if (_allButton == nullptr)
    return;
  const int state = _allButton->GetState();
  SetStatusOnEveryActivity(kAll, state == VORDlgCheck);
  // A name button set here does not notify its own change, so each name is applied as its
  // click would: the chart then shows what the buttons say.
  for (int i = 0; _nameButtons != nullptr && i < _numberOfNames; ++i) {
    if (_nameButtons[i] == nullptr)
      continue;
    _nameButtons[i]->SetState(state);
    SetStatusOnEveryActivity(_nameButtons[i]->GetTitle(), state == VORDlgCheck);
  }
  Trace(" \n  QELFpaZitBltHideShowDlg::AllZitBltModif <--");
}

void QELFpaZitBltHideShowDlg::OtherZitModif(VORCommand*, VORNotification*, void* data) {
  Trace(" \n  QELFpaZitBltHideShowDlg::OtherZitModif -->");
  auto* button = static_cast<VORDlgCheckButton*>(data);
  if (button == nullptr)
    return;
  SetStatusOnEveryActivity(button->GetTitle(), button->IsChecked());
  CheckAllStatus(button->GetState() != VORDlgUncheck ? VORDlgCheck : VORDlgUncheck);
  Trace(" \n  QELFpaZitBltHideShowDlg::OtherZitModif <--");
}

void QELFpaZitBltHideShowDlg::CheckAllStatus(int state) {
  Trace(" \n  QELFpaZitBltHideShowDlg::CheckAllStatus -->");
  if (_numberOfNames < 2 || _nameButtons == nullptr || _allButton == nullptr)
    return;
  for (int i = 0; i < _numberOfNames; ++i) {
    if (_nameButtons[i] == nullptr || _nameButtons[i]->GetState() != state)
      return;  // the names disagree: "All" stays as it is
  }
  _allButton->SetState(state);
  Trace(" \n  QELFpaZitBltHideShowDlg::CheckAllStatus <--");
}
