// The model's implementation classes (private to vor_model). Objects are owned by their
// document through handles (children by their father); cross references are raw pointers kept
// symmetric by the door, which removes them before an object leaves its document.
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <unordered_map>
#include <vector>

#include "VORDynamicCast.h"
#include "VORModel.h"
#include "VORSharedName.h"

struct VORDocumentData;
class VORActivityImpl;
class VORGraphNodeImpl;
class VORProductIOImpl;
class VORProductImpl;
class VORMfgAssemblyImpl;
class VORPlanTypeImpl;
class VORContainerImpl;

// A link from its owner to target, of a type; via is the product input an item assignment was
// made with (items only).
struct VORModelLink {
  class VORModelObject* target = nullptr;
  VORSharedName type;
  VORProductIOImpl* via = nullptr;
};

// The link types the model creates itself, shared: the hot loops compare them by address.
namespace VORSharedLinkTypes {
const VORSharedName& Item();
const VORSharedName& Resource();
const VORSharedName& IOItem();
}  // namespace VORSharedLinkTypes

// Kind bits of the implementation classes: a cheap exact cast in the hot loops (a
// dynamic_cast across shared libraries compares type names).
enum VORObjectKind : unsigned {
  VORKindRoot = 1,
  VORKindStation = 2,
  VORKindGrouping = 4,
  VORKindOtherActivity = 8,
  VORKindControlNode = 16,
  VORKindProductIO = 32,
  VORKindProduct = 64,
  VORKindAssembly = 128,
  VORKindPlanType = 256,
  VORKindActivity = 1 | 2 | 4 | 8,
  VORKindGraphNode = VORKindActivity | 16,
  VORKindItem = VORKindProduct | VORKindAssembly,
  VORKindAll = 511,
};

class VORModelObject : public virtual VORIModelEvents,
                       public virtual VORISpecObject,
                       public virtual VORILinkableObject {
  VOR_DECLARE_CLASS(VORModelObject, VORBaseUnknown)
 public:
  static constexpr unsigned KindMask = VORKindAll;
  VORModelObject(VORSharedName lateType, unsigned kind) : lateType(lateType), kind(kind) {}
  bool Is(unsigned mask) const { return (kind & mask) != 0; }

  const char* GetLateType() const override { return lateType.c_str(); }

  VOREventPublisher* GetEventPublisher() override;
  int Dispatch(VORNotification* notification) override;
  HRESULT GetTypeName(VORUnicodeString& typeName) override;
  VORString GetId() override { return VORString(id); }
  VORProcess* GetDocument() override;
  HRESULT GetLinkedObjects(VORListValVORBaseUnknown_var*& objects, const char* type) override;
  HRESULT GetPointingObjects(VORListValVORBaseUnknown_var*& objects, const char* type) override;
  HRESULT GetPointedObjects(VORListValVORBaseUnknown_var*& objects, const char* type) override;

  // Dispatches under event name when somebody listens.
  void DispatchEvent(const char* event, VORNotification* notification);
  // The same, reaching callbacks filed under key and callbacks without key only.
  void DispatchEventKeyed(const void* key, const char* event, VORNotification* notification);
  bool Attached() const { return data != nullptr; }

  // Outgoing links of a type, in order.
  std::vector<VORModelObject*> Targets(const char* type) const;
  const VORModelLink* FindLink(const VORModelObject* target, const char* type) const;
  int LinkIndex(const VORModelObject* target, const char* type) const;

  std::string id;
  VORSharedName lateType;
  unsigned kind;
  VORDocumentData* data = nullptr;
  std::vector<VORModelLink> out;
  std::vector<VORModelObject*> in;  // one entry per incoming link (sources)

 protected:
  ~VORModelObject() override = default;

 private:
  VORHandle<VOREventPublisher> _publisher;
};

// A precedence flow as seen from one end; stamp orders flows by creation.
struct VORFlowRef {
  VORGraphNodeImpl* node = nullptr;
  std::uint64_t stamp = 0;
};

class VORGraphNodeImpl : public VORModelObject,
                         public virtual VORIGENode,
                         public virtual VORIGraphNodeLayout,
                         public virtual VORISPPFlowMgt {
  VOR_DECLARE_CLASS(VORGraphNodeImpl, VORModelObject)
 public:
  static constexpr unsigned KindMask = VORKindGraphNode;
  using VORModelObject::VORModelObject;

  // VORIGENode
  HRESULT GetChildren(VORListValVORBaseUnknown_var*& children) override;
  HRESULT GetLabel(VORUnicodeString& label) override;
  HRESULT GetParentNode(VORBaseUnknown_var& parent) override;
  // VORIGraphNodeLayout
  bool HasPertPosition() override { return hasPosition; }
  void GetPertPosition(double& px, double& py) override;
  void SetPertPosition(double px, double py) override;
  void ClearPertPosition() override;
  int GetPertNodeState() override { return state; }
  void SetPertNodeState(int s) override;
  void GetPertNodeSize(double& pw, double& ph) override;
  void SetPertNodeSize(double pw, double ph) override;
  // VORISPPFlowMgt
  HRESULT GetPreviousActivities(VORListValVORBaseUnknown_var*& previous,
                                const char* filter) override;
  HRESULT GetNextActivities(VORListValVORBaseUnknown_var*& next, const char* filter) override;
  HRESULT AddNextActivity(VORBaseUnknown* nextNode) override;
  HRESULT RemoveLink(VORBaseUnknown* other) override;
  HRESULT GetProductInputs(VORListValVORBaseUnknown_var*& inputs) override;
  HRESULT AppendProductInputs(VORListValVORBaseUnknown_var& inputs) override;
  HRESULT GetProductOutputs(VORListValVORBaseUnknown_var*& outputs) override;
  HRESULT GetProductIOs(VORListValVORBaseUnknown_var*& productIOs) override;
  HRESULT AddProductInput(VORBaseUnknown* item, VORBaseUnknown_var& productInput) override;
  HRESULT AddProductOutput(VORBaseUnknown* item, VORBaseUnknown_var& productOutput) override;
  HRESULT RemoveProductIO(VORBaseUnknown* productIO) override;
  void VisitActivities(bool toNext, void (*visit)(void*, VORBaseUnknown*), void* context,
                       const char* filter) override;

  virtual VORActivityImpl* AsActivity() { return nullptr; }
  int IndexInFather() const;

  VORActivityImpl* father = nullptr;
  VORUnicodeString label;
  std::vector<VORFlowRef> previous;
  std::vector<VORFlowRef> next;
  bool hasPosition = false;
  double x = 0, y = 0;
  int state = 0;
  double width = 0, height = 0;

 protected:
  ~VORGraphNodeImpl() override = default;
};

class VORControlNodeImpl : public VORGraphNodeImpl {
  VOR_DECLARE_CLASS(VORControlNodeImpl, VORGraphNodeImpl)
 public:
  static constexpr unsigned KindMask = VORKindControlNode;
  explicit VORControlNodeImpl(std::string type) : VORGraphNodeImpl(std::move(type), KindMask) {}

 protected:
  ~VORControlNodeImpl() override = default;
};

class VORActivityImpl : public VORGraphNodeImpl,
                        public virtual VORISPPActivity,
                        public virtual VORISPPAbstractActivity,
                        public virtual VORISPPChildManagement,
                        public virtual VORISPPItemMgt,
                        public virtual VORISPPResourceManagement,
                        public virtual VORIUserAttributes,
                        public virtual VORIZitBltVisibility {
  VOR_DECLARE_CLASS(VORActivityImpl, VORGraphNodeImpl)
 public:
  static constexpr unsigned KindMask = VORKindActivity;
  explicit VORActivityImpl(std::string type, unsigned kind = VORKindOtherActivity)
      : VORGraphNodeImpl(std::move(type), kind) {}

  // VORISPPActivity / VORISPPAbstractActivity
  HRESULT GetName(VORUnicodeString& name) override;
  HRESULT GetActivityType(VORString& type) override;
  VORString GetActivityType() override { return VORString(lateType); }
  HRESULT GetFatherActivity(VORBaseUnknown_var& fatherActivity) override;
  HRESULT GetRootActivity(VORBaseUnknown_var& root) override;
  HRESULT GetLabel(VORUnicodeString& text) override { return VORGraphNodeImpl::GetLabel(text); }
  HRESULT SetLabel(const VORUnicodeString& text) override;
  HRESULT GetActivityTime(double& t) override;
  HRESULT SetActivityTime(double t) override;
  // VORISPPChildManagement (and VORIGENode)
  HRESULT GetChildren(VORListValVORBaseUnknown_var*& list) override;
  HRESULT GetChildren(VORListValVORBaseUnknown_var*& list, const char* filter) override;
  int GetNumberOfChildren() override { return static_cast<int>(children.size()); }
  HRESULT CreateChild(const char* type, VORBaseUnknown_var& child) override;
  HRESULT RemoveChild(VORBaseUnknown* child) override;
  // VORISPPItemMgt
  HRESULT GetAssignedItems(VORListValVORBaseUnknown_var*& items, const char* type,
                           int mode) override;
  HRESULT AppendAssignedItems(VORListValVORBaseUnknown_var& items, const char* type,
                              int mode) override;
  bool IsItemAssigned(VORBaseUnknown* item) override;
  HRESULT AssignItem(VORBaseUnknown* item, VORBaseUnknown* productInput) override;
  HRESULT UnassignItem(VORBaseUnknown* item) override;
  HRESULT GetAssignmentInput(VORBaseUnknown* item, VORBaseUnknown_var& productInput) override;
  // VORISPPResourceManagement
  HRESULT GetResources(VORListValVORBaseUnknown_var*& resources, const char* filter) override;
  HRESULT AppendResources(VORListValVORBaseUnknown_var& resources, const char* filter) override;
  HRESULT AssignResource(VORBaseUnknown* resource) override;
  HRESULT UnassignResource(VORBaseUnknown* resource) override;
  // VORIUserAttributes
  HRESULT GetAttributeValue(const VORUnicodeString& name, VORAttributeValue& value) override;
  HRESULT SetAttributeValue(const VORUnicodeString& name, const VORAttributeValue& value) override;
  HRESULT GetAttributeNames(VORListValVORUnicodeString& names) override;
  // VORIZitBltVisibility
  HRESULT GetZitBltShown(const VORUnicodeString& name, bool& shown) override;
  HRESULT SetZitBltShown(const VORUnicodeString& name, bool shown) override;
  HRESULT ForgetZitBltShown(const VORUnicodeString& name) override;
  HRESULT GetZitBltShownNames(VORListValVORUnicodeString& names) override;

  VORActivityImpl* AsActivity() override { return this; }
  VORActivityImpl* Root();

  std::vector<VORHandle<VORGraphNodeImpl>> children;
  std::vector<VORHandle<VORProductIOImpl>> productIOs;  // creation order, both directions
  double time = 0;
  double stationCycleTime = 0;  // stations only
  std::map<std::string, VORAttributeValue> attributes;
  std::map<std::string, bool> zitBltShown;  // ZitBlt name (or "All") -> shown

 protected:
  ~VORActivityImpl() override;
};

// The item bookkeeping shared by stations and groupings.
class VORBIWItemInfoImpl : public virtual QELIBIWItemInfo {
 public:
  HRESULT GetFirstItemList(VORListValVORBaseUnknown_var*& items) override;
  HRESULT GetSecondItemList(VORListValVORBaseUnknown_var*& items) override;
  HRESULT GetActivityList(VORListValVORBaseUnknown_var*& activities) override;
  HRESULT GetCoveredItems(VORListValVORBaseUnknown_var*& items) override;
  HRESULT AppendFirstItemList(VORListValVORBaseUnknown_var& items) override;
  HRESULT AppendSecondItemList(VORListValVORBaseUnknown_var& items) override;
  HRESULT AppendActivityList(VORListValVORBaseUnknown_var& activities) override;
  HRESULT AppendCoveredItems(VORListValVORBaseUnknown_var& items) override;
  HRESULT GetConsumedItems(VORListValVORBaseUnknown_var*& items) override;
  HRESULT GetReplaceableProductIOs(VORListValVORBaseUnknown_var*& productIOs) override;
  bool IsListedOutput(VORBaseUnknown* productOutput) override;
  bool AcceptsOutputTransfer(VORBaseUnknown* productOutput, VORBaseUnknown* target) override;
  bool IsInHierarchyOf(VORBaseUnknown* target) override;

 protected:
  ~VORBIWItemInfoImpl() override = default;

 private:
  VORActivityImpl* Self();
};

class VORStationImpl : public VORActivityImpl,
                       public virtual QELIBIWActivityStation,
                       public VORBIWItemInfoImpl {
  VOR_DECLARE_CLASS(VORStationImpl, VORActivityImpl)
 public:
  static constexpr unsigned KindMask = VORKindStation;
  explicit VORStationImpl(std::string type) : VORActivityImpl(std::move(type), KindMask) {}
  HRESULT GetStationCycleTime(double& t) override;
  HRESULT SetStationCycleTime(double t) override;

 protected:
  ~VORStationImpl() override = default;
};

class VORGroupingImpl : public VORActivityImpl, public VORBIWItemInfoImpl {
  VOR_DECLARE_CLASS(VORGroupingImpl, VORActivityImpl)
 public:
  static constexpr unsigned KindMask = VORKindGrouping;
  explicit VORGroupingImpl(std::string type) : VORActivityImpl(std::move(type), KindMask) {}

 protected:
  ~VORGroupingImpl() override = default;
};

class VORRootImpl : public VORActivityImpl,
                    public virtual VORISPPActivityRoot,
                    public virtual VORISPPActivityModificationEvents,
                    public virtual QELIUpdateManufAssly {
  VOR_DECLARE_CLASS(VORRootImpl, VORActivityImpl)
 public:
  static constexpr unsigned KindMask = VORKindRoot;
  explicit VORRootImpl(std::string type) : VORActivityImpl(std::move(type), KindMask) {}
  VOREventPublisher* GetEventPublisher() override { return VORModelObject::GetEventPublisher(); }
  VORProcess* GetProcessDocument() override { return GetDocument(); }
  bool IsUpdateInProgress() override { return updateInProgress; }
  void SetUpdateInProgress(bool inProgress) override { updateInProgress = inProgress; }

  bool updateInProgress = false;

 protected:
  ~VORRootImpl() override = default;
};

class VORProductIOImpl : public VORModelObject, public virtual VORISPPProductIO {
  VOR_DECLARE_CLASS(VORProductIOImpl, VORModelObject)
 public:
  static constexpr unsigned KindMask = VORKindProductIO;
  explicit VORProductIOImpl(bool input)
      : VORModelObject(input ? VORModelLateTypes::ProductInput : VORModelLateTypes::ProductOutput,
                       KindMask),
        input(input) {}
  bool IsInput() override { return input; }
  HRESULT GetItem(VORBaseUnknown_var& item) override;
  HRESULT GetConsumedItem(VORBaseUnknown_var& item) override;
  HRESULT GetProducedItem(VORBaseUnknown_var& item) override;
  HRESULT GetProduct(VORBaseUnknown_var& product) override { return GetItem(product); }
  HRESULT GetActivity(VORBaseUnknown_var& owner) override;
  HRESULT SetItem(VORBaseUnknown* item) override;

  VORModelObject* Item() const;

  bool input;
  VORActivityImpl* activity = nullptr;

 protected:
  ~VORProductIOImpl() override = default;
};

class VORProductImpl : public VORModelObject,
                       public virtual VORIProduct,
                       public virtual VORIAlias,
                       public virtual VORISPPItem,
                       public virtual VORIVisProperties,
                       public virtual VORIResource {
  VOR_DECLARE_CLASS(VORProductImpl, VORModelObject)
 public:
  static constexpr unsigned KindMask = VORKindProduct;
  VORProductImpl() : VORModelObject(VORModelLateTypes::Product, KindMask) {}
  // Answers VORIResource only once it is a resource.
  HRESULT QueryInterface(const VORInterfaceId& iid, void** result) override;

  HRESULT GetFatherProduct(VORBaseUnknown_var& fatherProduct) override;
  HRESULT GetReferenceProduct(VORBaseUnknown_var& reference) override;
  HRESULT GetChildren(VORListValVORBaseUnknown_var*& list, const char* type) override;
  HRESULT AddChild(const VORUnicodeString& name, VORBaseUnknown_var& child) override;
  HRESULT RemoveChild(VORBaseUnknown* child) override;
  HRESULT GetPartNumber(VORUnicodeString& name) override;
  HRESULT SetPartNumber(const VORUnicodeString& name) override;
  HRESULT GetAlias(VORUnicodeString& text) override;
  HRESULT SetAlias(const VORUnicodeString& text) override;
  HRESULT GetName(VORUnicodeString& name) override;
  VORUnicodeString GetDisplayName() override { return partNumber; }
  bool IsShown() override { return shown; }
  HRESULT SetShown(bool show) override;
  HRESULT GetPlanTypeName(VORUnicodeString& type) override;
  HRESULT SetPlanTypeName(const VORUnicodeString& type) override;
  HRESULT GetResourceClass(VORUnicodeString& cls) override;
  HRESULT SetName(const VORUnicodeString& name) override;

  VORProductImpl* Reference();
  int IndexInFather() const;

  VORProductImpl* father = nullptr;
  std::vector<VORHandle<VORProductImpl>> children;
  VORUnicodeString partNumber;
  VORUnicodeString alias;
  bool shown = true;
  bool isResource = false;
  VORUnicodeString resourceClass;
  VORUnicodeString planType;

 protected:
  ~VORProductImpl() override;
};

class VORMfgAssemblyImpl : public VORModelObject,
                           public virtual QELIMfgAssembly,
                           public virtual VORISPPItem {
  VOR_DECLARE_CLASS(VORMfgAssemblyImpl, VORModelObject)
 public:
  static constexpr unsigned KindMask = VORKindAssembly;
  VORMfgAssemblyImpl() : VORModelObject(VORModelLateTypes::MfgAssembly, KindMask) {}
  HRESULT GetComponents(VORListValVORBaseUnknown_var*& components) override;
  HRESULT AddComponent(VORBaseUnknown* component) override;
  HRESULT RemoveComponent(VORBaseUnknown* component) override;
  HRESULT GetName(VORUnicodeString& text) override;
  VORUnicodeString GetDisplayName() override { return name; }

  VORUnicodeString name;

 protected:
  ~VORMfgAssemblyImpl() override = default;
};

// A plan type of the planning hub: attributes by (key, name), relations as links whose type
// is the relation name, and an optional base plan type (link "base").
class VORPlanTypeImpl : public VORModelObject {
  VOR_DECLARE_CLASS(VORPlanTypeImpl, VORModelObject)
 public:
  static constexpr unsigned KindMask = VORKindPlanType;
  VORPlanTypeImpl() : VORModelObject("PlanType", KindMask) {}
  static constexpr const char* BaseLink = "base";
  VORPlanTypeImpl* Base() const;
  // attribute (key, name) -> value; "name" under key "" is the plan type's name.
  std::map<std::pair<std::string, std::string>, VORUnicodeString> attributes;
  VORUnicodeString Name() const;

 protected:
  ~VORPlanTypeImpl() override = default;
};

// The hub's record of a model object: user-defined attributes.
class VORHubObjectImpl : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORHubObjectImpl, VORBaseUnknown)
 public:
  std::string objectId;
  std::map<std::string, VORAttributeValue> attributes;

 protected:
  ~VORHubObjectImpl() override = default;
};

class VORResourceDescriptionImpl : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORResourceDescriptionImpl, VORBaseUnknown)
 public:
  VORUnicodeString resourceClass;
  VORUnicodeString planType;

 protected:
  ~VORResourceDescriptionImpl() override = default;
};

class VORContainerImpl : public virtual VORIContainer,
                         public virtual VORIModelEvents,
                         public virtual VORISPPProcessContainer,
                         public virtual VORIResourceFactory,
                         public virtual QELIMfgAssemblyModificationEvents {
  VOR_DECLARE_CLASS(VORContainerImpl, VORBaseUnknown)
 public:
  VORContainerImpl(VORDocumentData* data, std::string name) : data(data), name(std::move(name)) {}
  // Each container answers only the interfaces of its kind.
  HRESULT QueryInterface(const VORInterfaceId& iid, void** result) override;

  VORString GetContainerName() override { return VORString(name); }
  HRESULT ListMembers(const VORInterfaceId& iid, VORListValVORBaseUnknown_var*& members) override;
  VOREventPublisher* GetEventPublisher() override;
  int Dispatch(VORNotification* notification) override;
  HRESULT GetListOfProcesses(VORListValVORBaseUnknown_var*& processes) override;
  HRESULT RemoveResource(VORBaseUnknown* resource) override;
  HRESULT CreateResource(const VORUnicodeString& resourceClass, VORBaseUnknown* product,
                         const VORUnicodeString& planType,
                         VORBaseUnknown_var& description) override;
  HRESULT AttachResource(VORBaseUnknown* product, VORBaseUnknown* description) override;

  VORDocumentData* data;
  std::string name;

 protected:
  ~VORContainerImpl() override = default;

 private:
  VORHandle<VOREventPublisher> _publisher;
};

// Per-document state behind VORProcess.
struct VORDocumentData {
  explicit VORDocumentData(VORProcess* document);
  ~VORDocumentData();

  VORProcess* document;
  VORModelDoor door;
  VORUndoHistory history{door};
  std::string environment;
  VORHandle<VORContainerImpl> pprContainer;
  VORHandle<VORContainerImpl> bomContainer;
  VORHandle<VORContainerImpl> processContainer;
  VORHandle<VORRootImpl> root;
  std::vector<VORHandle<VORProductImpl>> rootProducts;
  std::vector<VORHandle<VORMfgAssemblyImpl>> assemblies;
  std::vector<VORHandle<VORPlanTypeImpl>> planTypes;
  std::map<std::string, VORHandle<VORHubObjectImpl>> hubObjects;  // by object id
  std::unordered_map<std::string, VORModelObject*> ids;
  std::uint64_t nextFlowStamp = 1;
  long nextIdNumber = 1;
  bool modified = false;

  std::string NewId(const char* prefix);
  void Register(VORModelObject* object, const std::string& wantedId);
  void Unregister(VORModelObject* object);
  VORModelObject* Find(const std::string& id) const;
  // Every object of the document (activities, control nodes, product IOs, products,
  // assemblies, plan types).
  std::vector<VORModelObject*> AllObjects() const;
  void DetachAll();
};

// Casts for the door and the services: the implementation object behind an interface, or null
// when it is not one of ours or not in data's document (data null: any document).
template <class T>
T* VORImplOf(VORBaseUnknown* object, VORDocumentData* data = nullptr) {
  if (object == nullptr)
    return nullptr;
  T* impl = VORDynamicCast<T>(object->GetIdentity());
  if (impl == nullptr || impl->data == nullptr)
    return nullptr;
  if (data != nullptr && impl->data != data)
    return nullptr;
  return impl;
}

// The object as T when its kind is one of T's, else null.
template <class T>
T* VORKindCast(VORModelObject* object) {
  return object != nullptr && object->Is(T::KindMask) ? static_cast<T*>(object) : nullptr;
}

// Helpers shared by the implementation files.
VORListValVORBaseUnknown_var* VORNewList();
bool VORMatchesFilter(VORModelObject* object, const char* filter);

// True when node is ancestor or lies below it: the one walk up a tree of the model (activities
// and their fathers, products and theirs).
template <class Node>
bool VORIsInside(const Node* node, const Node* ancestor) {
  for (const Node* n = node; n != nullptr; n = n->father) {
    if (n == ancestor)
      return true;
  }
  return false;
}
