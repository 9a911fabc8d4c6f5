#include "QELStatesInputListZitBltCmd.h"

#include "QELBaseScrollListZitBltRep.h"
#include "QELIBIWItemInfo.h"
#include "QELListZitBltCmdHelpers.h"
#include "VORCommandHeader.h"
#include "VORISPPItem.h"
#include "VORISPPItemMgt.h"
#include "VORScratchList.h"
#include "VORSmallSet.h"

bool QELStatesInputListZitBltCmd::HandleEvent(SPPModifyKind kind, VORBaseUnknown* son) {
  if (kind == SPPProductIOChanged)
    return true;
  return (kind == SPPItemAssigned || kind == SPPItemUnassigned) &&
         QELIsItemOfType(son, {"ASMPRODUCT", "QELMfgAssy"});
}

void QELStatesInputListZitBltCmd::UpdateList(QELBaseScrollListZitBltRep* rep) {
  if (rep == nullptr)
    return;
  rep->RemoveAllItems(1);
  VORISPPFlowMgt_var flow(GetOwner());
  if (flow && VORISPPItemMgt_var(GetOwner())) {
    VORScratchList assigned;
    GetFirstFirstAssignedItems(VORISPPActivity_var(GetOwner()), *assigned);
    QELIBIWItemInfo_var info(GetOwner());
    VORScratchList activities;
    if (info)
      info->AppendActivityList(*activities);
    // A station without sub-activities is its own listed activity: its items are the ones just
    // asked for, kept before its inputs take theirs out.
    const bool listsItself =
        activities->Size() == 1 &&
        (*activities)[1].Identity() == VORBaseUnknown_var(GetOwner()).Identity();
    VORScratchList collected;
    if (listsItself)
      collected->Append(*assigned);
    // The activity's own inputs.
    QELAppendAssignedInputs(flow.get(), *assigned, rep, QELIListZitBltItemState::Direct);
    // What the sub-activities take from outside, once each.
    if (activities->Size() > 0) {
      VORScratchList covered;
      info->AppendCoveredItems(*covered);
      VORSmallSet<const void*> skip;
      for (const VORBaseUnknown_var& item : *covered)
        skip.Insert(item.Identity());
      if (!listsItself) {
        for (const VORBaseUnknown_var& activity : *activities)
          GetFirstFirstAssignedItems(VORISPPActivity_var(activity), *collected);
      }
      for (const VORBaseUnknown_var& item : *collected) {
        if (VORISPPItem_var(item) && skip.Insert(item.Identity()))
          rep->AppendItem(item.get(), QELIListZitBltItemState::Listed);
      }
    }
  }
  rep->DrawScrollList();
}

VOR_EXPORT_COMMAND_FACTORY(QELStatesInputListZitBltCmd)
