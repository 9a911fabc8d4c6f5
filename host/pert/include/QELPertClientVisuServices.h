// Services of the graph editor for its clients: the grid, the viewer name, positions and
// snapping.
#pragma once

#include "QELIPertNode.h"
#include "QELPertParameters.h"
#include "VOR2DRep.h"
#include "VORIGENode.h"
#include "VORViewer.h"

class QELPertClientVisuServices {
 public:
  // A grid rep added to viewer: lines every PERT_GRID_CELL_SIZE over the area of the viewer's
  // other reps plus two cells. It has no bounding box of its own (reframing ignores it) and is
  // never picked. Returns a new rep (one reference, the caller's) or null without a viewer.
  static VOR2DRep* CreateGrid(VOR2DViewer* viewer);

  // The chart the graph editor serves (process-wide).
  static void SetViewerName(ViewerName& name);
  static ViewerName GetViewerName();

  // The children of node show their stored chart positions again: their working positions
  // are dropped, and children never placed get a provisional one (InitNodePosition).
  static HRESULT SetChildPertPositions(VORIGENode_var& node, GE_POSITION_INDEX index);

  // Snaps (x, y) in place to the centre of its grid cell: cells of PERT_GRID_CELL_SIZE with
  // their corners on the multiples of the cell size, so centres lie half a cell off them:
  //   x' = (floor((x - c/2) / c + 0.5)) * c + c/2   (a point midway between two centres goes
  //   to the upper one). The index and node are accepted for the callers; every index snaps.
  static HRESULT CalculateSnapPositionInPert(double& x, double& y, GE_POSITION_INDEX index,
                                             const QELIPertNode_var& node);
};
