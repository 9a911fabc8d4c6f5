// Synchronous event publisher carried by model objects, viewers, dialogs and commands.
// A callback registered for a name fires for events of that name and for notifications whose
// class IsAKindOf that name. Callbacks added or removed during a dispatch take effect at once:
// a removed one is not called, an added one waits for the next dispatch.
//
// Callbacks are filed by name, so a dispatch visits only the callbacks of its event and of the
// notification's classes. A callback may also be filed under a key (an object identity): a
// keyed dispatch reaches the callbacks without key and those of its key only, so a change to one
// object does not visit the listeners of every other; a dispatch without key reaches them all.
#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "VORCallbackFunction.h"
#include "VORNotification.h"

class VOREventPublisher : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VOREventPublisher, VORBaseUnknown)
 public:
  // owner is passed to callbacks as the publisher (defaults to the publisher itself); not held.
  explicit VOREventPublisher(VORBaseUnknown* owner = nullptr);
  ~VOREventPublisher() override;

  // subscriber is only a tag for RemoveCallbacksOf. Returns a process-wide unique id (> 0).
  VORCallbackId AddCallback(const std::string& name, VORCallbackFunction callback,
                            void* clientData = nullptr, const void* subscriber = nullptr);
  // As AddCallback, but reached by keyed dispatches only when they carry this key (non-null).
  VORCallbackId AddKeyedCallback(const void* key, const std::string& name,
                                 VORCallbackFunction callback, void* clientData = nullptr,
                                 const void* subscriber = nullptr);
  // False when no callback of this publisher has that id.
  bool RemoveCallback(VORCallbackId id);
  int RemoveCallbacksOf(const void* subscriber);

  // Calls, in order of registration, every callback whose name matches. Returns how many ran.
  int Dispatch(const std::string& event, VORNotification* notification = nullptr);
  // Dispatch under the notification's class name.
  int Dispatch(VORNotification* notification);
  // As Dispatch, but keyed callbacks run only when filed under key.
  int DispatchKeyed(const void* key, const std::string& event,
                    VORNotification* notification = nullptr);

  int CallbackCount() const;
  bool HasCallback(VORCallbackId id) const;
  // Callbacks filed under key for name (for the index's own checks and tests).
  int KeyedCallbackCount(const void* key, const std::string& name) const;
  // Callbacks run by all publishers since the process started: tests count what one change
  // reaches by the difference.
  static unsigned long long CallbacksRun();

 private:
  struct Entry;
  struct Channel;
  using EntryPtr = std::shared_ptr<Entry>;

  VORCallbackId Add(const void* key, const std::string& name, VORCallbackFunction callback,
                    void* clientData, const void* subscriber);
  void Forget(const EntryPtr& entry);
  Channel* Find(std::string_view name) const;
  const EntryPtr* FindLive(VORCallbackId id) const;
  void CompactLive();
  int Run(const std::string& event, VORNotification* notification, bool keyed, const void* key);

  // A publisher has few names (a manipulator four, a model object a handful): they are searched
  // in order, and indexed by name only once there are many.
  std::vector<std::unique_ptr<Channel>> _channels;
  // Their names side by side, each with its first bytes copied in: a search reads one block,
  // and reads a channel's own name only for the rest of a long name that agrees that far,
  // instead of reading every channel of a publisher nobody touched lately. Nor does it hash the
  // name asked for: one pass over it, not two.
  struct ChannelName {
    static constexpr size_t kHeadSize = 16;
    explicit ChannelName(std::string_view channelName);
    bool Is(std::string_view wanted) const;
    std::string_view name;  // the channel's own
    char head[kHeadSize];
  };
  std::vector<ChannelName> _channelNames;
  std::unordered_map<std::string_view, Channel*> _channelIndex;
  // Every callback by id (ids only grow, so appending keeps the order); a removed one stays,
  // flagged, until half of them are removed and no dispatch runs.
  std::vector<EntryPtr> _live;
  size_t _liveRemoved = 0;
  // Dispatches running on this publisher, their lists of due callbacks (kept for reuse), and
  // the callbacks removed meanwhile, whose function objects go when the outermost one ends.
  int _running = 0;
  std::vector<std::vector<Entry*>> _due;
  std::vector<EntryPtr> _retired;
  VORBaseUnknown* _owner;
};
