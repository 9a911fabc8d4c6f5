#include "QELPertNodeTraverser.h"

#include "QELPertController.h"
#include "QELPertNodeExtensions.h"

QELPertNodeTraverser::QELPertNodeTraverser(QELPertController* controller)
    : VORCommand(nullptr, "QELPertNodeTraverser"), _controller(controller) {}

HRESULT QELPertNodeTraverser::HideChildrenNodes(VORIGENode_var& node) {
  if (_controller == nullptr || !node)
    return E_FAIL;
  return _controller->HideInnerNodes(node);
}

HRESULT QELPertNodeTraverser::ShowChildrenNodes(VORIGENode_var& node) {
  if (_controller == nullptr || !node)
    return E_FAIL;
  return _controller->ShowInnerNodes(node);
}

HRESULT QELPertNodeTraverser::ChangePertNodeShape(PertNodeState state) {
  QELIPertNodeExt_var ext(_model);
  if (!ext)
    return E_FAIL;
  const HRESULT hr = ext->SetState(state);
  if (FAILED(hr))
    return hr;
  if (_controller != nullptr && _controller->IsInChart(_model))
    _controller->UpdateNodeShape(_model);
  return S_OK;
}
