// A test module with a creatable class and an extension it registers when loaded.
#include "TestInterfaces.h"
#include "VORExtensionRegistry.h"

namespace {
class ModuleWidget : public ITestShape {
  VOR_DECLARE_CLASS(ModuleWidget, VORBaseUnknown)
 public:
  int Corners() const override { return 5; }
};

class ModuleProvidedExtension : public VORExtension, public ITestModuleProvided {
 public:
  int Answer() const override { return 42; }
};
}  // namespace

extern "C" VORBaseUnknown* fctCreateModuleWidget() {
  return new ModuleWidget();
}

extern "C" void VORInitModule() {
  VORExtensionRegistry::Register(
      "TestModuleType", ITestModuleProvided::IID(),
      []() -> VORExtension* { return new ModuleProvidedExtension(); }, VORExtensionKind::Data);
}
