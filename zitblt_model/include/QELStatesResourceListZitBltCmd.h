// Fills the resource list: the resources assigned to the activity.
#pragma once

#include "QELBaseListZitBltCmd.h"

class QELStatesResourceListZitBltCmd : public QELBaseListZitBltCmd {
  VOR_DECLARE_CLASS(QELStatesResourceListZitBltCmd, QELBaseListZitBltCmd)
 public:
  explicit QELStatesResourceListZitBltCmd(VORBaseUnknown* owner) : QELBaseListZitBltCmd(owner) {}
  void UpdateList(QELBaseScrollListZitBltRep* rep) override;

 protected:
  ~QELStatesResourceListZitBltCmd() override = default;
  // Resource assignments only (15, 16).
  bool HandleEvent(SPPModifyKind kind, VORBaseUnknown* son) override;
};
