// Ties an editor's highlighted (HSO) and preselected (PSO) sets to the viewpoints that show them,
// and commits pending redraws.
#pragma once

#include <vector>

#include "VOR2DViewpoint.h"
#include "VORHSO.h"
#include "VORPSO.h"

class VORVisManager {
 public:
  static VORVisManager* GetVisManager();

  // The viewpoint's viewer draws the set's objects highlighted (HSO) or preselected (PSO) and,
  // for the PSO, keeps it filled with what lies under the pointer.
  void AttachHSOTo(VORHSO* hso, VOR2DViewpoint* viewpoint);
  void AttachPSOTo(VORPSO* pso, VOR2DViewpoint* viewpoint);
  // mode 1: drops the preselection and highlight drawn in the viewpoint (its reps are going
  //         away) and keeps the sets attached;
  // mode 0: detaches both sets from the viewpoint.
  void DetachFrom(VOR2DViewpoint* viewpoint, int mode);
  // Redraws every viewer whose attached viewpoint is known to the manager.
  void Commit();
  int GetCommitCount() const { return _commits; }
  bool IsAttached(VOR2DViewpoint* viewpoint) const;

  // Viewers call it when they die.
  void Forget(VOR2DViewpoint* viewpoint);

 private:
  VORVisManager() = default;
  std::vector<VOR2DViewpoint*> _viewpoints;
  int _commits = 0;
};
