#include "VORDialogAgent.h"

VORDialogAgent::VORDialogAgent(const VORString& name) : VORCommand(nullptr, name) {}

VORDialogAgent::~VORDialogAgent() = default;

void VORDialogAgent::AcceptOnNotify(VORCommand* sender, const char* notificationName) {
  if (sender != nullptr)
    AcceptOnNotify(sender->GetEventPublisher(), notificationName);
}

void VORDialogAgent::AcceptOnNotify(VOREventPublisher* publisher, const char* notificationName) {
  if (publisher == nullptr || notificationName == nullptr)
    return;
  AddCallback(publisher, notificationName,
              [this](VORBaseUnknown*, VORNotification* notification, void*) {
                if (_active)
                  SetOutput(nullptr, notification);
              });
}

void VORDialogAgent::Reset() {
  _outputSet = false;
  _value = NULL_var;
  _lastNotification = NULL_var;
}

VORString VORDialogAgent::GetResourceFilename(int) const {
  return DefaultResourceFilename();
}

void VORDialogAgent::SetOutput(VORBaseUnknown* value, VORNotification* notification) {
  VORDialogAgent_var keep(this);
  if (value != nullptr)
    _value = value;
  _lastNotification = notification;
  _outputSet = true;
  if (GetFather() != nullptr) {
    auto n = VORHandle<VORAgentOutputNotification>::Adopt(new VORAgentOutputNotification(this));
    SendNotification(GetFather(), n);
  }
}
