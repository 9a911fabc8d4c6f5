#include "QELEListZitBltItemDDResource.h"

#include <memory>

#include "QELListZitBltItemDDRules.h"
#include "VORIResource.h"
#include "VORISPPItemMgt.h"
#include "VORISPPResourceManagement.h"

using namespace QELItemDD;

namespace {
// True when the activity's resource management lists the resource.
bool HoldsResource(VORISPPResourceManagement* resources, VORBaseUnknown* resource) {
  VORListValVORBaseUnknown_var* list = nullptr;
  if (resources == nullptr || FAILED(resources->GetResources(list)) || list == nullptr)
    return false;
  const std::unique_ptr<VORListValVORBaseUnknown_var> owned(list);
  return list->Locate(VORBaseUnknown_var(resource)) != 0;
}
}  // namespace

int QELEListZitBltItemDDResource::CheckReassignment(VORBaseUnknown* from, VORBaseUnknown* to,
                                                    VORUnicodeString& message) {
  if (IsActivity(from) && IsActivity(to)) {
    message = VORUnicodeString(kValid);
    return 1;
  }
  message = VORUnicodeString(kNotAnActivity);
  return 0;
}

HRESULT QELEListZitBltItemDDResource::Reassign(VORBaseUnknown* from, VORBaseUnknown* to) {
  if (!IsActivity(from) || !IsActivity(to) || from->GetIdentity() == to->GetIdentity())
    return E_FAIL;
  VORBaseUnknown* product = GetExtendedObject();
  VORISPPResourceManagement_var fromResources{VORBaseUnknown_var(from)};
  VORISPPResourceManagement_var toResources{VORBaseUnknown_var(to)};
  VORISPPItemMgt_var fromItems{VORBaseUnknown_var(from)};
  VORISPPItemMgt_var toItems{VORBaseUnknown_var(to)};
  const bool resource = VORIResource_var{VORBaseUnknown_var(product)} &&
                        HoldsResource(fromResources, product) && toResources;
  const bool item = fromItems && fromItems->IsItemAssigned(product) && toItems;
  if (!resource && !item)
    return E_FAIL;
  AllOrNothing change(product);
  if (resource && (FAILED(fromResources->UnassignResource(product)) ||
                   FAILED(toResources->AssignResource(product))))
    return E_FAIL;
  if (item && (FAILED(fromItems->UnassignItem(product)) || FAILED(toItems->AssignItem(product))))
    return E_FAIL;
  change.Commit();
  return S_OK;
}
