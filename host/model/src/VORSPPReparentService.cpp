#include "VORSPPReparentService.h"

#include <algorithm>
#include <unordered_map>
#include <unordered_set>

#include "VORLateTypes.h"
#include "VORModelObjects.h"

namespace {
VORBaseUnknown* Unk(VORModelObject* o) {
  return static_cast<VORISpecObject*>(o);
}
}  // namespace

HRESULT VORSPPReparentService::ReparentResource(VORBaseUnknown* resource, VORBaseUnknown* newFather,
                                                const VORListValVORBaseUnknown_var* path,
                                                VORBaseUnknown* /*processContainer*/) {
  auto* r = VORImplOf<VORProductImpl>(resource);
  auto* f = VORImplOf<VORProductImpl>(newFather);
  if (r == nullptr || f == nullptr || r->data != f->data)
    return E_INVALIDARG;
  if (path != nullptr && path->Size() > 0 &&
      (*path)[path->Size()].Identity() != static_cast<VORBaseUnknown*>(Unk(f)))
    return E_INVALIDARG;
  HRESULT hr = r->data->door.ReparentProduct(resource, newFather);
  return hr == S_FALSE ? S_OK : hr;
}

VORListValVORBaseUnknown_var* VORSPPReparentService::GetPathOf(VORBaseUnknown* product) {
  auto* list = VORNewList();
  auto* p = VORImplOf<VORProductImpl>(product);
  for (; p != nullptr; p = p->father)
    list->InsertAt(1, VORBaseUnknown_var(Unk(p)));
  return list;
}
