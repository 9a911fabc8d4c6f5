// The door's items: product inputs and outputs, assignments, products, resources and
// manufacturing assemblies.
#include <algorithm>

#include "VORModelDoorDetail.h"

using namespace VORDoorDetail;

// ---------------------------------------------------------------- product IO

HRESULT VORModelDoor::AddProductIO(VORBaseUnknown* activityObject, VORBaseUnknown* itemObject,
                                   bool input, VORBaseUnknown_var& productIO, const char* id) {
  productIO = nullptr;
  auto* a = VORImplOf<VORActivityImpl>(activityObject, Data());
  VORModelObject* item = ItemOf(itemObject, Data());
  if (a == nullptr || item == nullptr)
    return E_INVALIDARG;
  if (id != nullptr && *id != '\0' && Data()->Find(id) != nullptr)
    return E_INVALIDARG;
  auto io = VORHandle<VORProductIOImpl>::Adopt(new VORProductIOImpl(input));
  Data()->Register(io.get(), id ? id : "");
  io->activity = a;
  AddLink(io.get(), item, VORILinkableObject::IOItemLink);
  a->productIOs.push_back(io);
  productIO = VORBaseUnknown_var(Unk(io.get()));
  Changed();
  VORBaseUnknown_var keep = productIO;
  Record([this, keep] { RemoveProductIO(keep.get()); });
  NotifyActivity(Data(), a, io.get(), SPPProductIOChanged);
  return S_OK;
}

HRESULT VORModelDoor::RemoveProductIO(VORBaseUnknown* productIO) {
  auto* io = VORImplOf<VORProductIOImpl>(productIO, Data());
  if (io == nullptr || io->activity == nullptr)
    return E_INVALIDARG;
  VORHandle<VORProductIOImpl> keep(io);
  VORHandle<VORActivityImpl> a(io->activity);
  auto detached = std::make_shared<Detached>();
  DetachEverything({io}, *detached);
  size_t index = 0;
  while (a->productIOs[index].get() != io)
    ++index;
  a->productIOs.erase(a->productIOs.begin() + static_cast<long>(index));
  const std::string id = io->id;
  Data()->Unregister(io);
  Changed();
  VORDocumentData* data = Data();
  Record([this, data, keep, a, index, detached, id] {
    data->Register(keep.get(), id);
    keep->activity = a.get();
    a->productIOs.insert(a->productIOs.begin() + static_cast<long>(index), keep);
    ReattachEverything(*detached);
    Changed();
    Record([this, keep] { RemoveProductIO(Unk(keep.get())); });
    NotifyActivity(Data(), a.get(), keep.get(), SPPProductIOChanged);
  });
  NotifyActivity(Data(), a.get(), io, SPPProductIOChanged);
  return S_OK;
}

HRESULT VORModelDoor::SetProductIOItem(VORBaseUnknown* productIO, VORBaseUnknown* itemObject) {
  auto* io = VORImplOf<VORProductIOImpl>(productIO, Data());
  VORModelObject* item = ItemOf(itemObject, Data());
  if (io == nullptr || item == nullptr || io->activity == nullptr)
    return E_INVALIDARG;
  VORModelObject* old = io->Item();
  if (old == item)
    return S_FALSE;
  int idx = io->LinkIndex(old, VORILinkableObject::IOItemLink);
  if (idx >= 0)
    DetachLink(io, static_cast<size_t>(idx));
  AddLink(io, item, VORILinkableObject::IOItemLink);
  Changed();
  VORHandle<VORProductIOImpl> keep(io);
  VORHandle<VORModelObject> oldItem(old);
  Record([this, keep, oldItem] { SetProductIOItem(Unk(keep.get()), Unk(oldItem.get())); });
  NotifyActivity(Data(), io->activity, io,
                 io->input ? SPPProductIOChanged : SPPProductOutputChanged);
  return S_OK;
}

// ---------------------------------------------------------------- assignments

HRESULT VORModelDoor::AssignItem(VORBaseUnknown* activityObject, VORBaseUnknown* itemObject,
                                 VORBaseUnknown* productInput) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, Data());
  VORModelObject* item = ItemOf(itemObject, Data());
  if (a == nullptr || item == nullptr)
    return E_INVALIDARG;
  VORProductIOImpl* via = nullptr;
  if (productInput != nullptr) {
    via = VORImplOf<VORProductIOImpl>(productInput, Data());
    if (via == nullptr || via->activity != a || !via->input)
      return E_INVALIDARG;
  }
  if (a->FindLink(item, VORILinkableObject::ItemLink) != nullptr)
    return S_FALSE;
  AddLink(a, item, VORILinkableObject::ItemLink, via);
  Changed();
  VORHandle<VORActivityImpl> keep(a);
  VORHandle<VORModelObject> keepItem(item);
  Record([this, keep, keepItem] { UnassignItem(Unk(keep.get()), Unk(keepItem.get())); });
  NotifyActivity(Data(), a, item, SPPItemAssigned);
  return S_OK;
}

HRESULT VORModelDoor::UnassignItem(VORBaseUnknown* activityObject, VORBaseUnknown* itemObject) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, Data());
  VORModelObject* item = ItemOf(itemObject, Data());
  if (a == nullptr || item == nullptr)
    return E_INVALIDARG;
  int idx = a->LinkIndex(item, VORILinkableObject::ItemLink);
  if (idx < 0)
    return S_FALSE;
  LinkRecord r = DetachLink(a, static_cast<size_t>(idx));
  Changed();
  Record([this, r] {
    ReattachLink(r);
    Changed();
    Record([this, r] { UnassignItem(Unk(r.source.get()), Unk(r.target.get())); });
    NotifyActivity(Data(), static_cast<VORActivityImpl*>(r.source.get()), r.target.get(),
                   SPPItemAssigned);
  });
  NotifyActivity(Data(), a, item, SPPItemUnassigned);
  return S_OK;
}

HRESULT VORModelDoor::AssignResource(VORBaseUnknown* activityObject, VORBaseUnknown* resource) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, Data());
  auto* r = VORImplOf<VORProductImpl>(resource, Data());
  if (a == nullptr || r == nullptr || !r->isResource)
    return E_INVALIDARG;
  if (a->FindLink(r, VORILinkableObject::ResourceLink) != nullptr)
    return S_FALSE;
  AddLink(a, r, VORILinkableObject::ResourceLink);
  Changed();
  VORHandle<VORActivityImpl> keep(a);
  VORHandle<VORProductImpl> keepR(r);
  Record([this, keep, keepR] { UnassignResource(Unk(keep.get()), Unk(keepR.get())); });
  NotifyActivity(Data(), a, r, SPPResourceAssigned);
  return S_OK;
}

HRESULT VORModelDoor::UnassignResource(VORBaseUnknown* activityObject, VORBaseUnknown* resource) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, Data());
  auto* r = VORImplOf<VORProductImpl>(resource, Data());
  if (a == nullptr || r == nullptr)
    return E_INVALIDARG;
  int idx = a->LinkIndex(r, VORILinkableObject::ResourceLink);
  if (idx < 0)
    return S_FALSE;
  LinkRecord rec = DetachLink(a, static_cast<size_t>(idx));
  Changed();
  Record([this, rec] {
    ReattachLink(rec);
    Changed();
    Record([this, rec] { UnassignResource(Unk(rec.source.get()), Unk(rec.target.get())); });
    NotifyActivity(Data(), static_cast<VORActivityImpl*>(rec.source.get()), rec.target.get(),
                   SPPResourceAssigned);
  });
  NotifyActivity(Data(), a, r, SPPResourceUnassigned);
  return S_OK;
}

// ---------------------------------------------------------------- products

HRESULT VORModelDoor::CreateProduct(VORBaseUnknown* fatherObject, const VORUnicodeString& name,
                                    VORBaseUnknown_var& product, const char* id) {
  product = nullptr;
  VORProductImpl* father = nullptr;
  if (fatherObject != nullptr) {
    father = VORImplOf<VORProductImpl>(fatherObject, Data());
    if (father == nullptr)
      return E_INVALIDARG;
  }
  if (id != nullptr && *id != '\0' && Data()->Find(id) != nullptr)
    return E_INVALIDARG;
  auto p = VORHandle<VORProductImpl>::Adopt(new VORProductImpl());
  Data()->Register(p.get(), id ? id : "");
  p->partNumber = name;
  p->father = father;
  (father ? father->children : Data()->rootProducts).push_back(p);
  product = VORBaseUnknown_var(Unk(p.get()));
  Changed();
  VORBaseUnknown_var keep = product;
  Record([this, keep] { RemoveProduct(keep.get()); });
  if (father != nullptr) {
    VORListValVORBaseUnknown_var added;
    added.Append(keep);
    auto n = VORHandle<VORPrdMultiImportNotif>::Adopt(new VORPrdMultiImportNotif(added));
    father->DispatchEvent(VORPrdMultiImportNotif::ClassName(), n.get());
  }
  return S_OK;
}

HRESULT VORModelDoor::RemoveProduct(VORBaseUnknown* productObject) {
  auto* p = VORImplOf<VORProductImpl>(productObject, Data());
  if (p == nullptr)
    return E_INVALIDARG;
  VORHandle<VORProductImpl> keep(p);
  std::vector<VORModelObject*> objects;
  CollectProducts(p, objects);
  // First the references from the process, each through its own door operation.
  for (VORModelObject* q : objects) {
    std::vector<VORModelObject*> sources(q->in.begin(), q->in.end());
    for (VORModelObject* s : sources) {
      if (auto* io = VORKindCast<VORProductIOImpl>(s); io && io->Item() == q) {
        RemoveProductIO(Unk(io));
      } else if (auto* a = VORKindCast<VORActivityImpl>(s)) {
        if (a->FindLink(q, VORILinkableObject::ItemLink))
          UnassignItem(Unk(a), Unk(q));
        if (a->FindLink(q, VORILinkableObject::ResourceLink))
          UnassignResource(Unk(a), Unk(q));
      }
    }
  }
  auto detached = std::make_shared<Detached>();
  DetachEverything(objects, *detached);
  VORHandle<VORProductImpl> father(p->father);
  const int index = p->IndexInFather();
  auto& siblings = father ? father->children : Data()->rootProducts;
  siblings.erase(siblings.begin() + index);
  auto ids = std::make_shared<std::vector<std::pair<VORHandle<VORModelObject>, std::string>>>();
  for (VORModelObject* o : objects) {
    ids->push_back({VORHandle<VORModelObject>(o), o->id});
    Data()->Unregister(o);
  }
  p->father = nullptr;
  Changed();
  VORDocumentData* data = Data();
  Record([this, data, keep, father, index, detached, ids] {
    for (auto& [o, id] : *ids)
      data->Register(o.get(), id);
    keep->father = father.get();
    auto& list = father ? father->children : data->rootProducts;
    list.insert(list.begin() + index, keep);
    ReattachEverything(*detached);
    Changed();
    Record([this, keep] { RemoveProduct(Unk(keep.get())); });
  });
  return S_OK;
}

HRESULT VORModelDoor::ReparentProduct(VORBaseUnknown* productObject, VORBaseUnknown* newFather) {
  auto* p = VORImplOf<VORProductImpl>(productObject, Data());
  auto* f = VORImplOf<VORProductImpl>(newFather, Data());
  if (p == nullptr || f == nullptr || VORIsInside<VORProductImpl>(f, p))
    return E_INVALIDARG;
  if (p->father == f)
    return S_FALSE;
  VORHandle<VORProductImpl> keep(p);
  VORHandle<VORProductImpl> oldFather(p->father);
  const int index = p->IndexInFather();
  auto& siblings = oldFather ? oldFather->children : Data()->rootProducts;
  siblings.erase(siblings.begin() + index);
  p->father = f;
  f->children.push_back(keep);
  Changed();
  VORDocumentData* data = Data();
  Record([this, data, keep, oldFather, index] {
    VORHandle<VORProductImpl> current(keep->father);
    auto& now = current->children;
    now.erase(std::find(now.begin(), now.end(), keep));
    keep->father = oldFather.get();
    auto& list = oldFather ? oldFather->children : data->rootProducts;
    list.insert(list.begin() + index, keep);
    Changed();
    Record([this, keep, current] { ReparentProduct(Unk(keep.get()), Unk(current.get())); });
    NotifyModify(keep.get(), "father");
  });
  NotifyModify(p, "father");
  VORListValVORBaseUnknown_var added;
  added.Append(VORBaseUnknown_var(Unk(p)));
  auto n = VORHandle<VORPrdMultiImportNotif>::Adopt(new VORPrdMultiImportNotif(added));
  f->DispatchEvent(VORPrdMultiImportNotif::ClassName(), n.get());
  return S_OK;
}

HRESULT VORModelDoor::SetPartNumber(VORBaseUnknown* productObject, const VORUnicodeString& name) {
  return SetScalar(VORImplOf<VORProductImpl>(productObject, Data()), &VORProductImpl::partNumber,
                   name, "name", &VORModelDoor::SetPartNumber);
}

HRESULT VORModelDoor::SetAlias(VORBaseUnknown* productObject, const VORUnicodeString& alias) {
  return SetScalar(VORImplOf<VORProductImpl>(productObject, Data()), &VORProductImpl::alias, alias,
                   "alias", &VORModelDoor::SetAlias);
}

HRESULT VORModelDoor::SetShown(VORBaseUnknown* productObject, bool shown) {
  auto* p = VORImplOf<VORProductImpl>(productObject, Data());
  if (p == nullptr)
    return E_INVALIDARG;
  if (p->shown == shown)
    return S_FALSE;
  p->shown = shown;
  Changed();
  VORHandle<VORProductImpl> keep(p);
  Record([this, keep, shown] { SetShown(Unk(keep.get()), !shown); });
  auto n = VORHandle<VORShowNotif>::Adopt(new VORShowNotif(Unk(p), shown));
  for (VORProductImpl* q = p; q != nullptr; q = q->father)
    q->DispatchEvent(VORShowNotif::ClassName(), n.get());
  return S_OK;
}

HRESULT VORModelDoor::SetReferenceProduct(VORBaseUnknown* productObject,
                                          VORBaseUnknown* reference) {
  auto* p = VORImplOf<VORProductImpl>(productObject, Data());
  auto* r = reference ? VORImplOf<VORProductImpl>(reference, Data()) : p;
  if (p == nullptr || r == nullptr)
    return E_INVALIDARG;
  if (r != p && r->Reference() != r)
    return E_INVALIDARG;  // references do not chain
  VORProductImpl* old = p->Reference();
  if (old == r)
    return S_FALSE;
  int idx = p->LinkIndex(old, VORILinkableObject::ReferenceLink);
  if (idx >= 0)
    DetachLink(p, static_cast<size_t>(idx));
  if (r != p)
    AddLink(p, r, VORILinkableObject::ReferenceLink);
  Changed();
  VORHandle<VORProductImpl> keep(p), keepOld(old);
  Record([this, keep, keepOld] { SetReferenceProduct(Unk(keep.get()), Unk(keepOld.get())); });
  NotifyModify(p, "reference");
  return S_OK;
}

HRESULT VORModelDoor::MakeResource(VORBaseUnknown* productObject,
                                   const VORUnicodeString& resourceClass,
                                   const VORUnicodeString& planType) {
  auto* p = VORImplOf<VORProductImpl>(productObject, Data());
  if (p == nullptr)
    return E_INVALIDARG;
  if (p->isResource)
    return S_FALSE;
  p->isResource = true;
  p->resourceClass = resourceClass.IsEmpty() ? VORUnicodeString("Resource") : resourceClass;
  p->planType = planType;
  Changed();
  VORHandle<VORProductImpl> keep(p);
  VORDocumentData* data = Data();
  Record([this, data, keep, resourceClass, planType] {
    // Back to a plain product: nothing may use it as a resource any more.
    std::vector<VORModelObject*> sources(keep->in.begin(), keep->in.end());
    for (VORModelObject* s : sources) {
      if (s->FindLink(keep.get(), VORILinkableObject::ResourceLink))
        UnassignResource(Unk(s), Unk(keep.get()));
    }
    keep->isResource = false;
    keep->resourceClass = VORUnicodeString();
    keep->planType = VORUnicodeString();
    Changed();
    Record([this, keep, resourceClass, planType] {
      MakeResource(Unk(keep.get()), resourceClass, planType);
    });
    NotifyModify(keep.get(), "resource");
    (void)data;
  });
  NotifyModify(p, "resource");
  return S_OK;
}

HRESULT VORModelDoor::SetResourcePlanType(VORBaseUnknown* resource,
                                          const VORUnicodeString& planType) {
  auto* p = VORImplOf<VORProductImpl>(resource, Data());
  if (p != nullptr && !p->isResource)
    return E_INVALIDARG;
  return SetScalar(p, &VORProductImpl::planType, planType, "plantype",
                   &VORModelDoor::SetResourcePlanType);
}

// ---------------------------------------------------------------- assemblies

HRESULT VORModelDoor::CreateMfgAssembly(const VORUnicodeString& name, VORBaseUnknown_var& assembly,
                                        const char* id) {
  assembly = nullptr;
  if (id != nullptr && *id != '\0' && Data()->Find(id) != nullptr)
    return E_INVALIDARG;
  auto m = VORHandle<VORMfgAssemblyImpl>::Adopt(new VORMfgAssemblyImpl());
  Data()->Register(m.get(), id ? id : "");
  m->name = name;
  Data()->assemblies.push_back(m);
  assembly = VORBaseUnknown_var(Unk(m.get()));
  Changed();
  VORBaseUnknown_var keep = assembly;
  Record([this, keep] { DeleteMfgAssembly(keep.get()); });
  NotifyMfg(Data(), m.get(), "MACreated");
  return S_OK;
}

HRESULT VORModelDoor::DeleteMfgAssembly(VORBaseUnknown* assemblyObject) {
  auto* m = VORImplOf<VORMfgAssemblyImpl>(assemblyObject, Data());
  if (m == nullptr)
    return E_INVALIDARG;
  VORHandle<VORMfgAssemblyImpl> keep(m);
  NotifyMfg(Data(), m, "MADeleting");
  if (m->data == nullptr)
    return S_OK;  // a listener deleted it
  std::vector<VORModelObject*> sources(m->in.begin(), m->in.end());
  for (VORModelObject* s : sources) {
    if (auto* io = VORKindCast<VORProductIOImpl>(s); io && io->Item() == m)
      RemoveProductIO(Unk(io));
    else if (auto* a = VORKindCast<VORActivityImpl>(s);
             a && a->FindLink(m, VORILinkableObject::ItemLink))
      UnassignItem(Unk(a), Unk(m));
  }
  auto detached = std::make_shared<Detached>();
  DetachEverything({m}, *detached);
  auto& list = Data()->assemblies;
  const long index = std::find(list.begin(), list.end(), keep) - list.begin();
  list.erase(list.begin() + index);
  const std::string id = m->id;
  Data()->Unregister(m);
  Changed();
  VORDocumentData* data = Data();
  Record([this, data, keep, index, detached, id] {
    data->Register(keep.get(), id);
    data->assemblies.insert(data->assemblies.begin() + index, keep);
    ReattachEverything(*detached);
    Changed();
    Record([this, keep] { DeleteMfgAssembly(Unk(keep.get())); });
    NotifyMfg(data, keep.get(), "MACreated");
  });
  return S_OK;
}

HRESULT VORModelDoor::AddComponent(VORBaseUnknown* assemblyObject, VORBaseUnknown* component) {
  auto* m = VORImplOf<VORMfgAssemblyImpl>(assemblyObject, Data());
  VORModelObject* c = ItemOf(component, Data());
  if (m == nullptr || c == nullptr || ReachesComponent(c, m))
    return E_INVALIDARG;
  if (m->FindLink(c, VORILinkableObject::ComponentLink) != nullptr)
    return S_FALSE;
  AddLink(m, c, VORILinkableObject::ComponentLink);
  Changed();
  VORHandle<VORMfgAssemblyImpl> keep(m);
  VORHandle<VORModelObject> keepC(c);
  Record([this, keep, keepC] { RemoveComponent(Unk(keep.get()), Unk(keepC.get())); });
  NotifyMfg(Data(), m, "MAModified");
  return S_OK;
}

HRESULT VORModelDoor::RemoveComponent(VORBaseUnknown* assemblyObject, VORBaseUnknown* component) {
  auto* m = VORImplOf<VORMfgAssemblyImpl>(assemblyObject, Data());
  VORModelObject* c = ItemOf(component, Data());
  if (m == nullptr || c == nullptr)
    return E_INVALIDARG;
  int idx = m->LinkIndex(c, VORILinkableObject::ComponentLink);
  if (idx < 0)
    return S_FALSE;
  LinkRecord r = DetachLink(m, static_cast<size_t>(idx));
  Changed();
  VORDocumentData* data = Data();
  Record([this, data, r] {
    ReattachLink(r);
    Changed();
    Record([this, r] { RemoveComponent(Unk(r.source.get()), Unk(r.target.get())); });
    NotifyMfg(data, static_cast<VORMfgAssemblyImpl*>(r.source.get()), "MAModified");
  });
  NotifyMfg(Data(), m, "MAModified");
  return S_OK;
}
