// The editor's highlighted set: what viewers draw highlighted.
#pragma once

#include "VORSelectionSet.h"

class VORHSO : public VORSelectionSet {
  VOR_DECLARE_CLASS(VORHSO, VORSelectionSet)
 public:
  VORHSO() = default;
};

VOR_DECLARE_HANDLE(VORHSO);
