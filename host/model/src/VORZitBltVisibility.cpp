// The ZitBlt visibility recorded on activities: the door's change and the activity's view of it.
#include "VORIZitBltVisibility.h"
#include "VORModelDoor.h"
#include "VORModelObjects.h"

HRESULT VORModelDoor::SetZitBltShown(VORBaseUnknown* activityObject, const VORUnicodeString& name,
                                     std::optional<bool> shown) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, &_document->Data());
  if (a == nullptr || name.IsEmpty())
    return E_INVALIDARG;
  const std::string key = name.ConvertToUTF8();
  auto it = a->zitBltShown.find(key);
  const std::optional<bool> old =
      it == a->zitBltShown.end() ? std::nullopt : std::optional<bool>(it->second);
  if (old == shown)
    return S_OK;
  if (shown.has_value())
    a->zitBltShown[key] = *shown;
  else
    a->zitBltShown.erase(it);
  Changed();
  VORHandle<VORActivityImpl> keep(a);
  Record([this, keep, name, old] {
    SetZitBltShown(static_cast<VORISPPActivity*>(keep.get()), name, old);
  });
  auto modify = VORHandle<VORModify>::Adopt(
      new VORModify(static_cast<VORISPPActivity*>(a), VORBaseUnknown::ClassId(), 1, "zitblt"));
  a->DispatchEvent(VORModify::ClassName(), modify.get());
  return S_OK;
}

HRESULT VORActivityImpl::GetZitBltShown(const VORUnicodeString& name, bool& shown) {
  if (zitBltShown.empty())
    return S_FALSE;  // most activities record nothing: no key to build
  auto it = zitBltShown.find(name.ConvertToUTF8());
  if (it == zitBltShown.end())
    return S_FALSE;
  shown = it->second;
  return S_OK;
}

HRESULT VORActivityImpl::SetZitBltShown(const VORUnicodeString& name, bool shown) {
  return data != nullptr
             ? data->door.SetZitBltShown(static_cast<VORISPPActivity*>(this), name, shown)
             : E_FAIL;
}

HRESULT VORActivityImpl::ForgetZitBltShown(const VORUnicodeString& name) {
  return data != nullptr
             ? data->door.SetZitBltShown(static_cast<VORISPPActivity*>(this), name, std::nullopt)
             : E_FAIL;
}

HRESULT VORActivityImpl::GetZitBltShownNames(VORListValVORUnicodeString& names) {
  for (const auto& entry : zitBltShown)
    names.Append(VORUnicodeString(entry.first));
  return S_OK;
}
