#include "VORSPPGroupingServices.h"

#include <string>

#include "VORModelObjects.h"

HRESULT VORSPPGroupingServices::CreateActivity(VORBaseUnknown* father, const char* type,
                                               VORBaseUnknown_var& activity) {
  activity = nullptr;
  auto* f = VORImplOf<VORActivityImpl>(father);
  if (f == nullptr || type == nullptr || !VORModelLateTypes::IsActivityType(type))
    return E_INVALIDARG;
  VORModelDoor& door = f->data->door;
  HRESULT hr = door.CreateNode(father, type, activity);
  if (FAILED(hr) || std::string(type) != VORModelLateTypes::Grouping)
    return hr;
  VORBaseUnknown_var start;
  VORBaseUnknown_var stop;
  door.CreateNode(activity, VORModelLateTypes::Start, start);
  door.CreateNode(activity, VORModelLateTypes::Stop, stop);
  return S_OK;
}
