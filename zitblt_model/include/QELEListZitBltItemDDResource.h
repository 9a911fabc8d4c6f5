// Dragging a product ("ASMPRODUCT", code extension) out of a list: a resource from a resource
// list, or a part that an input list shows without an input of its own. Any activity takes it.
#pragma once

#include "QELIListZitBltItemDD.h"
#include "VORExtension.h"

class QELEListZitBltItemDDResource : public VORExtension, public QELIListZitBltItemDD {
  VOR_DECLARE_CLASS(QELEListZitBltItemDDResource, VORExtension)
 public:
  int CheckReassignment(VORBaseUnknown* from, VORBaseUnknown* to,
                        VORUnicodeString& message) override;
  // Moves what the from activity holds of the product to the to activity: its resource
  // assignment through the resource management, its item assignment through the item
  // management (each only when the from activity holds it). E_FAIL when the from activity
  // holds neither, or from and to are the same.
  HRESULT Reassign(VORBaseUnknown* from, VORBaseUnknown* to) override;

 protected:
  ~QELEListZitBltItemDDResource() override = default;
};
