// The levels of a process that have a chart: every activity with children, in document order
// (depth first, a parent before its children), each with its path of labels from the root.
#pragma once

#include <string>
#include <vector>

#include "VORDocument.h"

struct PfvChartLevel {
  VORBaseUnknown_var activity;
  std::string path;  // "Process / Underbody line / Respot group"
};

std::vector<PfvChartLevel> PfvChartLevels(VORProcess* document);
