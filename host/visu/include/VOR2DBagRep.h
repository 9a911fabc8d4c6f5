// A group of reps drawn in order (later children on top) through an optional matrix.
#pragma once

#include <memory>
#include <vector>

#include <absl/container/inlined_vector.h>

#include "VOR2DRep.h"

// Most bags of a chart hold one or two reps (a button, a label and its box): those need no
// storage of their own.
using VOR2DBagChildren = absl::InlinedVector<VOR2DRep_var, 2>;

class VOR2DBagRep : public VOR2DRep {
  VOR_DECLARE_CLASS(VOR2DBagRep, VOR2DRep)
 public:
  VOR2DBagRep() = default;

  // Appends child (a reference is taken); a child of another bag is moved here. Null and the
  // bag itself or one of its fathers are refused (false).
  bool AddChild(VOR2DRep* child);
  // Detaches child and drops the bag's reference at once (the caller must hold its own when the
  // rep is still in use). False when child is not a child of this bag.
  bool RemoveChild(VOR2DRep* child);
  // Detaches child and releases it through deferred deletion, so that a rep still on the call
  // stack (a dragged scroller) survives the current event.
  bool DestroyChild(VOR2DRep* child);
  // Removes every child (deferred release, as DestroyChild).
  void EmptyBag();

  int GetSize() const { return static_cast<int>(_children.size()); }
  // Room for count children at once, for a bag built with a known number of them.
  void ReserveChildren(int count) { _children.reserve(static_cast<size_t>(count)); }
  // Child at position 1..GetSize(), null out of range.
  VOR2DRep* GetChild(int position) const;
  const VOR2DBagChildren& GetChildren() const { return _children; }

  void SetMatrix(const VOR3x3Matrix& matrix);
  // Null when no matrix was set (the bag draws its children as they are).
  const VOR3x3Matrix* GetMatrix() const { return _hasMatrix ? &_matrix : nullptr; }
  void GetMatrix(VOR3x3Matrix& matrix) const { matrix = _matrix; }
  void ResetMatrix();

  bool HitTest(const VORMathPoint2D& p, double tolerance) const override;
  // Bags with at least this many children pick through a grid index of their children's boxes
  // (built on the first pick after a change) instead of testing every child; the order of the
  // hits is the same.
  static int GetIndexThreshold();
  static void SetIndexThreshold(int children);
  void CollectPicks(const VORMathPoint2D& p, double tolerance, std::vector<VOR2DRep*>& chain,
                    std::vector<VORPickHit>& out) override;

 protected:
  ~VOR2DBagRep() override;
  VORBox2D ComputeBoundingBox() const override;
  void FlattenShown(VORFlattenContext& context) const override;

 private:
  void Detach(VOR2DRep* child);
  // The matrix changed: the box in the father's frame is stale, the children's box is not.
  void InvalidateFrame();
  // Point of the father's frame in the children's frame; false when the matrix is singular.
  bool ToLocal(const VORMathPoint2D& p, VORMathPoint2D& local, double& scale) const;

  void BuildIndex() const;
  // Positions (0-based) of the children whose box may hold p within tolerance, last first.
  void Candidates(const VORMathPoint2D& p, double tolerance, std::vector<int>& out) const;

  // The grid of children's boxes of a large bag; the many small bags of a chart have none.
  struct PickIndex {
    unsigned long version = 0;  // the _boxVersion it was built for
    int cells = 0;              // grid of cells x cells over _localBox
    std::vector<std::vector<int>> buckets;
  };

  VOR2DBagChildren _children;
  mutable VORBox2D _localBox;             // shown children, in the children's frame
  mutable unsigned long _boxVersion = 0;  // bumped by each box computation
  mutable std::unique_ptr<PickIndex> _index;
  // The inverse is computed when a pick needs it: matrices change far more often than picks.
  VOR3x3Matrix _matrix;
  bool _hasMatrix = false;
};
VOR_DECLARE_HANDLE(VOR2DBagRep);
