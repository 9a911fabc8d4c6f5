#include "VOR2DRep.h"

#include <cmath>

#include "VOR2DBagRep.h"
#include "VORGraphicAttribute.h"

namespace {
unsigned long& Generation() {
  static unsigned long generation = 1;
  return generation;
}
unsigned long long& BoxCount() {
  static unsigned long long count = 0;
  return count;
}
}  // namespace

unsigned long VORSceneGeneration() {
  return Generation();
}

void VOR2DRep::Touch() {
  ++Generation();
}

VOR2DRep::~VOR2DRep() = default;

void VOR2DRep::SetShowMode(int mode) {
  if (mode == _showMode)
    return;
  _showMode = mode;
  // A father's box only holds shown children.
  if (_father != nullptr)
    _father->Invalidate();
  Touch();
}

void VOR2DRep::SetColorIndex(int index) {
  _colorIndex = index;
  Touch();
}

void VOR2DRep::SetLineThickness(int thickness) {
  _lineThickness = thickness;
  Touch();
}

void VOR2DRep::SetObject(VORBaseUnknown* object) {
  _object = object;
}

void VOR2DRep::SetTag(const std::string& tag) {
  if (tag.empty())
    _tag.reset();
  else if (_tag)
    *_tag = tag;
  else
    _tag = std::make_unique<std::string>(tag);
  Touch();
}

const std::string& VOR2DRep::GetTag() const {
  static const std::string kNone;
  return _tag ? *_tag : kNone;
}

unsigned long long VOR2DRep::BoxesComputed() {
  return BoxCount();
}

VORBox2D VOR2DRep::GetBoundingBox() const {
  if (!_boxValid) {
    ++BoxCount();
    _box = ComputeBoundingBox();
    _boxValid = true;
  }
  return _box;
}

void VOR2DRep::GetBoundingBox(float& xmin, float& ymin, float& xmax, float& ymax) const {
  const VORBox2D box = GetBoundingBox();
  if (box.IsEmpty()) {
    xmin = ymin = xmax = ymax = 0.0f;
    return;
  }
  xmin = static_cast<float>(box.xmin);
  ymin = static_cast<float>(box.ymin);
  xmax = static_cast<float>(box.xmax);
  ymax = static_cast<float>(box.ymax);
}

void VOR2DRep::Invalidate() {
  Touch();
  _boxValid = false;
  _localValid = false;
  InvalidateFathers();
}

void VOR2DRep::InvalidateFathers() {
  // A father whose children's box is valid only ever holds valid children, so the walk stops at
  // the first father whose children's box is already invalid.
  for (VOR2DRep* r = _father; r != nullptr && r->_localValid; r = r->_father) {
    r->_boxValid = false;
    r->_localValid = false;
  }
}

void VOR2DRep::Flatten(VORFlattenContext& context) const {
  if (!IsShown())
    return;
  const int savedColor = context.colorIndex;
  const int savedHighlight = context.highlight;
  if (_colorIndex >= 0)
    context.colorIndex = _colorIndex;
  if (_object && context.highlightOf)
    context.highlight |= context.highlightOf(_object.get());
  // Only a tagged rep changes the context's tag, so only it puts the tag back.
  std::string savedTag;
  if (_tag) {
    savedTag = context.tag;
    context.tag = *_tag;
  }
  FlattenShown(context);
  context.colorIndex = savedColor;
  context.highlight = savedHighlight;
  if (_tag)
    context.tag = std::move(savedTag);
}

VORRenderItem& VOR2DRep::AddItem(VORFlattenContext& context, VORPrimitiveKind kind) const {
  VORRenderItem& item = context.list->Add(kind);
  item.color = VORColorFromIndex(context.colorIndex);
  item.thickness = _lineThickness;
  item.highlight = context.highlight;
  item.rep = this;
  item.tag = context.tag;
  return item;
}

void VOR2DRep::CollectPicks(const VORMathPoint2D& p, double tolerance,
                            std::vector<VOR2DRep*>& chain, std::vector<VORPickHit>& out) {
  if (!IsShown() || !GetBoundingBox().Contains(p.x, p.y, tolerance))
    return;
  if (!HitTest(p, tolerance))
    return;
  VORPickHit hit;
  hit.reps = chain;
  hit.reps.push_back(this);
  hit.exact = tolerance <= 0.0 || (GetBoundingBox().Contains(p.x, p.y, 0.0) && HitTest(p, 0.0));
  out.push_back(std::move(hit));
}

double VORDistanceToSegment(const VORMathPoint2D& p, double ax, double ay, double bx, double by) {
  const double dx = bx - ax;
  const double dy = by - ay;
  const double len2 = dx * dx + dy * dy;
  double t = len2 > 0.0 ? ((p.x - ax) * dx + (p.y - ay) * dy) / len2 : 0.0;
  t = t < 0.0 ? 0.0 : (t > 1.0 ? 1.0 : t);
  return std::hypot(p.x - (ax + t * dx), p.y - (ay + t * dy));
}

bool VORPointInPolygon(const VORMathPoint2D& p, const std::vector<VORMathPoint2Df>& pts) {
  bool inside = false;
  const size_t n = pts.size();
  for (size_t i = 0, j = n - 1; i < n; j = i++) {
    const double xi = pts[i].x, yi = pts[i].y, xj = pts[j].x, yj = pts[j].y;
    if (((yi > p.y) != (yj > p.y)) && (p.x < (xj - xi) * (p.y - yi) / (yj - yi) + xi))
      inside = !inside;
  }
  return inside;
}
