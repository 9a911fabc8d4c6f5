// Check button with a title; state VORDlgCheck (0x40000) or VORDlgUncheck (0x80000).
#pragma once

#include "VORDlgControl.h"

class VORDlgCheckButton : public VORDlgControl {
  VOR_DECLARE_CLASS(VORDlgCheckButton, VORDlgControl)
 public:
  VORDlgCheckButton(VORCommand* parent, const VORString& name, int style = 0);
  const char* GetKind() const override { return "CheckButton"; }
  VORUnicodeString GetValueText() const override;
  std::vector<std::string> GetNotificationNames() const override;

  // Programmatic change: no notification. Values other than the two states are ignored.
  void SetState(int state);
  int GetState() const { return _state; }
  bool IsChecked() const { return _state == VORDlgCheck; }
  static const char* GetChkBModifyNotification() { return "VORDlgCheckButtonModifyNotification"; }

  // The user clicks the button: the state flips and the modify notification is sent.
  bool UserToggle();

 private:
  int _state = VORDlgUncheck;
};
