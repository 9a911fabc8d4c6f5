#include "VORDialogInit.h"

#include "VORDlgControl.h"
#include "VORInteractionInit.h"

void VORInitDialog() {
  static const bool initialised = [] {
    VORInitInteraction();
    VORDlg::GetGlobalPublisher();  // lives as long as the process, made before any dialog
    return true;
  }();
  (void)initialised;
}
