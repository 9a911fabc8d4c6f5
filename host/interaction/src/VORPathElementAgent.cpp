#include "VORPathElementAgent.h"

#include "VORCSO.h"
#include "VORHSO.h"
#include "VORSelectionContext.h"

VORPathElementAgent::VORPathElementAgent(const VORString& name) : VORDialogAgent(name) {}

VORPathElementAgent::~VORPathElementAgent() = default;

void VORPathElementAgent::SetFilter(VORAgentFilter filter, void* data) {
  _filter = std::move(filter);
  _filterData = data;
}

VORListValVORBaseUnknown_var* VORPathElementAgent::GetListOfSelectedPaths() const {
  if (_selectedPaths.IsEmpty())
    return nullptr;
  auto* list = new VORListValVORBaseUnknown_var;
  list->Append(_selectedPaths);
  return list;
}

VORPathElement* VORPathElementAgent::GetValuePath() const {
  if (_selectedPaths.IsEmpty())
    return nullptr;
  return static_cast<VORPathElement*>(_selectedPaths[_selectedPaths.Size()].get());
}

VORCSO* VORPathElementAgent::GetCSO() const {
  return VORSelectionContext::CSO();
}

VORBaseUnknown_var VORPathElementAgent::ElementOf(VORPathElement* path) const {
  if (path == nullptr || path->GetSize() == 0)
    return VORBaseUnknown_var();
  if (!_elementTest)
    return VORBaseUnknown_var(path->GetLeaf());
  return path->SearchElement(_elementTest);
}

bool VORPathElementAgent::Try(VORPathElement* path, bool updateCSO) {
  VORBaseUnknown_var element = ElementOf(path);
  if (!element)
    return false;
  // The filter sees the candidate as the agent's value and the last of its selected paths.
  VORBaseUnknown_var previousValue = GetValue();
  if (!IsRepeated())
    _selectedPaths.RemoveAll();
  VORListValVORBaseUnknown_var previousPaths;
  previousPaths.Append(_selectedPaths);
  // One selection: a path picked again moves to the end instead of appearing twice.
  for (int i = _selectedPaths.Size(); i >= 1; --i) {
    if (static_cast<VORPathElement*>(_selectedPaths[i].get())->IsEqual(*path))
      _selectedPaths.RemovePosition(i);
  }
  _selectedPaths.Append(VORBaseUnknown_var(path));
  SetValue(element);
  if (_filter && !_filter(this, _filterData)) {
    _selectedPaths = previousPaths;
    SetValue(previousValue);
    return false;
  }
  if (updateCSO) {
    // The CSO takes the pick and the highlight shows it.
    for (VORSelectionSet* set : {static_cast<VORSelectionSet*>(GetCSO()),
                                 static_cast<VORSelectionSet*>(VORSelectionContext::HSO())}) {
      if (set == nullptr)
        continue;
      if (!IsRepeated() || _selectionRefused) {
        if (!(set->GetSize() == 1 && set->IsPresent(path))) {
          set->Empty();
          set->AddElement(path);
        }
      } else {
        // A path picked again moves to the end, so that the last element is the last pick.
        set->RemoveElement(path);
        set->AddElement(path);
      }
    }
    _selectionRefused = false;
  }
  return true;
}

bool VORPathElementAgent::OfferPath(VORPathElement* path) {
  if (!Try(path, true))
    return false;
  SetOutput(nullptr, nullptr);
  return true;
}

bool VORPathElementAgent::TakeCurrentSelection() {
  _selectionRefused = false;
  VORCSO* cso = GetCSO();
  if (cso == nullptr || cso->IsEmpty())
    return false;
  bool taken = false;
  for (int i = 1; i <= cso->GetSize(); ++i) {
    if (Try(cso->GetElement(i), false)) {
      taken = true;
      if (!IsRepeated())
        break;
    }
  }
  if (taken)
    SetOutput(nullptr, nullptr);
  _selectionRefused = !taken;
  return taken;
}

void VORPathElementAgent::Reset() {
  VORDialogAgent::Reset();
  _selectedPaths.RemoveAll();
}
