// One call that draws the chart of a level the way the product flow viewer does on opening:
// positions initialised, one node per child graph node, each placed.
#pragma once

#include "QELPertController.h"

// A new controller (one reference, the caller's) drawing the children of root into viewer,
// or null when root is no graph node or has no children list. Nodes never placed get their
// provisional row position.
QELPertController* QELPertBuildChart(const VORBaseUnknown_var& root, VORViewer* viewer,
                                     ViewerMode mode = PertModeReadOnly);
