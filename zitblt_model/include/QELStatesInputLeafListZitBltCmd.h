// Fills the input list of an activity without sub-activities of interest (joining, loading):
// its product inputs whose item is assigned to it, each item once.
#pragma once

#include "QELBaseListZitBltCmd.h"

class QELStatesInputLeafListZitBltCmd : public QELBaseListZitBltCmd {
  VOR_DECLARE_CLASS(QELStatesInputLeafListZitBltCmd, QELBaseListZitBltCmd)
 public:
  explicit QELStatesInputLeafListZitBltCmd(VORBaseUnknown* owner) : QELBaseListZitBltCmd(owner) {}
  void UpdateList(QELBaseScrollListZitBltRep* rep) override;

 protected:
  ~QELStatesInputLeafListZitBltCmd() override = default;
  // Assignments (17, 18) of products ("ASMPRODUCT") only.
  bool HandleEvent(SPPModifyKind kind, VORBaseUnknown* son) override;
};
