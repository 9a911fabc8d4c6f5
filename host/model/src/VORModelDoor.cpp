// The one door for model changes: validation, the change itself, the recorded inverse and the
// notifications, in that order.
#include "VORModelDoor.h"

#include <algorithm>
#include <functional>
#include <unordered_set>

#include "VORLateTypes.h"
#include "VORModelObjects.h"

namespace {

VORBaseUnknown* Unk(VORModelObject* o) {
  return static_cast<VORISpecObject*>(o);
}

// Emits an activity notification on the root's tree publisher (views-change event) and, when
// the father is another activity, on the father's own publisher.
void NotifyActivity(VORDocumentData* data, VORActivityImpl* father, VORModelObject* son,
                    SPPModifyKind kind) {
  if (father == nullptr || !data->root)
    return;
  auto n = VORHandle<VORSPPActivityNotification>::Adopt(
      new VORSPPActivityNotification(Unk(father), son ? Unk(son) : nullptr, kind));
  const char* event = VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE();
  VORRootImpl* root = data->root.get();
  root->DispatchEvent(event, n.get());
  if (father != root)
    father->DispatchEvent(event, n.get());
}

void NotifyModify(VORModelObject* object, const char* what) {
  auto n =
      VORHandle<VORModify>::Adopt(new VORModify(Unk(object), VORBaseUnknown::ClassId(), 1, what));
  object->DispatchEvent(VORModify::ClassName(), n.get());
}

void NotifyMfg(VORDocumentData* data, VORMfgAssemblyImpl* assembly, const char* event) {
  auto n = VORHandle<QELMfgUpdateNotification>::Adopt(
      new QELMfgUpdateNotification(Unk(assembly), event));
  VOREventPublisher* p = data->bomContainer->GetEventPublisher();
  if (p->CallbackCount() > 0)
    p->Dispatch(QELMfgNotificationDispatcher::GetMfgModified(), n.get());
}

// A removed link with the positions it had at both ends.
struct LinkRecord {
  VORHandle<VORModelObject> source;
  VORHandle<VORModelObject> target;
  std::string type;
  VORHandle<VORProductIOImpl> via;
  size_t outIndex;
  size_t inIndex;
};

size_t InIndexOf(VORModelObject* target, VORModelObject* source, size_t occurrence) {
  size_t seen = 0;
  for (size_t i = 0; i < target->in.size(); ++i) {
    if (target->in[i] == source && seen++ == occurrence)
      return i;
  }
  return target->in.size();
}

LinkRecord DetachLink(VORModelObject* source, size_t outIndex) {
  VORModelLink l = source->out[outIndex];
  // Which of source's links to target this is, to find the matching entry of target->in.
  size_t occurrence = 0;
  for (size_t i = 0; i < outIndex; ++i) {
    if (source->out[i].target == l.target)
      ++occurrence;
  }
  size_t inIndex = InIndexOf(l.target, source, occurrence);
  source->out.erase(source->out.begin() + static_cast<long>(outIndex));
  if (inIndex < l.target->in.size())
    l.target->in.erase(l.target->in.begin() + static_cast<long>(inIndex));
  return {VORHandle<VORModelObject>(source),
          VORHandle<VORModelObject>(l.target),
          l.type,
          VORHandle<VORProductIOImpl>(l.via),
          outIndex,
          inIndex};
}

void ReattachLink(const LinkRecord& r) {
  VORModelObject* s = r.source.get();
  VORModelObject* t = r.target.get();
  s->out.insert(s->out.begin() + static_cast<long>(std::min(r.outIndex, s->out.size())),
                VORModelLink{t, r.type, r.via.get()});
  t->in.insert(t->in.begin() + static_cast<long>(std::min(r.inIndex, t->in.size())), s);
}

void AddLink(VORModelObject* source, VORModelObject* target, const std::string& type,
             VORProductIOImpl* via = nullptr) {
  source->out.push_back({target, type, via});
  target->in.push_back(source);
}

struct FlowRecord {
  VORHandle<VORGraphNodeImpl> from;
  VORHandle<VORGraphNodeImpl> to;
  std::uint64_t stamp;
  size_t nextIndex;
  size_t prevIndex;
};

size_t FindFlow(const std::vector<VORFlowRef>& refs, const VORGraphNodeImpl* node) {
  for (size_t i = 0; i < refs.size(); ++i) {
    if (refs[i].node == node)
      return i;
  }
  return refs.size();
}

FlowRecord DetachFlow(VORGraphNodeImpl* from, VORGraphNodeImpl* to) {
  size_t ni = FindFlow(from->next, to);
  size_t pi = FindFlow(to->previous, from);
  std::uint64_t stamp = from->next[ni].stamp;
  from->next.erase(from->next.begin() + static_cast<long>(ni));
  to->previous.erase(to->previous.begin() + static_cast<long>(pi));
  return {VORHandle<VORGraphNodeImpl>(from), VORHandle<VORGraphNodeImpl>(to), stamp, ni, pi};
}

void ReattachFlow(const FlowRecord& r) {
  auto& n = r.from->next;
  auto& p = r.to->previous;
  n.insert(n.begin() + static_cast<long>(std::min(r.nextIndex, n.size())), {r.to.get(), r.stamp});
  p.insert(p.begin() + static_cast<long>(std::min(r.prevIndex, p.size())), {r.from.get(), r.stamp});
}

// Objects of a graph-node subtree: nodes (pre-order) and their product IOs.
void CollectSubtree(VORGraphNodeImpl* node, std::vector<VORModelObject*>& objects) {
  objects.push_back(node);
  if (VORActivityImpl* a = node->AsActivity()) {
    for (auto& io : a->productIOs)
      objects.push_back(io.get());
    for (auto& c : a->children)
      CollectSubtree(c.get(), objects);
  }
}

void CollectProducts(VORProductImpl* product, std::vector<VORProductImpl*>& products) {
  products.push_back(product);
  for (auto& c : product->children)
    CollectProducts(c.get(), products);
}

// Detaches every link and flow touching the objects (links among them too), newest position
// last, so that replaying the records backwards restores every index.
struct Detached {
  std::vector<LinkRecord> links;
  std::vector<FlowRecord> flows;
  // Item assignments that used a removed product input: (source activity, index, input).
  std::vector<std::pair<VORHandle<VORModelObject>, std::pair<size_t, VORHandle<VORProductIOImpl>>>>
      vias;
};

void DetachEverything(const std::vector<VORModelObject*>& objects, Detached& d) {
  for (VORModelObject* o : objects) {
    if (auto* io = VORKindCast<VORProductIOImpl>(o); io != nullptr && io->activity) {
      // Assignments made through this input keep the item but lose the input.
      VORActivityImpl* a = io->activity;
      for (size_t i = 0; i < a->out.size(); ++i) {
        if (a->out[i].via == io) {
          d.vias.push_back({VORHandle<VORModelObject>(a), {i, VORHandle<VORProductIOImpl>(io)}});
          a->out[i].via = nullptr;
        }
      }
    }
    while (!o->out.empty())
      d.links.push_back(DetachLink(o, o->out.size() - 1));
    while (!o->in.empty()) {
      VORModelObject* source = o->in.back();
      int idx = -1;
      for (int i = static_cast<int>(source->out.size()) - 1; i >= 0; --i) {
        if (source->out[static_cast<size_t>(i)].target == o) {
          idx = i;
          break;
        }
      }
      d.links.push_back(DetachLink(source, static_cast<size_t>(idx)));
    }
    if (auto* n = VORKindCast<VORGraphNodeImpl>(o)) {
      while (!n->next.empty())
        d.flows.push_back(DetachFlow(n, n->next.back().node));
      while (!n->previous.empty())
        d.flows.push_back(DetachFlow(n->previous.back().node, n));
    }
  }
}

void ReattachEverything(const Detached& d) {
  for (auto it = d.flows.rbegin(); it != d.flows.rend(); ++it)
    ReattachFlow(*it);
  for (auto it = d.links.rbegin(); it != d.links.rend(); ++it)
    ReattachLink(*it);
  for (auto it = d.vias.rbegin(); it != d.vias.rend(); ++it)
    it->first->out[it->second.first].via = it->second.second.get();
}

VORGraphNodeImpl* MakeNode(const std::string& type) {
  using namespace VORModelLateTypes;
  if (type == Station)
    return new VORStationImpl(type);
  if (type == Grouping)
    return new VORGroupingImpl(type);
  if (type == Root)
    return new VORRootImpl(type);
  if (IsControlNodeType(type))
    return new VORControlNodeImpl(type);
  return new VORActivityImpl(type);
}

bool IsInside(VORProductImpl* product, VORProductImpl* ancestor) {
  for (VORProductImpl* p = product; p != nullptr; p = p->father) {
    if (p == ancestor)
      return true;
  }
  return false;
}

// True when target is component (directly or not) of from.
bool ReachesComponent(VORModelObject* from, VORModelObject* target) {
  std::vector<VORModelObject*> stack{from};
  std::unordered_set<VORModelObject*> seen;
  while (!stack.empty()) {
    VORModelObject* o = stack.back();
    stack.pop_back();
    if (o == target)
      return true;
    if (!seen.insert(o).second)
      continue;
    for (VORModelObject* t : o->Targets(VORILinkableObject::ComponentLink))
      stack.push_back(t);
  }
  return false;
}

}  // namespace

// Gives the door's private helpers to this file only.
struct VORDoorAccess {
  static void Record(VORModelDoor& door, std::function<void()> inverse) {
    door.Record(std::move(inverse));
  }
};

VORChangeLog* VORModelDoor::SetRecorder(VORChangeLog* log) {
  return std::exchange(_recorder, log);
}

void VORModelDoor::Record(std::function<void()> inverse) {
  if (_recorder != nullptr)
    _recorder->_inverses.push_back(std::move(inverse));
}

void VORModelDoor::Changed() {
  ++_changes;
  _document->Data().modified = true;
}

void VORModelDoor::Undo(VORChangeLog& log, VORChangeLog* redo) {
  std::vector<std::function<void()>> inverses;
  inverses.swap(log._inverses);
  VORChangeLog* previous = SetRecorder(redo);
  for (auto it = inverses.rbegin(); it != inverses.rend(); ++it)
    (*it)();
  SetRecorder(previous);
}

#define DATA (&_document->Data())

// ---------------------------------------------------------------- graph nodes

HRESULT VORModelDoor::CreateNode(VORBaseUnknown* fatherObject, const char* type,
                                 VORBaseUnknown_var& node, int position, const char* id) {
  node = nullptr;
  auto* father = VORImplOf<VORActivityImpl>(fatherObject, DATA);
  if (father == nullptr || type == nullptr)
    return E_INVALIDARG;
  const std::string t = type;
  if (t == VORModelLateTypes::Root ||
      !(VORModelLateTypes::IsActivityType(t) || VORModelLateTypes::IsControlNodeType(t)))
    return E_INVALIDARG;
  if (id != nullptr && *id != '\0' && DATA->Find(id) != nullptr)
    return E_INVALIDARG;
  const size_t count = father->children.size();
  size_t index = (position <= 0 || static_cast<size_t>(position) > count + 1)
                     ? count
                     : static_cast<size_t>(position - 1);
  auto created = VORHandle<VORGraphNodeImpl>::Adopt(MakeNode(t));
  DATA->Register(created.get(), id ? id : "");
  created->father = father;
  if (VORModelLateTypes::IsControlNodeType(t))
    created->label = VORUnicodeString(t);
  father->children.insert(father->children.begin() + static_cast<long>(index), created);
  node = VORBaseUnknown_var(Unk(created.get()));
  Changed();
  VORBaseUnknown_var keep = node;
  Record([this, keep] { RemoveNode(keep.get()); });
  NotifyActivity(DATA, father, created.get(), SPPChildActivityChanged);
  return S_OK;
}

HRESULT VORModelDoor::RemoveNode(VORBaseUnknown* nodeObject) {
  auto* node = VORImplOf<VORGraphNodeImpl>(nodeObject, DATA);
  if (node == nullptr || node->father == nullptr)
    return E_INVALIDARG;
  VORHandle<VORGraphNodeImpl> keep(node);
  VORHandle<VORActivityImpl> father(node->father);
  std::vector<VORModelObject*> objects;
  CollectSubtree(node, objects);
  auto detached = std::make_shared<Detached>();
  DetachEverything(objects, *detached);
  const int index = node->IndexInFather();
  father->children.erase(father->children.begin() + index);
  for (VORModelObject* o : objects)
    DATA->Unregister(o);
  node->father = nullptr;
  Changed();
  VORDocumentData* data = DATA;
  auto ids = std::make_shared<std::vector<std::pair<VORHandle<VORModelObject>, std::string>>>();
  for (VORModelObject* o : objects)
    ids->push_back({VORHandle<VORModelObject>(o), o->id});
  Record([this, data, keep, father, index, detached, ids] {
    for (auto& [o, id] : *ids)
      data->Register(o.get(), id);
    keep->father = father.get();
    father->children.insert(father->children.begin() + index, keep);
    ReattachEverything(*detached);
    Changed();
    Record([this, keep] { RemoveNode(Unk(keep.get())); });
    NotifyActivity(DATA, father.get(), keep.get(), SPPChildActivityChanged);
  });
  NotifyActivity(DATA, father.get(), node, SPPChildActivityChanged);
  if (VORActivityImpl* a = node->AsActivity())
    NotifyActivity(DATA, a, a, SPPActivityDeleted);
  return S_OK;
}

HRESULT VORModelDoor::AddFlow(VORBaseUnknown* fromObject, VORBaseUnknown* toObject) {
  auto* from = VORImplOf<VORGraphNodeImpl>(fromObject, DATA);
  auto* to = VORImplOf<VORGraphNodeImpl>(toObject, DATA);
  if (from == nullptr || to == nullptr || from == to || from->father == nullptr ||
      from->father != to->father)
    return E_INVALIDARG;
  if (FindFlow(from->next, to) != from->next.size())
    return S_FALSE;
  const std::uint64_t stamp = DATA->nextFlowStamp++;
  from->next.push_back({to, stamp});
  to->previous.push_back({from, stamp});
  Changed();
  VORHandle<VORGraphNodeImpl> f(from), t(to);
  Record([this, f, t] { RemoveFlow(Unk(f.get()), Unk(t.get())); });
  NotifyModify(from, "flow");
  NotifyModify(to, "flow");
  return S_OK;
}

HRESULT VORModelDoor::RemoveFlow(VORBaseUnknown* fromObject, VORBaseUnknown* toObject) {
  auto* from = VORImplOf<VORGraphNodeImpl>(fromObject, DATA);
  auto* to = VORImplOf<VORGraphNodeImpl>(toObject, DATA);
  if (from == nullptr || to == nullptr)
    return E_INVALIDARG;
  if (FindFlow(from->next, to) == from->next.size())
    return S_FALSE;
  FlowRecord r = DetachFlow(from, to);
  Changed();
  Record([this, r] {
    ReattachFlow(r);
    Changed();
    Record([this, r] { RemoveFlow(Unk(r.from.get()), Unk(r.to.get())); });
    NotifyModify(r.from.get(), "flow");
    NotifyModify(r.to.get(), "flow");
  });
  NotifyModify(from, "flow");
  NotifyModify(to, "flow");
  return S_OK;
}

namespace {
// Sets a value with undo through the door, notifying VORModify(what).
template <class Object, class Value>
HRESULT SetValue(VORModelDoor& door, Object* object, Value Object::*field, const Value& value,
                 const char* what, std::function<HRESULT(const Value&)> again) {
  if (object->*field == value)
    return S_FALSE;
  Value old = object->*field;
  object->*field = value;
  VORDoorAccess::Record(door, [again, old] { again(old); });
  NotifyModify(object, what);
  return S_OK;
}
}  // namespace

HRESULT VORModelDoor::SetLabel(VORBaseUnknown* nodeObject, const VORUnicodeString& label) {
  auto* node = VORImplOf<VORGraphNodeImpl>(nodeObject, DATA);
  if (node == nullptr)
    return E_INVALIDARG;
  VORHandle<VORGraphNodeImpl> keep(node);
  HRESULT hr = SetValue<VORGraphNodeImpl, VORUnicodeString>(
      *this, node, &VORGraphNodeImpl::label, label, "label",
      [this, keep](const VORUnicodeString& v) { return SetLabel(Unk(keep.get()), v); });
  if (hr == S_OK)
    Changed();
  return SUCCEEDED(hr) ? S_OK : hr;
}

HRESULT VORModelDoor::SetActivityTime(VORBaseUnknown* activityObject, double time) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, DATA);
  if (a == nullptr)
    return E_INVALIDARG;
  VORHandle<VORActivityImpl> keep(a);
  HRESULT hr = SetValue<VORActivityImpl, double>(
      *this, a, &VORActivityImpl::time, time, "time",
      [this, keep](const double& v) { return SetActivityTime(Unk(keep.get()), v); });
  if (hr == S_OK)
    Changed();
  return SUCCEEDED(hr) ? S_OK : hr;
}

HRESULT VORModelDoor::SetStationCycleTime(VORBaseUnknown* stationObject, double time) {
  auto* s = VORImplOf<VORStationImpl>(stationObject, DATA);
  if (s == nullptr)
    return E_INVALIDARG;
  VORHandle<VORActivityImpl> keep(s);
  HRESULT hr = SetValue<VORActivityImpl, double>(
      *this, s, &VORActivityImpl::stationCycleTime, time, "cycletime",
      [this, keep](const double& v) { return SetStationCycleTime(Unk(keep.get()), v); });
  if (hr == S_OK)
    Changed();
  return SUCCEEDED(hr) ? S_OK : hr;
}

HRESULT VORModelDoor::SetPertPosition(VORBaseUnknown* nodeObject, bool has, double x, double y) {
  auto* n = VORImplOf<VORGraphNodeImpl>(nodeObject, DATA);
  if (n == nullptr)
    return E_INVALIDARG;
  if (!has) {
    x = 0;
    y = 0;
  }
  if (n->hasPosition == has && n->x == x && n->y == y)
    return S_OK;
  const bool oldHas = n->hasPosition;
  const double ox = n->x, oy = n->y;
  n->hasPosition = has;
  n->x = x;
  n->y = y;
  Changed();
  VORHandle<VORGraphNodeImpl> keep(n);
  Record([this, keep, oldHas, ox, oy] { SetPertPosition(Unk(keep.get()), oldHas, ox, oy); });
  NotifyModify(n, "position");
  return S_OK;
}

HRESULT VORModelDoor::SetPertNodeState(VORBaseUnknown* nodeObject, int state) {
  auto* n = VORImplOf<VORGraphNodeImpl>(nodeObject, DATA);
  if (n == nullptr || state < 0 || state > 2)
    return E_INVALIDARG;
  VORHandle<VORGraphNodeImpl> keep(n);
  HRESULT hr = SetValue<VORGraphNodeImpl, int>(
      *this, n, &VORGraphNodeImpl::state, state, "state",
      [this, keep](const int& v) { return SetPertNodeState(Unk(keep.get()), v); });
  if (hr == S_OK)
    Changed();
  return SUCCEEDED(hr) ? S_OK : hr;
}

HRESULT VORModelDoor::SetPertNodeSize(VORBaseUnknown* nodeObject, double w, double h) {
  auto* n = VORImplOf<VORGraphNodeImpl>(nodeObject, DATA);
  if (n == nullptr || w < 0 || h < 0)
    return E_INVALIDARG;
  if (n->width == w && n->height == h)
    return S_OK;
  const double ow = n->width, oh = n->height;
  n->width = w;
  n->height = h;
  Changed();
  VORHandle<VORGraphNodeImpl> keep(n);
  Record([this, keep, ow, oh] { SetPertNodeSize(Unk(keep.get()), ow, oh); });
  NotifyModify(n, "size");
  return S_OK;
}

HRESULT VORModelDoor::SetUserAttribute(VORBaseUnknown* activityObject, const VORUnicodeString& name,
                                       const VORAttributeValue& value) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, DATA);
  if (a == nullptr || name.IsEmpty())
    return E_INVALIDARG;
  const std::string key = name.ConvertToUTF8();
  auto it = a->attributes.find(key);
  VORAttributeValue old = it == a->attributes.end() ? VORAttributeValue{} : it->second;
  if (old == value)
    return S_OK;
  if (value.type == VORAttributeNone)
    a->attributes.erase(key);
  else
    a->attributes[key] = value;
  Changed();
  VORHandle<VORActivityImpl> keep(a);
  Record([this, keep, name, old] { SetUserAttribute(Unk(keep.get()), name, old); });
  NotifyModify(a, "attribute");
  return S_OK;
}

// ---------------------------------------------------------------- product IO

namespace {
VORModelObject* ItemOf(VORBaseUnknown* object, VORDocumentData* data) {
  auto* o = VORImplOf<VORModelObject>(object, data);
  if (o == nullptr)
    return nullptr;
  if (VORKindCast<VORProductImpl>(o) == nullptr && VORKindCast<VORMfgAssemblyImpl>(o) == nullptr)
    return nullptr;
  return o;
}
}  // namespace

HRESULT VORModelDoor::AddProductIO(VORBaseUnknown* activityObject, VORBaseUnknown* itemObject,
                                   bool input, VORBaseUnknown_var& productIO, const char* id) {
  productIO = nullptr;
  auto* a = VORImplOf<VORActivityImpl>(activityObject, DATA);
  VORModelObject* item = ItemOf(itemObject, DATA);
  if (a == nullptr || item == nullptr)
    return E_INVALIDARG;
  if (id != nullptr && *id != '\0' && DATA->Find(id) != nullptr)
    return E_INVALIDARG;
  auto io = VORHandle<VORProductIOImpl>::Adopt(new VORProductIOImpl(input));
  DATA->Register(io.get(), id ? id : "");
  io->activity = a;
  AddLink(io.get(), item, VORILinkableObject::IOItemLink);
  a->productIOs.push_back(io);
  productIO = VORBaseUnknown_var(Unk(io.get()));
  Changed();
  VORBaseUnknown_var keep = productIO;
  Record([this, keep] { RemoveProductIO(keep.get()); });
  NotifyActivity(DATA, a, io.get(), SPPProductIOChanged);
  return S_OK;
}

HRESULT VORModelDoor::RemoveProductIO(VORBaseUnknown* productIO) {
  auto* io = VORImplOf<VORProductIOImpl>(productIO, DATA);
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
  DATA->Unregister(io);
  Changed();
  VORDocumentData* data = DATA;
  Record([this, data, keep, a, index, detached, id] {
    data->Register(keep.get(), id);
    keep->activity = a.get();
    a->productIOs.insert(a->productIOs.begin() + static_cast<long>(index), keep);
    ReattachEverything(*detached);
    Changed();
    Record([this, keep] { RemoveProductIO(Unk(keep.get())); });
    NotifyActivity(DATA, a.get(), keep.get(), SPPProductIOChanged);
  });
  NotifyActivity(DATA, a.get(), io, SPPProductIOChanged);
  return S_OK;
}

HRESULT VORModelDoor::SetProductIOItem(VORBaseUnknown* productIO, VORBaseUnknown* itemObject) {
  auto* io = VORImplOf<VORProductIOImpl>(productIO, DATA);
  VORModelObject* item = ItemOf(itemObject, DATA);
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
  NotifyActivity(DATA, io->activity, io, io->input ? SPPProductIOChanged : SPPProductOutputChanged);
  return S_OK;
}

// ---------------------------------------------------------------- assignments

HRESULT VORModelDoor::AssignItem(VORBaseUnknown* activityObject, VORBaseUnknown* itemObject,
                                 VORBaseUnknown* productInput) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, DATA);
  VORModelObject* item = ItemOf(itemObject, DATA);
  if (a == nullptr || item == nullptr)
    return E_INVALIDARG;
  VORProductIOImpl* via = nullptr;
  if (productInput != nullptr) {
    via = VORImplOf<VORProductIOImpl>(productInput, DATA);
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
  NotifyActivity(DATA, a, item, SPPItemAssigned);
  return S_OK;
}

HRESULT VORModelDoor::UnassignItem(VORBaseUnknown* activityObject, VORBaseUnknown* itemObject) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, DATA);
  VORModelObject* item = ItemOf(itemObject, DATA);
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
    NotifyActivity(DATA, static_cast<VORActivityImpl*>(r.source.get()), r.target.get(),
                   SPPItemAssigned);
  });
  NotifyActivity(DATA, a, item, SPPItemUnassigned);
  return S_OK;
}

HRESULT VORModelDoor::AssignResource(VORBaseUnknown* activityObject, VORBaseUnknown* resource) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, DATA);
  auto* r = VORImplOf<VORProductImpl>(resource, DATA);
  if (a == nullptr || r == nullptr || !r->isResource)
    return E_INVALIDARG;
  if (a->FindLink(r, VORILinkableObject::ResourceLink) != nullptr)
    return S_FALSE;
  AddLink(a, r, VORILinkableObject::ResourceLink);
  Changed();
  VORHandle<VORActivityImpl> keep(a);
  VORHandle<VORProductImpl> keepR(r);
  Record([this, keep, keepR] { UnassignResource(Unk(keep.get()), Unk(keepR.get())); });
  NotifyActivity(DATA, a, r, SPPResourceAssigned);
  return S_OK;
}

HRESULT VORModelDoor::UnassignResource(VORBaseUnknown* activityObject, VORBaseUnknown* resource) {
  auto* a = VORImplOf<VORActivityImpl>(activityObject, DATA);
  auto* r = VORImplOf<VORProductImpl>(resource, DATA);
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
    NotifyActivity(DATA, static_cast<VORActivityImpl*>(rec.source.get()), rec.target.get(),
                   SPPResourceAssigned);
  });
  NotifyActivity(DATA, a, r, SPPResourceUnassigned);
  return S_OK;
}

// ---------------------------------------------------------------- products

HRESULT VORModelDoor::CreateProduct(VORBaseUnknown* fatherObject, const VORUnicodeString& name,
                                    VORBaseUnknown_var& product, const char* id) {
  product = nullptr;
  VORProductImpl* father = nullptr;
  if (fatherObject != nullptr) {
    father = VORImplOf<VORProductImpl>(fatherObject, DATA);
    if (father == nullptr)
      return E_INVALIDARG;
  }
  if (id != nullptr && *id != '\0' && DATA->Find(id) != nullptr)
    return E_INVALIDARG;
  auto p = VORHandle<VORProductImpl>::Adopt(new VORProductImpl());
  DATA->Register(p.get(), id ? id : "");
  p->partNumber = name;
  p->father = father;
  (father ? father->children : DATA->rootProducts).push_back(p);
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
  auto* p = VORImplOf<VORProductImpl>(productObject, DATA);
  if (p == nullptr)
    return E_INVALIDARG;
  VORHandle<VORProductImpl> keep(p);
  std::vector<VORProductImpl*> products;
  CollectProducts(p, products);
  // First the references from the process, each through its own door operation.
  for (VORProductImpl* q : products) {
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
  std::vector<VORModelObject*> objects(products.begin(), products.end());
  auto detached = std::make_shared<Detached>();
  DetachEverything(objects, *detached);
  VORHandle<VORProductImpl> father(p->father);
  const int index = p->IndexInFather();
  auto& siblings = father ? father->children : DATA->rootProducts;
  siblings.erase(siblings.begin() + index);
  auto ids = std::make_shared<std::vector<std::pair<VORHandle<VORModelObject>, std::string>>>();
  for (VORModelObject* o : objects) {
    ids->push_back({VORHandle<VORModelObject>(o), o->id});
    DATA->Unregister(o);
  }
  p->father = nullptr;
  Changed();
  VORDocumentData* data = DATA;
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
  auto* p = VORImplOf<VORProductImpl>(productObject, DATA);
  auto* f = VORImplOf<VORProductImpl>(newFather, DATA);
  if (p == nullptr || f == nullptr || IsInside(f, p))
    return E_INVALIDARG;
  if (p->father == f)
    return S_FALSE;
  VORHandle<VORProductImpl> keep(p);
  VORHandle<VORProductImpl> oldFather(p->father);
  const int index = p->IndexInFather();
  auto& siblings = oldFather ? oldFather->children : DATA->rootProducts;
  siblings.erase(siblings.begin() + index);
  p->father = f;
  f->children.push_back(keep);
  Changed();
  VORDocumentData* data = DATA;
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
  auto* p = VORImplOf<VORProductImpl>(productObject, DATA);
  if (p == nullptr)
    return E_INVALIDARG;
  VORHandle<VORProductImpl> keep(p);
  HRESULT hr = SetValue<VORProductImpl, VORUnicodeString>(
      *this, p, &VORProductImpl::partNumber, name, "name",
      [this, keep](const VORUnicodeString& v) { return SetPartNumber(Unk(keep.get()), v); });
  if (hr == S_OK)
    Changed();
  return SUCCEEDED(hr) ? S_OK : hr;
}

HRESULT VORModelDoor::SetAlias(VORBaseUnknown* productObject, const VORUnicodeString& alias) {
  auto* p = VORImplOf<VORProductImpl>(productObject, DATA);
  if (p == nullptr)
    return E_INVALIDARG;
  VORHandle<VORProductImpl> keep(p);
  HRESULT hr = SetValue<VORProductImpl, VORUnicodeString>(
      *this, p, &VORProductImpl::alias, alias, "alias",
      [this, keep](const VORUnicodeString& v) { return SetAlias(Unk(keep.get()), v); });
  if (hr == S_OK)
    Changed();
  return SUCCEEDED(hr) ? S_OK : hr;
}

HRESULT VORModelDoor::SetShown(VORBaseUnknown* productObject, bool shown) {
  auto* p = VORImplOf<VORProductImpl>(productObject, DATA);
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
  auto* p = VORImplOf<VORProductImpl>(productObject, DATA);
  auto* r = reference ? VORImplOf<VORProductImpl>(reference, DATA) : p;
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
  auto* p = VORImplOf<VORProductImpl>(productObject, DATA);
  if (p == nullptr)
    return E_INVALIDARG;
  if (p->isResource)
    return S_FALSE;
  p->isResource = true;
  p->resourceClass = resourceClass.IsEmpty() ? VORUnicodeString("Resource") : resourceClass;
  p->planType = planType;
  Changed();
  VORHandle<VORProductImpl> keep(p);
  VORDocumentData* data = DATA;
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
  auto* p = VORImplOf<VORProductImpl>(resource, DATA);
  if (p == nullptr || !p->isResource)
    return E_INVALIDARG;
  VORHandle<VORProductImpl> keep(p);
  HRESULT hr = SetValue<VORProductImpl, VORUnicodeString>(
      *this, p, &VORProductImpl::planType, planType, "plantype",
      [this, keep](const VORUnicodeString& v) { return SetResourcePlanType(Unk(keep.get()), v); });
  if (hr == S_OK)
    Changed();
  return SUCCEEDED(hr) ? S_OK : hr;
}

// ---------------------------------------------------------------- assemblies

HRESULT VORModelDoor::CreateMfgAssembly(const VORUnicodeString& name, VORBaseUnknown_var& assembly,
                                        const char* id) {
  assembly = nullptr;
  if (id != nullptr && *id != '\0' && DATA->Find(id) != nullptr)
    return E_INVALIDARG;
  auto m = VORHandle<VORMfgAssemblyImpl>::Adopt(new VORMfgAssemblyImpl());
  DATA->Register(m.get(), id ? id : "");
  m->name = name;
  DATA->assemblies.push_back(m);
  assembly = VORBaseUnknown_var(Unk(m.get()));
  Changed();
  VORBaseUnknown_var keep = assembly;
  Record([this, keep] { DeleteMfgAssembly(keep.get()); });
  NotifyMfg(DATA, m.get(), "MACreated");
  return S_OK;
}

HRESULT VORModelDoor::DeleteMfgAssembly(VORBaseUnknown* assemblyObject) {
  auto* m = VORImplOf<VORMfgAssemblyImpl>(assemblyObject, DATA);
  if (m == nullptr)
    return E_INVALIDARG;
  VORHandle<VORMfgAssemblyImpl> keep(m);
  NotifyMfg(DATA, m, "MADeleting");
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
  auto& list = DATA->assemblies;
  const long index = std::find(list.begin(), list.end(), keep) - list.begin();
  list.erase(list.begin() + index);
  const std::string id = m->id;
  DATA->Unregister(m);
  Changed();
  VORDocumentData* data = DATA;
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
  auto* m = VORImplOf<VORMfgAssemblyImpl>(assemblyObject, DATA);
  VORModelObject* c = ItemOf(component, DATA);
  if (m == nullptr || c == nullptr || ReachesComponent(c, m))
    return E_INVALIDARG;
  if (m->FindLink(c, VORILinkableObject::ComponentLink) != nullptr)
    return S_FALSE;
  AddLink(m, c, VORILinkableObject::ComponentLink);
  Changed();
  VORHandle<VORMfgAssemblyImpl> keep(m);
  VORHandle<VORModelObject> keepC(c);
  Record([this, keep, keepC] { RemoveComponent(Unk(keep.get()), Unk(keepC.get())); });
  NotifyMfg(DATA, m, "MAModified");
  return S_OK;
}

HRESULT VORModelDoor::RemoveComponent(VORBaseUnknown* assemblyObject, VORBaseUnknown* component) {
  auto* m = VORImplOf<VORMfgAssemblyImpl>(assemblyObject, DATA);
  VORModelObject* c = ItemOf(component, DATA);
  if (m == nullptr || c == nullptr)
    return E_INVALIDARG;
  int idx = m->LinkIndex(c, VORILinkableObject::ComponentLink);
  if (idx < 0)
    return S_FALSE;
  LinkRecord r = DetachLink(m, static_cast<size_t>(idx));
  Changed();
  VORDocumentData* data = DATA;
  Record([this, data, r] {
    ReattachLink(r);
    Changed();
    Record([this, r] { RemoveComponent(Unk(r.source.get()), Unk(r.target.get())); });
    NotifyMfg(data, static_cast<VORMfgAssemblyImpl*>(r.source.get()), "MAModified");
  });
  NotifyMfg(DATA, m, "MAModified");
  return S_OK;
}

// ---------------------------------------------------------------- planning data

HRESULT VORModelDoor::SetEnvironmentName(const VORUnicodeString& name) {
  const std::string value = name.ConvertToUTF8();
  if (DATA->environment == value)
    return S_FALSE;
  const std::string old = DATA->environment;
  DATA->environment = value;
  Changed();
  Record([this, old] { SetEnvironmentName(VORUnicodeString(old)); });
  return S_OK;
}

HRESULT VORModelDoor::DefinePlanType(const VORUnicodeString& name, VORBaseUnknown_var& planType,
                                     const char* id) {
  planType = nullptr;
  if (name.IsEmpty() || (id != nullptr && *id != '\0' && DATA->Find(id) != nullptr))
    return E_INVALIDARG;
  auto t = VORHandle<VORPlanTypeImpl>::Adopt(new VORPlanTypeImpl());
  DATA->Register(t.get(), id ? id : "");
  t->attributes[{"", "name"}] = name;
  DATA->planTypes.push_back(t);
  planType = VORBaseUnknown_var(Unk(t.get()));
  Changed();
  VORDocumentData* data = DATA;
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
  auto* t = VORImplOf<VORPlanTypeImpl>(planType, DATA);
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
  auto* t = VORImplOf<VORPlanTypeImpl>(planType, DATA);
  auto* b = base ? VORImplOf<VORPlanTypeImpl>(base, DATA) : nullptr;
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
  auto* from = VORImplOf<VORPlanTypeImpl>(fromObject, DATA);
  auto* to = VORImplOf<VORPlanTypeImpl>(toObject, DATA);
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
  auto* from = VORImplOf<VORPlanTypeImpl>(fromObject, DATA);
  auto* to = VORImplOf<VORPlanTypeImpl>(toObject, DATA);
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
  auto* o = VORImplOf<VORModelObject>(object, DATA);
  if (o == nullptr || name.IsEmpty())
    return E_INVALIDARG;
  auto& records = DATA->hubObjects;
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
  VORDocumentData* data = DATA;
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
  auto it = DATA->hubObjects.find(h->objectId);
  if (it == DATA->hubObjects.end() || it->second.get() != h)
    return S_FALSE;
  VORHandle<VORHubObjectImpl> keep(h);
  DATA->hubObjects.erase(it);
  Changed();
  VORDocumentData* data = DATA;
  Record([this, data, keep] {
    data->hubObjects[keep->objectId] = keep;
    Changed();
    Record([this, keep] { DeleteHubObject(keep.get()); });
  });
  return S_OK;
}
