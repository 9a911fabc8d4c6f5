// An attribute of an object changed (label, time, PERT position, state...). Dispatched on the
// object's own dispatcher. flag 1: the object's visualisation should follow.
#pragma once

#include <string>

#include "VORHandle.h"
#include "VORNotification.h"

class VORModify : public VORNotification {
  VOR_DECLARE_CLASS(VORModify, VORNotification)
 public:
  VORModify(VORBaseUnknown* object, const char* classId, int flag, std::string what = {})
      : _object(object), _classId(classId ? classId : ""), _flag(flag), _what(std::move(what)) {}
  VORBaseUnknown* GetObject() const { return _object.get(); }
  const std::string& GetClassId() const { return _classId; }
  int GetFlag() const { return _flag; }
  // What changed: "label", "time", "position", "state", "size", "attribute", "name"... (may
  // be empty).
  const std::string& GetWhat() const { return _what; }

 private:
  VORBaseUnknown_var _object;
  std::string _classId;
  int _flag;
  std::string _what;
};
