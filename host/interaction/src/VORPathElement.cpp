#include "VORPathElement.h"

VORPathElement::VORPathElement(VORBaseUnknown* leaf) {
  AddChildElement(leaf);
}

VORPathElement::VORPathElement(const VORListValVORBaseUnknown_var& rootToLeaf) {
  for (const VORBaseUnknown_var& e : rootToLeaf)
    AddChildElement(e);
}

void VORPathElement::AddChildElement(VORBaseUnknown* child) {
  if (child != nullptr)
    _elements.Append(VORBaseUnknown_var(child->GetIdentity()));
}

VORBaseUnknown* VORPathElement::GetElement(int position) const {
  if (position < 1 || position > _elements.Size())
    return nullptr;
  return _elements[position].get();
}

VORBaseUnknown* VORPathElement::GetLeaf() const {
  return GetElement(_elements.Size());
}

VORBaseUnknown* VORPathElement::GetRoot() const {
  return GetElement(1);
}

VORBaseUnknown* VORPathElement::NextFatherElement() {
  if (_cursor < 1)
    return nullptr;
  return GetElement(_cursor--);
}

VORBaseUnknown_var VORPathElement::SearchElement(
    const std::function<bool(VORBaseUnknown*)>& test) const {
  for (int i = _elements.Size(); i >= 1; --i) {
    if (test(_elements[i].get()))
      return _elements[i];
  }
  return VORBaseUnknown_var();
}

bool VORPathElement::Contains(VORBaseUnknown* object) const {
  return object != nullptr && _elements.Locate(VORBaseUnknown_var(object->GetIdentity())) != 0;
}

bool VORPathElement::IsEqual(const VORPathElement& other) const {
  if (other._elements.Size() != _elements.Size())
    return false;
  for (int i = 1; i <= _elements.Size(); ++i) {
    if (!(_elements[i] == other._elements[i]))
      return false;
  }
  return true;
}

VORPathElement_var VORMakePath(VORBaseUnknown* object) {
  if (object == nullptr)
    return VORPathElement_var();
  if (auto* path = dynamic_cast<VORPathElement*>(object))
    return VORPathElement_var(path);
  return VORPathElement_var::Adopt(new VORPathElement(object));
}
