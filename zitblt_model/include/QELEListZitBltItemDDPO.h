// Dragging a product output ("ProductOutput", data extension) from a station or grouping: the
// target takes its item as an input. Dropped on one of the from activity's own sub-activities
// that already has inputs or outputs, the planner first chooses in the item options dialog
// which of them the output replaces; the extension keeps the move in its fields until then.
#pragma once

#include "QELIListZitBltItemDD.h"
#include "VORExtension.h"
#include "VORISPPFlowMgt.h"
#include "VORLists.h"

class QELFpaBIWDDOptionsDlg;

class QELEListZitBltItemDDPO : public VORExtension, public QELIListZitBltItemDD {
  VOR_DECLARE_CLASS(QELEListZitBltItemDDPO, VORExtension)
 public:
  int CheckReassignment(VORBaseUnknown* from, VORBaseUnknown* to,
                        VORUnicodeString& message) override;
  // S_OK when the target took the item, S_FALSE while the options dialog waits for the
  // planner, E_FAIL when nothing changed.
  HRESULT Reassign(VORBaseUnknown* from, VORBaseUnknown* to) override;

  // The dialog's answer: the 1-based position of the chosen product IO among those offered;
  // 0 (cancelled) changes nothing. The chosen input or output carries the dragged item from
  // then on, and an assignment made through a chosen input follows it. One undo step.
  void CompleteReassign(int position);
  bool IsWaitingForChoice() const { return static_cast<bool>(_to); }

 protected:
  ~QELEListZitBltItemDDPO() override = default;

 private:
  // The target takes the item: an input of it and, with item management, its assignment.
  HRESULT AddAsInput(VORBaseUnknown* to, VORBaseUnknown* item);
  void Forget();

  // The move waiting for the planner's choice (empty otherwise).
  VORBaseUnknown* _output = nullptr;  // the extended object, not held
  VORISPPFlowMgt_var _fromFlow;
  VORBaseUnknown_var _to;
  VORBaseUnknown_var _item;
  VORListValVORBaseUnknown_var _offered;
  QELFpaBIWDDOptionsDlg* _dialog = nullptr;  // shown while the choice waits; owns itself
};
