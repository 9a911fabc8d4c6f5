// The editor's interactive set of objects: the models of reps that its viewers show on top of
// the document (for example the bags of a ZitBlt), and the viewers that show them. Viewers are
// not held; a viewer removes itself before it dies.
#pragma once

#include <cstddef>
#include <vector>

#include <absl/container/flat_hash_map.h>

#include "VOREventPublisher.h"
#include "VORLists.h"

class VORISO : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORISO, VORBaseUnknown)
 public:
  VORISO();

  // Adds a model once; false when it is already there or null.
  bool AddElement(VORBaseUnknown* model);
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
  void Compact();
  void Invalidate();

  std::vector<VORBaseUnknown_var> _slots;
  // identity -> index in _slots; flat, so that adding a model allocates nothing of its own.
  absl::flat_hash_map<VORBaseUnknown*, std::size_t> _slotOf;
  mutable VORListValVORBaseUnknown_var _models;  // _slots without the holes
  mutable bool _modelsValid = true;
  std::vector<VORBaseUnknown*> _viewers;
  VORHandle<VOREventPublisher> _publisher;
};

VOR_DECLARE_HANDLE(VORISO);
