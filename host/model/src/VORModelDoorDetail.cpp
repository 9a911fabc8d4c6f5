// The door's private toolkit: link and flow surgery, subtree walks, notifications.
#include "VORModelDoorDetail.h"

#include <algorithm>
#include <cmath>
#include <unordered_set>

#include "VORLateTypes.h"

namespace VORDoorDetail {

void NotifyActivity(VORDocumentData* data, VORActivityImpl* father, VORModelObject* son,
                    SPPModifyKind kind) {
  if (father == nullptr || !data->root)
    return;
  auto n = VORHandle<VORSPPActivityNotification>::Adopt(
      new VORSPPActivityNotification(Unk(father), son ? Unk(son) : nullptr, kind));
  const char* event = VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE();
  VORRootImpl* root = data->root.get();
  root->DispatchEventKeyed(Unk(father)->GetIdentity(), event, n.get());
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

namespace {
size_t InIndexOf(VORModelObject* target, VORModelObject* source, size_t occurrence) {
  size_t seen = 0;
  for (size_t i = 0; i < target->in.size(); ++i) {
    if (target->in[i] == source && seen++ == occurrence)
      return i;
  }
  return target->in.size();
}
}  // namespace

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
             VORProductIOImpl* via) {
  source->out.push_back({target, type, via});
  target->in.push_back(source);
}

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

void CollectSubtree(VORGraphNodeImpl* node, std::vector<VORModelObject*>& objects) {
  objects.push_back(node);
  if (VORActivityImpl* a = node->AsActivity()) {
    for (auto& io : a->productIOs)
      objects.push_back(io.get());
    for (auto& c : a->children)
      CollectSubtree(c.get(), objects);
  }
}

void CollectProducts(VORProductImpl* product, std::vector<VORModelObject*>& products) {
  products.push_back(product);
  for (auto& c : product->children)
    CollectProducts(c.get(), products);
}

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

bool IsFinite(double value) {
  return std::isfinite(value);
}

bool IsFinite(const VORAttributeValue& value) {
  return value.type != VORAttributeDouble || std::isfinite(value.doubleValue);
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

VORModelObject* ItemOf(VORBaseUnknown* object, VORDocumentData* data) {
  auto* o = VORImplOf<VORModelObject>(object, data);
  if (o == nullptr)
    return nullptr;
  if (VORKindCast<VORProductImpl>(o) == nullptr && VORKindCast<VORMfgAssemblyImpl>(o) == nullptr)
    return nullptr;
  return o;
}

}  // namespace VORDoorDetail
