// Parameters and named constants of the graph editor.
#pragma once

#include "VORTextMetric.h"

// Index of a node position: 1 is the chart position (kept in the document), 0 the provisional
// position a node gets before it was ever placed (never saved).
using GE_POSITION_INDEX = int;

// Which chart the graph editor currently serves (process-wide, see
// QELPertClientVisuServices::SetViewerName): 0 the classic PERT chart, 1 the product flow viewer.
enum ViewerName : int { PertViewerClassic = 0, PertViewerProductFlow = 1 };
// 0 read-only chart (no node dragging), 1 editable chart (nodes can be dragged).
enum ViewerMode : int { PertModeReadOnly = 0, PertModeEditable = 1 };
// Node states kept in the document.
enum PertNodeState : int { PertNodeNone = 0, PertNodeExpanded = 1, PertNodeCollapsed = 2 };

struct QELPertParameters {
  // Cell of the snapping grid, in model units (25 by default).
  static inline double PERT_GRID_CELL_SIZE = 25.0;
  // Label height of the chart; the same variable as the 2D layer's label height, so every text
  // rep made afterwards uses it (2 by default).
  static inline double& PERT_LABEL_HEIGHT = VORTextMetric::LabelHeight();
  // Smallest node box; a node grows to hold its label with one label height of margin.
  static inline double PERT_NODE_WIDTH = 20.0;
  static inline double PERT_NODE_HEIGHT = 10.0;
  // A node's label: at most this fraction of the box height, at least this fraction of that
  // when shrinking keeps the whole name (elided below), with this margin (model units) left and
  // right of the text.
  static constexpr double PERT_LABEL_BOX_RATIO = 0.5;
  static constexpr double PERT_LABEL_SHRINK_FLOOR = 0.9;
  static constexpr double PERT_LABEL_PADDING = 1.0;
  // Space between an expanded super node's border and its inner chart.
  static inline double PERT_SUPER_NODE_MARGIN = 5.0;

  // Viewer style word and flag word of the product flow viewer's PERT viewer. Style 0x40000:
  // a 2D viewer whose chart is drawn on a grid; flag 8: the viewer takes keyboard focus.
  static constexpr int PERT_VIEWER_STYLE = 0x40000;
  static constexpr int PERT_VIEWER_FLAGS = 8;

  // Colour indexes of the chart (VORGraphicAttribute.h palette).
  static constexpr int NodeFillColor = 12;
  static constexpr int NodeBorderColor = 13;
  static constexpr int LinkColor = 14;
  static constexpr int GridColor = 15;

  // Back to the defaults above.
  static void Reset() {
    PERT_GRID_CELL_SIZE = 25.0;
    PERT_LABEL_HEIGHT = 2.0;
  }
};
