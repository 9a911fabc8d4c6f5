#include "QELEListZitBltItemDDPO.h"

#include <memory>

#include "QELFpaBIWDDOptionsDlg.h"
#include "QELIBIWItemInfo.h"
#include "QELListZitBltItemDDRules.h"
#include "VORISPPItemMgt.h"
#include "VORISPPProductIO.h"
#include "VORISpecObject.h"
#include "VORModelTypes.h"

using namespace QELItemDD;

namespace {
using List = std::unique_ptr<VORListValVORBaseUnknown_var>;

bool Contains(VORListValVORBaseUnknown_var* list, VORBaseUnknown* object) {
  if (list == nullptr)
    return false;
  for (const VORBaseUnknown_var& entry : *list) {
    if (entry.Identity() == object->GetIdentity())
      return true;
  }
  return false;
}
}  // namespace

int QELEListZitBltItemDDPO::CheckReassignment(VORBaseUnknown* from, VORBaseUnknown* to,
                                              VORUnicodeString& message) {
  VORUnicodeString fromType;
  VORUnicodeString toType;
  if (!ReadActivityTypes(from, to, fromType, toType, message))
    return 0;
  if (!IsStationOrGrouping(fromType) || !IsStationGroupingOrLoading(toType)) {
    message = TypeRefusal(fromType, toType);
    return 0;
  }
  VORBaseUnknown* output = GetExtendedObject();
  QELIBIWItemInfo_var info{VORBaseUnknown_var(from)};
  if (!info)
    return 0;
  const bool listed = info->IsListedOutput(output);
  if (!listed && !info->IsInHierarchyOf(to))
    return 0;
  if (listed && toType == VORUnicodeString(VORModelLateTypes::Loading))
    return 0;
  if (!info->AcceptsOutputTransfer(output, to))
    return 0;
  const VORBaseUnknown_var item = ItemOf(output);
  VORISPPFlowMgt_var toFlow{VORBaseUnknown_var(to)};
  VORListValVORBaseUnknown_var* ios = nullptr;
  const List owned(toFlow && SUCCEEDED(toFlow->GetProductIOs(ios)) ? ios : nullptr);
  return RefuseIfListed(
      owned.get(),
      [&](const VORBaseUnknown_var& io) {
        return item && ItemOf(io).Identity() == item.Identity();
      },
      message);
}

HRESULT QELEListZitBltItemDDPO::Reassign(VORBaseUnknown* from, VORBaseUnknown* to) {
  if (from == nullptr || to == nullptr)
    return E_FAIL;
  VORUnicodeString toType;
  if (!TypeNameOf(to, toType) || !IsStationGroupingOrLoading(toType))
    return E_FAIL;
  // A choice still waiting for an earlier drop is given up.
  if (_dialog != nullptr)
    _dialog->UserCloseWindow();
  _output = GetExtendedObject();
  _item = ItemOf(_output);
  _fromFlow = VORISPPFlowMgt_var{VORBaseUnknown_var(from)};
  if (!_item) {
    Forget();
    return E_FAIL;
  }
  QELIBIWItemInfo_var fromInfo{VORBaseUnknown_var(from)};
  VORListValVORBaseUnknown_var* activities = nullptr;
  if (fromInfo)
    fromInfo->GetActivityList(activities);
  const List ownedActivities(activities);
  if (Contains(activities, to)) {
    // One of the from activity's own sub-activities: the planner says which of its items the
    // output replaces.
    VORListValVORBaseUnknown_var* ios = nullptr;
    if (QELIBIWItemInfo_var toInfo{VORBaseUnknown_var(to)}; toInfo)
      toInfo->GetReplaceableProductIOs(ios);
    const List ownedIOs(ios);
    _offered.RemoveAll();
    if (ios != nullptr) {
      for (const VORBaseUnknown_var& io : *ios) {
        if (ItemOf(io))
          _offered.Append(io);
      }
    }
    if (!_offered.IsEmpty()) {
      _to = VORBaseUnknown_var(to);
      VORISpecObject_var spec{VORBaseUnknown_var(to)};
      QELIListZitBltItemDD_var self{VORBaseUnknown_var(_output)};
      _dialog =
          new QELFpaBIWDDOptionsDlg(spec ? spec->GetDocument() : nullptr, [self](int position) {
            if (auto* po = dynamic_cast<QELEListZitBltItemDDPO*>(self.get()))
              po->CompleteReassign(position);
          });
      _dialog->Build();
      for (const VORBaseUnknown_var& io : _offered)
        _dialog->AppendItem(NameOf(ItemOf(io)));
      _dialog->SetVisibility(true);
      return S_FALSE;
    }
    const HRESULT hr = AddAsInput(to, _item);
    Forget();
    return hr;
  }
  VORISPPItemMgt_var toItems{VORBaseUnknown_var(to)};
  const HRESULT hr = !toItems || !toItems->IsItemAssigned(_item) ? AddAsInput(to, _item) : E_FAIL;
  Forget();
  return hr;
}

HRESULT QELEListZitBltItemDDPO::AddAsInput(VORBaseUnknown* to, VORBaseUnknown* item) {
  VORISPPFlowMgt_var toFlow{VORBaseUnknown_var(to)};
  if (!toFlow)
    return E_FAIL;
  AllOrNothing change(to);
  VORBaseUnknown_var input;
  if (FAILED(toFlow->AddProductInput(item, input)))
    return E_FAIL;
  if (VORISPPItemMgt_var toItems{VORBaseUnknown_var(to)};
      toItems && FAILED(toItems->AssignItem(item, input)))
    return E_FAIL;
  change.Commit();
  return S_OK;
}

void QELEListZitBltItemDDPO::CompleteReassign(int position) {
  if (!_to)
    return;
  if (position >= 1 && position <= _offered.Size()) {
    const VORBaseUnknown_var chosen = _offered[position];
    const VORBaseUnknown_var old = ItemOf(chosen);
    VORISPPProductIO_var io(chosen);
    UndoStep step(_to, "Reassign Item");
    AllOrNothing change(_to);
    bool ok = io && SUCCEEDED(io->SetItem(_item));
    // An assignment made through a chosen input follows it to the new item.
    VORISPPItemMgt_var toItems(_to);
    VORBaseUnknown_var via;
    if (ok && io->IsInput() && toItems && SUCCEEDED(toItems->GetAssignmentInput(old, via)) &&
        via.Identity() == chosen.Identity())
      ok = SUCCEEDED(toItems->UnassignItem(old)) && SUCCEEDED(toItems->AssignItem(_item, chosen));
    if (ok)
      change.Commit();
  }
  Forget();
}

void QELEListZitBltItemDDPO::Forget() {
  _output = nullptr;
  _fromFlow = NULL_var;
  _to = NULL_var;
  _item = NULL_var;
  _offered.RemoveAll();
  _dialog = nullptr;
}
