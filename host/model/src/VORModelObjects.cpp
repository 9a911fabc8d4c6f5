// Queries of the model objects; every change is handed to the document's door.
#include "VORModelObjects.h"

#include <algorithm>
#include <string_view>
#include <unordered_map>

#include "VORLateTypes.h"
#include "VORSmallSet.h"

VORListValVORBaseUnknown_var* VORNewList() {
  return new VORListValVORBaseUnknown_var();
}

bool VORMatchesFilter(VORModelObject* object, const char* filter) {
  if (filter == nullptr || *filter == '\0')
    return true;
  // A view, not a string: flows are filtered once per visited neighbour.
  const std::string_view f = filter;
  if (f == VORModelFilters::Activity)
    return VORKindCast<VORActivityImpl>(object) != nullptr;
  if (f == VORModelFilters::Item)
    return object->Is(VORKindItem);
  if (f == VORModelFilters::Resource) {
    auto* p = VORKindCast<VORProductImpl>(object);
    return p != nullptr && p->isResource;
  }
  if (f == VORModelFilters::Product)
    return VORKindCast<VORProductImpl>(object) != nullptr;
  return VORLateTypes::IsKindOf(object->lateType, std::string(f));
}

namespace VORSharedLinkTypes {
const VORSharedName& Item() {
  static const VORSharedName name(VORILinkableObject::ItemLink);
  return name;
}
const VORSharedName& Resource() {
  static const VORSharedName name(VORILinkableObject::ResourceLink);
  return name;
}
const VORSharedName& IOItem() {
  static const VORSharedName name(VORILinkableObject::IOItemLink);
  return name;
}
}  // namespace VORSharedLinkTypes

namespace {
VORModelDoor* DoorOf(VORModelObject* o) {
  return o->data ? &o->data->door : nullptr;
}
void AppendUnique(VORListValVORBaseUnknown_var& list, VORSmallSet<const void*>& seen,
                  VORModelObject* o) {
  if (seen.Insert(o))
    list.Append(VORBaseUnknown_var(static_cast<VORISpecObject*>(o)));
}
}  // namespace

// ---- VORModelObject ----

VOREventPublisher* VORModelObject::GetEventPublisher() {
  if (!_publisher)
    _publisher = VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher(this));
  return _publisher.get();
}

int VORModelObject::Dispatch(VORNotification* notification) {
  return GetEventPublisher()->Dispatch(notification);
}

void VORModelObject::DispatchEvent(const char* event, VORNotification* notification) {
  if (_publisher && _publisher->CallbackCount() > 0)
    _publisher->Dispatch(event, notification);
}

void VORModelObject::DispatchEventKeyed(const void* key, const char* event,
                                        VORNotification* notification) {
  if (_publisher && _publisher->CallbackCount() > 0)
    _publisher->DispatchKeyed(key, event, notification);
}

HRESULT VORModelObject::GetTypeName(VORUnicodeString& typeName) {
  typeName = lateType.Decoded();
  return S_OK;
}

VORProcess* VORModelObject::GetDocument() {
  return data ? data->document : nullptr;
}

HRESULT VORModelObject::GetLinkedObjects(VORListValVORBaseUnknown_var*& objects, const char* type) {
  objects = VORNewList();
  VORSmallSet<const void*> seen;
  for (const VORModelLink& l : out) {
    if (type == nullptr || *type == '\0' || l.type == type)
      AppendUnique(*objects, seen, l.target);
  }
  for (VORModelObject* source : in) {
    if (type == nullptr || *type == '\0' || source->FindLink(this, type) != nullptr)
      AppendUnique(*objects, seen, source);
  }
  return S_OK;
}

HRESULT VORModelObject::GetPointingObjects(VORListValVORBaseUnknown_var*& objects,
                                           const char* type) {
  objects = VORNewList();
  VORSmallSet<const void*> seen;
  for (VORModelObject* source : in) {
    if (type == nullptr || *type == '\0' || source->FindLink(this, type) != nullptr)
      AppendUnique(*objects, seen, source);
  }
  return S_OK;
}

HRESULT VORModelObject::GetPointedObjects(VORListValVORBaseUnknown_var*& objects,
                                          const char* type) {
  objects = VORNewList();
  VORSmallSet<const void*> seen;
  for (const VORModelLink& l : out) {
    if (type == nullptr || *type == '\0' || l.type == type)
      AppendUnique(*objects, seen, l.target);
  }
  return S_OK;
}

std::vector<VORModelObject*> VORModelObject::Targets(const char* type) const {
  std::vector<VORModelObject*> result;
  for (const VORModelLink& l : out) {
    if (l.type == type)
      result.push_back(l.target);
  }
  return result;
}

const VORModelLink* VORModelObject::FindLink(const VORModelObject* target, const char* type) const {
  int i = LinkIndex(target, type);
  return i < 0 ? nullptr : &out[static_cast<size_t>(i)];
}

int VORModelObject::LinkIndex(const VORModelObject* target, const char* type) const {
  for (size_t i = 0; i < out.size(); ++i) {
    if (out[i].target == target && (type == nullptr || out[i].type == type))
      return static_cast<int>(i);
  }
  return -1;
}

// ---- VORGraphNodeImpl ----

HRESULT VORGraphNodeImpl::GetChildren(VORListValVORBaseUnknown_var*& list) {
  list = VORNewList();
  return S_OK;
}

HRESULT VORGraphNodeImpl::GetLabel(VORUnicodeString& text) {
  text = label;
  return S_OK;
}

HRESULT VORGraphNodeImpl::GetParentNode(VORBaseUnknown_var& parent) {
  parent = nullptr;
  if (father == nullptr)
    return S_FALSE;
  parent = VORBaseUnknown_var(static_cast<VORIGENode*>(father));
  return S_OK;
}

void VORGraphNodeImpl::GetPertPosition(double& px, double& py) {
  px = hasPosition ? x : 0.0;
  py = hasPosition ? y : 0.0;
}

void VORGraphNodeImpl::SetPertPosition(double px, double py) {
  if (auto* door = DoorOf(this))
    door->SetPertPosition(static_cast<VORIGENode*>(this), true, px, py);
}

void VORGraphNodeImpl::ClearPertPosition() {
  if (auto* door = DoorOf(this))
    door->SetPertPosition(static_cast<VORIGENode*>(this), false, 0, 0);
}

void VORGraphNodeImpl::SetPertNodeState(int s) {
  if (auto* door = DoorOf(this))
    door->SetPertNodeState(static_cast<VORIGENode*>(this), s);
}

void VORGraphNodeImpl::GetPertNodeSize(double& pw, double& ph) {
  pw = width;
  ph = height;
}

void VORGraphNodeImpl::SetPertNodeSize(double pw, double ph) {
  if (auto* door = DoorOf(this))
    door->SetPertNodeSize(static_cast<VORIGENode*>(this), pw, ph);
}

namespace {
HRESULT FlowList(const std::vector<VORFlowRef>& refs, VORListValVORBaseUnknown_var*& list,
                 const char* filter) {
  list = VORNewList();
  list->Reserve(static_cast<int>(refs.size()));
  for (const VORFlowRef& r : refs) {
    if (VORMatchesFilter(r.node, filter))
      list->Append(VORBaseUnknown_var(static_cast<VORIGENode*>(r.node)));
  }
  return S_OK;
}
}  // namespace

HRESULT VORGraphNodeImpl::GetPreviousActivities(VORListValVORBaseUnknown_var*& list,
                                                const char* filter) {
  return FlowList(previous, list, filter);
}

HRESULT VORGraphNodeImpl::GetNextActivities(VORListValVORBaseUnknown_var*& list,
                                            const char* filter) {
  return FlowList(next, list, filter);
}

void VORGraphNodeImpl::VisitActivities(bool toNext, void (*visit)(void*, VORBaseUnknown*),
                                       void* context, const char* filter) {
  for (const VORFlowRef& r : toNext ? next : previous) {
    if (VORMatchesFilter(r.node, filter))
      visit(context, static_cast<VORIGENode*>(r.node));
  }
}

HRESULT VORGraphNodeImpl::AddNextActivity(VORBaseUnknown* nextNode) {
  auto* door = DoorOf(this);
  return door ? door->AddFlow(static_cast<VORIGENode*>(this), nextNode) : E_FAIL;
}

HRESULT VORGraphNodeImpl::RemoveLink(VORBaseUnknown* other) {
  auto* door = DoorOf(this);
  if (door == nullptr)
    return E_FAIL;
  HRESULT a = door->RemoveFlow(static_cast<VORIGENode*>(this), other);
  if (FAILED(a))
    return a;
  HRESULT b = door->RemoveFlow(other, static_cast<VORIGENode*>(this));
  if (FAILED(b))
    return b;
  return (a == S_OK || b == S_OK) ? S_OK : S_FALSE;
}

HRESULT VORGraphNodeImpl::GetProductInputs(VORListValVORBaseUnknown_var*& list) {
  list = nullptr;
  if (AsActivity() == nullptr)
    return E_NOTIMPL;
  list = VORNewList();
  return AppendProductInputs(*list);
}

HRESULT VORGraphNodeImpl::AppendProductInputs(VORListValVORBaseUnknown_var& list) {
  VORActivityImpl* a = AsActivity();
  if (a == nullptr)
    return E_NOTIMPL;
  for (auto& io : a->productIOs) {
    if (io->input)
      list.Append(VORBaseUnknown_var(static_cast<VORISPPProductIO*>(io.get())));
  }
  return S_OK;
}

HRESULT VORGraphNodeImpl::GetProductOutputs(VORListValVORBaseUnknown_var*& list) {
  list = nullptr;
  VORActivityImpl* a = AsActivity();
  if (a == nullptr)
    return E_NOTIMPL;
  list = VORNewList();
  for (auto& io : a->productIOs) {
    if (!io->input)
      list->Append(VORBaseUnknown_var(static_cast<VORISPPProductIO*>(io.get())));
  }
  return S_OK;
}

HRESULT VORGraphNodeImpl::GetProductIOs(VORListValVORBaseUnknown_var*& list) {
  HRESULT hr = GetProductInputs(list);
  if (FAILED(hr))
    return hr;
  VORListValVORBaseUnknown_var* outputs = nullptr;
  GetProductOutputs(outputs);
  list->Append(*outputs);
  delete outputs;
  return S_OK;
}

HRESULT VORGraphNodeImpl::AddProductInput(VORBaseUnknown* item, VORBaseUnknown_var& io) {
  if (AsActivity() == nullptr)
    return E_NOTIMPL;
  auto* door = DoorOf(this);
  return door ? door->AddProductIO(static_cast<VORIGENode*>(this), item, true, io) : E_FAIL;
}

HRESULT VORGraphNodeImpl::AddProductOutput(VORBaseUnknown* item, VORBaseUnknown_var& io) {
  if (AsActivity() == nullptr)
    return E_NOTIMPL;
  auto* door = DoorOf(this);
  return door ? door->AddProductIO(static_cast<VORIGENode*>(this), item, false, io) : E_FAIL;
}

HRESULT VORGraphNodeImpl::RemoveProductIO(VORBaseUnknown* productIO) {
  VORActivityImpl* a = AsActivity();
  if (a == nullptr)
    return E_NOTIMPL;
  auto* io = VORImplOf<VORProductIOImpl>(productIO, data);
  if (io == nullptr || io->activity != a)
    return E_INVALIDARG;
  return data->door.RemoveProductIO(productIO);
}

int VORGraphNodeImpl::IndexInFather() const {
  if (father == nullptr)
    return -1;
  for (size_t i = 0; i < father->children.size(); ++i) {
    if (father->children[i].get() == this)
      return static_cast<int>(i);
  }
  return -1;
}

// ---- VORActivityImpl ----

VORActivityImpl::~VORActivityImpl() {
  for (auto& c : children)
    c->father = nullptr;
  for (auto& io : productIOs)
    io->activity = nullptr;
}

VORActivityImpl* VORActivityImpl::Root() {
  VORActivityImpl* a = this;
  while (a->father != nullptr)
    a = a->father;
  return a;
}

HRESULT VORActivityImpl::GetName(VORUnicodeString& name) {
  name = label;
  return S_OK;
}

HRESULT VORActivityImpl::GetActivityType(VORString& type) {
  type = VORString(lateType);
  return S_OK;
}

HRESULT VORActivityImpl::GetFatherActivity(VORBaseUnknown_var& fatherActivity) {
  fatherActivity = nullptr;
  if (father == nullptr)
    return S_FALSE;
  fatherActivity = VORBaseUnknown_var(static_cast<VORISPPActivity*>(father));
  return S_OK;
}

HRESULT VORActivityImpl::GetRootActivity(VORBaseUnknown_var& root) {
  root = VORBaseUnknown_var(static_cast<VORISPPActivity*>(Root()));
  return S_OK;
}

HRESULT VORActivityImpl::SetLabel(const VORUnicodeString& text) {
  auto* door = DoorOf(this);
  return door ? door->SetLabel(static_cast<VORISPPActivity*>(this), text) : E_FAIL;
}

HRESULT VORActivityImpl::GetActivityTime(double& t) {
  t = time;
  return S_OK;
}

HRESULT VORActivityImpl::SetActivityTime(double t) {
  auto* door = DoorOf(this);
  return door ? door->SetActivityTime(static_cast<VORISPPActivity*>(this), t) : E_FAIL;
}

HRESULT VORActivityImpl::GetChildren(VORListValVORBaseUnknown_var*& list) {
  return GetChildren(list, nullptr);
}

HRESULT VORActivityImpl::GetChildren(VORListValVORBaseUnknown_var*& list, const char* filter) {
  list = VORNewList();
  list->Reserve(static_cast<int>(children.size()));
  for (auto& c : children) {
    if (VORMatchesFilter(c.get(), filter))
      list->Append(VORBaseUnknown_var(static_cast<VORIGENode*>(c.get())));
  }
  return S_OK;
}

HRESULT VORActivityImpl::CreateChild(const char* type, VORBaseUnknown_var& child) {
  auto* door = DoorOf(this);
  return door ? door->CreateNode(static_cast<VORISPPActivity*>(this), type, child) : E_FAIL;
}

HRESULT VORActivityImpl::RemoveChild(VORBaseUnknown* child) {
  auto* node = VORImplOf<VORGraphNodeImpl>(child, data);
  if (node == nullptr || node->father != this)
    return E_INVALIDARG;
  return data->door.RemoveNode(child);
}

HRESULT VORActivityImpl::GetAssignedItems(VORListValVORBaseUnknown_var*& items, const char* type,
                                          int mode) {
  items = VORNewList();
  return AppendAssignedItems(*items, type, mode);
}

HRESULT VORActivityImpl::AppendAssignedItems(VORListValVORBaseUnknown_var& items, const char* type,
                                             int mode) {
  VORSmallSet<const void*> seen;
  const char* filter = (type == nullptr || *type == '\0') ? VORModelFilters::Item : type;
  auto collect = [&](VORActivityImpl* a) {
    for (const VORModelLink& l : a->out) {
      if (l.type == VORSharedLinkTypes::Item() && VORMatchesFilter(l.target, filter))
        AppendUnique(items, seen, l.target);
    }
  };
  collect(this);
  if (mode == AssignedHereAndBelow) {
    std::vector<VORActivityImpl*> stack{this};
    while (!stack.empty()) {
      VORActivityImpl* a = stack.back();
      stack.pop_back();
      for (auto it = a->children.rbegin(); it != a->children.rend(); ++it) {
        if (VORActivityImpl* c = (*it)->AsActivity()) {
          collect(c);
          stack.push_back(c);
        }
      }
    }
  }
  return S_OK;
}

bool VORActivityImpl::IsItemAssigned(VORBaseUnknown* item) {
  auto* target = item ? dynamic_cast<VORModelObject*>(item->GetIdentity()) : nullptr;
  return target != nullptr && FindLink(target, VORILinkableObject::ItemLink) != nullptr;
}

HRESULT VORActivityImpl::AssignItem(VORBaseUnknown* item, VORBaseUnknown* productInput) {
  auto* door = DoorOf(this);
  return door ? door->AssignItem(static_cast<VORISPPActivity*>(this), item, productInput) : E_FAIL;
}

HRESULT VORActivityImpl::UnassignItem(VORBaseUnknown* item) {
  auto* door = DoorOf(this);
  return door ? door->UnassignItem(static_cast<VORISPPActivity*>(this), item) : E_FAIL;
}

HRESULT VORActivityImpl::GetAssignmentInput(VORBaseUnknown* item, VORBaseUnknown_var& input) {
  input = nullptr;
  auto* target = item ? dynamic_cast<VORModelObject*>(item->GetIdentity()) : nullptr;
  const VORModelLink* l = target ? FindLink(target, VORILinkableObject::ItemLink) : nullptr;
  if (l == nullptr)
    return E_INVALIDARG;
  if (l->via == nullptr)
    return S_FALSE;
  input = VORBaseUnknown_var(static_cast<VORISPPProductIO*>(l->via));
  return S_OK;
}

HRESULT VORActivityImpl::GetResources(VORListValVORBaseUnknown_var*& resources,
                                      const char* filter) {
  resources = VORNewList();
  return AppendResources(*resources, filter);
}

HRESULT VORActivityImpl::AppendResources(VORListValVORBaseUnknown_var& resources,
                                         const char* filter) {
  const bool all =
      filter == nullptr || *filter == '\0' || std::string_view(filter) == VORModelFilters::Resource;
  for (const VORModelLink& l : out) {
    if (l.type != VORSharedLinkTypes::Resource())
      continue;
    auto* p = static_cast<VORProductImpl*>(l.target);
    if (all || p->resourceClass == VORUnicodeString(filter))
      resources.Append(VORBaseUnknown_var(static_cast<VORIProduct*>(p)));
  }
  return S_OK;
}

HRESULT VORActivityImpl::AssignResource(VORBaseUnknown* resource) {
  auto* door = DoorOf(this);
  return door ? door->AssignResource(static_cast<VORISPPActivity*>(this), resource) : E_FAIL;
}

HRESULT VORActivityImpl::UnassignResource(VORBaseUnknown* resource) {
  auto* door = DoorOf(this);
  return door ? door->UnassignResource(static_cast<VORISPPActivity*>(this), resource) : E_FAIL;
}

HRESULT VORActivityImpl::GetAttributeValue(const VORUnicodeString& name, VORAttributeValue& value) {
  auto it = attributes.find(name.ConvertToUTF8());
  if (it == attributes.end()) {
    value = VORAttributeValue{};
    return S_FALSE;
  }
  value = it->second;
  return S_OK;
}

HRESULT VORActivityImpl::SetAttributeValue(const VORUnicodeString& name,
                                           const VORAttributeValue& value) {
  auto* door = DoorOf(this);
  return door ? door->SetUserAttribute(static_cast<VORISPPActivity*>(this), name, value) : E_FAIL;
}

HRESULT VORActivityImpl::GetAttributeNames(VORListValVORUnicodeString& names) {
  for (auto& [name, value] : attributes)
    names.Append(VORUnicodeString(name));
  return S_OK;
}

// ---- stations ----

HRESULT VORStationImpl::GetStationCycleTime(double& t) {
  t = stationCycleTime;
  return S_OK;
}

HRESULT VORStationImpl::SetStationCycleTime(double t) {
  return data ? data->door.SetStationCycleTime(static_cast<VORISPPActivity*>(this), t) : E_FAIL;
}
