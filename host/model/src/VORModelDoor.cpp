// The door's core: the change log and undo, graph nodes, flows and node values.
#include <utility>

#include "VORModelDoorDetail.h"

using namespace VORDoorDetail;

VORDocumentData* VORModelDoor::Data() const {
  return &_document->Data();
}

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

// ---------------------------------------------------------------- graph nodes

// ---------------------------------------------------------------- graph nodes

HRESULT VORModelDoor::CreateNode(VORBaseUnknown* fatherObject, const char* type,
                                 VORBaseUnknown_var& node, int position, const char* id) {
  node = nullptr;
  auto* father = VORImplOf<VORActivityImpl>(fatherObject, Data());
  if (father == nullptr || type == nullptr)
    return E_INVALIDARG;
  const std::string t = type;
  if (t == VORModelLateTypes::Root ||
      !(VORModelLateTypes::IsActivityType(t) || VORModelLateTypes::IsControlNodeType(t)))
    return E_INVALIDARG;
  if (id != nullptr && *id != '\0' && Data()->Find(id) != nullptr)
    return E_INVALIDARG;
  const size_t count = father->children.size();
  size_t index = (position <= 0 || static_cast<size_t>(position) > count + 1)
                     ? count
                     : static_cast<size_t>(position - 1);
  auto created = VORHandle<VORGraphNodeImpl>::Adopt(MakeNode(t));
  Data()->Register(created.get(), id ? id : "");
  created->father = father;
  if (VORModelLateTypes::IsControlNodeType(t))
    created->label = VORUnicodeString(t);
  father->children.insert(father->children.begin() + static_cast<long>(index), created);
  node = VORBaseUnknown_var(Unk(created.get()));
  Changed();
  VORBaseUnknown_var keep = node;
  Record([this, keep] { RemoveNode(keep.get()); });
  NotifyActivity(Data(), father, created.get(), SPPChildActivityChanged);
  return S_OK;
}

HRESULT VORModelDoor::RemoveNode(VORBaseUnknown* nodeObject) {
  auto* node = VORImplOf<VORGraphNodeImpl>(nodeObject, Data());
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
    Data()->Unregister(o);
  node->father = nullptr;
  Changed();
  VORDocumentData* data = Data();
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
    NotifyActivity(Data(), father.get(), keep.get(), SPPChildActivityChanged);
  });
  NotifyActivity(Data(), father.get(), node, SPPChildActivityChanged);
  if (VORActivityImpl* a = node->AsActivity())
    NotifyActivity(Data(), a, a, SPPActivityDeleted);
  return S_OK;
}

HRESULT VORModelDoor::AddFlow(VORBaseUnknown* fromObject, VORBaseUnknown* toObject) {
  auto* from = VORImplOf<VORGraphNodeImpl>(fromObject, Data());
  auto* to = VORImplOf<VORGraphNodeImpl>(toObject, Data());
  if (from == nullptr || to == nullptr || from == to || from->father == nullptr ||
      from->father != to->father)
    return E_INVALIDARG;
  if (FindFlow(from->next, to) != from->next.size())
    return S_FALSE;
  const std::uint64_t stamp = Data()->nextFlowStamp++;
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
  auto* from = VORImplOf<VORGraphNodeImpl>(fromObject, Data());
  auto* to = VORImplOf<VORGraphNodeImpl>(toObject, Data());
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

HRESULT VORModelDoor::SetLabel(VORBaseUnknown* nodeObject, const VORUnicodeString& label) {
  return SetScalar(VORImplOf<VORGraphNodeImpl>(nodeObject, Data()), &VORGraphNodeImpl::label, label,
                   "label", &VORModelDoor::SetLabel);
}

HRESULT VORModelDoor::SetActivityTime(VORBaseUnknown* activityObject, double time) {
  if (!IsFinite(time))
    return E_INVALIDARG;
  return SetScalar(VORImplOf<VORActivityImpl>(activityObject, Data()), &VORActivityImpl::time, time,
                   "time", &VORModelDoor::SetActivityTime);
}

HRESULT VORModelDoor::SetStationCycleTime(VORBaseUnknown* stationObject, double time) {
  if (!IsFinite(time))
    return E_INVALIDARG;
  return SetScalar(VORImplOf<VORStationImpl>(stationObject, Data()),
                   &VORActivityImpl::stationCycleTime, time, "cycletime",
                   &VORModelDoor::SetStationCycleTime);
}

HRESULT VORModelDoor::SetPertPosition(VORBaseUnknown* nodeObject, bool has, double x, double y) {
  auto* n = VORImplOf<VORGraphNodeImpl>(nodeObject, Data());
  if (n == nullptr || (has && !(IsFinite(x) && IsFinite(y))))
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
  if (state < 0 || state > 2)
    return E_INVALIDARG;
  return SetScalar(VORImplOf<VORGraphNodeImpl>(nodeObject, Data()), &VORGraphNodeImpl::state, state,
                   "state", &VORModelDoor::SetPertNodeState);
}

HRESULT VORModelDoor::SetPertNodeSize(VORBaseUnknown* nodeObject, double w, double h) {
  auto* n = VORImplOf<VORGraphNodeImpl>(nodeObject, Data());
  if (n == nullptr || !(IsFinite(w) && IsFinite(h)) || w < 0 || h < 0)
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
  auto* a = VORImplOf<VORActivityImpl>(activityObject, Data());
  if (a == nullptr || name.IsEmpty() || !IsFinite(value))
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
