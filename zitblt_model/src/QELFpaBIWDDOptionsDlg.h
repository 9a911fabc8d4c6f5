// The item options dialog of an output dropped on one of its activity's own sub-activities: it
// offers the items of the target's inputs and outputs in a selector list ("Select Item To
// Replace"), the first one chosen by default. OK hands the 1-based position of the chosen line
// to the client; Cancel, closing the window, or the closing of the document's last window
// hands 0. Either way the dialog then hides and asks for its deferred destruction: it holds
// its creator's reference itself until it is answered.
#pragma once

#include <functional>

#include "VORDlgDialog.h"
#include "VORDlgSelectorList.h"

class QELFpaBIWDDOptionsDlg : public VORDlgDialog {
  VOR_DECLARE_CLASS(QELFpaBIWDDOptionsDlg, VORDlgDialog)
 public:
  static constexpr const char* kName = "Select Item";
  static constexpr const char* kListName = "ItemSelectorList";
  static constexpr int kListColumns = 15;
  static constexpr int kListLines = 7;

  // A hidden dialog, child of the application's main window. document: the document whose
  // items it offers (its last window closing answers 0). answer: called once, with the
  // position or 0.
  QELFpaBIWDDOptionsDlg(VORBaseUnknown* document, std::function<void(int)> answer);

  void Build() override;
  // Appends a line at the end and selects the first line.
  void AppendItem(const VORUnicodeString& line);
  // The selected line's 0-based index + 1; 0 when nothing is selected.
  int GetChosenPosition() const;
  VORDlgSelectorList* GetSelectorList() const { return _list; }

 protected:
  ~QELFpaBIWDDOptionsDlg() override;

 private:
  // Answers (once), notifies the parent command, hides and requests deferred destruction.
  void Finish(int position, VORNotification* notification);
  void OnLayoutChange(VORNotification* notification);

  VORDlgSelectorList* _list = nullptr;
  VORBaseUnknown* _document;  // not held: only compared with the windows' documents
  std::function<void(int)> _answer;
  VORCallbackId _layoutCallback = 0;
};
