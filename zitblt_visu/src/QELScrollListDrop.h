// A dragged list line dropped on another activity's node: the verdict of the line's
// drag-and-drop interface, its announcement to the planner, and the reassignment carried out as
// one undo step with the ZitBlt callbacks muted, followed by the refresh of both activities.
#pragma once

#include <string>

#include "VORDocument.h"
#include "VORHandle.h"
#include "VORUnicodeString.h"

namespace QELScrollListDrop {
// Shown when a refusal carries no text of its own.
inline constexpr const char* kNoReason = "Item cannot be dropped on this activity";
// The ZitBlts a drop refreshes on both activities before their lists.
inline constexpr const char* kStatusBars[] = {"BIWPointFasteningStatusBars",
                                              "BIWCurveFasteningStatusBars", "BIWStationStatusBars",
                                              "BIWGroupingStatusBars"};

// Whether item may go from → to; message gets the reason (kNoReason when the check gives
// none). Refused for the same activity, a null one, or an item without drag-and-drop.
bool Check(VORBaseUnknown* item, VORBaseUnknown* from, VORBaseUnknown* to,
           VORUnicodeString& message);
// The line a script prints and the window shows: drop on "<to>": allowed, or refused: <text>.
std::string Verdict(VORBaseUnknown* to, bool allowed, const VORUnicodeString& message);
// Announces the verdict to the planner (VORFrmMessageNotification).
void Announce(VORBaseUnknown* to, bool allowed, const VORUnicodeString& message);
// Reassigns item from → to with every ZitBlt callback muted, then asks both activities to
// update their cycle times. The caller holds the undo step. Reassign's result.
HRESULT Reassign(VORBaseUnknown* item, VORBaseUnknown* from, VORBaseUnknown* to);
// Refreshes the status bars and then every list ZitBlt of the activity.
void Refresh(VORBaseUnknown* activity);

// The drop as one user step of the document of object (an undo step named "Reassign Item").
class UndoStep {
 public:
  explicit UndoStep(VORBaseUnknown* object);
  ~UndoStep();
  UndoStep(const UndoStep&) = delete;
  UndoStep& operator=(const UndoStep&) = delete;

 private:
  VORProcess_var _document;
};
}  // namespace QELScrollListDrop
