// Deep copy and removal of activities, for copy/cut/paste.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class VORSPPCopyServices {
 public:
  // True when every source is an activity (not the root) of one document and target is an
  // activity of that document that is neither a source nor inside one.
  static bool CanPasteInto(const VORListValVORBaseUnknown_var& sources, VORBaseUnknown* target);
  // Copies the sources (with their subtrees, control nodes, flows among the copied nodes,
  // product inputs and outputs, item assignments, resource assignments, times, attributes and
  // PERT data) under target, appended in source order; copies receives the new top-level
  // activities in that order. Items and resources are shared, not copied. Nothing changes on
  // failure.
  static HRESULT CopyActivities(const VORListValVORBaseUnknown_var& sources, VORBaseUnknown* target,
                                VORListValVORBaseUnknown_var& copies);
  // Removes the activities with their subtrees and every flow touching them.
  static HRESULT RemoveActivities(const VORListValVORBaseUnknown_var& activities);
};
