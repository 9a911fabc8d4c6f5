#include "VORSPPLinkServices.h"

#include <algorithm>
#include <unordered_map>
#include <unordered_set>

#include "VORLateTypes.h"
#include "VORModelObjects.h"

int VORSPPLinkServices::AreAllreadyLinked(VORBaseUnknown* from, VORBaseUnknown* to) {
  auto* f = VORImplOf<VORGraphNodeImpl>(from);
  auto* t = VORImplOf<VORGraphNodeImpl>(to);
  if (f == nullptr || t == nullptr || f == t || f->father == nullptr || f->father != t->father)
    return 0;
  for (const VORFlowRef& r : f->next) {
    if (r.node == t)
      return 0;
  }
  return 1;
}
