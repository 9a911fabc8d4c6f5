// Graph-editor interfaces of every graph node, as extensions of the late type "SPPGraphNode"
// on top of the document's chart data (VORIGraphNodeLayout).
#include "QELIPertNode.h"
#include "QELIPertPosition.h"
#include "QELPertNodeExtensions.h"
#include "VORDynamicCast.h"
#include "VORExtensionRegistry.h"
#include "VORIGENode.h"
#include "VORIGraphNodeLayout.h"
#include "VORModelTypes.h"
#include "VORTextMetric.h"

HRESULT QELEPertNodeExt::GetPosition(double& x, double& y, GE_POSITION_INDEX index) {
  if (index == 0) {
    x = _px;
    y = _py;
    return _hasProvisional ? S_OK : S_FALSE;
  }
  if (index != 1)
    return E_INVALIDARG;
  if (_hasPosition) {
    x = _x;
    y = _y;
    return S_OK;
  }
  VORIGraphNodeLayout_var layout(GetExtendedObject());
  if (layout && layout->HasPertPosition()) {
    layout->GetPertPosition(x, y);
    return S_OK;
  }
  x = 0.0;
  y = 0.0;
  return S_FALSE;
}

HRESULT QELEPertNodeExt::SetPosition(double x, double y, GE_POSITION_INDEX index) {
  if (index == 0) {
    SetProvisionalPosition(x, y);
    return S_OK;
  }
  if (index != 1)
    return E_INVALIDARG;
  _x = x;
  _y = y;
  _hasPosition = true;
  return S_OK;
}

int QELEPertNodeExt::GetState(int) {
  VORIGraphNodeLayout_var layout(GetExtendedObject());
  return layout ? layout->GetPertNodeState() : PertNodeNone;
}

HRESULT QELEPertNodeExt::SetState(int state) {
  VORIGraphNodeLayout_var layout(GetExtendedObject());
  if (!layout)
    return E_FAIL;
  if (state < PertNodeNone || state > PertNodeCollapsed)
    return E_INVALIDARG;
  if (layout->GetPertNodeState() != state)
    layout->SetPertNodeState(state);
  return S_OK;
}

HRESULT QELPertWritePosition(QELEPertNodeExt& ext, VORIGraphNodeLayout* layout, double x,
                             double y) {
  const HRESULT hr = ext.SetPosition(x, y, 1);
  if (layout == nullptr)
    return E_FAIL;
  double ox = 0.0;
  double oy = 0.0;
  layout->GetPertPosition(ox, oy);
  // One door change only when the stored position really changes.
  if (!layout->HasPertPosition() || ox != x || oy != y)
    layout->SetPertPosition(x, y);
  return hr;
}

QELEPertNodeExt* QELEPertNodeExt::Of(VORBaseUnknown* node) {
  if (node == nullptr)
    return nullptr;
  QELIPertNodeExt_var ext(node);
  // A data extension lives as long as its object: the raw pointer stays valid after the handle.
  return VORDynamicCast<QELEPertNodeExt>(ext.get());
}

namespace {

class QELEPertNode : public VORExtension, public QELIPertNode {
  VOR_DECLARE_CLASS(QELEPertNode, VORExtension)
 public:
  HRESULT GetPosition(double& x, double& y, GE_POSITION_INDEX index) override {
    QELEPertNodeExt* ext = Ext();
    return ext ? ext->GetPosition(x, y, index) : E_FAIL;
  }
  HRESULT SetPosition(double x, double y, GE_POSITION_INDEX index) override {
    QELEPertNodeExt* ext = Ext();
    if (ext == nullptr)
      return E_FAIL;
    if (index != 1)
      return ext->SetPosition(x, y, index);
    return QELPertWritePosition(*ext, VORIGraphNodeLayout_var(GetExtendedObject()).get(), x, y);
  }
  HRESULT GetSize(double& width, double& height) override {
    QELEPertNodeExt* ext = Ext();
    double w = 0.0;
    double h = 0.0;
    if (ext != nullptr)
      ext->GetDrawnSize(w, h);
    if (w <= 0.0 || h <= 0.0) {
      VORIGraphNodeLayout_var layout(GetExtendedObject());
      if (layout)
        layout->GetPertNodeSize(w, h);
    }
    if (w <= 0.0 || h <= 0.0) {
      w = QELPertParameters::PERT_NODE_WIDTH;
      h = QELPertParameters::PERT_NODE_HEIGHT;
    }
    width = w;
    height = h;
    return S_OK;
  }
  HRESULT SetSize(double width, double height) override {
    VORIGraphNodeLayout_var layout(GetExtendedObject());
    if (!layout || width <= 0.0 || height <= 0.0)
      return E_INVALIDARG;
    layout->SetPertNodeSize(width, height);
    return S_OK;
  }

 private:
  // The node's chart data, asked once: both are data extensions of the node and live as long as
  // it does. A ZitBlt reads position and size on every move of its node.
  QELEPertNodeExt* Ext() {
    if (_ext == nullptr)
      _ext = QELEPertNodeExt::Of(GetExtendedObject());
    return _ext;
  }
  QELEPertNodeExt* _ext = nullptr;
};

class QELEPertPosition : public VORExtension, public QELIPertPosition {
  VOR_DECLARE_CLASS(QELEPertPosition, VORExtension)
 public:
  HRESULT GetReferenceObject(VORBaseUnknown_var& reference) override {
    VORBaseUnknown* node = GetExtendedObject();
    QELEPertNodeExt* ext = QELEPertNodeExt::Of(node);
    if (ext != nullptr && ext->GetReference() != nullptr) {
      reference = ext->GetReference();
      return S_OK;
    }
    VORIGENode_var graphNode(node);
    VORBaseUnknown_var parent;
    if (graphNode && graphNode->GetParentNode(parent) == S_OK && parent) {
      reference = parent;
      return S_OK;
    }
    reference = node->GetIdentity();
    return S_OK;
  }
};

}  // namespace

// QELIPertNode and QELIPertPosition hold no state of their own, yet charts, layouts and ZitBlts
// ask for them on every move: made once per node and kept with it, rather than made and freed
// on each query.
void QELPertRegisterNodeExtensions() {
  VORExtensionRegistry::Register(
      VORModelLateTypes::GraphNode, QELIPertNodeExt::IID(),
      []() -> VORExtension* { return new QELEPertNodeExt(); }, VORExtensionKind::Data);
  VORExtensionRegistry::Register(
      VORModelLateTypes::GraphNode, QELIPertNode::IID(),
      []() -> VORExtension* { return new QELEPertNode(); }, VORExtensionKind::Data);
  VORExtensionRegistry::Register(
      VORModelLateTypes::GraphNode, QELIPertPosition::IID(),
      []() -> VORExtension* { return new QELEPertPosition(); }, VORExtensionKind::Data);
}
