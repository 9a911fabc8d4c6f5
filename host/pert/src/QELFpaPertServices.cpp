#include "QELFpaPertServices.h"

#include "QELPertClientVisuServices.h"
#include "QELPertNodeExtensions.h"
#include "VORIGraphNodeLayout.h"

QELIPertNodeExt_var QELFpaPertBaseServices::GetPertExtension(VORIGENode_var& node, bool& created) {
  created = false;
  if (!node)
    return QELIPertNodeExt_var();
  QELIPertNodeExt_var ext(node);
  if (!ext)
    return ext;
  // The extension remembers being asked: a list of every node ever asked would only grow.
  if (QELEPertNodeExt* data = QELEPertNodeExt::Of(node))
    created = data->FirstAsked();
  return ext;
}

HRESULT QELFpaPertBaseServices::InitNodePosition(VORIGENode_var& node) {
  QELEPertNodeExt* ext = node ? QELEPertNodeExt::Of(node) : nullptr;
  if (ext == nullptr)
    return E_FAIL;
  VORIGraphNodeLayout_var layout(node);
  if (layout && layout->HasPertPosition())
    return S_FALSE;
  // Index among the siblings, from a cached table of the last parent asked about.
  static VORBaseUnknown* lastParent = nullptr;
  static std::unordered_map<VORBaseUnknown*, int> indexes;
  VORBaseUnknown_var parent;
  int index = 0;
  if (node->GetParentNode(parent) == S_OK && parent) {
    auto it = indexes.find(node.Identity());
    if (lastParent != parent.Identity() || it == indexes.end()) {
      indexes.clear();
      lastParent = parent.Identity();
      VORIGENode_var parentNode(parent);
      VORListValVORBaseUnknown_var* siblings = nullptr;
      if (parentNode && SUCCEEDED(parentNode->GetChildren(siblings)) && siblings != nullptr) {
        int i = 0;
        for (const VORBaseUnknown_var& s : *siblings)
          indexes[s.Identity()] = i++;
      }
      delete siblings;
      it = indexes.find(node.Identity());
    }
    if (it != indexes.end())
      index = it->second;
  }
  double x = 2.0 * QELPertParameters::PERT_GRID_CELL_SIZE * index;
  double y = 0.0;
  QELPertClientVisuServices::CalculateSnapPositionInPert(x, y, 0, QELIPertNode_var());
  ext->SetProvisionalPosition(x, y);
  return S_OK;
}
