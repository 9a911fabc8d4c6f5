#include "QELStatesInputLeafListZitBltCmd.h"

#include "QELBaseScrollListZitBltRep.h"
#include "QELListZitBltCmdHelpers.h"
#include "VORCommandHeader.h"
#include "VORScratchList.h"

bool QELStatesInputLeafListZitBltCmd::HandleEvent(SPPModifyKind kind, VORBaseUnknown* son) {
  return (kind == SPPItemAssigned || kind == SPPItemUnassigned) &&
         QELIsItemOfType(son, {"ASMPRODUCT"});
}

void QELStatesInputLeafListZitBltCmd::UpdateList(QELBaseScrollListZitBltRep* rep) {
  if (rep == nullptr)
    return;
  rep->RemoveAllItems(1);
  if (VORISPPFlowMgt_var flow(GetOwner()); flow) {
    VORScratchList assigned;
    GetFirstFirstAssignedItems(VORISPPActivity_var(GetOwner()), *assigned);
    QELAppendAssignedInputs(flow.get(), *assigned, rep, QELIListZitBltItemState::Listed);
  }
  rep->DrawScrollList();
}

VOR_EXPORT_COMMAND_FACTORY(QELStatesInputLeafListZitBltCmd)
