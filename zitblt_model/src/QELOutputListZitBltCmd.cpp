#include "QELOutputListZitBltCmd.h"

#include "QELBaseScrollListZitBltRep.h"
#include "QELIBIWItemInfo.h"
#include "QELListZitBltCmdHelpers.h"
#include "VORCommandHeader.h"
#include "VORScratchList.h"

namespace {
// Room left below the outputs: the list of an output ZitBlt never scrolls.
constexpr int kSpareRange = 15;
}  // namespace

bool QELOutputListZitBltCmd::HandleEvent(SPPModifyKind kind, VORBaseUnknown* son) {
  return QELBaseListZitBltCmd::HandleEvent(kind, son) || kind == SPPProductOutputChanged;
}

void QELOutputListZitBltCmd::UpdateList(QELBaseScrollListZitBltRep* rep) {
  if (rep == nullptr)
    return;
  rep->RemoveAllItems(1);
  static const VORUnicodeString stationType("BIWActivityStation");
  static const VORUnicodeString groupingType("BIWActivityGrouping");
  const VORUnicodeString type = QELTypeNameOf(GetOwner().get());
  const bool station = type == stationType;
  if (!station && type != groupingType) {
    rep->SetScrollRange(kSpareRange);
    rep->DrawScrollList();
    return;
  }
  int appended = 0;
  // One list for both item lists, emptied in between.
  VORScratchList objects;
  auto append = [&](QELIListZitBltItemState::AssignState state) {
    for (const VORBaseUnknown_var& object : *objects) {
      rep->AppendItem(object.get(), state);
      ++appended;
    }
    objects->RemoveAll();
  };
  if (QELIBIWItemInfo_var info(GetOwner()); info) {
    info->AppendFirstItemList(*objects);
    append(QELIListZitBltItemState::Listed);
    // What a grouping hands on from its sub-activities is marked; a station's is not.
    info->AppendSecondItemList(*objects);
    append(station ? QELIListZitBltItemState::Listed : QELIListZitBltItemState::Direct);
  }
  rep->SetScrollRange(appended + kSpareRange);
  rep->DrawScrollList();
}

VOR_EXPORT_COMMAND_FACTORY(QELOutputListZitBltCmd)
