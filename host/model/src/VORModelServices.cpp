// The item bookkeeping of stations and groupings.
#include <algorithm>
#include <unordered_map>

#include "VORDynamicCast.h"
#include "VORLateTypes.h"
#include "VORModelObjects.h"
#include "VORSmallSet.h"

namespace {
VORBaseUnknown* Unk(VORModelObject* o) {
  return static_cast<VORISpecObject*>(o);
}
}  // namespace

VORActivityImpl* VORBIWItemInfoImpl::Self() {
  return VORDynamicCast<VORActivityImpl>(this);
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
bool HasChildActivity(VORActivityImpl* a) {
  for (auto& c : a->children) {
    if (c->AsActivity() != nullptr)
      return true;
  }
  return false;
}
void AppendIO(VORListValVORBaseUnknown_var& list, VORProductIOImpl* io) {
  list.Append(VORBaseUnknown_var(static_cast<VORISPPProductIO*>(io)));
}
}  // namespace

HRESULT VORBIWItemInfoImpl::GetFirstItemList(VORListValVORBaseUnknown_var*& items) {
  items = VORNewList();
  return AppendFirstItemList(*items);
}

HRESULT VORBIWItemInfoImpl::GetSecondItemList(VORListValVORBaseUnknown_var*& items) {
  items = VORNewList();
  return AppendSecondItemList(*items);
}

HRESULT VORBIWItemInfoImpl::GetActivityList(VORListValVORBaseUnknown_var*& activities) {
  activities = VORNewList();
  return AppendActivityList(*activities);
}

HRESULT VORBIWItemInfoImpl::GetCoveredItems(VORListValVORBaseUnknown_var*& items) {
  items = VORNewList();
  return AppendCoveredItems(*items);
}

HRESULT VORBIWItemInfoImpl::AppendFirstItemList(VORListValVORBaseUnknown_var& items) {
  for (auto& io : Self()->productIOs) {
    if (!io->input)
      AppendIO(items, io.get());
  }
  return S_OK;
}

HRESULT VORBIWItemInfoImpl::AppendSecondItemList(VORListValVORBaseUnknown_var& items) {
  VORActivityImpl* self = Self();
  if (!HasChildActivity(self))
    return S_OK;  // only children hand anything on
  VORSmallSet<VORModelObject*> consumed;
  auto addConsumed = [&](VORActivityImpl* a) {
    for (auto& io : a->productIOs) {
      if (io->input && io->Item())
        consumed.Insert(io->Item());
    }
  };
  addConsumed(self);
  const auto children = ChildActivities(self);
  for (VORActivityImpl* c : children)
    addConsumed(c);
  // What the activity declares itself is in the first list already.
  for (auto& io : self->productIOs) {
    if (!io->input && io->Item())
      consumed.Insert(io->Item());
  }
  for (VORActivityImpl* c : children) {
    for (auto& io : c->productIOs) {
      if (!io->input && io->Item() && consumed.Insert(io->Item()))
        AppendIO(items, io.get());
    }
  }
  return S_OK;
}

HRESULT VORBIWItemInfoImpl::AppendActivityList(VORListValVORBaseUnknown_var& activities) {
  VORActivityImpl* self = Self();
  if (!HasChildActivity(self)) {
    if (VORKindCast<VORStationImpl>(self))
      activities.Append(VORBaseUnknown_var(Unk(self)));
    return S_OK;
  }
  for (auto& c : self->children) {
    if (VORActivityImpl* ca = c->AsActivity())
      activities.Append(VORBaseUnknown_var(Unk(ca)));
  }
  return S_OK;
}

HRESULT VORBIWItemInfoImpl::AppendCoveredItems(VORListValVORBaseUnknown_var& items) {
  VORActivityImpl* self = Self();
  VORSmallSet<VORModelObject*> seen;
  auto add = [&](VORModelObject* item) {
    if (item != nullptr && seen.Insert(item))
      items.Append(VORBaseUnknown_var(Unk(item)));
  };
  auto addOutputsOf = [&](VORActivityImpl* a) {
    for (auto& io : a->productIOs) {
      if (!io->input)
        add(io->Item());
    }
  };
  // The listed activities: the children, or a station without children itself.
  if (!HasChildActivity(self)) {
    if (VORKindCast<VORStationImpl>(self))
      addOutputsOf(self);
  } else {
    for (auto& c : self->children) {
      if (VORActivityImpl* ca = c->AsActivity())
        addOutputsOf(ca);
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
  VORSmallSet<VORModelObject*> seen;
  std::vector<VORActivityImpl*> all{Self()};
  for (VORActivityImpl* c : ChildActivities(Self()))
    all.push_back(c);
  for (VORActivityImpl* a : all) {
    for (auto& io : a->productIOs) {
      if (io->input && io->Item() && seen.Insert(io->Item()))
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
  return VORIsInside<VORGraphNodeImpl>(self, t) || VORIsInside<VORGraphNodeImpl>(t, self);
}
