// The commands' trace channel.
#pragma once

#include "VORTrace.h"

inline const VORTrace& QELFpaViewerCmdsTrace() {
  static const VORTrace trace("QELFpaViewerCmdsTrace", 0, "STDERR", 1024);
  return trace;
}
