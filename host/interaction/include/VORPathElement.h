// A picked object with the objects above it, root first and leaf last (a chart pick: the level,
// then the node's object; a tree pick: the tree's branches down to the object). Walked from the
// leaf upwards with InitToLeafElement / NextFatherElement.
#pragma once

#include <functional>

#include "VORLists.h"

class VORPathElement : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORPathElement, VORBaseUnknown)
 public:
  VORPathElement() = default;
  // A path of one element.
  explicit VORPathElement(VORBaseUnknown* leaf);
  explicit VORPathElement(const VORListValVORBaseUnknown_var& rootToLeaf);

  // Appends child below the current leaf; null is ignored.
  void AddChildElement(VORBaseUnknown* child);
  int GetSize() const { return _elements.Size(); }
  // 1-based from the root; null when out of range.
  VORBaseUnknown* GetElement(int position) const;
  VORBaseUnknown* GetLeaf() const;
  VORBaseUnknown* GetRoot() const;

  // Positions the walk on the leaf; each NextFatherElement returns the current element (the
  // leaf first) and moves one up. Null past the root.
  void InitToLeafElement() { _cursor = _elements.Size(); }
  VORBaseUnknown* NextFatherElement();

  // The first element from the leaf upwards that answers T, or null.
  template <class T>
  VORHandle<T> SearchElement() const {
    for (int i = _elements.Size(); i >= 1; --i) {
      VORHandle<T> h(_elements[i]);
      if (h)
        return h;
    }
    return VORHandle<T>();
  }
  // The first element from the leaf upwards that passes test, or null.
  VORBaseUnknown_var SearchElement(const std::function<bool(VORBaseUnknown*)>& test) const;
  // True when the path holds object (by identity).
  bool Contains(VORBaseUnknown* object) const;
  // Same elements in the same order (object identity).
  bool IsEqual(const VORPathElement& other) const;
  const VORListValVORBaseUnknown_var& Elements() const { return _elements; }

 private:
  VORListValVORBaseUnknown_var _elements;
  int _cursor = 0;
};

VOR_DECLARE_HANDLE(VORPathElement);

// obj itself when it is a path, else a new one-element path around it (null for null).
VORPathElement_var VORMakePath(VORBaseUnknown* object);
