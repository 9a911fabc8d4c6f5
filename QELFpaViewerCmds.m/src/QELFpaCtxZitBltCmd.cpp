#include "QELFpaCtxZitBltCmd.h"

#include <memory>

#include "QELFpaViewerCmdsTrace.h"
#include "QELFpaZitBltHideShowDlg.h"
#include "QELIZitBltMgr.h"
#include "VORApplicationFrame.h"
#include "VORCommandHeader.h"
#include "VORDlgNotify.h"
#include "VORISPPActivity.h"
#include "VORMsgCatalog.h"

namespace {
void Trace(const char* text) {
  QELFpaViewerCmdsTrace().TraPrint(text);
}

const char* const kCatalog = "QELFpaCtxZitBltCmd";
}  // namespace

QELFpaCtxZitBltCmd::QELFpaCtxZitBltCmd() : VORStateCommand("QELFpaCtxZitBltCmd", 64, 0) {
  Trace(" \n  QELFpaCtxZitBltCmd::Constructor -->");
  Trace(" \n  QELFpaCtxZitBltCmd::Constructor <--");
}

QELFpaCtxZitBltCmd::~QELFpaCtxZitBltCmd() {
  Trace(" \n  QELFpaCtxZitBltCmd::Destructor -->");
  if (_dialog != nullptr) {
    _dialog->RequestDelayedDestruction();
    _dialog = nullptr;
  }
  if (_selectionAgent != nullptr) {
    _selectionAgent->RequestDelayedDestruction();
    _selectionAgent = nullptr;
  }
  if (_closeAgent != nullptr) {
    _closeAgent->RequestDelayedDestruction();
    _closeAgent = nullptr;
  }
  Trace(" \n  QELFpaCtxZitBltCmd::Destructor <--");
}

VORString QELFpaCtxZitBltCmd::GetResourceFilename(int) const {
  return VORDialogAgent::DefaultResourceFilename();
}

void QELFpaCtxZitBltCmd::BuildGraph() {
  Trace(" \n  QELFpaCtxZitBltCmd::BuildGraph -->");
  _selectionAgent = new VORPathElementAgent("ActSel");
  _selectionAgent->SetElementType<VORISPPActivity>();
  _selectionAgent->SetBehavior(VORAgentBehavior::SinglePick);
  _selectionAgent->SetBehavior(VORAgentBehavior::RepeatedPicks);
  _selectionAgent->AddCSOClient(this);
  VORDialogState* initial = GetInitialState("initialState");
  initial->AddDialogAgent(_selectionAgent);

  _closeAgent = new VORDialogAgent("Close");
  VORDialogState* close = AddDialogState("Close");
  close->AddDialogAgent(_closeAgent);

  AddTransition(initial, close, IsOutputSetCondition(_selectionAgent),
                Action(this, &QELFpaCtxZitBltCmd::ShowDlg));
  AddTransition(close, nullptr, IsOutputSetCondition(_closeAgent));
  Trace(" \n  QELFpaCtxZitBltCmd::BuildGraph <--");
}

bool QELFpaCtxZitBltCmd::ShowDlg(void*) {
  Trace(" \n  QELFpaCtxZitBltCmd::ShowDlg -->");
  std::unique_ptr<VORListValVORBaseUnknown_var> paths(
      _selectionAgent != nullptr ? _selectionAgent->GetListOfSelectedPaths() : nullptr);
  if (paths == nullptr)
    return false;
  _selectedActivities.RemoveAll();
  for (VORBaseUnknown_var& object : *paths) {
    VORPathElement_var path(object);
    if (!path)
      continue;
    path->InitToLeafElement();
    VORBaseUnknown_var element(path->NextFatherElement());
    if (VORISPPActivity_var(element))
      _selectedActivities.Append(element);
  }

  int numberOfNames = 0;
  if (_selectedActivities.Size() > 0) {
    if (QELIZitBltMgr_var manager(_selectedActivities[1]); manager) {
      VORListValVORUnicodeString* names = nullptr;
      manager->GetZitBltNames(names);
      numberOfNames = names != nullptr ? names->Size() : 0;
      delete names;
    }
  }

  VORCommand* mainWindow = VORApplicationFrame::GetApplicationFrame()->GetMainWindow();
  if (numberOfNames > 0) {
    _selectionAgent->Reset();
    _dialog = new QELFpaZitBltHideShowDlg(&_selectedActivities);
    _dialog->SetVisibility(true);
    _closeAgent->AcceptOnNotify(_dialog, VORDlgDialog::GetWindCloseNotification());
    _closeAgent->AcceptOnNotify(_dialog, VORDlgDialog::GetDiaOKNotification());
  } else {
    const VORUnicodeString message =
        VORMsgCatalog::BuildMessage(kCatalog, "NoZitBlt", "No ZitBlts Present");
    const VORUnicodeString title = VORMsgCatalog::BuildMessage(kCatalog, "Title", "Warning");
    auto* notify = new VORDlgNotify(mainWindow, "NoZitBlt", 0x10000200);
    notify->DisplayBlocked(message, title);
    notify->RequestDelayedDestruction();
    _closeAgent->Accept();
  }
  Trace(" \n  QELFpaCtxZitBltCmd::ShowDlg <--");
  return true;
}

VOR_EXPORT_COMMAND_FACTORY_NOARG(QELFpaCtxZitBltCmd)
