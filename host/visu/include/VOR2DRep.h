// Base of every 2D representation: show mode, colour index, line thickness, the model object it
// stands for, and a cached bounding box. Reps form a tree of bags; a bag holds a reference on
// each child, a child knows its father without holding it.
//
// Frames: a rep's geometry is given in its father's frame, except that a bag's own matrix maps
// the bag's children into the father's frame. GetBoundingBox answers in the father's frame
// (for a bag, the union of its shown children mapped through its matrix).
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "VOR3x3Matrix.h"
#include "VORBaseUnknown.h"
#include "VORHandle.h"
#include "VORMath2D.h"
#include "VORRenderList.h"

class VOR2DBagRep;
class VORManipulator;
class VOR2DRep;

// State carried down the tree while flattening.
struct VORFlattenContext {
  VORRenderList* list = nullptr;
  VOR3x3Matrix matrix;  // father frame -> model coordinates
  int colorIndex = 0;   // inherited colour index
  int highlight = VORHighlightNone;
  std::string tag;
  // Highlight flags of the object a rep stands for; may be empty.
  std::function<int(VORBaseUnknown*)> highlightOf;
};

// One pick: the reps from the picked top-level rep down to the leaf that was hit.
struct VORPickHit {
  std::vector<VOR2DRep*> reps;
  // The leaf is under the point itself, not only within the tolerance of it.
  bool exact = false;
};

// Process-wide counter bumped by every change of any rep; viewers rebuild their render list when
// it moved.
unsigned long VORSceneGeneration();

class VOR2DRep : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VOR2DRep, VORBaseUnknown)
 public:
  // 0 shown, 1 hidden; other values are stored and hide the rep as well.
  void SetShowMode(int mode);
  int GetShowMode() const { return _showMode; }
  bool IsShown() const { return _showMode == 0; }

  // Colour index of the palette (VORGraphicAttribute.h); -1 (the default) inherits the father's.
  void SetColorIndex(int index);
  int GetColorIndex() const { return _colorIndex; }
  // Line width in pixels (default 1).
  void SetLineThickness(int thickness);
  int GetLineThickness() const { return _lineThickness; }

  // The model object the rep stands for; picking reports it. Held by the rep.
  void SetObject(VORBaseUnknown* object);
  VORBaseUnknown* GetObject() const { return _object.get(); }
  // A role name ("PertNode", "PertLink" ...) carried into the render list and the SVG classes.
  void SetTag(const std::string& tag);
  const std::string& GetTag() const;

  VOR2DBagRep* GetFather() const { return _father; }
  // The manipulator acting on this rep, or null (set by the manipulator).
  VORManipulator* GetManipulator() const { return _manipulator; }
  // The manipulator a pick on this rep starts: the one set on it, or, for a rep whose owner
  // makes it on first need, that one.
  virtual VORManipulator* PickManipulator() { return _manipulator; }

  VORBox2D GetBoundingBox() const;
  // Boxes computed again (cache misses of GetBoundingBox) in this process: what a change costs,
  // for fan-out tests.
  static unsigned long long BoxesComputed();
  void GetBoundingBox(VORBox2D& box) const { box = GetBoundingBox(); }
  void GetBoundingBox(float& xmin, float& ymin, float& xmax, float& ymax) const;

  // True when p (in the father's frame) touches the rep's geometry within tolerance.
  virtual bool HitTest(const VORMathPoint2D& p, double tolerance) const = 0;
  // Appends the rep's primitives when shown.
  void Flatten(VORFlattenContext& context) const;
  // Collects hits front to back (last drawn first); hidden reps and their subtrees are skipped.
  virtual void CollectPicks(const VORMathPoint2D& p, double tolerance,
                            std::vector<VOR2DRep*>& chain, std::vector<VORPickHit>& out);

  // Drops cached boxes of this rep and its fathers; reps call it whenever geometry changes.
  void Invalidate();

 protected:
  VOR2DRep() = default;
  ~VOR2DRep() override;
  // Box in the father's frame, hidden or not.
  virtual VORBox2D ComputeBoundingBox() const = 0;
  virtual void FlattenShown(VORFlattenContext& context) const = 0;
  // Starts an item with this rep's colour, thickness, highlight and tag.
  VORRenderItem& AddItem(VORFlattenContext& context, VORPrimitiveKind kind) const;
  static void Touch();

 private:
  friend class VOR2DBagRep;
  friend class VORManipulator;
  int _showMode = 0;
  int _colorIndex = -1;
  int _lineThickness = 1;
  VORBaseUnknown_var _object;
  // Few reps carry a tag: the others keep no string of their own.
  std::unique_ptr<std::string> _tag;
  VOR2DBagRep* _father = nullptr;
  VORManipulator* _manipulator = nullptr;
  // Fathers' boxes only, for a rep whose own frame moved (its children's box stays valid).
  void InvalidateFathers();

  mutable VORBox2D _box;
  mutable bool _boxValid = false;
  // Bags: the box of the children in the bag's own frame is valid. It implies _boxValid's
  // inputs are all valid, so a bag whose matrix alone changed maps its children's box again
  // instead of visiting them.
  mutable bool _localValid = false;
};
VOR_DECLARE_HANDLE(VOR2DRep);

// Distance from p to segment ab.
double VORDistanceToSegment(const VORMathPoint2D& p, double ax, double ay, double bx, double by);
// True when p is inside the polygon of count points xy (even-odd rule).
bool VORPointInPolygon(const VORMathPoint2D& p, const std::vector<VORMathPoint2Df>& points);
