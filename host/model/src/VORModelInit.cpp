#include "VORModelInit.h"

#include "VORJoiningCycleTime.h"
#include "VORKernelInit.h"
#include "VORModelTypes.h"

void VORInitModel() {
  static const bool initialised = [] {
    VORInitKernel();
    VORModelLateTypes::Declare();
    VORRegisterJoiningCycleTimes();
    return true;
  }();
  (void)initialised;
}
