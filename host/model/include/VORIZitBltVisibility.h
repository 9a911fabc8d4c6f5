// The ZitBlt visibility a planner chose for an activity, kept with the document so that the
// viewer shows the activity's ZitBlts the same way the next time it opens. Per ZitBlt name
// (or "All"): shown, hidden, or nothing recorded (the configuration's default). Setters go
// through the model's door (saved, notified with VORModify "zitblt" on the activity, undoable).
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class VORIZitBltVisibility : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIZitBltVisibility)
 public:
  // S_OK and the recorded state; S_FALSE and shown untouched when nothing is recorded.
  virtual HRESULT GetZitBltShown(const VORUnicodeString& name, bool& shown) = 0;
  virtual HRESULT SetZitBltShown(const VORUnicodeString& name, bool shown) = 0;
  // Forgets what was recorded for name (S_OK also when nothing was).
  virtual HRESULT ForgetZitBltShown(const VORUnicodeString& name) = 0;
  // The names with a recorded state, sorted.
  virtual HRESULT GetZitBltShownNames(VORListValVORUnicodeString& names) = 0;
};
VOR_DECLARE_HANDLE(VORIZitBltVisibility);
