// A test module exporting one command class that records its argument and one class that is no
// command.
#include "VORCommandHeader.h"

namespace {
class ModuleCommand : public VORCommand {
  VOR_DECLARE_CLASS(ModuleCommand, VORCommand)
 public:
  explicit ModuleCommand(VORBaseUnknown* argument) : VORCommand(nullptr, "ModuleCommand") {
    _argument = argument;
  }
  VORStatusChangeRC Activate(VORCommand*, VORNotification*) override {
    ++activations;
    return VORStatusChangeRCCompleted;
  }
  VORBaseUnknown_var _argument;
  int activations = 0;
};

class NotACommand : public VORBaseUnknown {
  VOR_DECLARE_CLASS(NotACommand, VORBaseUnknown)
};
}  // namespace

VOR_EXPORT_COMMAND_FACTORY(ModuleCommand)

extern "C" VORBaseUnknown* fctCreateNotACommand(VORBaseUnknown*) {
  return new NotACommand();
}
