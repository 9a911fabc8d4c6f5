// The graph editor's 2D viewer: a VORViewer that knows the controller drawing its chart.
#pragma once

#include "VORViewer.h"

class QELPertController;

class QELPertViewer : public VORViewer {
  VOR_DECLARE_CLASS(QELPertViewer, VORViewer)
 public:
  // parent: the dialog (frame) that holds the viewer, not held.
  QELPertViewer(VORCommand* parent, const VORString& name, int style, int width, int height,
                int flags);

  // The controller drawing into this viewer (set by the controller, cleared when it goes).
  QELPertController* GetController() const { return _controller; }
  void SetController(QELPertController* controller) { _controller = controller; }
  // The chart node (graph node object) of the frontmost node box under the pixel, or null.
  VORBaseUnknown_var NodeAt(double px, double py);

 protected:
  ~QELPertViewer() override = default;

 private:
  QELPertController* _controller = nullptr;
};
VOR_DECLARE_HANDLE(QELPertViewer);
