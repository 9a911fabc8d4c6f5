// The editor's interactive set of objects: the models of reps that its viewers show on top of
// the document (for example the bags of a ZitBlt), and the viewers that show them. Viewers are
// not held; a viewer removes itself before it dies.
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include <absl/container/flat_hash_map.h>

#include "VOREventPublisher.h"
#include "VORLists.h"

class VORISO;

// A model that keeps its place in a set itself: adding and removing it looks nothing up in the
// set's index, which on a chart of many nodes is a cache miss per model. It keeps the place of
// one set only; another set that takes it files it in its index like any other model.
class VORISOElement : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORISOElement, VORBaseUnknown)
 public:
  VORISOElement() = default;

 private:
  friend class VORISO;
  VORISO* _placedIn = nullptr;  // not held: the set clears it when it lets the model go
  std::size_t _slot = 0;
};

class VORISO : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORISO, VORBaseUnknown)
 public:
  VORISO();

  // Adds a model once; false when it is already there or null. A VORISOElement keeps its own
  // place, whichever of the two is called.
  bool AddElement(VORBaseUnknown* model);
  bool AddElement(VORISOElement* model);
  bool RemoveElement(VORBaseUnknown* model);
  // By identity, without a scan: a chart adds several models per node.
  bool IsPresent(VORBaseUnknown* model) const;
  // The models in the order they were added. Built again on the first call after a change.
  const VORListValVORBaseUnknown_var& GetElements() const;
  void Empty();

  void AddViewer(VORBaseUnknown* viewer);
  void RemoveViewer(VORBaseUnknown* viewer);
  const std::vector<VORBaseUnknown*>& GetViewers() const { return _viewers; }

  // Dispatches "VORISOAdd" / "VORISORemove" events with no notification object.
  VOREventPublisher* GetEventPublisher() { return _publisher; }

 protected:
  ~VORISO() override;

 private:
  // Adding and removing cost O(1) (a removed model leaves a null slot, dropped at the next
  // compaction), so that removing the ZitBlts of many nodes of a large chart stays linear.
  struct Slot {
    VORBaseUnknown_var model;  // null once removed
    VORISOElement* placed;     // the model when it keeps its place itself, else null
  };
  bool Add(VORBaseUnknown* model, VORISOElement* placed);
  // Where a listed model is in _slots.
  std::optional<std::size_t> IndexOf(VORBaseUnknown* model) const;
  void Compact();
  void Invalidate();

  std::vector<Slot> _slots;
  std::size_t _size = 0;  // listed models
  // identity -> index in _slots of the models that do not keep their place; flat, so that
  // adding a model allocates nothing of its own.
  absl::flat_hash_map<VORBaseUnknown*, std::size_t> _slotOf;
  mutable VORListValVORBaseUnknown_var _models;  // _slots without the holes
  mutable bool _modelsValid = true;
  std::vector<VORBaseUnknown*> _viewers;
  VORHandle<VOREventPublisher> _publisher;
};

VOR_DECLARE_HANDLE(VORISO);
