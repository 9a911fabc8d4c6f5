// Visualisation components: objects that draw something (a list item, a marker) as a 2D rep.
// VORIVisu is what a caller asks for; VORExtIVisu is the base that components derive from: it
// keeps the rep it built last, so that its owner can find, empty and destroy it again.
#pragma once

#include "VOR2DRep.h"
#include "VORBaseUnknown.h"
#include "VORHandle.h"

class VORIVisu : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIVisu)
 public:
  // Builds the rep: a new rep with one reference for the caller, null when nothing can be drawn.
  virtual VOR2DRep* BuildRep() = 0;
  // The rep built last (not a new reference), null before the first build.
  virtual VOR2DRep* GetRep() const = 0;
};
VOR_DECLARE_HANDLE(VORIVisu);

class VORExtIVisu : public VORIVisu {
  VOR_DECLARE_CLASS(VORExtIVisu, VORBaseUnknown)
 public:
  VOR2DRep* GetRep() const override { return _rep.get(); }
  // Forgets the kept rep (the caller detaches and destroys it).
  void ForgetRep() { _rep = NULL_var; }

 protected:
  VORExtIVisu() = default;
  ~VORExtIVisu() override = default;
  // Keeps rep as the one built last.
  void KeepRep(VOR2DRep* rep) { _rep = rep; }

 private:
  VOR2DRep_var _rep;
};
VOR_DECLARE_HANDLE(VORExtIVisu);
