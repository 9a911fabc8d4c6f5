#include "VORSPPCopyServices.h"

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

namespace {

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
    if (a == nullptr || a->father == nullptr || VORIsInside<VORGraphNodeImpl>(t, a))
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
