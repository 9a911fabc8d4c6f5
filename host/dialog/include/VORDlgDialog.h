// A dialog window: hidden or shown, OK / Cancel buttons by style, their sensitivity, and the OK,
// Cancel and window-close notifications. Not owned by its parent window.
#pragma once

#include "VORDlgControl.h"

class VORDlgDialog : public VORDlgControl {
  VOR_DECLARE_CLASS(VORDlgDialog, VORDlgControl)
 public:
  // Created hidden; Build() fills it, SetVisibility(true) shows it.
  VORDlgDialog(VORCommand* parent, const VORString& name, int style = VORDlgWndBtnOKCancel);

  const char* GetKind() const override { return "Dialog"; }
  std::vector<std::string> GetNotificationNames() const override;
  virtual void Build() {}

  bool HasOKButton() const { return (GetStyle() & VORDlgWndBtnOK) != 0; }
  bool HasCancelButton() const { return (GetStyle() & VORDlgWndBtnCancel) != 0; }
  void SetOKSensitivity(bool on);
  bool GetOKSensitivity() const { return _okSensitive; }

  static const char* GetDiaOKNotification() { return "VORDlgDiaOKNotification"; }
  static const char* GetDiaCANCELNotification() { return "VORDlgDiaCANCELNotification"; }
  static const char* GetWindCloseNotification() { return "VORDlgWindCloseNotification"; }

  // What a user does. False (and nothing sent) when the dialog is hidden or the button is
  // missing or insensitive.
  bool UserPressOK();
  bool UserPressCancel();
  bool UserCloseWindow();

  // Dialogs alive, in creation order (not held).
  static std::vector<VORDlgDialog*> GetDialogs();
  // The last shown dialog of that name (any when name is empty), or null.
  static VORDlgDialog* FindShown(const std::string& name = std::string());

 protected:
  ~VORDlgDialog() override;

 private:
  bool _okSensitive = true;
};

VOR_DECLARE_HANDLE(VORDlgDialog);
