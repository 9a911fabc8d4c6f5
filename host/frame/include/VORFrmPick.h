// Where a user's pick goes, whether it comes from a viewer click or from the driver: the running
// command's agents first (front path first); without a command waiting for picks, the editor's
// CSO (Shift or Control with multi-selection behaviour 1 toggles the path in it; a click on the
// background empties it; a component that answers VORISelectShow names what is selected). Each pick
// is announced on the application frame's publisher with a VORFrmPickNotification.
#pragma once

#include <vector>

#include "VORFrmEditor.h"
#include "VORPathElement.h"

class VORFrmPickNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORFrmPickNotification, VORNotification)
 public:
  enum Result { TakenByCommand, RefusedByCommand, Selected, Background };
  VORFrmPickNotification(VORPathElement* path, Result result) : _path(path), _result(result) {}
  VORPathElement* GetPath() const { return _path.get(); }
  Result GetResult() const { return _result; }

 private:
  VORPathElement_var _path;
  Result _result;
};

VORFrmPickNotification::Result VORFrmDispatchPick(VORFrmEditor* editor,
                                                  const std::vector<VORPathElement_var>& paths,
                                                  int modifiers = 0, int multiSelBehavior = 0);
