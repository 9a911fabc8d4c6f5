// A list of lines of which the user selects one or several (one with the style
// VORDlgLstSingleSelection).
#pragma once

#include <vector>

#include "VORDlgControl.h"
#include "VORDlgStyles.h"
#include "VORLists.h"

class VORDlgSelectorList : public VORDlgControl {
  VOR_DECLARE_CLASS(VORDlgSelectorList, VORDlgControl)
 public:
  VORDlgSelectorList(VORCommand* parent, const VORString& name, int style = 0);
  const char* GetKind() const override { return "SelectorList"; }
  VORUnicodeString GetValueText() const override;
  std::vector<std::string> GetNotificationNames() const override;

  void SetLine(const VORUnicodeString& line);
  void ClearLine();
  int GetLineCount() const { return _lines.Size(); }
  VORUnicodeString GetLine(int index) const;
  // 0-based selected rows, in increasing order.
  const std::vector<int>& GetSelect() const { return _selected; }
  void SetSelect(const std::vector<int>& rows);
  static const char* GetListSelectNotification() { return "VORDlgListSelectNotification"; }
  // How much of the list a view shows: characters per line and lines (0: the view's choice).
  void SetVisibleSize(int columns, int lines) {
    _visibleColumns = columns;
    _visibleLines = lines;
    Changed();
  }
  int GetVisibleColumns() const { return _visibleColumns; }
  int GetVisibleLines() const { return _visibleLines; }

  // The user selects rows (out-of-range rows are dropped). False when insensitive.
  bool UserSelect(const std::vector<int>& rows);

 private:
  VORListValVORUnicodeString _lines;
  std::vector<int> _selected;
  int _visibleColumns = 0;
  int _visibleLines = 0;
};
