// A rep drawn from a list of graphic primitives, each with its packed graphic attribute word
// and alpha (VORGraphicAttribute.h). The rep owns its primitives.
#pragma once

#include <memory>
#include <vector>

#include "VOR2DPolylineGP.h"
#include "VOR2DRep.h"
#include "VORGraphicAttribute.h"

class VOR2DCustomRep : public VOR2DRep {
  VOR_DECLARE_CLASS(VOR2DCustomRep, VOR2DRep)
 public:
  VOR2DCustomRep() = default;

  // Takes ownership of primitive (null is ignored, false).
  bool AddPrimitive(VOR2DGP* primitive, const VOR2DGraphicAttribute& attribute);
  bool AddPrimitive(VOR2DGP* primitive, unsigned int word, int alpha) {
    return AddPrimitive(primitive, VOR2DGraphicAttribute(word, static_cast<std::uint8_t>(alpha)));
  }
  void RemoveAllPrimitives();
  // Gives the polyline at position (1-based) new points in place, keeping its attribute: a rep
  // redrawn often (a link whose ends move) keeps its primitives instead of rebuilding them.
  // False, and nothing changes, when there is no polyline at position.
  bool ModifyPolyline(int position, const VORMathPoint2Df* points, int count);
  int GetPrimitiveCount() const { return static_cast<int>(_primitives.size()); }
  // Room for count primitives at once, for a rep built with a known number of them.
  void ReservePrimitives(int count) { _primitives.reserve(static_cast<size_t>(count)); }
  const VOR2DGP* GetPrimitive(int position) const;  // 1-based, null out of range
  VOR2DGraphicAttribute GetAttribute(int position) const;

  bool HitTest(const VORMathPoint2D& p, double tolerance) const override;

 protected:
  VORBox2D ComputeBoundingBox() const override;
  void FlattenShown(VORFlattenContext& context) const override;

 private:
  struct Entry {
    std::unique_ptr<VOR2DGP> primitive;
    VOR2DGraphicAttribute attribute;
  };
  std::vector<Entry> _primitives;
};
VOR_DECLARE_HANDLE(VOR2DCustomRep);
