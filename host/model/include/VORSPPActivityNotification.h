// A change of the activity tree: the activity whose data changed (father), the object added,
// removed or changed (son) and the kind.
#pragma once

#include "VORHandle.h"
#include "VORModelTypes.h"
#include "VORNotification.h"

class VORSPPActivityNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORSPPActivityNotification, VORNotification)
 public:
  VORSPPActivityNotification(VORBaseUnknown* father, VORBaseUnknown* son, SPPModifyKind kind)
      : _father(father), _son(son), _kind(kind) {}
  VORBaseUnknown* GetFather() const { return _father.get(); }
  VORBaseUnknown* GetSon() const { return _son.get(); }
  SPPModifyKind GetKind() const { return _kind; }
  SPPModifyKind GetModifyKind() const { return _kind; }

 private:
  VORBaseUnknown_var _father;
  VORBaseUnknown_var _son;
  SPPModifyKind _kind;
};
