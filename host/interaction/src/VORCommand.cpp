#include "VORCommand.h"

#include <algorithm>

#include "VORDeferredDeletion.h"

VORCommand::VORCommand(VORCommand* father, const VORString& name) : _name(name) {
  SetFather(father);
}

VORCommand::~VORCommand() {
  for (VORCommand* child : _children)
    child->_father = nullptr;
  _children.clear();
  SetFather(nullptr);
}

void VORCommand::SetFather(VORCommand* father) {
  if (father == _father || father == this)
    return;
  if (_father != nullptr) {
    VORCommandChildren& siblings = _father->_children;
    siblings.erase(std::remove(siblings.begin(), siblings.end(), this), siblings.end());
  }
  _father = father;
  if (_father != nullptr)
    _father->_children.push_back(this);
}

void VORCommand::SendNotification(VORCommand* to, VORNotification* notification) {
  VORHandle<VORNotification> keepNotification(notification);
  VORCommand_var receiver(to);
  while (receiver) {
    if (receiver->AnalyseNotification(this, notification) != VORNotifPropagate)
      return;
    receiver = receiver->GetFather();
  }
}

VORNotifPropagation VORCommand::AnalyseNotification(VORCommand*, VORNotification*) {
  return VORNotifPropagate;
}

VORStatusChangeRC VORCommand::Activate(VORCommand*, VORNotification*) {
  return VORStatusChangeRCCompleted;
}

VORStatusChangeRC VORCommand::Desactivate(VORCommand*, VORNotification*) {
  return VORStatusChangeRCCompleted;
}

VORStatusChangeRC VORCommand::Cancel(VORCommand*, VORNotification*) {
  return VORStatusChangeRCCompleted;
}

VOREventPublisher* VORCommand::GetEventPublisher() {
  if (!_publisher)
    _publisher = VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher(this));
  return _publisher;
}

int VORCommand::DispatchNotification(VORNotification* notification) {
  if (notification == nullptr || !_publisher)
    return 0;
  VORCommand_var keep(this);
  return _publisher->Dispatch(notification);
}

void VORCommand::RequestDelayedDestruction() {
  VORCommandDeletion(this);
}
