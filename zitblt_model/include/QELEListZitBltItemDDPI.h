// Dragging a product input ("ProductInput", code extension) from one station, grouping or
// loading activity to another: the input moves with its item's assignment.
#pragma once

#include "QELIListZitBltItemDD.h"
#include "VORExtension.h"

class QELEListZitBltItemDDPI : public VORExtension, public QELIListZitBltItemDD {
  VOR_DECLARE_CLASS(QELEListZitBltItemDDPI, VORExtension)
 public:
  int CheckReassignment(VORBaseUnknown* from, VORBaseUnknown* to,
                        VORUnicodeString& message) override;
  // Removes the input from the from activity (with the assignment made through it), adds an
  // input of the same item to the to activity and, for a station, grouping or loading
  // activity, assigns the item through it. Never onto a welding activity.
  HRESULT Reassign(VORBaseUnknown* from, VORBaseUnknown* to) override;

 protected:
  ~QELEListZitBltItemDDPI() override = default;
};
