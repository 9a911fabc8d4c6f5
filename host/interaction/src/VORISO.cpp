#include "VORISO.h"

#include <algorithm>
#include <string>

namespace {
// Event names made once: a chart adds several models per node.
const std::string kAdded = "VORISOAdd";
const std::string kRemoved = "VORISORemove";
}  // namespace

VORISO::VORISO() : _publisher(VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher(this))) {}

VORISO::~VORISO() {
  // A model may outlive the set: it must not keep a place in it.
  for (Slot& slot : _slots) {
    if (slot.placed != nullptr)
      slot.placed->_placedIn = nullptr;
  }
}

std::optional<std::size_t> VORISO::IndexOf(VORBaseUnknown* model) const {
  if (model == nullptr)
    return std::nullopt;
  VORBaseUnknown* identity = model->GetIdentity();
  if (auto* placed = dynamic_cast<VORISOElement*>(identity); placed && placed->_placedIn == this)
    return placed->_slot;
  if (_slotOf.empty())
    return std::nullopt;
  auto it = _slotOf.find(identity);
  return it == _slotOf.end() ? std::nullopt : std::optional<std::size_t>(it->second);
}

bool VORISO::IsPresent(VORBaseUnknown* model) const {
  return IndexOf(model).has_value();
}

const VORListValVORBaseUnknown_var& VORISO::GetElements() const {
  if (!_modelsValid) {
    _models.RemoveAll();
    _models.Reserve(static_cast<int>(_size));
    for (const Slot& slot : _slots) {
      if (slot.model)
        _models.Append(slot.model);
    }
    _modelsValid = true;
  }
  return _models;
}

void VORISO::Invalidate() {
  // The cached list must not keep removed models alive; clearing it costs what building it did.
  if (_modelsValid)
    _models.RemoveAll();
  _modelsValid = false;
}

void VORISO::Compact() {
  std::size_t kept = 0;
  for (Slot& slot : _slots) {
    if (!slot.model)
      continue;
    if (slot.placed != nullptr)
      slot.placed->_slot = kept;
    else
      _slotOf[slot.model->GetIdentity()] = kept;
    _slots[kept++] = std::move(slot);
  }
  _slots.resize(kept);
}

bool VORISO::AddElement(VORBaseUnknown* model) {
  if (model == nullptr)
    return false;
  return Add(model, dynamic_cast<VORISOElement*>(model->GetIdentity()));
}

bool VORISO::AddElement(VORISOElement* model) {
  return model != nullptr && Add(model, model);
}

bool VORISO::Add(VORBaseUnknown* model, VORISOElement* placed) {
  if (placed != nullptr && placed->_placedIn == this)
    return false;
  VORBaseUnknown* identity = model->GetIdentity();
  // Filed in the index while another set keeps its place, and perhaps still filed from then.
  if (!_slotOf.empty() && _slotOf.contains(identity))
    return false;
  if (placed != nullptr && placed->_placedIn == nullptr) {
    placed->_placedIn = this;
    placed->_slot = _slots.size();
  } else {
    placed = nullptr;
    _slotOf.emplace(identity, _slots.size());
  }
  _slots.push_back(Slot{VORBaseUnknown_var(model), placed});
  ++_size;
  Invalidate();
  _publisher->Dispatch(kAdded);
  return true;
}

bool VORISO::RemoveElement(VORBaseUnknown* model) {
  const std::optional<std::size_t> index = IndexOf(model);
  if (!index)
    return false;
  Slot* slot = &_slots[*index];
  // Released after the bookkeeping: the model may be the last reference to its rep.
  VORBaseUnknown_var removed = std::move(slot->model);
  if (slot->placed != nullptr)
    slot->placed->_placedIn = nullptr;
  else
    _slotOf.erase(removed->GetIdentity());
  slot->placed = nullptr;
  --_size;
  if (_slots.size() > 2 * _size + 16)
    Compact();
  Invalidate();
  _publisher->Dispatch(kRemoved);
  return true;
}

void VORISO::Empty() {
  if (_size == 0)
    return;
  std::vector<Slot> removed;
  removed.swap(_slots);
  for (Slot& slot : removed) {
    if (slot.placed != nullptr)
      slot.placed->_placedIn = nullptr;
  }
  _slotOf.clear();
  _size = 0;
  Invalidate();
  _publisher->Dispatch(kRemoved);
}

void VORISO::AddViewer(VORBaseUnknown* viewer) {
  if (viewer != nullptr && std::find(_viewers.begin(), _viewers.end(), viewer) == _viewers.end())
    _viewers.push_back(viewer);
}

void VORISO::RemoveViewer(VORBaseUnknown* viewer) {
  std::erase(_viewers, viewer);
}
