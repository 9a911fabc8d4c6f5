// The dialog that hides and shows ZitBlts by name: one check button per ZitBlt name of the
// first selected activity and, with two names or more, "All". Every change is applied at once
// to all selected activities.
#pragma once

#include "VORDlgCheckButton.h"
#include "VORDlgDialog.h"
#include "VORDlgFrame.h"
#include "VORLists.h"

class QELFpaZitBltHideShowDlg : public VORDlgDialog {
  VOR_DECLARE_CLASS(QELFpaZitBltHideShowDlg, VORDlgDialog)
 public:
  // Copies the list and builds the dialog (hidden until shown).
  explicit QELFpaZitBltHideShowDlg(VORListValVORBaseUnknown_var* activities);

  void Build() override;
  void AllZitBltModif(VORCommand* sender, VORNotification* notification, void* data);
  void OtherZitModif(VORCommand* sender, VORNotification* notification, void* data);
  // Brings "All" into line when every name button has state; otherwise leaves it as it is, so
  // that unchecking one name keeps "All" checked.
  void CheckAllStatus(int state);

  VORDlgFrame* GetFrame() const { return _frame; }
  VORDlgCheckButton* GetAllButton() const { return _allButton; }
  // 1-based, in the order of the first activity's names; null out of range.
  VORDlgCheckButton* GetNameButton(int index) const;
  int GetNumberOfNames() const { return _numberOfNames; }

 protected:
  ~QELFpaZitBltHideShowDlg() override;

 private:
  void SetStatusOnEveryActivity(const VORUnicodeString& name, bool visible);

  VORDlgFrame* _frame = nullptr;
  VORDlgCheckButton* _allButton = nullptr;
  VORDlgCheckButton** _nameButtons = nullptr;
  VORListValVORUnicodeString* _zitBltNames = nullptr;
  VORListValVORBaseUnknown_var _activities;
  int _numberOfNames = 0;
};
