#include "QELStatesResourceListZitBltCmd.h"

#include "QELBaseScrollListZitBltRep.h"
#include "QELIListZitBltItemState.h"
#include "VORCommandHeader.h"
#include "VORISPPItem.h"
#include "VORISPPResourceManagement.h"
#include "VORScratchList.h"

bool QELStatesResourceListZitBltCmd::HandleEvent(SPPModifyKind kind, VORBaseUnknown*) {
  return kind == SPPResourceAssigned || kind == SPPResourceUnassigned;
}

void QELStatesResourceListZitBltCmd::UpdateList(QELBaseScrollListZitBltRep* rep) {
  if (rep == nullptr)
    return;
  rep->RemoveAllItems(1);
  VORISPPResourceManagement_var resources(GetOwner());
  VORScratchList assigned;
  if (resources && SUCCEEDED(resources->AppendResources(*assigned, "Resource"))) {
    for (const VORBaseUnknown_var& resource : *assigned) {
      if (VORISPPItem_var(resource))
        rep->AppendItem(resource.get(), QELIListZitBltItemState::NoState);
    }
  }
  rep->DrawScrollList();
}

VOR_EXPORT_COMMAND_FACTORY(QELStatesResourceListZitBltCmd)
