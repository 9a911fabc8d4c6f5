#include "VORISO.h"

#include <algorithm>
#include <string>

namespace {
// Event names made once: a chart adds several models per node.
const std::string kAdded = "VORISOAdd";
const std::string kRemoved = "VORISORemove";
}  // namespace

VORISO::VORISO() : _publisher(VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher(this))) {}

VORISO::~VORISO() = default;

bool VORISO::IsPresent(VORBaseUnknown* model) const {
  return model != nullptr && _slotOf.count(model->GetIdentity()) != 0;
}

const VORListValVORBaseUnknown_var& VORISO::GetElements() const {
  if (!_modelsValid) {
    _models.RemoveAll();
    _models.Reserve(static_cast<int>(_slotOf.size()));
    for (const VORBaseUnknown_var& model : _slots) {
      if (model)
        _models.Append(model);
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
  for (VORBaseUnknown_var& model : _slots) {
    if (!model)
      continue;
    _slotOf[model->GetIdentity()] = kept;
    _slots[kept++] = std::move(model);
  }
  _slots.resize(kept);
}

bool VORISO::AddElement(VORBaseUnknown* model) {
  if (model == nullptr)
    return false;
  // One look-up: a chart adds several models per node.
  if (!_slotOf.try_emplace(model->GetIdentity(), _slots.size()).second)
    return false;
  _slots.emplace_back(model);
  Invalidate();
  _publisher->Dispatch(kAdded);
  return true;
}

bool VORISO::RemoveElement(VORBaseUnknown* model) {
  auto it = model == nullptr ? _slotOf.end() : _slotOf.find(model->GetIdentity());
  if (it == _slotOf.end())
    return false;
  // Released after the bookkeeping: the model may be the last reference to its rep.
  VORBaseUnknown_var removed = std::move(_slots[it->second]);
  _slotOf.erase(it);
  if (_slots.size() > 2 * _slotOf.size() + 16)
    Compact();
  Invalidate();
  _publisher->Dispatch(kRemoved);
  return true;
}

void VORISO::Empty() {
  if (_slotOf.empty())
    return;
  std::vector<VORBaseUnknown_var> removed;
  removed.swap(_slots);
  _slotOf.clear();
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
