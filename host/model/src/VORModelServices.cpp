// Static services of the model: planning look-ups, reparenting, flow questions, deep copy and
// removal for copy/cut/paste, and the item bookkeeping of stations and groupings.
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

// ---------------------------------------------------------------- planning

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

// ---------------------------------------------------------------- reparenting and links

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

// ---------------------------------------------------------------- copy / remove

namespace {

bool IsInsideNode(VORGraphNodeImpl* node, VORGraphNodeImpl* ancestor) {
  for (VORGraphNodeImpl* n = node; n != nullptr; n = n->father) {
    if (n == ancestor)
      return true;
  }
  return false;
}

struct Copier {
  VORModelDoor& door;
  std::unordered_map<VORGraphNodeImpl*, VORGraphNodeImpl*> nodes;  // source -> copy

  HRESULT CopyNode(VORGraphNodeImpl* source, VORActivityImpl* father, VORGraphNodeImpl*& copy) {
    VORBaseUnknown_var created;
    HRESULT hr = door.CreateNode(Unk(father), source->lateType.c_str(), created);
    if (FAILED(hr))
      return hr;
    copy = VORImplOf<VORGraphNodeImpl>(created);
    nodes[source] = copy;
    door.SetLabel(created, source->label);
    if (source->hasPosition)
      door.SetPertPosition(created, true, source->x, source->y);
    door.SetPertNodeState(created, source->state);
    door.SetPertNodeSize(created, source->width, source->height);
    VORActivityImpl* a = source->AsActivity();
    if (a == nullptr)
      return S_OK;
    door.SetActivityTime(created, a->time);
    if (VORKindCast<VORStationImpl>(a))
      door.SetStationCycleTime(created, a->stationCycleTime);
    for (auto& [name, value] : a->attributes)
      door.SetUserAttribute(created, VORUnicodeString(name), value);
    for (auto& [name, shown] : a->zitBltShown)
      door.SetZitBltShown(created, VORUnicodeString(name), shown);
    std::unordered_map<VORProductIOImpl*, VORBaseUnknown*> ios;
    std::vector<VORBaseUnknown_var> keep;
    for (auto& io : a->productIOs) {
      VORBaseUnknown_var newIO;
      hr = door.AddProductIO(created, Unk(io->Item()), io->input, newIO);
      if (FAILED(hr))
        return hr;
      ios[io.get()] = newIO.get();
      keep.push_back(newIO);
    }
    for (const VORModelLink& l : a->out) {
      if (l.type == VORILinkableObject::ItemLink)
        hr = door.AssignItem(created, Unk(l.target), l.via ? ios[l.via] : nullptr);
      else if (l.type == VORILinkableObject::ResourceLink)
        hr = door.AssignResource(created, Unk(l.target));
      if (FAILED(hr))
        return hr;
    }
    std::vector<VORGraphNodeImpl*> children;
    for (auto& c : a->children)
      children.push_back(c.get());
    for (VORGraphNodeImpl* c : children) {
      VORGraphNodeImpl* childCopy = nullptr;
      hr = CopyNode(c, copy->AsActivity(), childCopy);
      if (FAILED(hr))
        return hr;
    }
    return CopyFlows(children);
  }

  // Flows among the given (copied) nodes, in creation order.
  HRESULT CopyFlows(const std::vector<VORGraphNodeImpl*>& sources) {
    std::unordered_set<VORGraphNodeImpl*> set(sources.begin(), sources.end());
    std::vector<std::pair<std::uint64_t, std::pair<VORGraphNodeImpl*, VORGraphNodeImpl*>>> flows;
    for (VORGraphNodeImpl* s : sources) {
      for (const VORFlowRef& r : s->next) {
        if (set.count(r.node))
          flows.push_back({r.stamp, {s, r.node}});
      }
    }
    std::sort(flows.begin(), flows.end());
    for (auto& [stamp, f] : flows) {
      HRESULT hr = door.AddFlow(Unk(nodes[f.first]), Unk(nodes[f.second]));
      if (FAILED(hr))
        return hr;
    }
    return S_OK;
  }
};

}  // namespace

bool VORSPPCopyServices::CanPasteInto(const VORListValVORBaseUnknown_var& sources,
                                      VORBaseUnknown* target) {
  auto* t = VORImplOf<VORActivityImpl>(target);
  if (t == nullptr || sources.IsEmpty())
    return false;
  for (const VORBaseUnknown_var& s : sources) {
    auto* a = VORImplOf<VORActivityImpl>(s.get(), t->data);
    if (a == nullptr || a->father == nullptr || IsInsideNode(t, a))
      return false;
  }
  return true;
}

HRESULT VORSPPCopyServices::CopyActivities(const VORListValVORBaseUnknown_var& sources,
                                           VORBaseUnknown* target,
                                           VORListValVORBaseUnknown_var& copies) {
  if (!CanPasteInto(sources, target))
    return E_INVALIDARG;
  auto* t = VORImplOf<VORActivityImpl>(target);
  VORModelDoor& door = t->data->door;
  VORChangeLog local;
  VORChangeLog* outer = door.SetRecorder(&local);
  Copier copier{door, {}};
  std::vector<VORGraphNodeImpl*> tops;
  HRESULT hr = S_OK;
  for (const VORBaseUnknown_var& s : sources) {
    auto* a = VORImplOf<VORActivityImpl>(s.get());
    if (std::find(tops.begin(), tops.end(), a) != tops.end())
      continue;  // listed twice
    VORGraphNodeImpl* copy = nullptr;
    hr = copier.CopyNode(a, t, copy);
    if (FAILED(hr))
      break;
    tops.push_back(a);
  }
  if (SUCCEEDED(hr))
    hr = copier.CopyFlows(tops);
  door.SetRecorder(outer);
  if (FAILED(hr)) {
    door.Undo(local);
    return hr;
  }
  if (outer != nullptr)
    outer->Append(std::move(local));
  for (VORGraphNodeImpl* a : tops)
    copies.Append(VORBaseUnknown_var(Unk(copier.nodes[a])));
  return S_OK;
}

HRESULT VORSPPCopyServices::RemoveActivities(const VORListValVORBaseUnknown_var& activities) {
  std::vector<VORHandle<VORActivityImpl>> todo;
  for (const VORBaseUnknown_var& s : activities) {
    auto* a = VORImplOf<VORActivityImpl>(s.get());
    if (a == nullptr || a->father == nullptr)
      return E_INVALIDARG;
    todo.push_back(VORHandle<VORActivityImpl>(a));
  }
  for (auto& a : todo) {
    // An activity inside another listed one went with it.
    if (a->data != nullptr)
      a->data->door.RemoveNode(Unk(a.get()));
  }
  return S_OK;
}

// ---------------------------------------------------------------- station/grouping items

VORActivityImpl* VORBIWItemInfoImpl::Self() {
  return dynamic_cast<VORActivityImpl*>(this);
}

namespace {
std::vector<VORActivityImpl*> ChildActivities(VORActivityImpl* a) {
  std::vector<VORActivityImpl*> result;
  for (auto& c : a->children) {
    if (VORActivityImpl* ca = c->AsActivity())
      result.push_back(ca);
  }
  return result;
}
void AppendIO(VORListValVORBaseUnknown_var& list, VORProductIOImpl* io) {
  list.Append(VORBaseUnknown_var(static_cast<VORISPPProductIO*>(io)));
}
}  // namespace

HRESULT VORBIWItemInfoImpl::GetFirstItemList(VORListValVORBaseUnknown_var*& items) {
  items = VORNewList();
  for (auto& io : Self()->productIOs) {
    if (!io->input)
      AppendIO(*items, io.get());
  }
  return S_OK;
}

HRESULT VORBIWItemInfoImpl::GetSecondItemList(VORListValVORBaseUnknown_var*& items) {
  items = VORNewList();
  VORActivityImpl* self = Self();
  std::unordered_set<VORModelObject*> consumed;
  auto addConsumed = [&](VORActivityImpl* a) {
    for (auto& io : a->productIOs) {
      if (io->input && io->Item())
        consumed.insert(io->Item());
    }
  };
  addConsumed(self);
  const auto children = ChildActivities(self);
  for (VORActivityImpl* c : children)
    addConsumed(c);
  // What the activity declares itself is in the first list already.
  for (auto& io : self->productIOs) {
    if (!io->input && io->Item())
      consumed.insert(io->Item());
  }
  for (VORActivityImpl* c : children) {
    for (auto& io : c->productIOs) {
      if (!io->input && io->Item() && consumed.insert(io->Item()).second)
        AppendIO(*items, io.get());
    }
  }
  return S_OK;
}

HRESULT VORBIWItemInfoImpl::GetActivityList(VORListValVORBaseUnknown_var*& activities) {
  activities = VORNewList();
  const auto children = ChildActivities(Self());
  if (children.empty() && VORKindCast<VORStationImpl>(Self()))
    activities->Append(VORBaseUnknown_var(Unk(Self())));
  for (VORActivityImpl* c : children)
    activities->Append(VORBaseUnknown_var(Unk(c)));
  return S_OK;
}

HRESULT VORBIWItemInfoImpl::GetCoveredItems(VORListValVORBaseUnknown_var*& items) {
  items = VORNewList();
  VORActivityImpl* self = Self();
  std::unordered_set<VORModelObject*> seen;
  auto add = [&](VORModelObject* item) {
    if (item != nullptr && seen.insert(item).second)
      items->Append(VORBaseUnknown_var(Unk(item)));
  };
  auto children = ChildActivities(self);
  if (children.empty() && VORKindCast<VORStationImpl>(self))
    children.push_back(self);  // the activity list of a station without children
  for (VORActivityImpl* a : children) {
    for (auto& io : a->productIOs) {
      if (!io->input)
        add(io->Item());
    }
  }
  for (auto& io : self->productIOs) {
    if (io->input && io->Item() && self->FindLink(io->Item(), VORILinkableObject::ItemLink))
      add(io->Item());
  }
  return S_OK;
}

HRESULT VORBIWItemInfoImpl::GetConsumedItems(VORListValVORBaseUnknown_var*& items) {
  items = VORNewList();
  std::unordered_set<VORModelObject*> seen;
  std::vector<VORActivityImpl*> all{Self()};
  for (VORActivityImpl* c : ChildActivities(Self()))
    all.push_back(c);
  for (VORActivityImpl* a : all) {
    for (auto& io : a->productIOs) {
      if (io->input && io->Item() && seen.insert(io->Item()).second)
        items->Append(VORBaseUnknown_var(Unk(io->Item())));
    }
  }
  return S_OK;
}

HRESULT VORBIWItemInfoImpl::GetReplaceableProductIOs(VORListValVORBaseUnknown_var*& productIOs) {
  productIOs = VORNewList();
  for (auto& io : Self()->productIOs)
    AppendIO(*productIOs, io.get());
  return S_OK;
}

bool VORBIWItemInfoImpl::IsListedOutput(VORBaseUnknown* productOutput) {
  auto* po = VORImplOf<VORProductIOImpl>(productOutput);
  if (po == nullptr || po->input)
    return false;
  VORListValVORBaseUnknown_var* first = nullptr;
  VORListValVORBaseUnknown_var* second = nullptr;
  GetFirstItemList(first);
  GetSecondItemList(second);
  VORBaseUnknown_var h(static_cast<VORISPPProductIO*>(po));
  const bool listed = first->Locate(h) != 0 || second->Locate(h) != 0;
  delete first;
  delete second;
  return listed;
}

bool VORBIWItemInfoImpl::AcceptsOutputTransfer(VORBaseUnknown* productOutput,
                                               VORBaseUnknown* target) {
  auto* t = VORImplOf<VORActivityImpl>(target);
  VORActivityImpl* self = Self();
  if (t == nullptr || t == self || t->data != self->data || !IsListedOutput(productOutput))
    return false;
  const std::string& type = t->lateType;
  return type == VORModelLateTypes::Station || type == VORModelLateTypes::Grouping ||
         type == VORModelLateTypes::Loading;
}

bool VORBIWItemInfoImpl::IsInHierarchyOf(VORBaseUnknown* target) {
  auto* t = VORImplOf<VORGraphNodeImpl>(target);
  VORActivityImpl* self = Self();
  if (t == nullptr || t->data != self->data)
    return false;
  return IsInsideNode(self, t) || IsInsideNode(t, self);
}
