// Creates the new grouping activity of a grouping: after the anchor, on the anchor's level.
#pragma once

#include "VORBaseUnknown.h"
#include "VORHandle.h"
#include "VORLists.h"
#include "VORMetaObject.h"
#include "VORString.h"

class QELProcessGroupUtils : public VORBaseUnknown {
  VOR_DECLARE_CLASS(QELProcessGroupUtils, VORBaseUnknown)
 public:
  // A new child of type under the anchor's father activity (a grouping activity comes with its
  // "Start" and "Stop"); the anchor's flows into selected activities move to the new activity,
  // and the anchor is linked to it. Null (nothing changed) for a null anchor or when the child
  // cannot be made.
  static VORBaseUnknown_var CreateAfterOperation(const VORBaseUnknown_var& anchor,
                                                 const VORString& type,
                                                 const VORListValVORBaseUnknown_var& selection);

 protected:
  ~QELProcessGroupUtils() override = default;
};
