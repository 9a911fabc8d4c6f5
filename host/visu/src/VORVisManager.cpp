#include "VORVisManager.h"

#include <algorithm>

#include "VORViewer.h"

VORVisManager* VORVisManager::GetVisManager() {
  static VORVisManager manager;
  return &manager;
}

bool VORVisManager::IsAttached(VOR2DViewpoint* viewpoint) const {
  return std::find(_viewpoints.begin(), _viewpoints.end(), viewpoint) != _viewpoints.end();
}

void VORVisManager::AttachHSOTo(VORHSO* hso, VOR2DViewpoint* viewpoint) {
  if (viewpoint == nullptr || viewpoint->GetViewer() == nullptr)
    return;
  viewpoint->GetViewer()->SetHighlightSet(hso);
  if (!IsAttached(viewpoint))
    _viewpoints.push_back(viewpoint);
}

void VORVisManager::AttachPSOTo(VORPSO* pso, VOR2DViewpoint* viewpoint) {
  if (viewpoint == nullptr || viewpoint->GetViewer() == nullptr)
    return;
  viewpoint->GetViewer()->SetPreselectionSet(pso);
  if (!IsAttached(viewpoint))
    _viewpoints.push_back(viewpoint);
}

void VORVisManager::DetachFrom(VOR2DViewpoint* viewpoint, int mode) {
  if (viewpoint == nullptr || viewpoint->GetViewer() == nullptr)
    return;
  VORViewer* viewer = viewpoint->GetViewer();
  viewer->ClearPreselection();
  if (mode == 0) {
    viewer->SetHighlightSet(nullptr);
    viewer->SetPreselectionSet(nullptr);
    Forget(viewpoint);
  }
}

void VORVisManager::Commit() {
  ++_commits;
  for (VOR2DViewpoint* viewpoint : _viewpoints) {
    if (viewpoint->GetViewer() != nullptr)
      viewpoint->GetViewer()->Draw();
  }
}

void VORVisManager::Forget(VOR2DViewpoint* viewpoint) {
  std::erase(_viewpoints, viewpoint);
}
