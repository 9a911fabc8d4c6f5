#include "QELEListZitBltItemDDPI.h"

#include <memory>

#include "QELIMfgAssembly.h"
#include "QELListZitBltItemDDRules.h"
#include "VORISPPFlowMgt.h"
#include "VORISPPItemMgt.h"

using namespace QELItemDD;

int QELEListZitBltItemDDPI::CheckReassignment(VORBaseUnknown* from, VORBaseUnknown* to,
                                              VORUnicodeString& message) {
  VORUnicodeString fromType;
  VORUnicodeString toType;
  if (!ReadActivityTypes(from, to, fromType, toType, message))
    return 0;
  const VORBaseUnknown_var item = ItemOf(GetExtendedObject());
  if (IsStationOrGrouping(fromType) && !AcceptsInputOf(to, item)) {
    message = VORUnicodeString(kProducedByTarget);
    return 0;
  }
  if (!IsStationGroupingOrLoading(fromType) || !IsStationGroupingOrLoading(toType)) {
    message = TypeRefusal(fromType, toType);
    return 0;
  }
  if (!item)
    return 0;
  if (QELIMfgAssembly_var(item) && !AcceptsAssembly(to, item)) {
    message = VORUnicodeString(kComponentAssigned);
    return 0;
  }
  VORISPPItemMgt_var items{VORBaseUnknown_var(to)};
  VORListValVORBaseUnknown_var* assigned = nullptr;
  if (!items || FAILED(items->GetAssignedItems(assigned, "Item")) || assigned == nullptr) {
    message = VORUnicodeString(kNoItemList);
    return 0;
  }
  const std::unique_ptr<VORListValVORBaseUnknown_var> owned(assigned);
  const VORUnicodeString name = NameOf(item);
  return RefuseIfListed(
      assigned, [&](const VORBaseUnknown_var& other) { return NameOf(other) == name; }, message);
}

HRESULT QELEListZitBltItemDDPI::Reassign(VORBaseUnknown* from, VORBaseUnknown* to) {
  if (from == nullptr || to == nullptr)
    return E_FAIL;
  VORUnicodeString toType;
  TypeNameOf(to, toType);
  if (IsWelding(toType))
    return E_FAIL;
  VORBaseUnknown* input = GetExtendedObject();
  const VORBaseUnknown_var item = ItemOf(input);
  VORISPPFlowMgt_var fromFlow{VORBaseUnknown_var(from)};
  VORISPPFlowMgt_var toFlow{VORBaseUnknown_var(to)};
  if (!item || !fromFlow || !toFlow)
    return E_FAIL;
  AllOrNothing change(input);
  // The assignment made through the dragged input belongs to it: it leaves with it, or the
  // from activity's list would still show the item.
  VORISPPItemMgt_var fromItems{VORBaseUnknown_var(from)};
  VORBaseUnknown_var via;
  const bool assignedThrough = fromItems && SUCCEEDED(fromItems->GetAssignmentInput(item, via)) &&
                               via && via.Identity() == input->GetIdentity();
  if (FAILED(fromFlow->RemoveProductIO(input)))
    return E_FAIL;
  if (assignedThrough && FAILED(fromItems->UnassignItem(item)))
    return E_FAIL;
  VORBaseUnknown_var added;
  if (FAILED(toFlow->AddProductInput(item, added)))
    return E_FAIL;
  if (IsStationGroupingOrLoading(toType)) {
    VORISPPItemMgt_var toItems{VORBaseUnknown_var(to)};
    if (!toItems || FAILED(toItems->AssignItem(item, added)))
      return E_FAIL;
  }
  change.Commit();
  return S_OK;
}
