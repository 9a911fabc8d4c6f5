// An object that subscribes callbacks to event publishers and removes them again, by handle or
// all at once when it dies, so that no publisher ever calls into a destroyed subscriber.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "VOREventPublisher.h"
#include "VORHandle.h"

class VORCommand;

class VOREventSubscriber : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VOREventSubscriber, VORBaseUnknown)
 public:
  // publisher's owner (or the publisher), the notification, the client data given at AddCallback.
  using Method = std::function<void(VORBaseUnknown* publisher, VORNotification* notification,
                                    void* clientData)>;

  VOREventSubscriber() = default;

  // Calls method for every notification whose class IsAKindOf notificationName (or every event
  // of that name) that publisher dispatches. Returns the handle (> 0), 0 for a null publisher.
  VORCallbackId AddCallback(VOREventPublisher* publisher, const std::string& notificationName,
                            Method method, void* clientData = nullptr);
  // Member-function form: method(sender command or null, notification, clientData).
  template <class C>
  VORCallbackId AddCallback(VOREventPublisher* publisher, const std::string& notificationName,
                            void (C::*method)(VORCommand*, VORNotification*, void*),
                            void* clientData = nullptr);

  // False when this subscriber holds no callback with that handle.
  bool RemoveCallback(VORCallbackId handle);
  // Removes every callback of this subscriber on publisher; returns how many.
  int RemoveCallbacksOn(VOREventPublisher* publisher);
  int SubscriptionCount() const { return static_cast<int>(_subscriptions.size()); }

 protected:
  ~VOREventSubscriber() override;

 private:
  struct Subscription {
    VORHandle<VOREventPublisher> publisher;
    VORCallbackId id;
  };
  static VORCommand* AsCommand(VORBaseUnknown* publisherOwner);
  VORCallbackId Subscribe(VOREventPublisher* publisher, const std::string& name,
                          VORCallbackFunction callback, void* clientData);
  std::vector<Subscription> _subscriptions;
};

template <class C>
VORCallbackId VOREventSubscriber::AddCallback(
    VOREventPublisher* publisher, const std::string& notificationName,
    void (C::*method)(VORCommand*, VORNotification*, void*), void* clientData) {
  if (method == nullptr)
    return 0;
  C* self = static_cast<C*>(this);
  // Small enough to live inside the publisher's callback: no heap block per subscription.
  return Subscribe(
      publisher, notificationName,
      [self, method](VORBaseUnknown* owner, const std::string&, VORNotification* notification,
                     void* data,
                     VORCallbackId) { (self->*method)(AsCommand(owner), notification, data); },
      clientData);
}
