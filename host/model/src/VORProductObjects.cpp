// Queries of the product side of the model (product inputs and outputs, products and
// resources, manufacturing assemblies, plan types); every change is handed to the door.
#include "VORModelObjects.h"

#include "VORLateTypes.h"

// ---- product IO ----

VORModelObject* VORProductIOImpl::Item() const {
  for (const VORModelLink& l : out) {
    if (l.type == VORSharedLinkTypes::IOItem())
      return l.target;
  }
  return nullptr;
}

HRESULT VORProductIOImpl::GetItem(VORBaseUnknown_var& item) {
  VORModelObject* i = Item();
  item = i ? VORBaseUnknown_var(static_cast<VORISpecObject*>(i)) : VORBaseUnknown_var();
  return i ? S_OK : S_FALSE;
}

HRESULT VORProductIOImpl::GetConsumedItem(VORBaseUnknown_var& item) {
  if (!input) {
    item = nullptr;
    return S_FALSE;
  }
  return GetItem(item);
}

HRESULT VORProductIOImpl::GetProducedItem(VORBaseUnknown_var& item) {
  if (input) {
    item = nullptr;
    return S_FALSE;
  }
  return GetItem(item);
}

HRESULT VORProductIOImpl::GetActivity(VORBaseUnknown_var& owner) {
  owner = nullptr;
  if (data == nullptr || activity == nullptr)
    return S_FALSE;
  owner = VORBaseUnknown_var(static_cast<VORISPPActivity*>(activity));
  return S_OK;
}

HRESULT VORProductIOImpl::SetItem(VORBaseUnknown* item) {
  return data ? data->door.SetProductIOItem(static_cast<VORISPPProductIO*>(this), item) : E_FAIL;
}

// ---- products ----

VORProductImpl::~VORProductImpl() {
  for (auto& c : children)
    c->father = nullptr;
}

HRESULT VORProductImpl::QueryInterface(const VORInterfaceId& iid, void** result) {
  if (!isResource && iid == VORIResource::IID()) {
    *result = nullptr;
    return E_NOINTERFACE;
  }
  return VORBaseUnknown::QueryInterface(iid, result);
}

VORProductImpl* VORProductImpl::Reference() {
  for (const VORModelLink& l : out) {
    if (l.type == VORILinkableObject::ReferenceLink)
      return static_cast<VORProductImpl*>(l.target);
  }
  return this;
}

int VORProductImpl::IndexInFather() const {
  const auto& siblings = father ? father->children : data->rootProducts;
  for (size_t i = 0; i < siblings.size(); ++i) {
    if (siblings[i].get() == this)
      return static_cast<int>(i);
  }
  return -1;
}

HRESULT VORProductImpl::GetFatherProduct(VORBaseUnknown_var& fatherProduct) {
  fatherProduct = nullptr;
  if (father == nullptr)
    return S_FALSE;
  fatherProduct = VORBaseUnknown_var(static_cast<VORIProduct*>(father));
  return S_OK;
}

HRESULT VORProductImpl::GetReferenceProduct(VORBaseUnknown_var& reference) {
  reference = VORBaseUnknown_var(static_cast<VORIProduct*>(Reference()));
  return S_OK;
}

HRESULT VORProductImpl::GetChildren(VORListValVORBaseUnknown_var*& list, const char* type) {
  list = VORNewList();
  for (auto& c : children) {
    if (type == nullptr || VORMatchesFilter(c.get(), type))
      list->Append(VORBaseUnknown_var(static_cast<VORIProduct*>(c.get())));
  }
  return S_OK;
}

HRESULT VORProductImpl::AddChild(const VORUnicodeString& name, VORBaseUnknown_var& child) {
  return data ? data->door.CreateProduct(static_cast<VORIProduct*>(this), name, child) : E_FAIL;
}

HRESULT VORProductImpl::RemoveChild(VORBaseUnknown* child) {
  auto* c = VORImplOf<VORProductImpl>(child, data);
  if (c == nullptr || c->father != this)
    return E_INVALIDARG;
  return data->door.RemoveProduct(child);
}

HRESULT VORProductImpl::GetPartNumber(VORUnicodeString& name) {
  name = partNumber;
  return S_OK;
}

HRESULT VORProductImpl::SetPartNumber(const VORUnicodeString& name) {
  return data ? data->door.SetPartNumber(static_cast<VORIProduct*>(this), name) : E_FAIL;
}

HRESULT VORProductImpl::GetAlias(VORUnicodeString& text) {
  text = alias;
  return S_OK;
}

HRESULT VORProductImpl::SetAlias(const VORUnicodeString& text) {
  return data ? data->door.SetAlias(static_cast<VORIProduct*>(this), text) : E_FAIL;
}

HRESULT VORProductImpl::GetName(VORUnicodeString& name) {
  name = partNumber;
  return S_OK;
}

HRESULT VORProductImpl::SetShown(bool show) {
  return data ? data->door.SetShown(static_cast<VORIProduct*>(this), show) : E_FAIL;
}

HRESULT VORProductImpl::GetPlanTypeName(VORUnicodeString& type) {
  type = planType;
  return S_OK;
}

HRESULT VORProductImpl::SetPlanTypeName(const VORUnicodeString& type) {
  return data ? data->door.SetResourcePlanType(static_cast<VORIProduct*>(this), type) : E_FAIL;
}

HRESULT VORProductImpl::GetResourceClass(VORUnicodeString& cls) {
  cls = resourceClass;
  return S_OK;
}

HRESULT VORProductImpl::SetName(const VORUnicodeString& name) {
  return SetPartNumber(name);
}

// ---- manufacturing assemblies ----

HRESULT VORMfgAssemblyImpl::GetComponents(VORListValVORBaseUnknown_var*& components) {
  components = VORNewList();
  for (VORModelObject* t : Targets(VORILinkableObject::ComponentLink))
    components->Append(VORBaseUnknown_var(static_cast<VORISpecObject*>(t)));
  return S_OK;
}

HRESULT VORMfgAssemblyImpl::AddComponent(VORBaseUnknown* component) {
  return data ? data->door.AddComponent(static_cast<QELIMfgAssembly*>(this), component) : E_FAIL;
}

HRESULT VORMfgAssemblyImpl::RemoveComponent(VORBaseUnknown* component) {
  return data ? data->door.RemoveComponent(static_cast<QELIMfgAssembly*>(this), component) : E_FAIL;
}

HRESULT VORMfgAssemblyImpl::GetName(VORUnicodeString& text) {
  text = name;
  return S_OK;
}

// ---- plan types ----

VORPlanTypeImpl* VORPlanTypeImpl::Base() const {
  for (const VORModelLink& l : out) {
    if (l.type == BaseLink)
      return static_cast<VORPlanTypeImpl*>(l.target);
  }
  return nullptr;
}

VORUnicodeString VORPlanTypeImpl::Name() const {
  auto it = attributes.find({"", "name"});
  return it == attributes.end() ? VORUnicodeString() : it->second;
}
