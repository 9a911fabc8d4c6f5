#include "QELScrollListDrop.h"

#include <memory>

#include "QELBaseScrollListZitBltRep.h"
#include "QELIListZitBltItemDD.h"
#include "QELIZitBltCBSubscriber.h"
#include "QELIZitBltMgr.h"
#include "VORFrmMessageNotification.h"
#include "VORFrmWindowKinds.h"
#include "VORISpecObject.h"
#include "VORUndoHistory.h"

namespace QELScrollListDrop {

bool Check(VORBaseUnknown* item, VORBaseUnknown* from, VORBaseUnknown* to,
           VORUnicodeString& message) {
  message = VORUnicodeString();
  QELIListZitBltItemDD_var dd{VORBaseUnknown_var(item)};
  const bool allowed = dd && from != nullptr && to != nullptr &&
                       from->GetIdentity() != to->GetIdentity() &&
                       dd->CheckReassignment(from, to, message) == 1;
  if (!allowed && message.IsEmpty())
    message = VORUnicodeString(kNoReason);
  return allowed;
}

std::string Verdict(VORBaseUnknown* to, bool allowed, const VORUnicodeString& message) {
  return "drop on \"" + VORFrmObjectLabel(to).ConvertToUTF8() +
         (allowed ? "\": allowed" : "\": refused: " + message.ConvertToUTF8());
}

void Announce(VORBaseUnknown* to, bool allowed, const VORUnicodeString& message) {
  VORFrmMessageNotification::Announce(Verdict(to, allowed, message));
}

HRESULT Reassign(VORBaseUnknown* item, VORBaseUnknown* from, VORBaseUnknown* to) {
  QELIListZitBltItemDD_var dd{VORBaseUnknown_var(item)};
  if (!dd)
    return E_FAIL;
  // The flag is process-wide: any activity's subscriber sets it for all of them.
  QELIZitBltCBSubscriber_var subscriber{VORBaseUnknown_var(from)};
  if (!subscriber)
    subscriber = QELIZitBltCBSubscriber_var{VORBaseUnknown_var(to)};
  const bool muted = subscriber && subscriber->AreCallbacksSuspended();
  if (subscriber)
    subscriber->SetCallbacksSuspended(true);
  const HRESULT hr = dd->Reassign(from, to);
  if (hr == S_OK) {
    QELBaseScrollListZitBltRep::UpdateCycleTime(from);
    QELBaseScrollListZitBltRep::UpdateCycleTime(to);
  }
  if (subscriber)
    subscriber->SetCallbacksSuspended(muted);
  return hr;
}

void Refresh(VORBaseUnknown* activity) {
  QELIZitBltMgr_var manager{VORBaseUnknown_var(activity)};
  if (!manager)
    return;
  for (const char* name : kStatusBars)
    manager->UpdateZitBlt(VORUnicodeString(name));
  VORListValVORUnicodeString* names = nullptr;
  manager->GetZitBltNames(names);
  const std::unique_ptr<VORListValVORUnicodeString> owned(names);
  if (names == nullptr)
    return;
  for (const VORUnicodeString& name : *names) {
    QELZitBltRep* rep = nullptr;
    if (SUCCEEDED(manager->GetZitBlt(name, &rep)) && rep != nullptr &&
        rep->GetScrollListRep() != nullptr)
      manager->UpdateZitBlt(name);
  }
}

namespace {
VORProcess* DocumentOf(VORBaseUnknown* object) {
  VORISpecObject_var spec{VORBaseUnknown_var(object)};
  return spec ? spec->GetDocument() : nullptr;
}
}  // namespace

UndoStep::UndoStep(VORBaseUnknown* object) {
  _document = DocumentOf(object);
  if (_document)
    _document->GetUndoHistory().Begin("Reassign Item");
}

UndoStep::~UndoStep() {
  if (_document)
    _document->GetUndoHistory().End();
}

}  // namespace QELScrollListDrop
