#include "VORSelectionSet.h"

#include <algorithm>

#include "VORCSO.h"
#include "VORHSO.h"
#include "VORISO.h"
#include "VORPSO.h"
#include "VORSelectionContext.h"

VORSelectionSet::VORSelectionSet()
    : _publisher(VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher(this))) {}

VORSelectionSet::~VORSelectionSet() = default;

VORPathElement* VORSelectionSet::GetElement(int position) const {
  if (position < 1 || position > _elements.Size())
    return nullptr;
  return static_cast<VORPathElement*>(_elements[position].get());
}

VORPathElement* VORSelectionSet::NextElement() {
  if (_cursor >= _elements.Size())
    return nullptr;
  return GetElement(++_cursor);
}

void VORSelectionSet::Index(VORPathElement* path) {
  _byLeaf.emplace(path->GetLeaf(), path);
}

void VORSelectionSet::Unindex(VORPathElement* path) {
  auto [first, last] = _byLeaf.equal_range(path->GetLeaf());
  for (auto it = first; it != last; ++it) {
    if (it->second == path) {
      _byLeaf.erase(it);
      return;
    }
  }
}

bool VORSelectionSet::HasEqual(const VORPathElement& path) const {
  auto [first, last] = _byLeaf.equal_range(path.GetLeaf());
  for (auto it = first; it != last; ++it) {
    if (it->second == &path || it->second->IsEqual(path))
      return true;
  }
  return false;
}

int VORSelectionSet::LocateEqual(const VORPathElement& path) const {
  if (!HasEqual(path))
    return 0;
  for (int i = 1; i <= _elements.Size(); ++i) {
    if (GetElement(i) == &path || GetElement(i)->IsEqual(path))
      return i;
  }
  return 0;
}

bool VORSelectionSet::AddElement(VORBaseUnknown* pathOrObject) {
  VORListValVORBaseUnknown_var one;
  one.Append(VORBaseUnknown_var(pathOrObject));
  return AddElements(one) > 0;
}

int VORSelectionSet::AddElements(const VORListValVORBaseUnknown_var& pathsOrObjects) {
  VORListValVORBaseUnknown_var added;
  for (const VORBaseUnknown_var& e : pathsOrObjects) {
    VORPathElement_var path = VORMakePath(e);
    if (!path || path->GetSize() == 0 || HasEqual(*path))
      continue;
    _elements.Append(VORBaseUnknown_var(path.get()));
    Index(path);
    added.Append(VORBaseUnknown_var(path.get()));
  }
  if (!added.IsEmpty())
    Notify(added, VORListValVORBaseUnknown_var());
  return added.Size();
}

bool VORSelectionSet::RemoveElement(VORBaseUnknown* pathOrObject) {
  if (pathOrObject == nullptr)
    return false;
  VORListValVORBaseUnknown_var removed;
  auto* path = dynamic_cast<VORPathElement*>(pathOrObject);
  if (path ? !HasEqual(*path) : _byLeaf.count(pathOrObject->GetIdentity()) == 0)
    return false;
  for (int i = _elements.Size(); i >= 1; --i) {
    VORPathElement* e = GetElement(i);
    const bool match =
        path ? (e == path || e->IsEqual(*path)) : e->GetLeaf() == pathOrObject->GetIdentity();
    if (match) {
      Unindex(e);
      removed.InsertAt(1, _elements[i]);
      _elements.RemovePosition(i);
    }
  }
  if (removed.IsEmpty())
    return false;
  Notify(VORListValVORBaseUnknown_var(), removed);
  return true;
}

void VORSelectionSet::Empty(int notify) {
  if (_elements.IsEmpty())
    return;
  VORListValVORBaseUnknown_var removed;
  removed.Append(_elements);
  _elements.RemoveAll();
  _byLeaf.clear();
  if (notify != 0)
    Notify(VORListValVORBaseUnknown_var(), removed);
}

int VORSelectionSet::Locate(VORBaseUnknown* pathOrObject) const {
  if (pathOrObject == nullptr)
    return 0;
  if (auto* path = dynamic_cast<VORPathElement*>(pathOrObject))
    return LocateEqual(*path);
  if (_byLeaf.find(pathOrObject->GetIdentity()) == _byLeaf.end())
    return 0;
  for (int i = 1; i <= _elements.Size(); ++i) {
    if (GetElement(i)->GetLeaf() == pathOrObject->GetIdentity())
      return i;
  }
  return 0;
}

VORListValVORBaseUnknown_var* VORSelectionSet::GetLeaves() const {
  auto* leaves = new VORListValVORBaseUnknown_var;
  for (int i = 1; i <= _elements.Size(); ++i)
    leaves->Append(VORBaseUnknown_var(GetElement(i)->GetLeaf()));
  return leaves;
}

VORNotification* VORSelectionSet::CreateChangeNotification(
    const VORListValVORBaseUnknown_var& added, const VORListValVORBaseUnknown_var& removed) {
  return new VORSOChangeNotification(this, added, removed);
}

void VORSelectionSet::Notify(const VORListValVORBaseUnknown_var& added,
                             const VORListValVORBaseUnknown_var& removed) {
  VORHandle<VORSelectionSet> keep(this);
  auto notification = VORHandle<VORNotification>::Adopt(CreateChangeNotification(added, removed));
  _publisher->Dispatch(notification);
}
