#include "VOREventPublisher.h"

#include <algorithm>
#include <cstring>

#include <absl/container/flat_hash_map.h>

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

namespace {
// The callbacks filed under one key, in registration order. A key has one callback nearly
// always (a subscriber's own activity): that one needs no block of its own.
template <class EntryPtr>
class KeyedEntries {
 public:
  void Add(EntryPtr entry) {
    if (!_first)
      _first = std::move(entry);
    else
      _rest.push_back(std::move(entry));
  }
  void Erase(const EntryPtr& entry) {
    if (_first != entry) {
      std::erase(_rest, entry);
    } else if (_rest.empty()) {
      _first.reset();
    } else {
      _first = std::move(_rest.front());
      _rest.erase(_rest.begin());
    }
  }
  bool Empty() const { return !_first; }
  size_t Size() const { return _first ? 1 + _rest.size() : 0; }
  template <class F>
  void ForEach(F&& f) const {
    if (_first)
      f(_first);
    for (const EntryPtr& e : _rest)
      f(e);
  }

 private:
  EntryPtr _first;
  std::vector<EntryPtr> _rest;
};
}  // namespace

// The callbacks of one name, each list in registration order (ids grow with every addition).
struct VOREventPublisher::Channel {
  std::string name;
  std::vector<EntryPtr> unkeyed;
  size_t unkeyedRemoved = 0;  // flagged removed, not yet erased
  // Flat: on a large level one key per activity, and a node per key would be a cache miss more.
  absl::flat_hash_map<const void*, KeyedEntries<EntryPtr>> byKey;
};

namespace {
// Names a publisher searches in order before it indexes them.
constexpr size_t kChannelsSearchedInOrder = 8;
}  // namespace

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
  Channel* channel = Find(name);
  if (channel == nullptr) {
    _channels.push_back(std::make_unique<Channel>());
    channel = _channels.back().get();
    channel->name = name;
    _channelNames.emplace_back(channel->name);
    if (!_channelIndex.empty()) {
      _channelIndex.emplace(channel->name, channel);
    } else if (_channels.size() > kChannelsSearchedInOrder) {
      for (const auto& c : _channels)
        _channelIndex.emplace(c->name, c.get());
    }
  }
  auto entry = std::make_shared<Entry>(
      Entry{++nextId, key, std::move(callback), clientData, subscriber, channel});
  // Most publishers hold a handful of callbacks: one block for the first few, not one per
  // doubling.
  if (key != nullptr) {
    channel->byKey[key].Add(entry);
  } else {
    if (channel->unkeyed.empty())
      channel->unkeyed.reserve(4);
    channel->unkeyed.push_back(entry);
  }
  if (_live.empty())
    _live.reserve(4);
  _live.push_back(std::move(entry));
  return _live.back()->id;
}

const VOREventPublisher::EntryPtr* VOREventPublisher::FindLive(VORCallbackId id) const {
  auto it =
      std::lower_bound(_live.begin(), _live.end(), id,
                       [](const EntryPtr& e, VORCallbackId wanted) { return e->id < wanted; });
  if (it == _live.end() || (*it)->id != id || (*it)->removed)
    return nullptr;
  return &*it;
}

void VOREventPublisher::CompactLive() {
  std::erase_if(_live, [](const EntryPtr& e) { return e->removed; });
  _liveRemoved = 0;
}

void VOREventPublisher::Forget(const EntryPtr& entry) {
  entry->removed = true;
  // What the callback holds goes now, unless a dispatch of this publisher may be running it:
  // then when that dispatch ends.
  if (_running > 0)
    _retired.push_back(entry);
  else
    entry->callback = nullptr;
  Channel* channel = entry->channel;
  if (entry->key != nullptr) {
    // One key's list is short: erase at once (running dispatches work on their own list).
    auto list = channel->byKey.find(entry->key);
    list->second.Erase(entry);
    if (list->second.Empty())
      channel->byKey.erase(list);
  } else if (++channel->unkeyedRemoved * 2 >= channel->unkeyed.size()) {
    // Erase in bulk once half are gone: removing n callbacks one by one stays linear.
    std::erase_if(channel->unkeyed, [](const EntryPtr& e) { return e->removed; });
    channel->unkeyedRemoved = 0;
  }
  // Running dispatches point at removed entries too: they stay until no dispatch runs.
  if (++_liveRemoved * 2 >= _live.size() && _running == 0)
    CompactLive();
}

bool VOREventPublisher::RemoveCallback(VORCallbackId id) {
  const EntryPtr* found = FindLive(id);
  if (found == nullptr)
    return false;
  const EntryPtr entry = *found;  // Forget may compact _live
  Forget(entry);
  return true;
}

int VOREventPublisher::RemoveCallbacksOf(const void* subscriber) {
  std::vector<EntryPtr> gone;
  for (const EntryPtr& entry : _live) {
    if (!entry->removed && entry->subscriber == subscriber)
      gone.push_back(entry);
  }
  for (const EntryPtr& entry : gone)
    Forget(entry);
  return static_cast<int>(gone.size());
}

VOREventPublisher::Channel* VOREventPublisher::Find(std::string_view name) const {
  if (!_channelIndex.empty()) {
    auto it = _channelIndex.find(name);
    return it == _channelIndex.end() ? nullptr : it->second;
  }
  for (size_t i = 0; i < _channelNames.size(); ++i) {
    if (_channelNames[i].Is(name))
      return _channels[i].get();
  }
  return nullptr;
}

VOREventPublisher::ChannelName::ChannelName(std::string_view channelName)
    : name(channelName), head{} {
  if (!name.empty())
    std::memcpy(head, name.data(), std::min(name.size(), kHeadSize));
}

bool VOREventPublisher::ChannelName::Is(std::string_view wanted) const {
  if (wanted.size() != name.size())
    return false;
  if (wanted.empty())
    return true;
  const size_t inHead = std::min(wanted.size(), kHeadSize);
  if (std::memcmp(head, wanted.data(), inHead) != 0)
    return false;
  return wanted.size() <= kHeadSize ||
         std::memcmp(name.data() + kHeadSize, wanted.data() + kHeadSize,
                     wanted.size() - kHeadSize) == 0;
}

int VOREventPublisher::Run(const std::string& event, VORNotification* notification, bool keyed,
                           const void* key) {
  // The channels of the event and of the notification's classes, each once.
  Channel* channels[16];
  size_t channelCount = 0;
  auto take = [&](Channel* c) {
    if (c == nullptr || channelCount == std::size(channels) ||
        std::find(channels, channels + channelCount, c) != channels + channelCount)
      return;
    channels[channelCount++] = c;
  };
  take(Find(event));
  if (notification != nullptr) {
    for (const VORMetaObject* m = notification->GetMetaObject(); m != nullptr; m = m->Base())
      take(Find(m->ClassName()));
  }
  if (channelCount == 0)
    return 0;

  // Keep the publisher alive: a callback may drop the last handle on its owner.
  VORHandle<VOREventPublisher> guard(this);
  if (_due.size() <= static_cast<size_t>(_running))
    _due.emplace_back();
  ++_running;
  // Only the callbacks present now; several lists are merged back into registration order.
  // The entries stay alive while a dispatch runs (removed ones are kept in _live meanwhile).
  std::vector<Entry*> due;
  due.swap(_due[static_cast<size_t>(_running - 1)]);
  due.clear();
  int lists = 0;
  auto keep = [&](const EntryPtr& e) {
    if (!e->removed)
      due.push_back(e.get());
  };
  auto append = [&](const std::vector<EntryPtr>& list) {
    if (list.empty())
      return;
    ++lists;
    for (const EntryPtr& e : list)
      keep(e);
  };
  auto appendKeyed = [&](const KeyedEntries<EntryPtr>& list) {
    if (list.Empty())
      return;
    ++lists;
    list.ForEach(keep);
  };
  for (size_t i = 0; i < channelCount; ++i) {
    Channel* c = channels[i];
    append(c->unkeyed);
    if (keyed) {
      if (auto it = c->byKey.find(key); it != c->byKey.end())
        appendKeyed(it->second);
    } else {
      for (const auto& [k, list] : c->byKey)
        appendKeyed(list);
    }
  }
  if (lists > 1)
    std::sort(due.begin(), due.end(), [](const Entry* a, const Entry* b) { return a->id < b->id; });

  int called = 0;
  for (Entry* e : due) {
    if (e->removed)
      continue;
    // A callback removed while it runs keeps its function object until the dispatch ends.
    e->callback(_owner ? _owner : this, event, notification, e->clientData, e->id);
    ++called;
    ++callbacksRun;
  }
  due.clear();
  due.swap(_due[static_cast<size_t>(_running - 1)]);
  if (--_running == 0) {
    std::vector<EntryPtr> retired;
    retired.swap(_retired);
    for (const EntryPtr& e : retired)
      e->callback = nullptr;
    if (_liveRemoved * 2 >= _live.size() && _liveRemoved > 0)
      CompactLive();
  }
  return called;
}

int VOREventPublisher::Dispatch(const std::string& event, VORNotification* notification) {
  return Run(event, notification, false, nullptr);
}

int VOREventPublisher::Dispatch(VORNotification* notification) {
  if (notification == nullptr)
    return 0;
  // Class names are literals: each becomes the event's string once, not on every dispatch.
  thread_local std::unordered_map<const char*, std::string> eventNames;
  const char* className = notification->IsA();
  auto it = eventNames.find(className);
  if (it == eventNames.end())
    it = eventNames.emplace(className, className).first;
  else if (it->second != className)
    return Dispatch(std::string(className), notification);  // not a literal after all
  return Dispatch(it->second, notification);
}

int VOREventPublisher::DispatchKeyed(const void* key, const std::string& event,
                                     VORNotification* notification) {
  return Run(event, notification, true, key);
}

unsigned long long VOREventPublisher::CallbacksRun() {
  return callbacksRun;
}

int VOREventPublisher::CallbackCount() const {
  return static_cast<int>(_live.size() - _liveRemoved);
}

bool VOREventPublisher::HasCallback(VORCallbackId id) const {
  return FindLive(id) != nullptr;
}

int VOREventPublisher::KeyedCallbackCount(const void* key, const std::string& name) const {
  const Channel* channel = Find(name);
  if (channel == nullptr)
    return 0;
  auto it = channel->byKey.find(key);
  return it == channel->byKey.end() ? 0 : static_cast<int>(it->second.Size());
}
