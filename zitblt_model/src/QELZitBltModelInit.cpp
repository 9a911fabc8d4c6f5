// Registers the ZitBlt model's extensions when the module is loaded.
#include "QELEListZitBltItem.h"
#include "QELEListZitBltItemDDPI.h"
#include "QELEListZitBltItemDDPO.h"
#include "QELEListZitBltItemDDResource.h"
#include "QELEListZitBltItemStatePI.h"
#include "QELEZitBltCBSubscriber.h"
#include "QELEZitBltMgr.h"
#include "QELPFViewerItemSelectShowComponent.h"
#include "QELScrollListScriptSteps.h"
#include "QELZitBltScriptStep.h"
#include "VORExtensionRegistry.h"

extern "C" void VORInitModule() {
  VORExtensionRegistry::Register(
      "PhysicalActivity", QELIZitBltMgr::IID(),
      []() -> VORExtension* { return new QELEZitBltMgr(); }, VORExtensionKind::Data);
  VORExtensionRegistry::Register(
      "PhysicalActivity", QELIZitBltCBSubscriber::IID(),
      []() -> VORExtension* { return new QELEZitBltCBSubscriber(); }, VORExtensionKind::Data);
  // What the lists show of the model objects.
  for (const char* type : {"ProductInput", "QELMfgAssy"})
    VORExtensionRegistry::Register(
        type, QELIListZitBltItem::IID(),
        []() -> VORExtension* { return new QELEListZitBltItemPI(); }, VORExtensionKind::Code);
  VORExtensionRegistry::Register(
      "ProductOutput", QELIListZitBltItem::IID(),
      []() -> VORExtension* { return new QELEListZitBltItemPO(); }, VORExtensionKind::Code);
  VORExtensionRegistry::Register(
      "ASMPRODUCT", QELIListZitBltItem::IID(),
      []() -> VORExtension* { return new QELEListZitBltItemResource(); }, VORExtensionKind::Code);
  VORExtensionRegistry::Register(
      "ProductInput", QELIListZitBltItemState::IID(),
      []() -> VORExtension* { return new QELEListZitBltItemStatePI(); }, VORExtensionKind::Data);
  // Dragging list items onto other activities.
  VORExtensionRegistry::Register(
      "ProductInput", QELIListZitBltItemDD::IID(),
      []() -> VORExtension* { return new QELEListZitBltItemDDPI(); }, VORExtensionKind::Code);
  VORExtensionRegistry::Register(
      "ProductOutput", QELIListZitBltItemDD::IID(),
      []() -> VORExtension* { return new QELEListZitBltItemDDPO(); }, VORExtensionKind::Data);
  VORExtensionRegistry::Register(
      "ASMPRODUCT", QELIListZitBltItemDD::IID(),
      []() -> VORExtension* { return new QELEListZitBltItemDDResource(); }, VORExtensionKind::Code);
  // What a picked list line selects and hides (the list visualisation this module links).
  QELPFViewerItemSelectShowComponent::Register();
  QELRegisterZitBltScriptStep();
  QELRegisterScrollListScriptSteps();  // the list visualisation this module links
}
