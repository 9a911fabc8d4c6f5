#include "VORISO.h"

VORISO::VORISO() : _publisher(VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher(this))) {}

VORISO::~VORISO() = default;

bool VORISO::IsPresent(VORBaseUnknown* model) const {
  return model != nullptr && _present.count(model->GetIdentity()) != 0;
}

bool VORISO::AddElement(VORBaseUnknown* model) {
  if (model == nullptr || IsPresent(model))
    return false;
  _models.Append(VORBaseUnknown_var(model));
  _present.insert(model->GetIdentity());
  _publisher->Dispatch("VORISOAdd");
  return true;
}

bool VORISO::RemoveElement(VORBaseUnknown* model) {
  if (!IsPresent(model) || _models.RemoveValue(VORBaseUnknown_var(model)) == 0)
    return false;
  _present.erase(model->GetIdentity());
  _publisher->Dispatch("VORISORemove");
  return true;
}

void VORISO::Empty() {
  if (_models.IsEmpty())
    return;
  _models.RemoveAll();
  _present.clear();
  _publisher->Dispatch("VORISORemove");
}

void VORISO::AddViewer(VORBaseUnknown* viewer) {
  if (viewer != nullptr && std::find(_viewers.begin(), _viewers.end(), viewer) == _viewers.end())
    _viewers.push_back(viewer);
}

void VORISO::RemoveViewer(VORBaseUnknown* viewer) {
  std::erase(_viewers, viewer);
}
