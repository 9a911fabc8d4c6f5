// Graph-editor services of the planning product line: node extensions and positions, and the
// 2D matrix helper.
#pragma once

#include "QELIPertNodeExt.h"
#include "VOR3x3Matrix.h"
#include "VORIGENode.h"

class QELFpaPertBaseServices {
 public:
  // The node's graph-editor extension; created is true on the first call for that node.
  // Null for an object that is no graph node.
  static QELIPertNodeExt_var GetPertExtension(VORIGENode_var& node, bool& created);
  // A node without a stored chart position gets a provisional one (index 0): a row along x,
  // two grid cells apart in the order of its siblings, snapped. S_FALSE when the node has a
  // stored position, E_FAIL for no graph node.
  static HRESULT InitNodePosition(VORIGENode_var& node);
};

class QELFpaPertVisuServices {
 public:
  // Rotation by angle then translation (tx, ty): columns (cos a, sin a), (-sin a, cos a).
  static VOR3x3Matrix CreateMatrix(double angle, double tx = 0.0, double ty = 0.0) {
    return VOR3x3Matrix::Rotation(angle, tx, ty);
  }
  // params = (angle, tx, ty).
  static VOR3x3Matrix CreateMatrix(const double params[3]) {
    return VOR3x3Matrix::Rotation(params[0], params[1], params[2]);
  }
};
