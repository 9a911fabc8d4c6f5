// The per-activity subscriber that owns one update command per ZitBlt (from the "UpdateData"
// elements of "zitbltcfg.xml") and passes the root activity's views-change notifications about
// its activity to them. Answered by every "PhysicalActivity" (module QELZitBltModel).
#pragma once

#include "VORHandle.h"
#include "VORUnicodeString.h"

class QELBaseListZitBltCmd;

class QELIZitBltCBSubscriber : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIZitBltCBSubscriber)
 public:
  // Registers the callback on the root activity and creates the update commands (also without
  // a root activity). Nothing when already subscribed. S_OK.
  virtual HRESULT Subscribe() = 0;
  virtual bool IsSubscribed() = 0;
  // Hands the commands to deferred deletion and drops the callback. S_OK.
  virtual HRESULT Unsubscribe() = 0;
  // The command created for the ZitBlt of that name (not held for the caller); E_FAIL when the
  // output is null or no command has that name.
  virtual HRESULT GetUpdateCommand(const VORUnicodeString& zitBltName,
                                   QELBaseListZitBltCmd** command) = 0;
  // The process-wide flag that mutes every subscriber (during a drag-and-drop reassignment).
  virtual void SetCallbacksSuspended(bool suspended) = 0;
  virtual bool AreCallbacksSuspended() = 0;
};
VOR_DECLARE_HANDLE(QELIZitBltCBSubscriber);
