#include "VOR2DBagRep.h"

#include <algorithm>
#include <cmath>
#include <functional>

#include "VORDeferredDeletion.h"

VOR2DBagRep::~VOR2DBagRep() {
  for (VOR2DRep_var& child : _children)
    child->_father = nullptr;
}

bool VOR2DBagRep::AddChild(VOR2DRep* child) {
  if (child == nullptr)
    return false;
  for (VOR2DRep* r = this; r != nullptr; r = r->GetFather()) {
    if (r == child)
      return false;
  }
  VOR2DRep_var keep(child);
  if (child->_father != nullptr)
    child->_father->RemoveChild(child);
  _children.push_back(keep);
  child->_father = this;
  Invalidate();
  return true;
}

void VOR2DBagRep::Detach(VOR2DRep* child) {
  child->_father = nullptr;
  Invalidate();
}

bool VOR2DBagRep::RemoveChild(VOR2DRep* child) {
  // Searched from the end: removal of the last added child is the common case.
  for (auto it = _children.rbegin(); it != _children.rend(); ++it) {
    if (it->get() == child) {
      VOR2DRep_var keep = *it;
      _children.erase(std::next(it).base());
      Detach(child);
      return true;
    }
  }
  return false;
}

bool VOR2DBagRep::DestroyChild(VOR2DRep* child) {
  if (child == nullptr)
    return false;
  child->AddRef();
  if (!RemoveChild(child)) {
    child->Release();
    return false;
  }
  VORCommandDeletion(child);
  return true;
}

void VOR2DBagRep::EmptyBag() {
  VOR2DBagChildren children;
  children.swap(_children);
  for (VOR2DRep_var& child : children) {
    child->_father = nullptr;
    VORCommandDeletion(child.Detach());
  }
  Invalidate();
}

VOR2DRep* VOR2DBagRep::GetChild(int position) const {
  if (position < 1 || position > GetSize())
    return nullptr;
  return _children[static_cast<size_t>(position - 1)].get();
}

void VOR2DBagRep::SetMatrix(const VOR3x3Matrix& matrix) {
  _matrix = matrix;
  _hasMatrix = true;
  InvalidateFrame();
}

void VOR2DBagRep::ResetMatrix() {
  _matrix = VOR3x3Matrix();
  _hasMatrix = false;
  InvalidateFrame();
}

void VOR2DBagRep::InvalidateFrame() {
  Touch();
  _boxValid = false;
  InvalidateFathers();
}

VORBox2D VOR2DBagRep::ComputeBoundingBox() const {
  if (!_localValid) {
    VORBox2D box;
    for (const VOR2DRep_var& child : _children) {
      if (child->IsShown())
        box.Extend(child->GetBoundingBox());
    }
    _localBox = box;
    _localValid = true;
    ++_boxVersion;
  }
  return _hasMatrix ? _matrix.TransformBox(_localBox) : _localBox;
}

namespace {
int& IndexThreshold() {
  static int threshold = 256;
  return threshold;
}
}  // namespace

int VOR2DBagRep::GetIndexThreshold() {
  return IndexThreshold();
}

void VOR2DBagRep::SetIndexThreshold(int children) {
  IndexThreshold() = children < 1 ? 1 : children;
}

void VOR2DBagRep::BuildIndex() const {
  if (!_index)
    _index = std::make_unique<PickIndex>();
  PickIndex& index = *_index;
  index.version = _boxVersion;
  index.buckets.clear();
  index.cells = 0;
  if (_localBox.IsEmpty())
    return;
  // About four children per cell when they are spread evenly.
  const double n = static_cast<double>(_children.size());
  const int cells = std::clamp(static_cast<int>(std::ceil(std::sqrt(n / 4.0))), 1, 512);
  index.cells = cells;
  index.buckets.assign(static_cast<size_t>(cells) * static_cast<size_t>(cells), {});
  const double cw = _localBox.Width() / cells;
  const double ch = _localBox.Height() / cells;
  auto cell = [cells](double v, double origin, double size) {
    if (!(size > 0.0))
      return 0;
    return std::clamp(static_cast<int>(std::floor((v - origin) / size)), 0, cells - 1);
  };
  for (size_t i = 0; i < _children.size(); ++i) {
    const VOR2DRep* child = _children[i].get();
    if (!child->IsShown())
      continue;
    const VORBox2D b = child->GetBoundingBox();
    if (b.IsEmpty())
      continue;
    const int x0 = cell(b.xmin, _localBox.xmin, cw);
    const int x1 = cell(b.xmax, _localBox.xmin, cw);
    const int y0 = cell(b.ymin, _localBox.ymin, ch);
    const int y1 = cell(b.ymax, _localBox.ymin, ch);
    for (int y = y0; y <= y1; ++y) {
      for (int x = x0; x <= x1; ++x)
        index.buckets[static_cast<size_t>(y * cells + x)].push_back(static_cast<int>(i));
    }
  }
}

void VOR2DBagRep::Candidates(const VORMathPoint2D& p, double tolerance,
                             std::vector<int>& out) const {
  out.clear();
  const int cells = _index ? _index->cells : 0;
  if (cells == 0 || !_localBox.Contains(p.x, p.y, tolerance))
    return;
  const double cw = _localBox.Width() / cells;
  const double ch = _localBox.Height() / cells;
  auto cell = [cells](double v, double origin, double size) {
    if (!(size > 0.0))
      return 0;
    return std::clamp(static_cast<int>(std::floor((v - origin) / size)), 0, cells - 1);
  };
  const int x0 = cell(p.x - tolerance, _localBox.xmin, cw);
  const int x1 = cell(p.x + tolerance, _localBox.xmin, cw);
  const int y0 = cell(p.y - tolerance, _localBox.ymin, ch);
  const int y1 = cell(p.y + tolerance, _localBox.ymin, ch);
  for (int y = y0; y <= y1; ++y) {
    for (int x = x0; x <= x1; ++x) {
      const auto& bucket = _index->buckets[static_cast<size_t>(y * cells + x)];
      out.insert(out.end(), bucket.begin(), bucket.end());
    }
  }
  // Front first, each child once.
  std::sort(out.begin(), out.end(), std::greater<int>());
  out.erase(std::unique(out.begin(), out.end()), out.end());
}

bool VOR2DBagRep::ToLocal(const VORMathPoint2D& p, VORMathPoint2D& local, double& scale) const {
  if (!_hasMatrix) {
    local = p;
    scale = 1.0;
    return true;
  }
  VOR3x3Matrix inverse;
  if (!_matrix.Invert(inverse))
    return false;
  local = inverse.Transform(p);
  scale = _matrix.ScaleFactor();
  return true;
}

bool VOR2DBagRep::HitTest(const VORMathPoint2D& p, double tolerance) const {
  VORMathPoint2D local;
  double scale = 1.0;
  if (!ToLocal(p, local, scale))
    return false;
  const double localTolerance = scale > 0.0 ? tolerance / scale : tolerance;
  for (auto it = _children.rbegin(); it != _children.rend(); ++it) {
    const VOR2DRep* child = it->get();
    if (child->IsShown() && child->GetBoundingBox().Contains(local.x, local.y, localTolerance) &&
        child->HitTest(local, localTolerance))
      return true;
  }
  return false;
}

void VOR2DBagRep::CollectPicks(const VORMathPoint2D& p, double tolerance,
                               std::vector<VOR2DRep*>& chain, std::vector<VORPickHit>& out) {
  if (!IsShown() || !GetBoundingBox().Contains(p.x, p.y, tolerance))
    return;
  VORMathPoint2D local;
  double scale = 1.0;
  if (!ToLocal(p, local, scale))
    return;
  const double localTolerance = scale > 0.0 ? tolerance / scale : tolerance;
  chain.push_back(this);
  if (static_cast<int>(_children.size()) >= IndexThreshold()) {
    if (!_index || _index->version != _boxVersion)
      BuildIndex();
    std::vector<int> candidates;
    Candidates(local, localTolerance, candidates);
    for (int i : candidates)
      _children[static_cast<size_t>(i)]->CollectPicks(local, localTolerance, chain, out);
  } else {
    // Last drawn is in front.
    for (auto it = _children.rbegin(); it != _children.rend(); ++it)
      (*it)->CollectPicks(local, localTolerance, chain, out);
  }
  chain.pop_back();
}

void VOR2DBagRep::FlattenShown(VORFlattenContext& context) const {
  const VOR3x3Matrix saved = context.matrix;
  if (_hasMatrix)
    context.matrix = saved * _matrix;
  for (const VOR2DRep_var& child : _children)
    child->Flatten(context);
  context.matrix = saved;
}
