#include "VOREventSubscriber.h"

#include <algorithm>

#include "VORCommand.h"

VOREventSubscriber::~VOREventSubscriber() {
  for (Subscription& s : _subscriptions)
    s.publisher->RemoveCallback(s.id);
}

VORCallbackId VOREventSubscriber::AddCallback(VOREventPublisher* publisher,
                                              const std::string& notificationName, Method method,
                                              void* clientData) {
  if (!method)
    return 0;
  return Subscribe(
      publisher, notificationName,
      [method = std::move(method)](VORBaseUnknown* owner, const std::string&,
                                   VORNotification* notification, void* data,
                                   VORCallbackId) { method(owner, notification, data); },
      clientData);
}

VORCallbackId VOREventSubscriber::Subscribe(VOREventPublisher* publisher, const std::string& name,
                                            VORCallbackFunction callback, void* clientData) {
  if (publisher == nullptr)
    return 0;
  const VORCallbackId id = publisher->AddCallback(name, std::move(callback), clientData, this);
  if (_subscriptions.empty())
    _subscriptions.reserve(4);  // a subscriber rarely holds fewer: one block, not three
  _subscriptions.push_back(Subscription{VORHandle<VOREventPublisher>(publisher), id});
  return id;
}

bool VOREventSubscriber::RemoveCallback(VORCallbackId handle) {
  auto it = std::find_if(_subscriptions.begin(), _subscriptions.end(),
                         [handle](const Subscription& s) { return s.id == handle; });
  if (it == _subscriptions.end())
    return false;
  it->publisher->RemoveCallback(handle);
  _subscriptions.erase(it);
  return true;
}

int VOREventSubscriber::RemoveCallbacksOn(VOREventPublisher* publisher) {
  int count = 0;
  for (auto it = _subscriptions.begin(); it != _subscriptions.end();) {
    if (it->publisher.get() == publisher) {
      publisher->RemoveCallback(it->id);
      it = _subscriptions.erase(it);
      ++count;
    } else {
      ++it;
    }
  }
  return count;
}

VORCommand* VOREventSubscriber::AsCommand(VORBaseUnknown* publisherOwner) {
  return dynamic_cast<VORCommand*>(publisherOwner);
}
