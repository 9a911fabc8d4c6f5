#include "VOREventPublisher.h"

#include <algorithm>

#include "VORHandle.h"

namespace {
VORCallbackId nextId = 0;
}

VORCallbackId VOREventPublisher::AddCallback(const std::string& name, VORCallbackFunction callback,
                                             void* clientData, const void* subscriber) {
  if (!callback)
    return 0;
  _entries.push_back(Entry{++nextId, name, std::move(callback), clientData, subscriber, false});
  return nextId;
}

bool VOREventPublisher::RemoveCallback(VORCallbackId id) {
  // Ids grow with every AddCallback and entries are appended, so they are sorted by id.
  auto it = std::lower_bound(_entries.begin(), _entries.end(), id,
                             [](const Entry& e, VORCallbackId v) { return e.id < v; });
  if (it == _entries.end() || it->id != id || it->removed)
    return false;
  it->removed = true;
  it->callback = nullptr;  // what the callback holds goes now (a running one was copied)
  ++_removedCount;
  // Erase in bulk once half the entries are gone: removing n callbacks one by one stays linear.
  if (_dispatchDepth == 0 && _removedCount * 2 >= _entries.size())
    Compact();
  return true;
}

void VOREventPublisher::Compact() {
  std::erase_if(_entries, [](const Entry& x) { return x.removed; });
  _removedCount = 0;
}

int VOREventPublisher::RemoveCallbacksOf(const void* subscriber) {
  int count = 0;
  for (Entry& e : _entries) {
    if (!e.removed && e.subscriber == subscriber) {
      e.removed = true;
      e.callback = nullptr;
      ++_removedCount;
      ++count;
    }
  }
  if (_dispatchDepth == 0 && _removedCount > 0)
    Compact();
  return count;
}

int VOREventPublisher::Dispatch(const std::string& event, VORNotification* notification) {
  // Keep the publisher alive: a callback may drop the last handle on its owner.
  VORHandle<VOREventPublisher> guard(this);
  ++_dispatchDepth;
  int called = 0;
  // Only entries present at the start; indexes stay valid because erasure waits for depth 0.
  const size_t count = _entries.size();
  for (size_t i = 0; i < count; ++i) {
    if (_entries[i].removed)
      continue;
    const bool matches =
        _entries[i].name == event ||
        (notification != nullptr && notification->IsAKindOf(_entries[i].name.c_str()));
    if (!matches)
      continue;
    // Copy: the callback may add entries and reallocate the vector.
    VORCallbackFunction callback = _entries[i].callback;
    callback(_owner ? _owner : this, event, notification, _entries[i].clientData, _entries[i].id);
    ++called;
  }
  if (--_dispatchDepth == 0 && _removedCount > 0)
    Compact();
  return called;
}

int VOREventPublisher::Dispatch(VORNotification* notification) {
  return notification ? Dispatch(notification->IsA(), notification) : 0;
}

int VOREventPublisher::CallbackCount() const {
  return static_cast<int>(
      std::count_if(_entries.begin(), _entries.end(), [](const Entry& e) { return !e.removed; }));
}

bool VOREventPublisher::HasCallback(VORCallbackId id) const {
  return std::any_of(_entries.begin(), _entries.end(),
                     [id](const Entry& e) { return e.id == id && !e.removed; });
}
