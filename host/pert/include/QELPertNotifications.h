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
  const VORBaseUnknown_var& GetNode() const { return _node; }
  void* GetData() const { return _data; }
  int GetRemoveRep() const { return _removeRep; }

 private:
  VORBaseUnknown_var _node;
  void* _data;
  int _removeRep;
};
