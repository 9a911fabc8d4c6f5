#include "QELPFViewerItemSelectShowComponent.h"

#include <new>

#include "QELIScrollListZitBltItemVisu.h"
#include "VORExtensionRegistry.h"
#include "VORISPPProductIO.h"

QELPFViewerItemSelectShowComponent* QELPFViewerItemSelectShowComponent::CreateItself() {
  return new (std::nothrow) QELPFViewerItemSelectShowComponent();
}

const VORInterfaceId& QELPFViewerItemSelectShowComponent::GetSelectShowInterface() {
  return VORISelectShow::IID();
}

VORBaseUnknown* QELPFViewerItemSelectShowComponent::GetElement(VORPathElement*) {
  QELIScrollListZitBltItemVisu_var visual{VORBaseUnknown_var(GetExtendedObject())};
  return visual ? visual->GetAssociatedPFItem() : nullptr;
}

HRESULT QELPFViewerItemSelectShowComponent::GetElementForHideShow(VORPathElement* path,
                                                                  VORBaseUnknown*& element,
                                                                  int& flag) {
  if (path == nullptr)
    return E_FAIL;
  VORBaseUnknown* item = GetElement(path);
  if (item == nullptr)
    return E_FAIL;
  // Hiding a list line of an input or output hides its product, not the line's object.
  VORBaseUnknown_var target(item);
  if (VORISPPProductIO_var io{VORBaseUnknown_var(item)}; io) {
    VORBaseUnknown_var product;
    io->GetProduct(product);
    target = product;
  }
  if (!target)
    return E_FAIL;
  flag = 0;
  return target->QueryInterface(VORBaseUnknown::IID(), reinterpret_cast<void**>(&element));
}

void QELPFViewerItemSelectShowComponent::Register() {
  VORExtensionRegistry::Register(
      "QELPFViewerItemRepComponent", VORISelectShow::IID(),
      []() -> VORExtension* { return CreateItself(); }, VORExtensionKind::Code);
}
