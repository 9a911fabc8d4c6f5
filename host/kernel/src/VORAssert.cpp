#include "VORAssert.h"

#include <cstdio>
#include <cstdlib>

void VORAssertionFailed(const char* condition, const char* module, int line) {
  std::fprintf(stderr, "AssertionFailed:%s\n%s, line %d\n", condition, module, line);
  std::fflush(stderr);
  std::abort();
}
