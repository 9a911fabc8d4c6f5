// Registers the ZitBlt model's extensions when the module is loaded.
#include "QELEZitBltCBSubscriber.h"
#include "QELEZitBltMgr.h"
#include "QELZitBltScriptStep.h"
#include "VORExtensionRegistry.h"

extern "C" void VORInitModule() {
  VORExtensionRegistry::Register(
      "PhysicalActivity", QELIZitBltMgr::IID(),
      []() -> VORExtension* { return new QELEZitBltMgr(); }, VORExtensionKind::Data);
  VORExtensionRegistry::Register(
      "PhysicalActivity", QELIZitBltCBSubscriber::IID(),
      []() -> VORExtension* { return new QELEZitBltCBSubscriber(); }, VORExtensionKind::Data);
  QELRegisterZitBltScriptStep();
}
