// The assignment state a product input keeps (data extension on "ProductInput").
#pragma once

#include "QELIListZitBltItemState.h"
#include "VORExtension.h"

class QELEListZitBltItemStatePI : public VORExtension, public QELIListZitBltItemState {
  VOR_DECLARE_CLASS(QELEListZitBltItemStatePI, VORExtension)
 public:
  void SetState(AssignState state) override { _state = state; }
  int GetState(AssignState& state) override;
  bool CanAssignState(VORBaseUnknown* object) override;

 protected:
  ~QELEListZitBltItemStatePI() override = default;

 private:
  AssignState _state = NoState;
};
