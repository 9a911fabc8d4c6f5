// The reference object of a node: the chart root whose model events carry the chart's position
// and node notifications (QELPertPositionNotify, QELPertAppInfoNotify).
#pragma once

#include "VORHandle.h"

class QELIPertPosition : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIPertPosition)
 public:
  // The root of the chart that shows the node (set by the controller); for a node no chart
  // shows, its parent graph node; for a node without parent, the node itself.
  virtual HRESULT GetReferenceObject(VORBaseUnknown_var& reference) = 0;
};
VOR_DECLARE_HANDLE(QELIPertPosition);
