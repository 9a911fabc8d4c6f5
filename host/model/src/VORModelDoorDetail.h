// The door's private toolkit (vor_model only): symmetric link and flow surgery that can be
// replayed backwards, subtree walks shared with the document, notifications, and the one
// template behind the scalar setters.
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include "VORModelDoor.h"
#include "VORModelObjects.h"

namespace VORDoorDetail {

inline VORBaseUnknown* Unk(VORModelObject* o) {
  return static_cast<VORISpecObject*>(o);
}

// Emits an activity notification on the root's tree publisher (views-change event) and, when
// the father is another activity, on the father's own publisher.
void NotifyActivity(VORDocumentData* data, VORActivityImpl* father, VORModelObject* son,
                    SPPModifyKind kind);
void NotifyModify(VORModelObject* object, const char* what);
void NotifyMfg(VORDocumentData* data, VORMfgAssemblyImpl* assembly, const char* event);

// A removed link with the positions it had at both ends.
struct LinkRecord {
  VORHandle<VORModelObject> source;
  VORHandle<VORModelObject> target;
  std::string type;
  VORHandle<VORProductIOImpl> via;
  size_t outIndex;
  size_t inIndex;
};

LinkRecord DetachLink(VORModelObject* source, size_t outIndex);
void ReattachLink(const LinkRecord& r);
void AddLink(VORModelObject* source, VORModelObject* target, const std::string& type,
             VORProductIOImpl* via = nullptr);

struct FlowRecord {
  VORHandle<VORGraphNodeImpl> from;
  VORHandle<VORGraphNodeImpl> to;
  std::uint64_t stamp;
  size_t nextIndex;
  size_t prevIndex;
};

// Index of node in refs, refs.size() when absent.
size_t FindFlow(const std::vector<VORFlowRef>& refs, const VORGraphNodeImpl* node);
FlowRecord DetachFlow(VORGraphNodeImpl* from, VORGraphNodeImpl* to);
void ReattachFlow(const FlowRecord& r);

// Objects of a graph-node subtree: nodes (pre-order) and their product IOs.
void CollectSubtree(VORGraphNodeImpl* node, std::vector<VORModelObject*>& objects);
// A product and its descendants, pre-order.
void CollectProducts(VORProductImpl* product, std::vector<VORModelObject*>& products);

// Detaches every link and flow touching the objects (links among them too), newest position
// last, so that replaying the records backwards restores every index.
struct Detached {
  std::vector<LinkRecord> links;
  std::vector<FlowRecord> flows;
  // Item assignments that used a removed product input: (source activity, index, input).
  std::vector<std::pair<VORHandle<VORModelObject>, std::pair<size_t, VORHandle<VORProductIOImpl>>>>
      vias;
};

void DetachEverything(const std::vector<VORModelObject*>& objects, Detached& d);
void ReattachEverything(const Detached& d);

// The values a document can hold: no NaN or infinity (the reader refuses them too, so that
// what is saved can be opened again).
bool IsFinite(double value);
bool IsFinite(const VORAttributeValue& value);

VORGraphNodeImpl* MakeNode(const std::string& type);
// True when target is component (directly or not) of from.
bool ReachesComponent(VORModelObject* from, VORModelObject* target);
// The product or assembly behind object, null for anything else.
VORModelObject* ItemOf(VORBaseUnknown* object, VORDocumentData* data);

}  // namespace VORDoorDetail

// Sets one field with undo through the door, notifying VORModify(what). An equal value
// changes nothing and still succeeds.
template <class Impl, class Owner, class Value, class Arg>
HRESULT VORModelDoor::SetScalar(Impl* object, Value Owner::*field, std::type_identity_t<Arg> value,
                                const char* what,
                                HRESULT (VORModelDoor::*again)(VORBaseUnknown*, Arg)) {
  if (object == nullptr)
    return E_INVALIDARG;
  Owner* owner = object;
  if (owner->*field == value)
    return S_OK;
  Value old = owner->*field;
  owner->*field = value;
  VORHandle<Impl> keep(object);
  Record([this, keep, again, old] { (this->*again)(VORDoorDetail::Unk(keep.get()), old); });
  VORDoorDetail::NotifyModify(object, what);
  Changed();
  return S_OK;
}
