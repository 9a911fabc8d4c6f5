#include "QELEZitBltCBSubscriber.h"

#include <unordered_map>

#include <absl/container/flat_hash_map.h>

#include "QELBaseListZitBltCmd.h"
#include "QELIUpdateManufAssly.h"
#include "QELIZitBltMgr.h"
#include "QELZitBltCommandFactory.h"
#include "QELZitBltConfiguration.h"
#include "VORDeferredDeletion.h"
#include "VORDynamicCast.h"
#include "VORISPPActivity.h"
#include "VORISPPActivityModificationEvents.h"
#include "VORISpecObject.h"
#include "VORSPPActivityNotification.h"

namespace {
bool callbacksSuspended = false;

// The subscribers listening on one root publisher. Their callbacks are filed under their own
// activity, so a change under one activity reaches its subscriber only. A subscriber that hears
// another activity's change during an assembly update leaves the callbacks-suspended flag
// cleared; the level's stand-in callback does that for all the subscribers it skipped.
struct Level {
  VORCallbackId standIn = 0;
  VORBaseUnknown* root = nullptr;                    // not held, as each subscriber's
  absl::flat_hash_map<const void*, int> activities;  // listening activity -> subscribers
};
std::unordered_map<const VOREventPublisher*, Level>& Levels() {
  static std::unordered_map<const VOREventPublisher*, Level> levels;
  return levels;
}

void StandForSkippedSubscribers(const VOREventPublisher* publisher, VORNotification* n) {
  auto level = Levels().find(publisher);
  auto* change = VORDynamicCast<VORSPPActivityNotification>(n);
  if (level == Levels().end() || change == nullptr || change->GetFather() == nullptr)
    return;
  QELIUpdateManufAssly_var update{VORBaseUnknown_var(level->second.root)};
  if (!update || !update->IsUpdateInProgress())
    return;
  const auto& listening = level->second.activities;
  const size_t fatherListens = listening.count(change->GetFather()->GetIdentity());
  if (listening.size() > fatherListens)
    callbacksSuspended = false;
}

void JoinLevel(VOREventPublisher* publisher, VORBaseUnknown* root, const void* activity) {
  Level& level = Levels()[publisher];
  level.root = root;
  if (level.standIn == 0)
    level.standIn = publisher->AddCallback(
        VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE(),
        [](VORBaseUnknown*, const std::string&, VORNotification* n, void* self, VORCallbackId) {
          StandForSkippedSubscribers(static_cast<VOREventPublisher*>(self), n);
        },
        publisher);
  ++level.activities[activity];
}

void LeaveLevel(VOREventPublisher* publisher, const void* activity) {
  auto level = Levels().find(publisher);
  if (level == Levels().end())
    return;
  auto& listening = level->second.activities;
  if (auto it = listening.find(activity); it != listening.end() && --it->second == 0)
    listening.erase(it);
  if (listening.empty()) {
    publisher->RemoveCallback(level->second.standIn);
    Levels().erase(level);
  }
}
}  // namespace

QELEZitBltCBSubscriber::~QELEZitBltCBSubscriber() {
  DeleteCommands();
  DropCallback();
}

void QELEZitBltCBSubscriber::DeleteCommands() {
  for (auto& entry : _commands) {
    entry.second->_holder = QELBaseListZitBltCmd::Holder::Released;
    entry.second->_subscriber = nullptr;
    // The command is not called any more: it must not reach an activity that may be dying.
    entry.second->RemoveCallbacks();
    entry.second->_owner = nullptr;
    VORCommandDeletion(entry.second);
  }
  _commands.clear();
}

void QELEZitBltCBSubscriber::ForgetEndedCommand(QELBaseListZitBltCmd* command) {
  std::erase_if(_commands, [command](const auto& entry) { return entry.second == command; });
}

HRESULT QELEZitBltCBSubscriber::Subscribe() {
  if (_subscribed)
    return S_OK;
  VORBaseUnknown* activity = GetExtendedObject();
  VORISPPActivity_var spp{VORBaseUnknown_var(activity)};
  VORBaseUnknown_var root;
  if (spp)
    spp->GetRootActivity(root);
  if (VORISPPActivityModificationEvents_var events(root);
      events && events->GetEventPublisher() != nullptr && _callbackHandle == 0) {
    _publisher = events->GetEventPublisher();
    _root = root.Identity();
    _key = activity->GetIdentity();
    JoinLevel(_publisher.get(), _root, _key);
    _callbackHandle = _publisher->AddKeyedCallback(
        _key, VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE(),
        [this](VORBaseUnknown*, const std::string& event, VORNotification* n, void* data,
               VORCallbackId id) { OnViewsChange(event, n, data, id); },
        nullptr, this);
  }
  CreateUpdateCommands();
  _subscribed = true;
  return S_OK;
}

void QELEZitBltCBSubscriber::CreateUpdateCommands() {
  VORBaseUnknown* activity = GetExtendedObject();
  QELIZitBltMgr_var manager{VORBaseUnknown_var(activity)};
  VORIDOMDocument_var document;
  if (!manager || !manager->LoadConfiguration(document) || !document)
    return;
  const std::vector<QELZitBltDefinition>& definitions =
      QELZitBltConfiguration::DefinitionsForActivity(document, activity);
  if (_commands.empty())
    _commands.reserve(definitions.size());
  for (const QELZitBltDefinition& d : definitions) {
    if (!d.hasUpdateData)
      continue;
    VORCommand* created = QELZitBltCommandFactory::CreateUpdateCommand(d, activity);
    auto* command = VORDynamicCast<QELBaseListZitBltCmd>(created);
    if (command == nullptr) {
      VORCommandDeletion(created);
      continue;
    }
    command->Activate(nullptr, nullptr);
    command->SetPODName(d.name);
    bool known = false;
    for (auto& entry : _commands)
      known = known || entry.first == d.name;
    if (known) {
      VORCommandDeletion(command);  // one command per ZitBlt name: the first is kept
      continue;
    }
    command->_holder = QELBaseListZitBltCmd::Holder::Subscriber;
    command->_subscriber = this;
    _commands.emplace_back(d.name, command);
  }
}

void QELEZitBltCBSubscriber::DropCallback() {
  if (_callbackHandle != 0 && _publisher) {
    _publisher->RemoveCallback(_callbackHandle);
    LeaveLevel(_publisher.get(), _key);
  }
  _callbackHandle = 0;
  _publisher = NULL_var;
  _root = nullptr;
  _key = nullptr;
}

HRESULT QELEZitBltCBSubscriber::Unsubscribe() {
  if (_subscribed) {
    DeleteCommands();
    _subscribed = false;
  }
  DropCallback();
  return S_OK;
}

HRESULT QELEZitBltCBSubscriber::GetUpdateCommand(const VORUnicodeString& zitBltName,
                                                 QELBaseListZitBltCmd** command) {
  if (command == nullptr)
    return E_FAIL;
  for (auto& entry : _commands) {
    if (entry.first == zitBltName) {
      *command = entry.second;
      return S_OK;
    }
  }
  return E_FAIL;
}

void QELEZitBltCBSubscriber::SetCallbacksSuspended(bool suspended) {
  callbacksSuspended = suspended;
}

bool QELEZitBltCBSubscriber::AreCallbacksSuspended() {
  return callbacksSuspended;
}

void QELEZitBltCBSubscriber::OnViewsChange(const std::string& event, VORNotification* notification,
                                           void* clientData, VORCallbackId id) {
  const bool remembered = callbacksSuspended;
  bool cleared = false;
  // An assembly update refreshes even while muted.
  if (QELIUpdateManufAssly_var update{VORBaseUnknown_var(_root)};
      update && update->IsUpdateInProgress()) {
    callbacksSuspended = false;
    cleared = true;
  }
  if (!callbacksSuspended) {
    auto* activityNotification = VORDynamicCast<VORSPPActivityNotification>(notification);
    if (activityNotification != nullptr && activityNotification->GetFather() != nullptr) {
      if (activityNotification->GetFather()->GetIdentity() != GetExtendedObject()->GetIdentity())
        return;  // another activity's change: the flag is deliberately not restored here
      // The commands may refresh and queue deletions: iterate over a copy.
      auto commands = _commands;
      for (auto& entry : commands)
        entry.second->OnActivityCallback(event.c_str(), clientData, notification, nullptr,
                                         static_cast<int>(id));
    }
  }
  if (cleared)
    callbacksSuspended = remembered;
}
