#include "VORManipulator.h"

#include <algorithm>

#include "VOR2DBagRep.h"
#include "VOR2DManipulator.h"
#include "VOR2DRep.h"

VORManipulator::VORManipulator(VORCommand* father, const VORString& name, int style)
    : VORCommand(father, name), _style(style) {}

VORManipulatorNotification* VORManipulator::Notification(Slot slot) const {
  if (!_notifications)
    _notifications = std::make_unique<VORHandle<VORManipulatorNotification>[]>(kSlotCount);
  VORHandle<VORManipulatorNotification>& notification = _notifications[slot];
  if (!notification) {
    static constexpr const char* kEvents[kSlotCount] = {
        kVORPreactivate, kVOREndPreactivate, kVORActivate, kVORManipulate, kVOREndManipulate};
    // The manipulator stays the notification's sender, as when it was made up front.
    notification = VORHandle<VORManipulatorNotification>::Adopt(
        new VORManipulatorNotification(const_cast<VORManipulator*>(this), kEvents[slot]));
  }
  return notification.get();
}

VORManipulator::~VORManipulator() {
  for (auto& rep : _reps) {
    if (rep->_manipulator == this)
      rep->_manipulator = nullptr;
  }
}

void VORManipulator::SetDirection(const VORMathVector2Df& direction) {
  _direction = direction.Normalized();
  _hasDirection = _direction.Norm() > 0.0f;
}

void VORManipulator::AddElement(VOR2DRep* rep) {
  if (rep == nullptr)
    return;
  // The rep's back pointer tells membership: no search through the elements.
  if (rep->_manipulator == this)
    return;
  if (rep->_manipulator != nullptr)
    rep->_manipulator->RemoveElement(rep);
  _reps.emplace_back(rep);
  rep->_manipulator = this;
}

bool VORManipulator::RemoveElement(VOR2DRep* rep) {
  // From the end: the last added rep is the usual one to go.
  auto rit = std::find_if(_reps.rbegin(), _reps.rend(), [rep](auto& r) { return r.get() == rep; });
  if (rit == _reps.rend())
    return false;
  VORHandle<VOR2DRep> keep = *rit;
  _reps.erase(std::next(rit).base());
  if (rep->_manipulator == this)
    rep->_manipulator = nullptr;
  return true;
}

void VORManipulator::RemoveAllElements() {
  VORManipulatedReps reps;
  reps.swap(_reps);
  for (auto& rep : reps) {
    if (rep->_manipulator == this)
      rep->_manipulator = nullptr;
  }
}

void VORManipulator::SendAny(const char* event, VORNotification* notification) {
  VORManipulator_var keep(this);
  GetEventPublisher()->Dispatch(event, notification);
  if (GetFather() != nullptr)
    SendNotification(GetFather(), notification);
}

void VORManipulator::Send(VORManipulatorNotification* notification, const VORMathPoint2D& point,
                          const VORMathPoint2D& delta, int modifiers) {
  notification->_point = point;
  notification->_delta = delta;
  notification->_modifiers = modifiers;
  SendAny(notification->GetEventName(), notification);
}

void VORManipulator::Preactivate(VORViewer* viewer, const VORMathPoint2D& point, int modifiers) {
  if (_preactivated)
    return;
  _preactivated = true;
  _viewer = viewer;
  _current = point;
  Send(Notification(kPreactivateSlot), point, {}, modifiers);
}

void VORManipulator::EndPreactivate(VORViewer* viewer, const VORMathPoint2D& point, int modifiers) {
  if (!_preactivated)
    return;
  _preactivated = false;
  _viewer = viewer;
  _current = point;
  Send(Notification(kEndPreactivateSlot), point, {}, modifiers);
  if (!_pressed)
    _viewer = nullptr;
}

void VORManipulator::PointerPress(VORViewer* viewer, const VORMathPoint2D& point, int /*modifiers*/,
                                  VOR2DRep* element) {
  _viewer = viewer;
  _pressed_element = element;
  _pressed = true;
  _dragging = false;
  _current = point;
}

void VORManipulator::PointerDrag(const VORMathPoint2D& point, int modifiers) {
  if (!_pressed)
    return;
  _dragging = true;
  double dx = point.x - _current.x;
  double dy = point.y - _current.y;
  if (_hasDirection) {
    const double along = dx * _direction.x + dy * _direction.y;
    dx = along * _direction.x;
    dy = along * _direction.y;
  }
  _current = point;
  _position.origin.x += dx;
  _position.origin.y += dy;
  ApplyDrag({dx, dy});
  Send(Notification(kManipulateSlot), point, {dx, dy}, modifiers);
}

bool VORManipulator::PointerRelease(const VORMathPoint2D& point, int modifiers) {
  if (!_pressed)
    return false;
  _pressed = false;
  const bool wasDragging = _dragging;
  _dragging = false;
  _current = point;
  bool activated = false;
  if (wasDragging) {
    Send(Notification(kEndManipulateSlot), point, {}, modifiers);
  } else if (_style != 2) {
    Send(Notification(kActivateSlot), point, {}, modifiers);
    activated = true;
  }
  if (!_preactivated)
    _viewer = nullptr;
  return activated;
}

void VORManipulator::Context(VORViewer* viewer, VORContext* context) {
  if (context == nullptr)
    return;
  _viewer = viewer;
  SendAny(kVORContext, context);
}

void VORManipulator::ApplyDrag(const VORMathPoint2D&) {}
