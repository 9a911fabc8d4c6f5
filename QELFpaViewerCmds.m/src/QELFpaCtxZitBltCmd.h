// Hides and shows ZitBlts by name on the selected activities: takes the selection (or waits for
// picks), then opens the visibility dialog on the names of the first activity's ZitBlts; warns
// when it has none. The command ends when the dialog is closed or confirmed.
#pragma once

#include "VORPathElementAgent.h"
#include "VORStateCommand.h"

class QELFpaZitBltHideShowDlg;

class QELFpaCtxZitBltCmd : public VORStateCommand {
  VOR_DECLARE_CLASS(QELFpaCtxZitBltCmd, VORStateCommand)
 public:
  QELFpaCtxZitBltCmd();

  void BuildGraph() override;
  bool ShowDlg(void* data);
  VORString GetResourceFilename(int index = 0) const override;

  QELFpaZitBltHideShowDlg* GetDialog() const { return _dialog; }

 protected:
  ~QELFpaCtxZitBltCmd() override;

 private:
  QELFpaZitBltHideShowDlg* _dialog = nullptr;
  VORPathElementAgent* _selectionAgent = nullptr;
  VORDialogAgent* _closeAgent = nullptr;
  VORListValVORBaseUnknown_var _selectedActivities;
};
