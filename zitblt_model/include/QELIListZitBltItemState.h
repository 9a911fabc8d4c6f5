// The assignment state with which an object is shown in a ZitBlt list, and whether an object
// is listed for an activity whose items take states. Product inputs also keep a state of their
// own (module QELZitBltModel).
#pragma once

#include "VORHandle.h"

class QELIListZitBltItemState : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIListZitBltItemState)
 public:
  enum AssignState : int {
    // Inputs and items of the activity itself in the input lists (in the full input list: the
    // items that sub-activities take from outside), the outputs of a station or grouping.
    Listed = 0,
    // Inputs assigned directly to the activity in the full input list; the outputs a grouping
    // hands on from its sub-activities.
    Direct = 1,
    // Resources, and a product input that was never given a state.
    NoState = 2,
  };
  virtual void SetState(AssignState state) = 0;
  // Writes the stored state to state and returns it too (not an error code).
  virtual int GetState(AssignState& state) = 0;
  // True when object is a list item listed for a station, or for a grouping that holds no
  // process of its own (no child of type "BIWActivityRoot").
  virtual bool CanAssignState(VORBaseUnknown* object) = 0;
};
VOR_DECLARE_HANDLE(QELIListZitBltItemState);
