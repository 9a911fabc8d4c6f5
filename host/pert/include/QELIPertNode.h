// A graph node seen by the graph editor: its chart position and its box size.
#pragma once

#include "QELPertParameters.h"
#include "VORHandle.h"

class QELIPertNode : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIPertNode)
 public:
  // Index 1: the position shown in the chart (the editor's working copy while a node is being
  // dragged, else the document's), S_FALSE and (0, 0) when the node was never placed.
  // Index 0: the provisional position. E_INVALIDARG for other indexes.
  virtual HRESULT GetPosition(double& x, double& y, GE_POSITION_INDEX index = 1) = 0;
  // Index 1 writes the document (one change through the model's door) and the working copy.
  virtual HRESULT SetPosition(double x, double y, GE_POSITION_INDEX index = 1) = 0;
  // The node box: as drawn when the node is in a chart, else the document's size, else the
  // default size.
  virtual HRESULT GetSize(double& width, double& height) = 0;
  virtual HRESULT SetSize(double width, double height) = 0;
};
VOR_DECLARE_HANDLE(QELIPertNode);
