// The 2D manipulator: named, on one rep (more can be added), with a style and options.
// Option bit 0: the manipulator translates the bags it acts on by each drag step itself;
// without it (the usual case) the receivers of the manipulate notification move what they want.
#pragma once

#include "VORManipulator.h"

class VOR2DRep;

class VOR2DManipulator : public VORManipulator {
  VOR_DECLARE_CLASS(VOR2DManipulator, VORManipulator)
 public:
  VOR2DManipulator(VORCommand* father, const VORString& name, VOR2DRep* rep, int style,
                   int options = 0);
  int GetOptions() const { return _options; }

 protected:
  ~VOR2DManipulator() override = default;
  void ApplyDrag(const VORMathPoint2D& delta) override;

 private:
  int _options;
};
VOR_DECLARE_HANDLE(VOR2DManipulator);
