// Read-only drop-down list of lines. Lines are appended at the end; the first line appended to
// an empty combo becomes the selected one.
#pragma once

#include "VORDlgControl.h"
#include "VORLists.h"

class VORDlgCombo : public VORDlgControl {
  VOR_DECLARE_CLASS(VORDlgCombo, VORDlgControl)
 public:
  VORDlgCombo(VORCommand* parent, const VORString& name, int style = VORDlgCmbDropDown);
  const char* GetKind() const override { return "Combo"; }
  VORUnicodeString GetValueText() const override { return GetSelectedLine(); }
  std::vector<std::string> GetNotificationNames() const override;

  void SetLine(const VORUnicodeString& line);
  void ClearLine();
  int GetLineCount() const { return _lines.Size(); }
  // 0-based; empty when out of range.
  VORUnicodeString GetLine(int index) const;
  // 0-based selected line, -1 when the combo is empty.
  int GetSelect() const { return _selected; }
  // Programmatic selection (no notification); ignored when out of range.
  void SetSelect(int index);
  VORUnicodeString GetSelectedLine() const { return GetLine(_selected); }
  static const char* GetComboSelectNotification() { return "VORDlgComboSelectNotification"; }

  // The user chooses a line (by index, or by its text). False when absent or insensitive.
  bool UserSelect(int index);
  bool UserSelect(const VORUnicodeString& line);

 private:
  VORListValVORUnicodeString _lines;
  int _selected = -1;
};
