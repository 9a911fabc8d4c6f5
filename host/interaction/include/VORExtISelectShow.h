// What a picked component stands for, to the selection and to hide/show. The selection asks a
// picked path's components (from the leaf up) for VORISelectShow: the element it names is what
// the pick selects, and hide and show act on the element it gives for them (a list line that
// shows a product input hides and shows the product). VORExtISelectShow is the base that such
// components' extensions derive from: by default both are the path's leaf.
#pragma once

#include "VORExtension.h"
#include "VORPathElement.h"

class VORISelectShow : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISelectShow)
 public:
  // The interface this protocol is asked through (VORISelectShow's).
  virtual const VORInterfaceId& GetSelectShowInterface() = 0;
  // The element a pick of path selects (not a new reference); null when none.
  virtual VORBaseUnknown* GetElement(VORPathElement* path) = 0;
  // The element hide and show act on, as a new reference the caller releases, and flag 0.
  // E_FAIL, with both left untouched, when there is none (or path is null).
  virtual HRESULT GetElementForHideShow(VORPathElement* path, VORBaseUnknown*& element,
                                        int& flag) = 0;
};
VOR_DECLARE_HANDLE(VORISelectShow);

class VORExtISelectShow : public VORExtension, public VORISelectShow {
  VOR_DECLARE_CLASS(VORExtISelectShow, VORExtension)
 public:
  const VORInterfaceId& GetSelectShowInterface() override { return VORISelectShow::IID(); }
  VORBaseUnknown* GetElement(VORPathElement* path) override {
    return path != nullptr ? path->GetLeaf() : nullptr;
  }
  HRESULT GetElementForHideShow(VORPathElement* path, VORBaseUnknown*& element,
                                int& flag) override {
    VORBaseUnknown* leaf = GetElement(path);
    if (leaf == nullptr)
      return E_FAIL;
    flag = 0;
    return leaf->QueryInterface(VORBaseUnknown::IID(), reinterpret_cast<void**>(&element));
  }

 protected:
  VORExtISelectShow() = default;
  ~VORExtISelectShow() override = default;
};

namespace VORSelectShow {
// The path a pick selects: up to the deepest component that answers VORISelectShow, then the
// element it names (path itself when no component answers or it names nothing). A new path or
// path itself.
VORPathElement_var PathToSelect(VORPathElement* path);
// The element hide and show act on: what the deepest answering component gives, else the leaf.
VORBaseUnknown_var ElementForHideShow(VORPathElement* path);
}  // namespace VORSelectShow
