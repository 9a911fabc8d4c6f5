// Dragging a list item onto another activity's node: whether the drop is allowed (with a text
// for the planner) and the reassignment itself. Answered by product inputs, product outputs
// and products (resources and the parts a list shows without an input) (module QELZitBltModel).
#pragma once

#include "VORHandle.h"
#include "VORUnicodeString.h"

class QELIListZitBltItemDD : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIListZitBltItemDD)
 public:
  // 1 when the item may go from the from activity to the to activity, 0 when not. message
  // gets the reason on most paths (always on the allowed one: "Activities are valid"); a
  // refusal that has no text of its own leaves it untouched.
  virtual int CheckReassignment(VORBaseUnknown* from, VORBaseUnknown* to,
                                VORUnicodeString& message) = 0;
  // Changes the model through its door. S_OK when it changed, S_FALSE when the change waits
  // for the planner's answer in a dialog, E_FAIL when nothing changed.
  virtual HRESULT Reassign(VORBaseUnknown* from, VORBaseUnknown* to) = 0;
};
VOR_DECLARE_HANDLE(QELIListZitBltItemDD);
