#include "VORFrameInit.h"

#include "QELIFPAAdapters.h"
#include "VORDialogInit.h"
#include "VORFrmWindowKinds.h"
#include "VORVisuInit.h"

void VORInitFrame() {
  static const bool initialised = [] {
    VORInitDialog();
    VORInitVisu();
    QELRegisterFPAAdapters();
    VORFrmHostCommands::DeclareAll();
    return true;
  }();
  (void)initialised;
}
