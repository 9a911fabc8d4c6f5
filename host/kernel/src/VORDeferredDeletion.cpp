#include "VORDeferredDeletion.h"

#include <vector>

#include "VORBaseUnknown.h"
#include "VORHeap.h"

namespace {
std::vector<VORBaseUnknown*>& Queue() {
  static std::vector<VORBaseUnknown*> queue;
  return queue;
}
}  // namespace

void VORCommandDeletion(VORBaseUnknown* object) {
  if (object != nullptr)
    Queue().push_back(object);
}

namespace VORDeferredDeletion {

int Drain() {
  int released = 0;
  // Releasing may queue more objects (a command releasing its agents): loop until empty.
  while (!Queue().empty()) {
    std::vector<VORBaseUnknown*> batch;
    batch.swap(Queue());
    for (VORBaseUnknown* object : batch) {
      object->Release();
      ++released;
    }
  }
  VORHeap::DrainDone();
  return released;
}

int Pending() {
  return static_cast<int>(Queue().size());
}

}  // namespace VORDeferredDeletion
