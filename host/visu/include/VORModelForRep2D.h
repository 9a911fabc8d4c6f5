// Puts a rep into an editor's interactive set of objects (VORISO): every viewer attached to that
// set draws the rep of each model it holds, on top of the viewer's own reps.
#pragma once

#include "VOR2DRep.h"
#include "VORISO.h"

class VORModelForRep2D : public VORISOElement {
  VOR_DECLARE_CLASS(VORModelForRep2D, VORISOElement)
 public:
  VORModelForRep2D() = default;
  // The rep is held by the model.
  void SetRep(VOR2DRep* rep) { _rep = rep; }
  VOR2DRep* GetRep() const { return _rep.get(); }

 private:
  VOR2DRep_var _rep;
};
VOR_DECLARE_HANDLE(VORModelForRep2D);
