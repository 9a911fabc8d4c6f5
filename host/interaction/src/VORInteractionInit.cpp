#include "VORInteractionInit.h"

#include "VORModelInit.h"

void VORInitInteraction() {
  static const bool initialised = [] {
    VORInitModel();
    return true;
  }();
  (void)initialised;
}
