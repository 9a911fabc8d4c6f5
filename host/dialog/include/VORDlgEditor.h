// One-line text editor; a user's change sends the modify notification.
#pragma once

#include "VORDlgControl.h"

class VORDlgEditor : public VORDlgControl {
  VOR_DECLARE_CLASS(VORDlgEditor, VORDlgControl)
 public:
  VORDlgEditor(VORCommand* parent, const VORString& name, int style = 0);
  const char* GetKind() const override { return "Editor"; }
  VORUnicodeString GetValueText() const override { return _text; }
  std::vector<std::string> GetNotificationNames() const override;

  // Programmatic change: no notification.
  void SetText(const VORUnicodeString& text);
  VORUnicodeString GetText() const { return _text; }
  static const char* GetEditModifyNotification() { return "VORDlgEditModifyNotification"; }

  // The user types text (replacing the old one). False when insensitive.
  bool UserSetText(const VORUnicodeString& text);

 private:
  VORUnicodeString _text;
};
