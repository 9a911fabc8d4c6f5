#include "VORFrameInit.h"

#include "QELIFPAAdapters.h"
#include "VORDialogInit.h"
#include "VORFrmWindowKinds.h"
#include "VORVisuInit.h"

void VORInitFrame() {
  static const bool initialised = [] {
    VORInitVisu();  // before the dialogs: kernel, model, interaction, visu, dialog, frame
    VORInitDialog();
    QELRegisterFPAAdapters();
    VORFrmHostCommands::DeclareAll();
    return true;
  }();
  (void)initialised;
}
