#include "VORVisuInit.h"

#include "VORInteractionInit.h"

void VORInitVisu() {
  static const bool initialised = [] {
    VORInitInteraction();
    return true;
  }();
  (void)initialised;
}
