// Deferred destruction: objects that may still be on the call stack (commands, reps, dialogs)
// are released after the current user event, when the event loop drains this queue.
#pragma once

class VORBaseUnknown;

// Queues one Release of object; null is ignored.
void VORCommandDeletion(VORBaseUnknown* object);

namespace VORDeferredDeletion {
// Releases everything queued, including what those releases queue in turn. Returns the count.
int Drain();
int Pending();
}  // namespace VORDeferredDeletion
