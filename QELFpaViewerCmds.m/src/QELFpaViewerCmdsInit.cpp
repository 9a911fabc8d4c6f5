// The commands module's initialisation, called by the module loader when it loads the library:
// the viewer library it links registers its extensions (it was loaded along, not by name).
#include "QELProductFlowViewerInit.h"

extern "C" void VORInitModule() {
  QELInitProductFlowViewer();
}
