#include "QELBaseListZitBltCmd.h"

#include "QELEZitBltCBSubscriber.h"
#include "QELIZitBltMgr.h"
#include "QELZitBltConfiguration.h"
#include "QELZitBltRep.h"
#include "VORISPPActivity.h"
#include "VORISPPActivityModificationEvents.h"
#include "VORDocument.h"
#include "VORIIPDAdapter.h"
#include "VORIIPDAttributeMgt.h"
#include "VORISPPItem.h"
#include "VORISPPItemMgt.h"
#include "VORISpecObject.h"
#include "VORIUserAttributes.h"
#include "VORSPPActivityNotification.h"

VORIDOMDocument_var QELBaseListZitBltCmd::_spXmlDocument;
bool QELBaseListZitBltCmd::_xmlParsed = false;

namespace {
// Every list command has this name: made once, not once per command.
const VORString& CommandName() {
  static const VORString name("QELBaseListZitBltCmd");
  return name;
}
}  // namespace

QELBaseListZitBltCmd::QELBaseListZitBltCmd(VORBaseUnknown* owner)
    : VORCommand(nullptr, CommandName()), _owner(owner) {
  if (!_xmlParsed)
    InitializeData();
}

QELBaseListZitBltCmd::~QELBaseListZitBltCmd() {
  RemoveCallbacks();
}

VORUnicodeString QELBaseListZitBltCmd::GetConfigFile() {
  return QELZitBltConfiguration::StatusBarConfigFile();
}

void QELBaseListZitBltCmd::InitializeData() {
  VORIDOMDocument_var document;
  _xmlParsed = QELZitBltConfiguration::ParseConfigFile(GetConfigFile(), document) && document;
  _spXmlDocument = _xmlParsed ? document : VORIDOMDocument_var();
}

VORIDOMDocument_var QELBaseListZitBltCmd::GetUserDefinedAttributeDOMDoc() {
  return _spXmlDocument;
}

void QELBaseListZitBltCmd::ForgetStatusBarConfigurationForTests() {
  _spXmlDocument = NULL_var;
  _xmlParsed = false;
}

VORStatusChangeRC QELBaseListZitBltCmd::Activate(VORCommand* from, VORNotification*) {
  if (auto* rep = dynamic_cast<QELZitBltRep*>(from)) {
    _podName = rep->GetName();
    UpdateList(rep->GetScrollListRep());
  }
  return 0;
}

bool QELBaseListZitBltCmd::HandleEvent(SPPModifyKind kind, VORBaseUnknown*) {
  return kind == SPPChildActivityChanged || kind == SPPItemAssigned || kind == SPPItemUnassigned ||
         kind == SPPProductIOChanged;
}

void QELBaseListZitBltCmd::RefreshOwnerAndAncestors() {
  if (QELIZitBltMgr_var manager(GetOwner()); manager)
    manager->UpdateZitBlt(_podName);
  VORISPPActivity_var activity(GetOwner());
  VORBaseUnknown_var father;
  if (activity)
    activity->GetFatherActivity(father);
  for (int guard = 0; father && guard < 100000; ++guard) {
    if (QELIZitBltMgr_var manager(father); manager)
      manager->UpdateZitBlt(_podName);
    VORISPPActivity_var up(father);
    VORBaseUnknown_var next;
    if (up)
      up->GetFatherActivity(next);
    father = next;
  }
}

void QELBaseListZitBltCmd::OnActivityCallback(const char*, void*, VORNotification* notif, void*,
                                              int) {
  auto* activityNotification = dynamic_cast<VORSPPActivityNotification*>(notif);
  if (activityNotification == nullptr)
    return;
  // Keep this command alive while refreshes run (a refresh may end in deferred deletions).
  VORHandle<QELBaseListZitBltCmd> self(this);
  const SPPModifyKind kind = activityNotification->GetKind();
  if (HandleEvent(kind, activityNotification->GetSon()))
    RefreshOwnerAndAncestors();
  else if (kind == SPPActivityDeleted) {
    EndWithOwner();
    return;
  }
  // An unassignment refreshes a second time, accepted or not.
  if (kind == SPPItemUnassigned)
    RefreshOwnerAndAncestors();
}

HRESULT QELBaseListZitBltCmd::GetRootActivity(VORISPPActivity** root) {
  if (root == nullptr)
    return E_FAIL;
  *root = nullptr;
  VORISPPActivity_var activity(GetOwner());
  VORBaseUnknown_var rootObject;
  if (!activity || FAILED(activity->GetRootActivity(rootObject)))
    return E_FAIL;
  VORISPPActivity_var rootActivity(rootObject);
  if (!rootActivity)
    return E_FAIL;
  *root = rootActivity.Detach();
  return S_OK;
}

void QELBaseListZitBltCmd::AddCallBacks() {
  if (_callbackHandle != -1 || !_owner)
    return;
  VORISPPActivity* root = nullptr;
  if (FAILED(GetRootActivity(&root)))
    return;
  VORISPPActivityModificationEvents_var events{VORBaseUnknown_var(root)};
  root->Release();
  if (!events || events->GetEventPublisher() == nullptr)
    return;
  _callbackPublisher = events->GetEventPublisher();
  // Filed under the owner: only changes of the owner's children reach this command.
  _callbackHandle = static_cast<int>(_callbackPublisher->AddKeyedCallback(
      _owner->GetIdentity(), VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE(),
      [this](VORBaseUnknown*, const std::string& event, VORNotification* n, void* data,
             VORCallbackId id) {
        OnActivityCallback(event.c_str(), data, n, nullptr, static_cast<int>(id));
      },
      nullptr, this));
}

bool QELBaseListZitBltCmd::RemoveCallbacks() {
  if (_callbackHandle == -1 || !_callbackPublisher)
    return false;
  _callbackPublisher->RemoveCallback(static_cast<VORCallbackId>(_callbackHandle));
  _callbackPublisher = NULL_var;
  _callbackHandle = -1;
  return true;
}

void QELBaseListZitBltCmd::EndWithOwner() {
  RemoveCallbacks();
  switch (_holder) {
    case Holder::Released:
      return;  // its release is queued already
    case Holder::Subscriber:
      if (_subscriber != nullptr)
        _subscriber->ForgetEndedCommand(this);
      break;
    case Holder::Creator:
      break;
  }
  _holder = Holder::Released;
  _subscriber = nullptr;
  RequestDelayedDestruction();
}

int QELBaseListZitBltCmd::GetAttributeValue(const VORUnicodeString& name) {
  VORAttributeValue value;
  if (VORIUserAttributes_var attributes(GetOwner()); attributes)
    attributes->GetAttributeValue(name, value);
  switch (value.type) {
    case VORAttributeLong:
      return static_cast<int>(value.longValue);
    case VORAttributeDouble:
      return static_cast<int>(value.doubleValue);
    case VORAttributeString:
      return -1;
    case VORAttributeNone:
      break;
  }
  // The planning hub's user-defined attribute; there 0 and "no value" both give -1.
  VORISpecObject_var spec(GetOwner());
  VORProcess* document = spec ? spec->GetDocument() : nullptr;
  const VORBaseUnknown_var documentObject(document);
  if (!VORIIPDAdapter_var(documentObject))
    return -1;
  VORIIPDAttributeMgt_var hub(documentObject);
  VORAttributeValue hubValue;
  if (!hub || FAILED(hub->GetUserDefinedAttribute(_owner, name, hubValue)))
    return -1;
  int result = -1;
  if (hubValue.type == VORAttributeLong)
    result = static_cast<int>(hubValue.longValue);
  else if (hubValue.type == VORAttributeDouble)
    result = static_cast<int>(hubValue.doubleValue);
  return result == 0 ? -1 : result;
}

void QELBaseListZitBltCmd::GetFirstFirstAssignedItems(const VORISPPActivity_var& activity,
                                                      VORListValVORBaseUnknown_var& items) {
  VORISPPItemMgt_var itemMgt(activity);
  if (!itemMgt)
    return;
  // Appended in place (no list of its own per activity), then what is no item is taken out.
  const int before = items.Size();
  if (FAILED(itemMgt->AppendAssignedItems(items, "Item", VORISPPItemMgt::FirstAssigned))) {
    while (items.Size() > before)
      items.RemovePosition(items.Size());
    return;
  }
  for (int position = items.Size(); position > before; --position) {
    if (!VORISPPItem_var(items[position]))
      items.RemovePosition(position);
  }
}
