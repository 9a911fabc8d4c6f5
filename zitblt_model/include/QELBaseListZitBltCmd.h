// Base of the commands that fill and refresh a ZitBlt's list. The callback subscriber creates
// one per ZitBlt that has an "UpdateData" element and hands it the views-change notifications
// of its activity; the ZitBlt manager calls UpdateList for explicit refreshes. Derived commands
// (here and in other modules) decide what a list shows and read the status-bar configuration
// document through GetUserDefinedAttributeDOMDoc.
#pragma once

#include "VORCommand.h"
#include "VORIDOMDocument.h"
#include "VORISPPActivity.h"
#include "VORLists.h"
#include "VORModelTypes.h"
#include "VORUnicodeString.h"

class QELBaseScrollListZitBltRep;
class QELEZitBltCBSubscriber;

class QELBaseListZitBltCmd : public VORCommand {
  VOR_DECLARE_CLASS(QELBaseListZitBltCmd, VORCommand)
 public:
  // owner: the activity whose ZitBlt this command fills (not held). Parses the status-bar
  // configuration file while it has not parsed once in the process.
  explicit QELBaseListZitBltCmd(VORBaseUnknown* owner);

  // With a ZitBlt rep as `from`: takes its name as the POD name and fills it. Returns 0.
  VORStatusChangeRC Activate(VORCommand* from, VORNotification* notification) override;
  // A views-change notification about the owner: refreshes the ZitBlt on the owner and on
  // every ancestor when HandleEvent accepts it (an item unassignment refreshes once more).
  virtual void OnActivityCallback(const char* event, void* clientData, VORNotification* notif,
                                  void* subscriberData, int callbackId);
  // Fills the list. rep is null for a ZitBlt that shows no list.
  virtual void UpdateList(QELBaseScrollListZitBltRep* rep) = 0;

  // Null once the owner's subscriber has let the command go.
  VORBaseUnknown_var GetOwner() const { return VORBaseUnknown_var(_owner); }
  VORUnicodeString GetPODName() const { return _podName; }
  void SetPODName(const VORUnicodeString& name) { _podName = name; }

  // The root process of the owner's tree (one reference for the caller), or E_FAIL.
  HRESULT GetRootActivity(VORISPPActivity** root);
  // Registers OnActivityCallback on the root activity's views-change event (once), filed under
  // the owner: changes of other activities' children do not reach it.
  void AddCallBacks();
  // False when no callback was registered.
  bool RemoveCallbacks();

  // Forgets the parsed status-bar file (tests only: the product parses it once per process).
  static void ForgetStatusBarConfigurationForTests();

 protected:
  ~QELBaseListZitBltCmd() override;
  // Whether a modification of this kind on son concerns the list: child activities, item
  // assignments and product IO changes.
  virtual bool HandleEvent(SPPModifyKind kind, VORBaseUnknown* son);
  // The parsed status-bar configuration file, null when it is missing or ill-formed.
  VORIDOMDocument_var GetUserDefinedAttributeDOMDoc();
  // A whole-number value of the owner's attribute name, or -1. The owner's own attribute is
  // returned as it is (0 included; a text gives -1); without one, the planning hub's
  // user-defined attribute of that name, where 0 also gives -1.
  int GetAttributeValue(const VORUnicodeString& name);
  // Appends to items the items assigned to activity itself, in assignment order.
  void GetFirstFirstAssignedItems(const VORISPPActivity_var& activity,
                                  VORListValVORBaseUnknown_var& items);

 private:
  friend class QELEZitBltCBSubscriber;
  // Who releases the creator's reference: the creator, the subscriber's table, or nobody more
  // (already handed to deferred deletion).
  enum class Holder { Creator, Subscriber, Released };
  // The owner was deleted: drop the callback and end, settling the reference with its holder.
  void EndWithOwner();

  static VORUnicodeString GetConfigFile();
  static void InitializeData();
  void RefreshOwnerAndAncestors();

  // Not held: the owner holds the command (through its subscriber), and a command holding its
  // owner back would keep every activity with list ZitBlts alive.
  VORBaseUnknown* _owner;
  int _callbackHandle = -1;
  VORUnicodeString _podName;
  VORHandle<VOREventPublisher> _callbackPublisher;
  Holder _holder = Holder::Creator;
  QELEZitBltCBSubscriber* _subscriber = nullptr;  // while _holder is Subscriber

  static VORIDOMDocument_var _spXmlDocument;
  static bool _xmlParsed;
};
