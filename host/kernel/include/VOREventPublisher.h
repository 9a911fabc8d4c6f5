// Synchronous event publisher carried by model objects, viewers, dialogs and commands.
// A callback registered for a name fires for events of that name and for notifications whose
// class IsAKindOf that name. Callbacks added or removed during a dispatch take effect at once:
// a removed one is not called, an added one waits for the next dispatch.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "VORNotification.h"

using VORCallbackId = unsigned int;  // 0 means none

// publisher, event name, notification, client data, callback id
using VORCallbackFunction =
    std::function<void(VORBaseUnknown* publisher, const std::string& event,
                       VORNotification* notification, void* clientData, VORCallbackId id)>;

class VOREventPublisher : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VOREventPublisher, VORBaseUnknown)
 public:
  // owner is passed to callbacks as the publisher (defaults to the publisher itself); not held.
  explicit VOREventPublisher(VORBaseUnknown* owner = nullptr) : _owner(owner) {}

  // subscriber is only a tag for RemoveCallbacksOf. Returns a process-wide unique id (> 0).
  VORCallbackId AddCallback(const std::string& name, VORCallbackFunction callback,
                            void* clientData = nullptr, const void* subscriber = nullptr);
  // False when no callback of this publisher has that id.
  bool RemoveCallback(VORCallbackId id);
  int RemoveCallbacksOf(const void* subscriber);

  // Calls, in order of registration, every callback whose name matches. Returns how many ran.
  int Dispatch(const std::string& event, VORNotification* notification = nullptr);
  // Dispatch under the notification's class name.
  int Dispatch(VORNotification* notification);

  int CallbackCount() const;
  bool HasCallback(VORCallbackId id) const;

 private:
  struct Entry {
    VORCallbackId id;
    std::string name;
    VORCallbackFunction callback;
    void* clientData;
    const void* subscriber;
    bool removed;
  };
  std::vector<Entry> _entries;
  VORBaseUnknown* _owner;
  int _dispatchDepth = 0;
  size_t _removedCount = 0;  // entries flagged removed and not yet erased
  void Compact();
};
