#include "VORFrmPick.h"

#include "VORApplicationFrame.h"
#include "VORCommandEngine.h"
#include "VORExtISelectShow.h"
#include "VORStateCommand.h"
#include "VORViewer.h"

namespace {
VORFrmPickNotification::Result Announce(VORPathElement* path,
                                        VORFrmPickNotification::Result result) {
  auto n = VORHandle<VORFrmPickNotification>::Adopt(new VORFrmPickNotification(path, result));
  VORApplicationFrame::GetApplicationFrame()->GetEventPublisher()->Dispatch(n);
  return result;
}
}  // namespace

VORFrmPickNotification::Result VORFrmDispatchPick(VORFrmEditor* editor,
                                                  const std::vector<VORPathElement_var>& paths,
                                                  int modifiers, int multiSelBehavior) {
  if (dynamic_cast<VORStateCommand*>(VORCommandEngine::Current()) != nullptr && !paths.empty()) {
    for (const VORPathElement_var& path : paths) {
      if (VORCommandEngine::OfferPath(path))
        return Announce(path, VORFrmPickNotification::TakenByCommand);
    }
    return Announce(paths.front(), VORFrmPickNotification::RefusedByCommand);
  }
  if (editor == nullptr)
    return VORFrmPickNotification::Background;
  VORCSO* cso = editor->GetCSO();
  if (paths.empty()) {
    cso->Empty();
    return Announce(nullptr, VORFrmPickNotification::Background);
  }
  // A picked component may stand for another element (a list line for its item).
  const VORPathElement_var front = VORSelectShow::PathToSelect(paths.front());
  const bool toggle = multiSelBehavior == 1 && (modifiers & (VORModShift | VORModControl)) != 0;
  if (toggle) {
    if (!cso->RemoveElement(front))
      cso->AddElement(front);
  } else {
    cso->Empty();
    cso->AddElement(front);
  }
  return Announce(front, VORFrmPickNotification::Selected);
}
