#include "VORQtInit.h"

#include "VORFrameInit.h"
#include "VORPertInit.h"

void VORInitQt() {
  static const bool initialised = [] {
    VORInitFrame();
    VORInitPert();
    return true;
  }();
  (void)initialised;
}
