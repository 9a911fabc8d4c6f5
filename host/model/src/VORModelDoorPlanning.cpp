// The door's planning data (hub mode): environment, plan types, their relations, hub
// attributes.
#include <algorithm>

#include "VORModelDoorDetail.h"

using namespace VORDoorDetail;

// ---------------------------------------------------------------- planning data

HRESULT VORModelDoor::SetEnvironmentName(const VORUnicodeString& name) {
  const std::string value = name.ConvertToUTF8();
  if (Data()->environment == value)
    return S_FALSE;
  const std::string old = Data()->environment;
  Data()->environment = value;
  Changed();
  Record([this, old] { SetEnvironmentName(VORUnicodeString(old)); });
  return S_OK;
}

HRESULT VORModelDoor::DefinePlanType(const VORUnicodeString& name, VORBaseUnknown_var& planType,
                                     const char* id) {
  planType = nullptr;
  if (name.IsEmpty() || (id != nullptr && *id != '\0' && Data()->Find(id) != nullptr))
    return E_INVALIDARG;
  auto t = VORHandle<VORPlanTypeImpl>::Adopt(new VORPlanTypeImpl());
  Data()->Register(t.get(), id ? id : "");
  t->attributes[{"", "name"}] = name;
  Data()->planTypes.push_back(t);
  planType = VORBaseUnknown_var(Unk(t.get()));
  Changed();
  VORDocumentData* data = Data();
  Record([this, data, t] {
    auto detached = std::make_shared<Detached>();
    DetachEverything({t.get()}, *detached);
    auto& list = data->planTypes;
    const long index = std::find(list.begin(), list.end(), t) - list.begin();
    list.erase(list.begin() + index);
    const std::string tid = t->id;
    data->Unregister(t.get());
    Changed();
    Record([this, data, t, index, detached, tid] {
      data->Register(t.get(), tid);
      data->planTypes.insert(data->planTypes.begin() + index, t);
      ReattachEverything(*detached);
      Changed();
    });
  });
  return S_OK;
}

HRESULT VORModelDoor::SetPlanTypeAttribute(VORBaseUnknown* planType, const VORUnicodeString& key,
                                           const VORUnicodeString& name,
                                           const VORUnicodeString& value) {
  auto* t = VORImplOf<VORPlanTypeImpl>(planType, Data());
  if (t == nullptr || name.IsEmpty())
    return E_INVALIDARG;
  const auto k = std::make_pair(key.ConvertToUTF8(), name.ConvertToUTF8());
  auto it = t->attributes.find(k);
  const bool had = it != t->attributes.end();
  const VORUnicodeString old = had ? it->second : VORUnicodeString();
  if (had && old == value)
    return S_FALSE;
  t->attributes[k] = value;
  Changed();
  VORHandle<VORPlanTypeImpl> keep(t);
  Record([this, keep, k, had, old, key, name] {
    if (had) {
      SetPlanTypeAttribute(Unk(keep.get()), key, name, old);
    } else {
      VORUnicodeString now = keep->attributes[k];
      keep->attributes.erase(k);
      Changed();
      Record(
          [this, keep, key, name, now] { SetPlanTypeAttribute(Unk(keep.get()), key, name, now); });
    }
  });
  return S_OK;
}

HRESULT VORModelDoor::SetPlanTypeBase(VORBaseUnknown* planType, VORBaseUnknown* base) {
  auto* t = VORImplOf<VORPlanTypeImpl>(planType, Data());
  auto* b = base ? VORImplOf<VORPlanTypeImpl>(base, Data()) : nullptr;
  if (t == nullptr || (base != nullptr && b == nullptr))
    return E_INVALIDARG;
  for (VORPlanTypeImpl* p = b; p != nullptr; p = p->Base()) {
    if (p == t)
      return E_INVALIDARG;
  }
  VORPlanTypeImpl* old = t->Base();
  if (old == b)
    return S_FALSE;
  int idx = t->LinkIndex(old, VORPlanTypeImpl::BaseLink);
  if (idx >= 0)
    DetachLink(t, static_cast<size_t>(idx));
  if (b != nullptr)
    AddLink(t, b, VORPlanTypeImpl::BaseLink);
  Changed();
  VORHandle<VORPlanTypeImpl> keep(t), keepOld(old);
  Record([this, keep, keepOld] {
    SetPlanTypeBase(Unk(keep.get()), keepOld ? Unk(keepOld.get()) : nullptr);
  });
  return S_OK;
}

HRESULT VORModelDoor::AddPlanTypeRelation(VORBaseUnknown* fromObject,
                                          const VORUnicodeString& relation,
                                          VORBaseUnknown* toObject) {
  auto* from = VORImplOf<VORPlanTypeImpl>(fromObject, Data());
  auto* to = VORImplOf<VORPlanTypeImpl>(toObject, Data());
  const std::string rel = relation.ConvertToUTF8();
  if (from == nullptr || to == nullptr || rel.empty() || rel == VORPlanTypeImpl::BaseLink)
    return E_INVALIDARG;
  if (from->FindLink(to, rel.c_str()) != nullptr)
    return S_FALSE;
  AddLink(from, to, rel);
  Changed();
  VORHandle<VORPlanTypeImpl> f(from), t(to);
  Record([this, f, t, relation] { RemovePlanTypeRelation(Unk(f.get()), relation, Unk(t.get())); });
  return S_OK;
}

HRESULT VORModelDoor::RemovePlanTypeRelation(VORBaseUnknown* fromObject,
                                             const VORUnicodeString& relation,
                                             VORBaseUnknown* toObject) {
  auto* from = VORImplOf<VORPlanTypeImpl>(fromObject, Data());
  auto* to = VORImplOf<VORPlanTypeImpl>(toObject, Data());
  if (from == nullptr || to == nullptr)
    return E_INVALIDARG;
  int idx = from->LinkIndex(to, relation.ConvertToUTF8().c_str());
  if (idx < 0)
    return S_FALSE;
  LinkRecord r = DetachLink(from, static_cast<size_t>(idx));
  Changed();
  Record([this, r, relation] {
    ReattachLink(r);
    Changed();
    Record([this, r, relation] {
      RemovePlanTypeRelation(Unk(r.source.get()), relation, Unk(r.target.get()));
    });
  });
  return S_OK;
}

HRESULT VORModelDoor::SetHubAttribute(VORBaseUnknown* object, const VORUnicodeString& name,
                                      const VORAttributeValue& value) {
  auto* o = VORImplOf<VORModelObject>(object, Data());
  if (o == nullptr || name.IsEmpty() || !IsFinite(value))
    return E_INVALIDARG;
  auto& records = Data()->hubObjects;
  auto it = records.find(o->id);
  const bool hadRecord = it != records.end();
  if (!hadRecord) {
    auto h = VORHandle<VORHubObjectImpl>::Adopt(new VORHubObjectImpl());
    h->objectId = o->id;
    it = records.emplace(o->id, h).first;
  }
  const std::string key = name.ConvertToUTF8();
  auto& attrs = it->second->attributes;
  auto a = attrs.find(key);
  VORAttributeValue old = a == attrs.end() ? VORAttributeValue{} : a->second;
  if (value.type == VORAttributeNone)
    attrs.erase(key);
  else
    attrs[key] = value;
  Changed();
  VORHandle<VORModelObject> keep(o);
  VORDocumentData* data = Data();
  Record([this, data, keep, name, old, hadRecord] {
    SetHubAttribute(Unk(keep.get()), name, old);
    if (!hadRecord) {
      auto found = data->hubObjects.find(keep->id);
      if (found != data->hubObjects.end() && found->second->attributes.empty())
        data->hubObjects.erase(found);
    }
  });
  return S_OK;
}

HRESULT VORModelDoor::DeleteHubObject(VORBaseUnknown* object) {
  auto* h = object ? dynamic_cast<VORHubObjectImpl*>(object->GetIdentity()) : nullptr;
  if (h == nullptr)
    return E_INVALIDARG;
  auto it = Data()->hubObjects.find(h->objectId);
  if (it == Data()->hubObjects.end() || it->second.get() != h)
    return S_FALSE;
  VORHandle<VORHubObjectImpl> keep(h);
  Data()->hubObjects.erase(it);
  Changed();
  VORDocumentData* data = Data();
  Record([this, data, keep] {
    data->hubObjects[keep->objectId] = keep;
    Changed();
    Record([this, keep] { DeleteHubObject(keep.get()); });
  });
  return S_OK;
}
