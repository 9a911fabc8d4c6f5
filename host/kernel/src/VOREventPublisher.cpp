#include "VOREventPublisher.h"

#include <algorithm>

#include "VORHandle.h"

namespace {
VORCallbackId nextId = 0;
unsigned long long callbacksRun = 0;
}  // namespace

// One registered callback. Shared by the index and by the dispatches running over it, so that a
// callback removed during a dispatch stays readable (as removed) until that dispatch ends.
struct VOREventPublisher::Entry {
  VORCallbackId id;
  const void* key;  // null: not keyed
  VORCallbackFunction callback;
  void* clientData;
  const void* subscriber;
  Channel* channel;
  bool removed = false;
};

// The callbacks of one name, each list in registration order (ids grow with every addition).
struct VOREventPublisher::Channel {
  std::vector<EntryPtr> unkeyed;
  size_t unkeyedRemoved = 0;  // flagged removed, not yet erased
  std::unordered_map<const void*, std::vector<EntryPtr>> byKey;
};

VOREventPublisher::VOREventPublisher(VORBaseUnknown* owner) : _owner(owner) {}

VOREventPublisher::~VOREventPublisher() = default;

VORCallbackId VOREventPublisher::AddCallback(const std::string& name, VORCallbackFunction callback,
                                             void* clientData, const void* subscriber) {
  return Add(nullptr, name, std::move(callback), clientData, subscriber);
}

VORCallbackId VOREventPublisher::AddKeyedCallback(const void* key, const std::string& name,
                                                  VORCallbackFunction callback, void* clientData,
                                                  const void* subscriber) {
  if (key == nullptr)
    return 0;
  return Add(key, name, std::move(callback), clientData, subscriber);
}

VORCallbackId VOREventPublisher::Add(const void* key, const std::string& name,
                                     VORCallbackFunction callback, void* clientData,
                                     const void* subscriber) {
  if (!callback)
    return 0;
  auto it = _channels.find(name);
  if (it == _channels.end())
    it = _channels.emplace(name, std::make_unique<Channel>()).first;
  Channel* channel = it->second.get();
  auto entry = std::make_shared<Entry>(
      Entry{++nextId, key, std::move(callback), clientData, subscriber, channel});
  if (key != nullptr)
    channel->byKey[key].push_back(entry);
  else
    channel->unkeyed.push_back(entry);
  _live.emplace(entry->id, entry);
  return entry->id;
}

void VOREventPublisher::Forget(const EntryPtr& entry) {
  entry->removed = true;
  entry->callback = nullptr;  // what the callback holds goes now (a running one was copied)
  Channel* channel = entry->channel;
  if (entry->key != nullptr) {
    // One key's list is short: erase at once (running dispatches work on their own copy).
    auto list = channel->byKey.find(entry->key);
    std::erase(list->second, entry);
    if (list->second.empty())
      channel->byKey.erase(list);
  } else if (++channel->unkeyedRemoved * 2 >= channel->unkeyed.size()) {
    // Erase in bulk once half are gone: removing n callbacks one by one stays linear.
    std::erase_if(channel->unkeyed, [](const EntryPtr& e) { return e->removed; });
    channel->unkeyedRemoved = 0;
  }
  _live.erase(entry->id);
}

bool VOREventPublisher::RemoveCallback(VORCallbackId id) {
  auto it = _live.find(id);
  if (it == _live.end())
    return false;
  EntryPtr entry = it->second;
  Forget(entry);
  return true;
}

int VOREventPublisher::RemoveCallbacksOf(const void* subscriber) {
  std::vector<EntryPtr> gone;
  for (const auto& [id, entry] : _live) {
    if (entry->subscriber == subscriber)
      gone.push_back(entry);
  }
  for (const EntryPtr& entry : gone)
    Forget(entry);
  return static_cast<int>(gone.size());
}

VOREventPublisher::Channel* VOREventPublisher::Find(std::string_view name) const {
  auto it = _channels.find(name);
  return it == _channels.end() ? nullptr : it->second.get();
}

int VOREventPublisher::Run(const std::string& event, VORNotification* notification, bool keyed,
                           const void* key) {
  // The channels of the event and of the notification's classes, each once.
  std::vector<Channel*> channels;
  auto take = [&](Channel* c) {
    if (c != nullptr && std::find(channels.begin(), channels.end(), c) == channels.end())
      channels.push_back(c);
  };
  take(Find(event));
  if (notification != nullptr) {
    for (const VORMetaObject* m = notification->GetMetaObject(); m != nullptr; m = m->Base())
      take(Find(m->ClassName()));
  }
  // Only the callbacks present now; several lists are merged back into registration order.
  std::vector<EntryPtr> due;
  int lists = 0;
  auto append = [&](const std::vector<EntryPtr>& list) {
    if (list.empty())
      return;
    ++lists;
    for (const EntryPtr& e : list) {
      if (!e->removed)
        due.push_back(e);
    }
  };
  for (Channel* c : channels) {
    append(c->unkeyed);
    if (keyed) {
      if (auto it = c->byKey.find(key); it != c->byKey.end())
        append(it->second);
    } else {
      for (const auto& [k, list] : c->byKey)
        append(list);
    }
  }
  if (lists > 1)
    std::sort(due.begin(), due.end(),
              [](const EntryPtr& a, const EntryPtr& b) { return a->id < b->id; });

  // Keep the publisher alive: a callback may drop the last handle on its owner.
  VORHandle<VOREventPublisher> guard(this);
  int called = 0;
  for (const EntryPtr& e : due) {
    if (e->removed)
      continue;
    // Copy: the callback may remove itself, which drops its function object.
    VORCallbackFunction callback = e->callback;
    callback(_owner ? _owner : this, event, notification, e->clientData, e->id);
    ++called;
    ++callbacksRun;
  }
  return called;
}

int VOREventPublisher::Dispatch(const std::string& event, VORNotification* notification) {
  return Run(event, notification, false, nullptr);
}

int VOREventPublisher::Dispatch(VORNotification* notification) {
  return notification ? Dispatch(notification->IsA(), notification) : 0;
}

int VOREventPublisher::DispatchKeyed(const void* key, const std::string& event,
                                     VORNotification* notification) {
  return Run(event, notification, true, key);
}

unsigned long long VOREventPublisher::CallbacksRun() {
  return callbacksRun;
}

int VOREventPublisher::CallbackCount() const {
  return static_cast<int>(_live.size());
}

bool VOREventPublisher::HasCallback(VORCallbackId id) const {
  return _live.count(id) != 0;
}

int VOREventPublisher::KeyedCallbackCount(const void* key, const std::string& name) const {
  const Channel* channel = Find(name);
  if (channel == nullptr)
    return 0;
  auto it = channel->byKey.find(key);
  return it == channel->byKey.end() ? 0 : static_cast<int>(it->second.size());
}
