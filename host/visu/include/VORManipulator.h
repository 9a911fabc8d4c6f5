// Interactive handle on reps, driven by a viewer's mouse events. A manipulator is a command: its
// notifications go first to the callbacks on its event publisher, then up its father chain
// (SendNotification), so a rep command that owns it receives them in AnalyseNotification.
//
// Notification order for one gesture:
//   pointer enters one of its reps      -> preactivate
//   press, move beyond 3 pixels, ...    -> manipulate (one per move)
//   release after moving                -> end of manipulation
//   press and release without moving    -> activate (style 1 only)
//   right click on one of its reps      -> context (after the viewer's own context dispatch)
//   pointer leaves its reps             -> end of preactivate
// Each kind has one notification object per manipulator (GetVORActivate() ...), so receivers
// tell them apart by identity; the event names are the kVOR... constants.
//
// Styles: 1 a click activates and a drag manipulates; 2 drag only: a click without motion is
// left to the viewer as an ordinary selection pick (lists whose items are selected and dragged).
#pragma once

#include <memory>
#include <vector>

#include <absl/container/inlined_vector.h>

#include "VORCommand.h"
#include "VORContext.h"
#include "VORMath2D.h"

class VORViewer;
class VOR2DRep;

class VORManipulatorNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORManipulatorNotification, VORNotification)
 public:
  VORManipulatorNotification(VORBaseUnknown* manipulator, const char* event)
      : _manipulator(manipulator), _event(event) {}
  VORBaseUnknown* GetManipulator() const { return _manipulator; }
  const char* GetEventName() const { return _event; }
  // Model point of the pointer, and the constrained step of this event (manipulate only).
  const VORMathPoint2D& GetPoint() const { return _point; }
  const VORMathPoint2D& GetDelta() const { return _delta; }
  int GetModifiers() const { return _modifiers; }

 private:
  friend class VORManipulator;
  VORBaseUnknown* _manipulator;
  const char* _event;
  VORMathPoint2D _point;
  VORMathPoint2D _delta;
  int _modifiers = 0;
};

// A manipulator usually handles one rep (a button, a scroller): no storage of its own.
using VORManipulatedReps = absl::InlinedVector<VORHandle<VOR2DRep>, 1>;

class VORManipulator : public VORCommand {
  VOR_DECLARE_CLASS(VORManipulator, VORCommand)
 public:
  static constexpr const char* kVORPreactivate = "VORPreactivate";
  static constexpr const char* kVOREndPreactivate = "VOREndPreactivate";
  static constexpr const char* kVORActivate = "VORActivate";
  static constexpr const char* kVORManipulate = "VORManipulate";
  static constexpr const char* kVOREndManipulate = "VOREndManipulate";
  static constexpr const char* kVORContext = "VORContext";

  VORManipulator(VORCommand* father, const VORString& name, int style);

  int GetStyle() const { return _style; }
  void SetStyle(int style) { _style = style; }

  // Drags are projected on this direction (normalised); a null vector removes the constraint.
  void SetDirection(const VORMathVector2Df& direction);
  bool HasDirection() const { return _hasDirection; }
  VORMathVector2Df GetDirection() const { return _direction; }

  // The manipulator's position: it moves with every constrained drag step.
  void SetPosition(const VORMathAxis2D& axis) { _position = axis; }
  void GetPosition(VORMathAxis2D& axis) const { axis = _position; }

  // The reps it acts on (held); a rep answers one manipulator at a time.
  void AddElement(VOR2DRep* rep);
  bool RemoveElement(VOR2DRep* rep);
  void RemoveAllElements();
  int GetElementCount() const { return static_cast<int>(_reps.size()); }
  const VORManipulatedReps& GetElements() const { return _reps; }

  VORNotification* GetVORPreactivate() const { return Notification(kPreactivateSlot); }
  VORNotification* GetVOREndPreactivate() const { return Notification(kEndPreactivateSlot); }
  VORNotification* GetVORActivate() const { return Notification(kActivateSlot); }
  VORNotification* GetVORManipulate() const { return Notification(kManipulateSlot); }
  VORNotification* GetVOREndManipulate() const { return Notification(kEndManipulateSlot); }

  // The viewer driving the current gesture (null between gestures) and the last pointer point.
  VORViewer* GetViewer() const { return _viewer; }
  const VORMathPoint2D& GetCurrentPoint() const { return _current; }
  bool IsPreactivated() const { return _preactivated; }
  bool IsDragging() const { return _dragging; }
  // The rep among its elements that the current (or last) gesture started on.
  VOR2DRep* GetPressedElement() const { return _pressed_element.get(); }

  // Entry points of the viewer.
  void Preactivate(VORViewer* viewer, const VORMathPoint2D& point, int modifiers);
  void EndPreactivate(VORViewer* viewer, const VORMathPoint2D& point, int modifiers);
  // element: the manipulated rep the press hit (null when unknown).
  void PointerPress(VORViewer* viewer, const VORMathPoint2D& point, int modifiers,
                    VOR2DRep* element = nullptr);
  // A drag step (the viewer calls it once the pointer moved past the drag threshold).
  void PointerDrag(const VORMathPoint2D& point, int modifiers);
  // Returns true when the release activated the manipulator (a click).
  bool PointerRelease(const VORMathPoint2D& point, int modifiers);
  void Context(VORViewer* viewer, VORContext* context);

 protected:
  ~VORManipulator() override;
  // Called on each drag step with the constrained delta, before the notification.
  virtual void ApplyDrag(const VORMathPoint2D& delta);

 private:
  void Send(VORManipulatorNotification* notification, const VORMathPoint2D& point,
            const VORMathPoint2D& delta, int modifiers);
  void SendAny(const char* event, VORNotification* notification);

  int _style;
  bool _hasDirection = false;
  VORMathVector2Df _direction;
  VORMathAxis2D _position;
  VORManipulatedReps _reps;
  enum Slot {
    kPreactivateSlot,
    kEndPreactivateSlot,
    kActivateSlot,
    kManipulateSlot,
    kEndManipulateSlot,
    kSlotCount
  };
  // The notification of one gesture event, made on first use: a chart has thousands of
  // manipulators and most never see a gesture.
  VORManipulatorNotification* Notification(Slot slot) const;
  mutable std::unique_ptr<VORHandle<VORManipulatorNotification>[]> _notifications;
  VORViewer* _viewer = nullptr;
  VORHandle<VOR2DRep> _pressed_element;
  VORMathPoint2D _current;
  bool _preactivated = false;
  bool _pressed = false;
  bool _dragging = false;
};
VOR_DECLARE_HANDLE(VORManipulator);
