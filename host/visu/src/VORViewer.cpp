#include "VORViewer.h"

#include <algorithm>
#include <cmath>

#include "VORModelForRep2D.h"
#include "VORPVBalloon.h"
#include "VORSelectionContext.h"
#include "VORVisManager.h"

VORViewer::VORViewer(VORCommand* parent, const VORString& name, int style, int width, int height,
                     int flags)
    : VORCommand(parent, name),
      _style(style),
      _flags(flags),
      _width(std::max(width, 0)),
      _height(std::max(height, 0)) {
  _viewpoint = VOR2DViewpoint_var::Adopt(new VOR2DViewpoint(this));
}

VORViewer::~VORViewer() {
  VORVisManager::GetVisManager()->Forget(_viewpoint);
  for (VORPVBalloon* balloon : _balloons)
    balloon->_viewer = nullptr;
  _balloons.clear();
  SetHighlightSet(nullptr);
  SetPreselectionSet(nullptr);
  for (VORISO_var iso : std::vector<VORISO_var>(_isos))
    DetachISO(iso);
}

void VORViewer::AddRep(VOR2DRep* rep) {
  if (rep == nullptr)
    return;
  if (std::find(_reps.begin(), _reps.end(), VOR2DRep_var(rep)) == _reps.end())
    _reps.emplace_back(rep);
  _dirty = true;
}

bool VORViewer::RemoveRep(VOR2DRep* rep) {
  auto it = std::find_if(_reps.begin(), _reps.end(), [rep](auto& r) { return r.get() == rep; });
  if (it == _reps.end())
    return false;
  _reps.erase(it);
  _dirty = true;
  return true;
}

void VORViewer::AttachISO(VORISO* iso) {
  if (iso == nullptr)
    return;
  iso->AddViewer(this);
  if (std::find(_isos.begin(), _isos.end(), VORISO_var(iso)) != _isos.end())
    return;
  _isos.emplace_back(iso);
  _isoModelsValid = false;
  auto dirty = [this](VORBaseUnknown*, VORNotification*, void*) {
    _dirty = true;
    _isoModelsValid = false;
  };
  AddCallback(iso->GetEventPublisher(), "VORISOAdd", dirty);
  AddCallback(iso->GetEventPublisher(), "VORISORemove", dirty);
  _dirty = true;
}

void VORViewer::DetachISO(VORISO* iso) {
  auto it = std::find(_isos.begin(), _isos.end(), VORISO_var(iso));
  if (it == _isos.end())
    return;
  VORISO_var keep = *it;
  RemoveCallbacksOn(iso->GetEventPublisher());
  iso->RemoveViewer(this);
  _isos.erase(it);
  _isoModelsValid = false;
  _dirty = true;
}

const std::vector<std::vector<VORModelForRep2D*>>& VORViewer::ISOModels() {
  FollowISOs();
  if (_isoModelsValid)
    return _isoModels;
  _isoModels.assign(_isos.size(), {});
  for (size_t i = 0; i < _isos.size(); ++i) {
    const auto& elements = _isos[i]->GetElements();
    _isoModels[i].reserve(static_cast<size_t>(elements.Size()));
    for (const VORBaseUnknown_var& element : elements) {
      VORHandle<VORModelForRep2D> model(element);
      if (model)
        _isoModels[i].push_back(model.get());
    }
  }
  _isoModelsValid = true;
  return _isoModels;
}

void VORViewer::FollowISOs() {
  auto lists = [this](VORISO* iso) {
    const auto& viewers = iso->GetViewers();
    return std::find(viewers.begin(), viewers.end(), static_cast<VORBaseUnknown*>(this)) !=
           viewers.end();
  };
  for (size_t i = _isos.size(); i-- > 0;) {
    if (!lists(_isos[i]))
      DetachISO(_isos[i]);
  }
  VORISO* current = VORSelectionContext::ISO();
  if (current != nullptr && lists(current))
    AttachISO(current);
}

VORBox2D VORViewer::GetSceneBox() {
  FollowISOs();
  VORBox2D box;
  for (const VOR2DRep_var& rep : _reps) {
    if (rep->IsShown())
      box.Extend(rep->GetBoundingBox());
  }
  for (const std::vector<VORModelForRep2D*>& models : ISOModels()) {
    for (const VORModelForRep2D* model : models) {
      if (model->GetRep() != nullptr && model->GetRep()->IsShown())
        box.Extend(model->GetRep()->GetBoundingBox());
    }
  }
  return box;
}

void VORViewer::Reframe() {
  _viewpoint->Reframe(GetSceneBox());
}

void VORViewer::Draw() {
  ++_drawRequests;
  GetEventPublisher()->Dispatch(kRedrawEvent, nullptr);
}

void VORViewer::GetGraphicSize(float& width, float& height) const {
  width = static_cast<float>(_width);
  height = static_cast<float>(_height);
}

void VORViewer::SetGraphicSize(int width, int height) {
  _width = std::max(width, 0);
  _height = std::max(height, 0);
  ViewChanged();
}

void VORViewer::SetBackgroundColor(float r, float g, float b) {
  _background[0] = r;
  _background[1] = g;
  _background[2] = b;
  _dirty = true;
}

void VORViewer::GetBackgroundColor(float& r, float& g, float& b) const {
  r = _background[0];
  g = _background[1];
  b = _background[2];
}

void VORViewer::SetHighlightSet(VORSelectionSet* hso) {
  if (_hso != nullptr && _hsoCallback != 0)
    RemoveCallback(_hsoCallback);
  _hso = hso;
  _hsoCallback = 0;
  if (_hso != nullptr)
    _hsoCallback = AddCallback(_hso->GetEventPublisher(), "VORSOChangeNotification",
                               [this](VORBaseUnknown*, VORNotification*, void*) {
                                 _highlightsValid = false;
                                 _dirty = true;
                               });
  _highlightsValid = false;
  _dirty = true;
}

void VORViewer::SetPreselectionSet(VORSelectionSet* pso) {
  if (_pso != nullptr && _psoCallback != 0)
    RemoveCallback(_psoCallback);
  _pso = pso;
  _psoCallback = 0;
  if (_pso != nullptr)
    _psoCallback = AddCallback(_pso->GetEventPublisher(), "VORSOChangeNotification",
                               [this](VORBaseUnknown*, VORNotification*, void*) {
                                 _highlightsValid = false;
                                 _dirty = true;
                               });
  _highlightsValid = false;
  _dirty = true;
}

void VORViewer::ClearPreselection() {
  if (_pso != nullptr && !_pso->IsEmpty())
    _pso->Empty();
  if (_hover) {
    VORManipulator_var hover = _hover;
    _hover = NULL_var;
    hover->EndPreactivate(this, _pointer, 0);
  }
  _highlightsValid = false;
  _dirty = true;
}

int VORViewer::HighlightOf(VORBaseUnknown* object) {
  if (object == nullptr)
    return VORHighlightNone;
  if (!_highlightsValid) {
    _highlights.clear();
    auto collect = [this](VORSelectionSet* set, int flag) {
      if (set == nullptr)
        return;
      for (int i = 1; i <= set->GetSize(); ++i) {
        VORPathElement* path = set->GetElement(i);
        if (path != nullptr && path->GetLeaf() != nullptr)
          _highlights[path->GetLeaf()->GetIdentity()] |= flag;
      }
    };
    collect(_pso, VORHighlightPreselected);
    collect(_hso, VORHighlightSelected);
    _highlightsValid = true;
  }
  auto it = _highlights.find(object->GetIdentity());
  return it == _highlights.end() ? VORHighlightNone : it->second;
}

const VORRenderList& VORViewer::GetRenderList() {
  FollowISOs();
  if (!_dirty && _renderGeneration == VORSceneGeneration())
    return _renderList;
  _renderList.Clear();
  VORFlattenContext context;
  context.list = &_renderList;
  if (_hso != nullptr || _pso != nullptr)
    context.highlightOf = [this](VORBaseUnknown* object) { return HighlightOf(object); };
  for (const VOR2DRep_var& rep : _reps)
    rep->Flatten(context);
  for (const std::vector<VORModelForRep2D*>& models : ISOModels()) {
    for (const VORModelForRep2D* model : models) {
      if (model->GetRep() != nullptr)
        model->GetRep()->Flatten(context);
    }
  }
  _renderList.Close();
  _renderGeneration = VORSceneGeneration();
  _dirty = false;
  return _renderList;
}

std::vector<VORPickHit> VORViewer::PickReps(double x, double y, double tolerance) {
  FollowISOs();
  std::vector<VORPickHit> hits;
  std::vector<VOR2DRep*> chain;
  const VORMathPoint2D p(x, y);
  // The set's reps are drawn last, so they are in front.
  const std::vector<std::vector<VORModelForRep2D*>>& isoModels = ISOModels();
  for (auto models = isoModels.rbegin(); models != isoModels.rend(); ++models) {
    for (auto model = models->rbegin(); model != models->rend(); ++model) {
      if ((*model)->GetRep() != nullptr)
        (*model)->GetRep()->CollectPicks(p, tolerance, chain, hits);
    }
  }
  for (auto rep = _reps.rbegin(); rep != _reps.rend(); ++rep)
    (*rep)->CollectPicks(p, tolerance, chain, hits);
  // What is under the point itself goes before what is only near it, so that in a dense list
  // the line clicked on wins over its neighbour drawn in front of it.
  std::stable_partition(hits.begin(), hits.end(), [](const VORPickHit& h) { return h.exact; });
  return hits;
}

std::vector<VORPathElement_var> VORViewer::PathsFromHits(
    const std::vector<VORPickHit>& hits) const {
  std::vector<VORPathElement_var> paths;
  for (const VORPickHit& hit : hits) {
    auto path = VORPathElement_var::Adopt(new VORPathElement());
    for (VOR2DRep* rep : hit.reps) {
      if (rep->GetObject() != nullptr)
        path->AddChildElement(rep->GetObject());
    }
    if (path->GetSize() == 0)
      continue;
    const bool seen = std::any_of(paths.begin(), paths.end(),
                                  [&](const VORPathElement_var& p) { return p->IsEqual(*path); });
    if (!seen)
      paths.push_back(path);
  }
  return paths;
}

std::vector<VORPathElement_var> VORViewer::PickPaths(double px, double py) {
  const VORMathPoint2D p = _viewpoint->PixelToModel(px, py);
  return PathsFromHits(PickReps(p.x, p.y, kPickTolerancePixels / _viewpoint->GetScale()));
}

std::vector<VORPathElement_var> VORViewer::PickPathsAtModelPoint(double x, double y) {
  return PathsFromHits(PickReps(x, y, kPickTolerancePixels / _viewpoint->GetScale()));
}

VORListValVORBaseUnknown_var* VORViewer::Pick(double px, double py) {
  auto* list = new VORListValVORBaseUnknown_var();
  for (const VORPathElement_var& path : PickPaths(px, py))
    list->Append(VORBaseUnknown_var(path.get()));
  return list;
}

VORManipulator* VORViewer::ManipulatorAt(double px, double py, VOR2DRep** element) {
  const VORMathPoint2D p = _viewpoint->PixelToModel(px, py);
  const std::vector<VORPickHit> hits =
      PickReps(p.x, p.y, kPickTolerancePixels / _viewpoint->GetScale());
  if (hits.empty())
    return nullptr;
  // The frontmost rep decides; its nearest manipulated ancestor owns the gesture.
  const std::vector<VOR2DRep*>& reps = hits.front().reps;
  for (auto it = reps.rbegin(); it != reps.rend(); ++it) {
    if (VORManipulator* manipulator = (*it)->PickManipulator()) {
      if (element != nullptr)
        *element = *it;
      return manipulator;
    }
  }
  return nullptr;
}

void VORViewer::UpdateHover(double px, double py, int modifiers) {
  VORManipulator_var now(ManipulatorAt(px, py));
  if (now.get() != _hover.get()) {
    VORManipulator_var before = _hover;
    _hover = now;
    if (before)
      before->EndPreactivate(this, _pointer, modifiers);
    if (now)
      now->Preactivate(this, _pointer, modifiers);
  }
  if (_pso != nullptr) {
    std::vector<VORPathElement_var> paths = PickPaths(px, py);
    VORPathElement* current = _pso->GetSize() == 1 ? _pso->GetElement(1) : nullptr;
    if (paths.empty()) {
      if (!_pso->IsEmpty())
        _pso->Empty();
    } else if (current == nullptr || !current->IsEqual(*paths.front())) {
      if (!_pso->IsEmpty())
        _pso->Empty();
      _pso->AddElement(paths.front());
    }
  }
}

void VORViewer::SelectionPick(double px, double py, int modifiers) {
  if (!_selectable)
    return;
  auto notification = VORHandle<VORViewerPickNotification>::Adopt(
      new VORViewerPickNotification(PickPaths(px, py), modifiers, _multiSel));
  GetEventPublisher()->Dispatch(kPickEvent, notification);
}

void VORViewer::OnMousePress(double px, double py, int button, int modifiers) {
  VORViewer_var keep(this);
  _pointer = _viewpoint->PixelToModel(px, py);
  _pressButton = button;
  _pressX = _lastX = px;
  _pressY = _lastY = py;
  _moved = false;
  if (button != VORMouseLeft)
    return;
  VOR2DRep* element = nullptr;
  _active = ManipulatorAt(px, py, &element);
  if (_active)
    _active->PointerPress(this, _pointer, modifiers, element);
}

void VORViewer::OnMouseMove(double px, double py, int modifiers) {
  VORViewer_var keep(this);
  _pointer = _viewpoint->PixelToModel(px, py);
  if (_pressButton != VORMouseNone &&
      std::hypot(px - _pressX, py - _pressY) >= kDragThresholdPixels)
    _moved = true;
  if (_pressButton == VORMouseMiddle) {
    _viewpoint->Pan(px - _lastX, py - _lastY);
    _pointer = _viewpoint->PixelToModel(px, py);
  } else if (_active) {
    if (_moved)
      _active->PointerDrag(_pointer, modifiers);
  } else if (_pressButton == VORMouseNone) {
    UpdateHover(px, py, modifiers);
  }
  _lastX = px;
  _lastY = py;
}

void VORViewer::OnMouseRelease(double px, double py, int button, int modifiers) {
  VORViewer_var keep(this);
  _pointer = _viewpoint->PixelToModel(px, py);
  if (button != _pressButton) {
    return;
  }
  _pressButton = VORMouseNone;
  if (button != VORMouseLeft)
    return;
  if (_active) {
    VORManipulator_var active = _active;
    _active = NULL_var;
    const bool dragged = active->IsDragging();
    const bool activated = active->PointerRelease(_pointer, modifiers);
    if (!activated && !dragged && !_moved)
      SelectionPick(px, py, modifiers);
    return;
  }
  if (!_moved)
    SelectionPick(px, py, modifiers);
}

void VORViewer::OnMouseWheel(double px, double py, int delta, int) {
  _viewpoint->Zoom(std::pow(kWheelNotchZoom, delta / 120.0), px, py);
}

void VORViewer::OnContextMenu(double px, double py, int) {
  VORViewer_var keep(this);
  _pointer = _viewpoint->PixelToModel(px, py);
  VORManipulator_var manipulator(ManipulatorAt(px, py));
  auto context = VORHandle<VORContext>::Adopt(new VORContext(this, _pointer.x, _pointer.y));
  GetEventPublisher()->Dispatch(context);
  if (manipulator)
    manipulator->Context(this, context);
}

void VORViewer::OnMouseLeave() {
  if (_hover) {
    VORManipulator_var hover = _hover;
    _hover = NULL_var;
    hover->EndPreactivate(this, _pointer, 0);
  }
  if (_pso != nullptr && !_pso->IsEmpty())
    _pso->Empty();
}
