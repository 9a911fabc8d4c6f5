// The ZitBlts of one physical activity: builds them from "zitbltcfg.xml", places them on the
// activity's PERT node and keeps them there, keeps their statuses ("All" for every one of them)
// and refreshes them through their update commands. Answered by every "PhysicalActivity"
// (module QELZitBltModel, loaded through the module dictionary).
#pragma once

#include "VORHandle.h"
#include "VORIDOMDocument.h"
#include "VORLists.h"

class QELZitBltRep;
class VORViewer;

class QELIZitBltMgr : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIZitBltMgr)
 public:
  // Builds the ZitBlts when not yet built, then builds, places and opens their reps in viewer.
  // Returns 1; a null viewer does nothing.
  virtual int BuildZitBltReps(VORViewer* viewer) = 0;
  // A new list, owned by the caller, of every ZitBlt name (builds the ZitBlts first).
  virtual HRESULT GetZitBltNames(VORListValVORUnicodeString*& names) = 0;
  // "All" stores the overall status; otherwise the named ZitBlt's status (E_FAIL when there is
  // none of that name). The change is announced on the activity in both cases.
  virtual HRESULT SetZitBltStatus(const VORUnicodeString& name, unsigned char status) = 0;
  // E_FAIL and status untouched for an unknown name.
  virtual HRESULT GetZitBltStatus(const VORUnicodeString& name, unsigned char& status) = 0;
  // The rep of that name (not held for the caller); E_FAIL and null when absent, E_FAIL without
  // writing when rep is null.
  virtual HRESULT GetZitBlt(const VORUnicodeString& name, QELZitBltRep** rep) = 0;
  // Unsubscribes, hands every rep to deferred deletion, empties the set. Always S_OK.
  virtual HRESULT RemoveZitBlts() = 0;
  // Follows a move or a resize of the activity's node.
  virtual void UpdateZitBltPositions() = 0;
  // Refreshes one ZitBlt through its update command; the status bars climb to the parents.
  virtual void UpdateZitBlt(const VORUnicodeString& name) = 0;
  // The parsed "zitbltcfg.xml" (once per process; retried after a failure).
  virtual bool LoadConfiguration(VORIDOMDocument_var& document) = 0;
  // UpdateZitBlt for every name, in GetZitBltNames order.
  virtual void UpdateAllZitBlts() = 0;
};
VOR_DECLARE_HANDLE(QELIZitBltMgr);
