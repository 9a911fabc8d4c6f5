#include "VORKernelInit.h"

void VORInitKernel() {}
