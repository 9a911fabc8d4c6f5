// Creation of activities the way a planner's command makes them: a new grouping activity comes
// with its "Start" and "Stop" control nodes, so that its inner chart has an entry and an exit.
#pragma once

#include "VORHandle.h"

class VORSPPGroupingServices {
 public:
  // Creates a child activity of type at the end of father's children (through the model's
  // door, undoable). For "BIWActivityGrouping" the new activity receives "Start" (first) and
  // "Stop" (last). E_INVALIDARG when father is no activity or type no activity type; nothing
  // changes then.
  static HRESULT CreateActivity(VORBaseUnknown* father, const char* type,
                                VORBaseUnknown_var& activity);
};
