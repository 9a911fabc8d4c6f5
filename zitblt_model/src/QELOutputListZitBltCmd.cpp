#include "QELOutputListZitBltCmd.h"

#include "QELBaseScrollListZitBltRep.h"
#include "QELIBIWItemInfo.h"
#include "QELListZitBltCmdHelpers.h"
#include "VORCommandHeader.h"

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
  const VORUnicodeString type = QELTypeNameOf(GetOwner().get());
  const bool station = type == VORUnicodeString("BIWActivityStation");
  if (!station && type != VORUnicodeString("BIWActivityGrouping")) {
    rep->SetScrollRange(kSpareRange);
    rep->DrawScrollList();
    return;
  }
  int appended = 0;
  auto append = [&](VORListValVORBaseUnknown_var* objects,
                    QELIListZitBltItemState::AssignState state) {
    if (objects == nullptr)
      return;
    for (const VORBaseUnknown_var& object : *objects) {
      rep->AppendItem(object.get(), state);
      ++appended;
    }
    delete objects;
  };
  if (QELIBIWItemInfo_var info(GetOwner()); info) {
    VORListValVORBaseUnknown_var* first = nullptr;
    info->GetFirstItemList(first);
    append(first, QELIListZitBltItemState::Listed);
    // What a grouping hands on from its sub-activities is marked; a station's is not.
    VORListValVORBaseUnknown_var* second = nullptr;
    info->GetSecondItemList(second);
    append(second, station ? QELIListZitBltItemState::Listed : QELIListZitBltItemState::Direct);
  }
  rep->SetScrollRange(appended + kSpareRange);
  rep->DrawScrollList();
}

VOR_EXPORT_COMMAND_FACTORY(QELOutputListZitBltCmd)
