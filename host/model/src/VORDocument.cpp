// Process documents: object registry, containers, statistics and the planning hub.
#include "VORDocument.h"

#include <algorithm>

#include "VORHeap.h"
#include "VORLateTypes.h"
#include "VORModelDoorDetail.h"
#include "VORModelObjects.h"

// ---------------------------------------------------------------- document data

VORDocumentData::VORDocumentData(VORProcess* document) : document(document), door(document) {
  pprContainer =
      VORHandle<VORContainerImpl>::Adopt(new VORContainerImpl(this, VORDocument::PPRContainer));
  bomContainer =
      VORHandle<VORContainerImpl>::Adopt(new VORContainerImpl(this, VORDocument::BomContainer));
  processContainer =
      VORHandle<VORContainerImpl>::Adopt(new VORContainerImpl(this, VORDocument::ProcessContainer));
}

VORDocumentData::~VORDocumentData() {
  DetachAll();
}

std::string VORDocumentData::NewId(const char* prefix) {
  for (;;) {
    std::string id = prefix + std::to_string(nextIdNumber++);
    if (ids.find(id) == ids.end())
      return id;
  }
}

void VORDocumentData::Register(VORModelObject* object, const std::string& wantedId) {
  const char* prefix = "X";
  if (VORKindCast<VORActivityImpl>(object))
    prefix = "A";
  else if (VORKindCast<VORControlNodeImpl>(object))
    prefix = "N";
  else if (VORKindCast<VORProductIOImpl>(object))
    prefix = "IO";
  else if (VORKindCast<VORProductImpl>(object))
    prefix = "P";
  else if (VORKindCast<VORMfgAssemblyImpl>(object))
    prefix = "M";
  else if (VORKindCast<VORPlanTypeImpl>(object))
    prefix = "T";
  object->id = wantedId.empty() || ids.count(wantedId) ? NewId(prefix) : wantedId;
  object->data = this;
  ids[object->id] = object;
}

void VORDocumentData::Unregister(VORModelObject* object) {
  auto it = ids.find(object->id);
  if (it != ids.end() && it->second == object)
    ids.erase(it);
  object->data = nullptr;
}

VORModelObject* VORDocumentData::Find(const std::string& id) const {
  auto it = ids.find(id);
  return it == ids.end() ? nullptr : it->second;
}

std::vector<VORModelObject*> VORDocumentData::AllObjects() const {
  std::vector<VORModelObject*> all;
  all.reserve(ids.size());
  if (root)
    VORDoorDetail::CollectSubtree(root.get(), all);
  for (auto& p : rootProducts)
    VORDoorDetail::CollectProducts(p.get(), all);
  for (auto& m : assemblies)
    all.push_back(m.get());
  for (auto& t : planTypes)
    all.push_back(t.get());
  return all;
}

void VORDocumentData::DetachAll() {
  // Handles held outside may outlive the document: leave them no raw pointer to follow.
  for (VORModelObject* o : AllObjects()) {
    o->out.clear();
    o->in.clear();
    o->data = nullptr;
    if (auto* n = VORKindCast<VORGraphNodeImpl>(o)) {
      n->next.clear();
      n->previous.clear();
    }
  }
  ids.clear();
  hubObjects.clear();
  root = nullptr;
  rootProducts.clear();
  assemblies.clear();
  planTypes.clear();
}

// ---------------------------------------------------------------- containers

HRESULT VORContainerImpl::QueryInterface(const VORInterfaceId& iid, void** result) {
  const bool ppr = name == VORDocument::PPRContainer;
  const bool bom = name == VORDocument::BomContainer;
  const bool proc = name == VORDocument::ProcessContainer;
  if ((iid == VORIResourceFactory::IID() && !ppr) ||
      (iid == QELIMfgAssemblyModificationEvents::IID() && !bom) ||
      (iid == VORISPPProcessContainer::IID() && !proc)) {
    *result = nullptr;
    return E_NOINTERFACE;
  }
  return VORBaseUnknown::QueryInterface(iid, result);
}

HRESULT VORContainerImpl::ListMembers(const VORInterfaceId& iid,
                                      VORListValVORBaseUnknown_var*& members) {
  members = VORNewList();
  if (data == nullptr)
    return E_FAIL;
  auto add = [&](VORModelObject* o) {
    void* cast = nullptr;
    if (SUCCEEDED(o->QueryInterface(iid, &cast))) {
      static_cast<VORBaseUnknown*>(o)->Release();  // QueryInterface added one
      members->Append(VORBaseUnknown_var(static_cast<VORISpecObject*>(o)));
    }
  };
  if (name == VORDocument::PPRContainer) {
    for (auto& p : data->rootProducts)
      add(p.get());
  } else if (name == VORDocument::BomContainer) {
    for (auto& m : data->assemblies)
      add(m.get());
  } else if (data->root) {
    add(data->root.get());
  }
  return S_OK;
}

VOREventPublisher* VORContainerImpl::GetEventPublisher() {
  if (!_publisher)
    _publisher = VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher(this));
  return _publisher.get();
}

int VORContainerImpl::Dispatch(VORNotification* notification) {
  return GetEventPublisher()->Dispatch(notification);
}

HRESULT VORContainerImpl::GetListOfProcesses(VORListValVORBaseUnknown_var*& processes) {
  processes = VORNewList();
  if (data != nullptr && data->root)
    processes->Append(VORBaseUnknown_var(static_cast<VORISPPActivity*>(data->root.get())));
  return S_OK;
}

HRESULT VORContainerImpl::RemoveResource(VORBaseUnknown* resource) {
  if (data == nullptr)
    return E_FAIL;
  auto* r = VORImplOf<VORProductImpl>(resource, data);
  if (r == nullptr)
    return E_INVALIDARG;
  std::vector<VORProductImpl*> all{r};
  for (size_t i = 0; i < all.size(); ++i) {
    for (auto& c : all[i]->children)
      all.push_back(c.get());
  }
  bool any = false;
  for (VORProductImpl* p : all) {
    std::vector<VORModelObject*> sources(p->in.begin(), p->in.end());
    for (VORModelObject* s : sources) {
      if (s->FindLink(p, VORILinkableObject::ResourceLink) != nullptr &&
          data->door.UnassignResource(static_cast<VORISpecObject*>(s),
                                      static_cast<VORIProduct*>(p)) == S_OK)
        any = true;
    }
  }
  return any ? S_OK : S_FALSE;
}

HRESULT VORContainerImpl::CreateResource(const VORUnicodeString& resourceClass,
                                         VORBaseUnknown* product, const VORUnicodeString& planType,
                                         VORBaseUnknown_var& description) {
  description = nullptr;
  if (product != nullptr && VORImplOf<VORProductImpl>(product, data) == nullptr)
    return E_INVALIDARG;
  auto d = VORHandle<VORResourceDescriptionImpl>::Adopt(new VORResourceDescriptionImpl());
  d->resourceClass = resourceClass.IsEmpty() ? VORUnicodeString("Resource") : resourceClass;
  d->planType = planType;
  description = VORBaseUnknown_var(d.get());
  return S_OK;
}

HRESULT VORContainerImpl::AttachResource(VORBaseUnknown* product, VORBaseUnknown* description) {
  auto* p = VORImplOf<VORProductImpl>(product, data);
  auto* d =
      description ? dynamic_cast<VORResourceDescriptionImpl*>(description->GetIdentity()) : nullptr;
  if (p == nullptr || d == nullptr)
    return E_INVALIDARG;
  return data->door.MakeResource(static_cast<VORIProduct*>(p->Reference()), d->resourceClass,
                                 d->planType);
}

// ---------------------------------------------------------------- planning hub

namespace {

// The hub interfaces of a document in hub mode.
class VORPlanningHub : public virtual VORIIPDAdapter,
                       public virtual VORIIPDDataMgt,
                       public virtual VORIIPDAttributeMgt {
  VOR_DECLARE_CLASS(VORPlanningHub, VORBaseUnknown)
 public:
  explicit VORPlanningHub(VORDocumentData* data) : _data(data) {}

  HRESULT GetPlanType(VORBaseUnknown* product, VORBaseUnknown_var& planType) override {
    planType = nullptr;
    auto* p = VORImplOf<VORProductImpl>(product, _data);
    if (p == nullptr)
      return E_INVALIDARG;
    VORProductImpl* r = p->isResource ? p : p->Reference();
    if (!r->isResource || r->planType.IsEmpty())
      return S_FALSE;
    return FindPlanType(r->planType, planType);
  }
  HRESULT FindPlanType(const VORUnicodeString& name, VORBaseUnknown_var& planType) override {
    planType = nullptr;
    for (auto& t : _data->planTypes) {
      if (t->Name() == name) {
        planType = VORBaseUnknown_var(static_cast<VORISpecObject*>(t.get()));
        return S_OK;
      }
    }
    return S_FALSE;
  }
  HRESULT GetPlanTypes(VORListValVORBaseUnknown_var*& planTypes) override {
    planTypes = VORNewList();
    for (auto& t : _data->planTypes)
      planTypes->Append(VORBaseUnknown_var(static_cast<VORISpecObject*>(t.get())));
    return S_OK;
  }
  HRESULT DeleteHubObject(VORBaseUnknown* hubObject) override {
    return _data->door.DeleteHubObject(hubObject);
  }

  HRESULT GetHubObject(VORBaseUnknown* object, VORBaseUnknown_var& hubObject,
                       bool create) override {
    hubObject = nullptr;
    auto* o = VORImplOf<VORModelObject>(object, _data);
    if (o == nullptr)
      return E_INVALIDARG;
    auto it = _data->hubObjects.find(o->id);
    if (it == _data->hubObjects.end()) {
      if (!create)
        return S_FALSE;
      auto h = VORHandle<VORHubObjectImpl>::Adopt(new VORHubObjectImpl());
      h->objectId = o->id;
      it = _data->hubObjects.emplace(o->id, h).first;
    }
    hubObject = VORBaseUnknown_var(it->second.get());
    return S_OK;
  }
  HRESULT SetUserDefinedAttribute(VORBaseUnknown* object, const VORUnicodeString& name,
                                  const VORAttributeValue& value) override {
    return _data->door.SetHubAttribute(object, name, value);
  }

  HRESULT GetAttribute(VORBaseUnknown* planType, const VORUnicodeString& name,
                       VORUnicodeString& value) override {
    return GetAttribute(planType, name, VORUnicodeString(), value);
  }
  HRESULT GetAttribute(VORBaseUnknown* planType, const VORUnicodeString& name,
                       const VORUnicodeString& key, VORUnicodeString& value) override {
    value = VORUnicodeString();
    auto* t = VORImplOf<VORPlanTypeImpl>(planType, _data);
    if (t == nullptr)
      return E_INVALIDARG;
    const auto k = std::make_pair(key.ConvertToUTF8(), name.ConvertToUTF8());
    for (VORPlanTypeImpl* p = t; p != nullptr; p = p->Base()) {
      auto it = p->attributes.find(k);
      if (it != p->attributes.end()) {
        value = it->second;
        return S_OK;
      }
      if (k.second == "name" && k.first.empty())
        break;  // a plan type's own name is never inherited
    }
    return S_FALSE;
  }
  HRESULT GetRelatedObjects(VORBaseUnknown* planType, const VORUnicodeString& relation,
                            const char* option, VORListValVORBaseUnknown_var*& related) override {
    related = VORNewList();
    auto* t = VORImplOf<VORPlanTypeImpl>(planType, _data);
    if (t == nullptr)
      return E_INVALIDARG;
    const std::string rel = relation.ConvertToUTF8();
    const bool recursive = option != nullptr && std::string(option) == Recursive;
    for (VORPlanTypeImpl* p = t; p != nullptr; p = recursive ? p->Base() : nullptr) {
      for (VORModelObject* target : p->Targets(rel.c_str())) {
        VORBaseUnknown_var h(static_cast<VORISpecObject*>(target));
        if (related->Locate(h) == 0)
          related->Append(h);
      }
    }
    return S_OK;
  }
  HRESULT GetUserDefinedAttribute(VORBaseUnknown* object, const VORUnicodeString& name,
                                  VORAttributeValue& value) override {
    value = VORAttributeValue{};
    auto* o = VORImplOf<VORModelObject>(object, _data);
    if (o == nullptr)
      return E_INVALIDARG;
    auto it = _data->hubObjects.find(o->id);
    if (it == _data->hubObjects.end())
      return S_FALSE;
    auto a = it->second->attributes.find(name.ConvertToUTF8());
    if (a == it->second->attributes.end())
      return S_FALSE;
    value = a->second;
    return S_OK;
  }

 protected:
  ~VORPlanningHub() override = default;

 private:
  VORDocumentData* _data;
};

}  // namespace

// ---------------------------------------------------------------- VORProcess

VORProcess::VORProcess() : _data(std::make_unique<VORDocumentData>(this)) {}

// A closed document's memory goes back to the system, with its chart's: the heap keeps freed
// memory until then.
VORProcess::~VORProcess() {
  VORHeap::ReturnFreeMemoryAfterDrain();
}

VORProcess* VORProcess::CreateNew(const VORUnicodeString& rootLabel, const char* environment) {
  VORModelLateTypes::Declare();
  auto* doc = new VORProcess();
  VORDocumentData& d = *doc->_data;
  d.environment = environment ? environment : "";
  d.root = VORHandle<VORRootImpl>::Adopt(new VORRootImpl(VORModelLateTypes::Root));
  d.Register(d.root.get(), "");
  d.root->label = rootLabel;
  VORBaseUnknown_var product, resources;
  d.door.CreateProduct(nullptr, "Product", product);
  d.door.SetAlias(product, RootProductAlias);
  d.door.CreateProduct(nullptr, "Resources", resources);
  d.door.SetAlias(resources, ResourceRootAlias);
  d.modified = false;
  return doc;
}

HRESULT VORProcess::GetEnvironmentName(VORUnicodeString& name) {
  name = VORUnicodeString(_data->environment);
  return S_OK;
}

VORString VORProcess::GetEnvironment() {
  return VORString(_data->environment);
}

HRESULT VORProcess::GetContainer(const char* name, VORBaseUnknown_var& container) {
  container = nullptr;
  if (name == nullptr)
    return E_FAIL;
  for (auto* c :
       {_data->pprContainer.get(), _data->bomContainer.get(), _data->processContainer.get()}) {
    if (c->name == name) {
      container = VORBaseUnknown_var(static_cast<VORIContainer*>(c));
      return S_OK;
    }
  }
  return E_FAIL;
}

HRESULT VORProcess::GetInitObject(VORBaseUnknown_var& init) {
  init = VORBaseUnknown_var(static_cast<VORIDocInit*>(this));
  return S_OK;
}

HRESULT VORProcess::GetRootContainer(VORBaseUnknown_var& container) {
  container = VORBaseUnknown_var(static_cast<VORIContainer*>(_data->processContainer.get()));
  return S_OK;
}

HRESULT VORProcess::QueryInterface(const VORInterfaceId& iid, void** out) {
  if (iid == VORIIPDAdapter::IID() || iid == VORIIPDDataMgt::IID() ||
      iid == VORIIPDAttributeMgt::IID()) {
    *out = nullptr;
    if (!IsHubMode())
      return E_NOINTERFACE;
    // One hub object per query: it holds no state of its own.
    auto hub = VORHandle<VORPlanningHub>::Adopt(new VORPlanningHub(_data.get()));
    return hub->QueryInterface(iid, out);
  }
  return VORDocument::QueryInterface(iid, out);
}

VORBaseUnknown_var VORProcess::GetRootProcess() {
  return _data->root ? VORBaseUnknown_var(static_cast<VORISPPActivity*>(_data->root.get()))
                     : VORBaseUnknown_var();
}

namespace {
VORBaseUnknown_var RootWithAlias(VORDocumentData& d, const char* alias) {
  for (auto& p : d.rootProducts) {
    if (p->alias == VORUnicodeString(alias))
      return VORBaseUnknown_var(static_cast<VORIProduct*>(p.get()));
  }
  return {};
}
}  // namespace

VORBaseUnknown_var VORProcess::GetRootProduct() {
  return RootWithAlias(*_data, RootProductAlias);
}

VORBaseUnknown_var VORProcess::GetResourceRoot() {
  return RootWithAlias(*_data, ResourceRootAlias);
}

VORBaseUnknown* VORProcess::FindObject(const std::string& id) {
  VORModelObject* o = _data->Find(id);
  return o ? static_cast<VORISpecObject*>(o) : nullptr;
}

VORProcessStatistics VORProcess::GetStatistics() {
  VORProcessStatistics s;
  for (VORModelObject* o : _data->AllObjects()) {
    if (auto* n = VORKindCast<VORGraphNodeImpl>(o)) {
      (n->AsActivity() ? s.activities : s.controlNodes)++;
      s.flows += static_cast<int>(n->next.size());
    } else if (VORKindCast<VORProductIOImpl>(o)) {
      s.productIOs++;
    } else if (auto* p = VORKindCast<VORProductImpl>(o)) {
      s.products++;
      if (p->isResource)
        s.resources++;
    } else if (VORKindCast<VORMfgAssemblyImpl>(o)) {
      s.assemblies++;
    } else if (VORKindCast<VORPlanTypeImpl>(o)) {
      s.planTypes++;
    }
    for (const VORModelLink& l : o->out) {
      if (l.type == VORILinkableObject::ItemLink)
        s.itemAssignments++;
      else if (l.type == VORILinkableObject::ResourceLink)
        s.resourceAssignments++;
    }
  }
  return s;
}

VORUndoHistory& VORProcess::GetUndoHistory() {
  return _data->history;
}

VORModelDoor& VORProcess::GetDoor() {
  return _data->door;
}

bool VORProcess::IsModified() const {
  return _data->modified;
}

void VORProcess::SetModified(bool modified) {
  _data->modified = modified;
}
