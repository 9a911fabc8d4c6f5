#include "VORHeap.h"

#include <dlfcn.h>

#include <cstddef>

namespace {

using MallCtl = int (*)(const char*, void*, std::size_t*, void*, std::size_t);

// jemalloc's control entry, found at run time: sanitizer builds run on their own allocator and
// link no jemalloc, and the kernel needs no allocator header.
MallCtl FindMallCtl() {
  return reinterpret_cast<MallCtl>(dlsym(RTLD_DEFAULT, "mallctl"));
}

bool returnAfterDrain = false;

}  // namespace

void VORHeap::ReturnFreeMemory() {
  static const MallCtl mallctl = FindMallCtl();
  returnAfterDrain = false;
  if (mallctl != nullptr)
    mallctl("arena.4096.purge", nullptr, nullptr, nullptr, 0);  // 4096: every arena
}

void VORHeap::ReturnFreeMemoryAfterDrain() {
  returnAfterDrain = true;
}

void VORHeap::DrainDone() {
  if (returnAfterDrain)
    ReturnFreeMemory();
}
