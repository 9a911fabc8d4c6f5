// The editor's interactive set of objects: the models of reps that its viewers show on top of
// the document (for example the bags of a ZitBlt), and the viewers that show them. Viewers are
// not held; a viewer removes itself before it dies.
#pragma once

#include <unordered_set>

#include <vector>

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
  const VORListValVORBaseUnknown_var& GetElements() const { return _models; }
  void Empty();

  void AddViewer(VORBaseUnknown* viewer);
  void RemoveViewer(VORBaseUnknown* viewer);
  const std::vector<VORBaseUnknown*>& GetViewers() const { return _viewers; }

  // Dispatches "VORISOAdd" / "VORISORemove" events with no notification object.
  VOREventPublisher* GetEventPublisher() { return _publisher; }

 protected:
  ~VORISO() override;

 private:
  VORListValVORBaseUnknown_var _models;
  std::unordered_set<VORBaseUnknown*> _present;  // identities of _models
  std::vector<VORBaseUnknown*> _viewers;
  VORHandle<VOREventPublisher> _publisher;
};

VOR_DECLARE_HANDLE(VORISO);
