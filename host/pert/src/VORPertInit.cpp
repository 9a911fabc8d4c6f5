#include "VORPertInit.h"

#include "QELPertNodeExtensions.h"
#include "VORVisuInit.h"

void VORInitPert() {
  static const bool initialised = [] {
    VORInitVisu();
    QELPertRegisterNodeExtensions();
    return true;
  }();
  (void)initialised;
}
