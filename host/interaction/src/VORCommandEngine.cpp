#include "VORCommandEngine.h"

#include "VORDeferredDeletion.h"
#include "VORStateCommand.h"

namespace {
VORCommand_var& Running() {
  // Never destroyed: a command still running at exit is not released after its dependencies.
  static auto* running = new VORCommand_var();
  return *running;
}
VORHandle<VOREventPublisher>& Publisher() {
  static auto* publisher = new VORHandle<VOREventPublisher>(
      VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher()));
  return *publisher;
}
}  // namespace

namespace VORCommandEngine {

VORStatusChangeRC Start(VORCommand* command) {
  if (command == nullptr)
    return VORStatusChangeRCAborted;
  VORCommand_var keep(command);
  if (Running() && Running().get() != command)
    CancelCurrent();
  Running() = command;
  Publisher()->Dispatch("VORCommandStarted");
  VORStatusChangeRC rc = command->Activate(nullptr, nullptr);
  // A plain command does its work in Activate; a state command ends itself.
  if (dynamic_cast<VORStateCommand*>(command) == nullptr && Running().get() == command)
    CommandEnded(command, false);
  return rc;
}

VORCommand* Current() {
  return Running().get();
}

void CancelCurrent() {
  VORCommand_var command = Running();
  if (!command)
    return;
  command->Cancel(nullptr, nullptr);
  if (Running().get() == command.get())
    CommandEnded(command, true);
}

bool OfferPath(VORPathElement* path) {
  auto* command = dynamic_cast<VORStateCommand*>(Running().get());
  return command != nullptr && command->OfferPath(path);
}

void CommandEnded(VORCommand* command, bool cancelled) {
  VORCommand_var keep(command);
  if (Running().get() == command && command != nullptr)
    VORCommandDeletion(Running().Detach());
  auto notification = VORHandle<VORCommandEndNotification>::Adopt(
      new VORCommandEndNotification(command, cancelled));
  Publisher()->Dispatch(notification);
}

VOREventPublisher* GetEventPublisher() {
  return Publisher();
}

}  // namespace VORCommandEngine
