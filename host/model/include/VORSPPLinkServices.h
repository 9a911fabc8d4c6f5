// Questions about precedence flows.
#pragma once

#include "VORHandle.h"

class VORSPPLinkServices {
 public:
  // 1 when a flow from -> to may be created because none exists (both sibling graph nodes,
  // distinct); 0 otherwise.
  static int AreAllreadyLinked(VORBaseUnknown* from, VORBaseUnknown* to);
};
