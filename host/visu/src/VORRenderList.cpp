#include "VORRenderList.h"

VORRenderItem& VORRenderList::Add(VORPrimitiveKind kind) {
  Close();
  _items.emplace_back();
  _items.back().kind = kind;
  _pendingBox = true;
  return _items.back();
}

void VORRenderList::Close() {
  if (_pendingBox && !_items.empty())
    _box.Extend(_items.back().box);
  _pendingBox = false;
}

std::vector<int> VORRenderList::Cull(const VORBox2D& area) const {
  std::vector<int> out;
  for (size_t i = 0; i < _items.size(); ++i) {
    if (_items[i].box.Intersects(area))
      out.push_back(static_cast<int>(i));
  }
  return out;
}
