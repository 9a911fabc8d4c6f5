// The root process's adapters as a data extension on "BIWActivityRoot".
#include "QELIFPAAdapters.h"

#include "VORExtensionRegistry.h"
#include "VORIGENode.h"
#include "VORIGraphNodeLayout.h"
#include "VORISPPActivity.h"
#include "VORISPPActivityRoot.h"

bool QELFpaPertAdapter::Owns(VORBaseUnknown* node) const {
  if (node == nullptr || !VORIGENode_var(node))
    return false;
  // Graph nodes that are activities name their root; control nodes hang below an activity.
  VORBaseUnknown_var current(node);
  while (current) {
    if (current.Identity() == _root)
      return true;
    VORBaseUnknown_var parent;
    VORIGENode_var graphNode(current);
    if (!graphNode || FAILED(graphNode->GetParentNode(parent)))
      return false;
    current = parent;
  }
  return false;
}

HRESULT QELFpaPertAdapter::StoreNodePosition(VORBaseUnknown* node, double x, double y) {
  VORIGraphNodeLayout_var layout(node);
  if (!Owns(node) || !layout)
    return E_INVALIDARG;
  layout->SetPertPosition(x, y);
  return S_OK;
}

HRESULT QELFpaPertAdapter::GetStoredNodePosition(VORBaseUnknown* node, double& x, double& y) {
  x = 0.0;
  y = 0.0;
  VORIGraphNodeLayout_var layout(node);
  if (!Owns(node) || !layout)
    return E_INVALIDARG;
  if (!layout->HasPertPosition())
    return S_FALSE;
  layout->GetPertPosition(x, y);
  return S_OK;
}

HRESULT QELFpaPertAdapter::StoreNodeState(VORBaseUnknown* node, int state) {
  VORIGraphNodeLayout_var layout(node);
  if (!Owns(node) || !layout || state < 0 || state > 2)
    return E_INVALIDARG;
  layout->SetPertNodeState(state);
  return S_OK;
}

HRESULT QELFpaPertAdapter::GetStoredNodeState(VORBaseUnknown* node, int& state) {
  state = 0;
  VORIGraphNodeLayout_var layout(node);
  if (!Owns(node) || !layout)
    return E_INVALIDARG;
  state = layout->GetPertNodeState();
  return S_OK;
}

namespace {

class QELEFPAAdapters : public VORExtension, public QELIFPAAdapters {
  VOR_DECLARE_CLASS(QELEFPAAdapters, VORExtension)
 public:
  HRESULT CreatePertAdapter(QELFpaPertAdapter*& adapter) override {
    adapter = nullptr;
    VORBaseUnknown* root = GetExtendedObject();
    if (root == nullptr || !VORISPPActivityRoot_var(root))
      return E_FAIL;
    adapter = new QELFpaPertAdapter(root);
    return S_OK;
  }
  HRESULT SetPertAdapter(QELFpaPertAdapter* adapter) override {
    _adapter = adapter;
    return S_OK;
  }
  QELFpaPertAdapter* GetPertAdapter() override { return _adapter.get(); }
  HRESULT SetPertController(QELPertController* controller) override {
    _controller = controller;
    return S_OK;
  }
  QELPertController* GetPertController() override { return _controller; }

 private:
  QELFpaPertAdapter_var _adapter;
  QELPertController* _controller = nullptr;
};

}  // namespace

void QELRegisterFPAAdapters() {
  VORExtensionRegistry::Register(
      "BIWActivityRoot", QELIFPAAdapters::IID(),
      []() -> VORExtension* { return new QELEFPAAdapters(); }, VORExtensionKind::Data);
}
