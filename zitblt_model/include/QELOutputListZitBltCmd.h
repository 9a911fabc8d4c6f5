// Fills the product output list of a station or grouping: what the activity produces, then what
// its sub-activities hand on (see QELIBIWItemInfo). Other activities show an empty list.
#pragma once

#include "QELBaseListZitBltCmd.h"

class QELOutputListZitBltCmd : public QELBaseListZitBltCmd {
  VOR_DECLARE_CLASS(QELOutputListZitBltCmd, QELBaseListZitBltCmd)
 public:
  explicit QELOutputListZitBltCmd(VORBaseUnknown* owner) : QELBaseListZitBltCmd(owner) {}
  void UpdateList(QELBaseScrollListZitBltRep* rep) override;

 protected:
  ~QELOutputListZitBltCmd() override = default;
  // The base kinds and an output's item change (39).
  bool HandleEvent(SPPModifyKind kind, VORBaseUnknown* son) override;
};
