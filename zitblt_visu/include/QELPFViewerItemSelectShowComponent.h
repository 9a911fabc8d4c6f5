// What a picked line of a ZitBlt list stands for (code extension of the item visualisation
// component, "QELPFViewerItemRepComponent"): a pick selects the list item, and hide and show
// act on the product of a product input or output, or on the item itself (a resource).
#pragma once

#include "VORExtISelectShow.h"

class QELPFViewerItemSelectShowComponent : public VORExtISelectShow {
  VOR_DECLARE_CLASS(QELPFViewerItemSelectShowComponent, VORExtISelectShow)
 public:
  // A new instance (the caller's reference), or null when allocation fails.
  static QELPFViewerItemSelectShowComponent* CreateItself();

  const VORInterfaceId& GetSelectShowInterface() override;
  // The list item of the component this extension is attached to; null for other objects.
  VORBaseUnknown* GetElement(VORPathElement* path) override;
  // E_FAIL for a null path or when there is no list item; otherwise the product of a product
  // input or output, or the item itself, as a new reference, with flag 0.
  HRESULT GetElementForHideShow(VORPathElement* path, VORBaseUnknown*& element, int& flag) override;

  // Registers the extension on the item visualisation component.
  static void Register();

 protected:
  QELPFViewerItemSelectShowComponent() = default;
  ~QELPFViewerItemSelectShowComponent() override = default;
};
