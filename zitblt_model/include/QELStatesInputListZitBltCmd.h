// Fills the full input list of a station or grouping: its product inputs whose item is assigned
// to it, then what its sub-activities take from outside it (see QELIBIWItemInfo).
#pragma once

#include "QELBaseListZitBltCmd.h"

class QELStatesInputListZitBltCmd : public QELBaseListZitBltCmd {
  VOR_DECLARE_CLASS(QELStatesInputListZitBltCmd, QELBaseListZitBltCmd)
 public:
  explicit QELStatesInputListZitBltCmd(VORBaseUnknown* owner) : QELBaseListZitBltCmd(owner) {}
  void UpdateList(QELBaseScrollListZitBltRep* rep) override;

 protected:
  ~QELStatesInputListZitBltCmd() override = default;
  // Product IO changes (29), and assignments (17, 18) of products and assemblies.
  bool HandleEvent(SPPModifyKind kind, VORBaseUnknown* son) override;
};
