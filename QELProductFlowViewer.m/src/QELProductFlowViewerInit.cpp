#include "QELProductFlowViewerInit.h"

#include "QELFpaProductFlowViewer.h"

void QELInitProductFlowViewer() {
  static const bool initialised = [] {
    QELFpaProductFlowViewer::RegisterExtensions();
    return true;
  }();
  (void)initialised;
}

extern "C" void VORInitModule() {
  QELInitProductFlowViewer();
}
