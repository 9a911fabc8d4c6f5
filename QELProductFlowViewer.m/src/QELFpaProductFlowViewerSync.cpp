// The viewer's synchronisation with the process model: callbacks on the root activity's model
// events and the chart's context menu. Until the ZitBlt work fills it in, the window subscribes
// to nothing and adds the navigation items only.
#include "QELFpaProductFlowViewer.h"

void QELFpaProductFlowViewer::AddCallbacks() {}

void QELFpaProductFlowViewer::RemoveCallbacks() {}

void QELFpaProductFlowViewer::ContextCB(VORCommand*, VORNotification* notification, void*) {
  AddCenterGraph(notification);
  AddPreviewWindowItem(notification);
}
