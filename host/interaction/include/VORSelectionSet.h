// Ordered set of picked paths with change notifications: the base of the editor's CSO (current
// selection), PSO (preselection) and HSO (highlight). Plain objects given to it are wrapped in a
// one-element path. Each change dispatches one notification with the added and removed paths.
// A path must not be changed while a set holds it (the set indexes paths by their leaf).
#pragma once

#include <unordered_map>

#include "VOREventPublisher.h"
#include "VORPathElement.h"

class VORSelectionSet : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORSelectionSet, VORBaseUnknown)
 public:
  VORSelectionSet();

  int GetSize() const { return _elements.Size(); }
  bool IsEmpty() const { return _elements.IsEmpty(); }
  // 1-based; null when out of range.
  VORPathElement* GetElement(int position) const;
  // Iteration in order: InitElementList, then NextElement until null.
  void InitElementList() { _cursor = 0; }
  VORPathElement* NextElement();

  // Adds a path (or a plain object); an equal path already present is not added twice.
  // Returns false when nothing was added.
  bool AddElement(VORBaseUnknown* pathOrObject);
  // Adds several with one notification.
  int AddElements(const VORListValVORBaseUnknown_var& pathsOrObjects);
  // Removes the path (identity), or for a plain object every path whose leaf is that object.
  bool RemoveElement(VORBaseUnknown* pathOrObject);
  // notify 0 empties without a notification (a set being torn down).
  void Empty(int notify = 1);
  // Position (1-based) of the path, or of the first path whose leaf is the object; 0 if absent.
  int Locate(VORBaseUnknown* pathOrObject) const;
  bool IsPresent(VORBaseUnknown* pathOrObject) const { return Locate(pathOrObject) != 0; }
  // The leaves of the paths, in order. A new list; the caller deletes it.
  VORListValVORBaseUnknown_var* GetLeaves() const;

  VOREventPublisher* GetEventPublisher() { return _publisher; }

 protected:
  ~VORSelectionSet() override;
  // Builds the notification that one change dispatches.
  virtual VORNotification* CreateChangeNotification(const VORListValVORBaseUnknown_var& added,
                                                    const VORListValVORBaseUnknown_var& removed);

 private:
  int LocateEqual(const VORPathElement& path) const;
  // True when a path equal to path is in the set (through the leaf index).
  bool HasEqual(const VORPathElement& path) const;
  void Index(VORPathElement* path);
  void Unindex(VORPathElement* path);
  void Notify(const VORListValVORBaseUnknown_var& added,
              const VORListValVORBaseUnknown_var& removed);

  VORListValVORBaseUnknown_var _elements;  // VORPathElement objects
  // Paths by leaf identity: duplicate checks and object look-ups without scanning the set.
  std::unordered_multimap<VORBaseUnknown*, VORPathElement*> _byLeaf;
  int _cursor = 0;
  VORHandle<VOREventPublisher> _publisher;
};

// Sent by a selection set after each change: the paths added and removed, in order.
class VORSOChangeNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORSOChangeNotification, VORNotification)
 public:
  VORSOChangeNotification(VORSelectionSet* set, const VORListValVORBaseUnknown_var& added,
                          const VORListValVORBaseUnknown_var& removed)
      : _set(set), _added(added), _removed(removed) {}
  VORSelectionSet* GetSet() const { return _set; }
  const VORListValVORBaseUnknown_var& GetAddedElements() const { return _added; }
  const VORListValVORBaseUnknown_var& GetRemovedElements() const { return _removed; }

 private:
  VORSelectionSet* _set;
  VORListValVORBaseUnknown_var _added;
  VORListValVORBaseUnknown_var _removed;
};

VOR_DECLARE_HANDLE(VORSelectionSet);
