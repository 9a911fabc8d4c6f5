// The editor's preselected set: what lies under the mouse before a click.
#pragma once

#include "VORSelectionSet.h"

class VORPSO : public VORSelectionSet {
  VOR_DECLARE_CLASS(VORPSO, VORSelectionSet)
 public:
  VORPSO() = default;
};

VOR_DECLARE_HANDLE(VORPSO);
