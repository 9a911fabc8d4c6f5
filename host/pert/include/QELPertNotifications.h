// Notifications of the graph editor, dispatched on the chart root's model events.
#pragma once

#include "VORHandle.h"
#include "VORNotification.h"

// A node moved to (x, y).
class QELPertPositionNotify : public VORNotification {
  VOR_DECLARE_CLASS(QELPertPositionNotify, VORNotification)
 public:
  QELPertPositionNotify(const VORBaseUnknown_var& node, const double& x, const double& y)
      : _node(node), _x(x), _y(y) {}
  // For QELPertNotifySlot: the next move, or nothing held.
  void Set(const VORBaseUnknown_var& node, const double& x, const double& y) {
    _node = node;
    _x = x;
    _y = y;
  }
  void Clear() { _node = NULL_var; }
  const VORBaseUnknown_var& GetNode() const { return _node; }
  void GetPosition(double& x, double& y) const {
    x = _x;
    y = _y;
  }

 private:
  VORBaseUnknown_var _node;
  double _x;
  double _y;
};

// A node's rep was added to a chart (remove flag 0) or taken out of it (1); also sent by
// others to ask the chart to refresh a node (data then empty).
class QELPertAppInfoNotify : public VORNotification {
  VOR_DECLARE_CLASS(QELPertAppInfoNotify, VORNotification)
 public:
  explicit QELPertAppInfoNotify(const VORBaseUnknown_var& node, void* data = nullptr,
                                int removeRep = 0)
      : _node(node), _data(data), _removeRep(removeRep) {}
  // For QELPertNotifySlot: the next node, or nothing held.
  void Set(const VORBaseUnknown_var& node, void* data, int removeRep) {
    _node = node;
    _data = data;
    _removeRep = removeRep;
  }
  void Clear() { _node = NULL_var; }
  const VORBaseUnknown_var& GetNode() const { return _node; }
  void* GetData() const { return _data; }
  int GetRemoveRep() const { return _removeRep; }

 private:
  VORBaseUnknown_var _node;
  void* _data;
  int _removeRep;
};

// For a sender that dispatches notifications of one class one after another (a chart being
// filled, a layout moving every node): one object serves them all, a new one only while a
// listener still holds the last. Nothing stays referenced between dispatches.
template <class Notify>
class QELPertNotifySlot {
 public:
  // Dispatches Notify(args...) on events (anything with Dispatch(VORNotification*)).
  template <class Events, class... Args>
  void Dispatch(Events& events, const Args&... args) {
    if (_kept && _kept->RefCount() == 1)
      _kept->Set(args...);
    else
      _kept = VORHandle<Notify>::Adopt(new Notify(args...));
    {
      // Held here while listeners run: a dispatch nested in one of them takes a new object.
      const VORHandle<Notify> notification = _kept;
      events.Dispatch(notification.get());
    }
    if (_kept->RefCount() == 1)
      _kept->Clear();
    else
      _kept = NULL_var;
  }

 private:
  VORHandle<Notify> _kept;
};
