#include "VORIPDServices.h"

#include <algorithm>
#include <unordered_map>
#include <unordered_set>

#include "VORLateTypes.h"
#include "VORModelObjects.h"

HRESULT VORIPDServices::GetPPRContainer(VORProcess* document, VORBaseUnknown_var& container) {
  container = nullptr;
  if (document == nullptr)
    return E_INVALIDARG;
  return document->GetContainer(VORDocument::PPRContainer, container);
}

HRESULT VORIPDServices::GetPlanTypeUnknowObject(const VORUnicodeString& name, int /*index*/,
                                                const VORIIPDAdapter_var& adapter,
                                                VORBaseUnknown_var& planType) {
  planType = nullptr;
  if (!adapter)
    return E_FAIL;
  return adapter->FindPlanType(name, planType);
}

HRESULT VORIPDServices::GetPlanTypeObject(const VORUnicodeString& name, int index,
                                          const VORIIPDAdapter_var& adapter,
                                          VORBaseUnknown_var& planType) {
  return GetPlanTypeUnknowObject(name, index, adapter, planType);
}
