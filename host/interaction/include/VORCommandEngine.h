// Runs the interactive commands: one exclusive command at a time (starting another cancels the
// running one), picks offered to it, its end announced. Ended commands are released through
// deferred destruction.
#pragma once

#include "VORCommand.h"

class VORPathElement;
class VORStateCommand;

namespace VORCommandEngine {
// Starts command (the engine adds its own reference) and returns the command's result.
VORStatusChangeRC Start(VORCommand* command);
// The running exclusive command, or null.
VORCommand* Current();
// Cancels the running command, if any.
void CancelCurrent();
// Offers a pick to the running command; true when an agent took it.
bool OfferPath(VORPathElement* path);
// Called by a state command when it ends: releases the engine's reference later.
void CommandEnded(VORCommand* command, bool cancelled);
// Publishes VORCommandEndNotification (and "VORCommandStarted" events with no notification).
VOREventPublisher* GetEventPublisher();
}  // namespace VORCommandEngine
