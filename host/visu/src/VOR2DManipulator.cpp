#include "VOR2DManipulator.h"

#include "VOR2DBagRep.h"

VOR2DManipulator::VOR2DManipulator(VORCommand* father, const VORString& name, VOR2DRep* rep,
                                   int style, int options)
    : VORManipulator(father, name, style), _options(options) {
  AddElement(rep);
}

void VOR2DManipulator::ApplyDrag(const VORMathPoint2D& delta) {
  if ((_options & 1) == 0)
    return;
  for (const auto& rep : GetElements()) {
    auto* bag = dynamic_cast<VOR2DBagRep*>(rep.get());
    if (bag == nullptr)
      continue;
    VOR3x3Matrix m;
    bag->GetMatrix(m);
    double tx = 0.0;
    double ty = 0.0;
    m.GetTranslation(tx, ty);
    m.SetTranslation(tx + delta.x, ty + delta.y);
    bag->SetMatrix(m);
  }
}
