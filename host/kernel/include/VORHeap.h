// The programs' heap, seen from the code that knows when memory has served its purpose.
#pragma once

namespace VORHeap {
// Gives the memory the heap holds free back to the system now. The heap keeps what objects free
// for reuse (reopening a chart, drilling into another level); closing a document is the moment
// it has served. Does nothing when the program does not run on jemalloc.
void ReturnFreeMemory();
// The same, once the objects released with the current user event are gone too: at the next
// drain of deferred deletions (a closed document's chart goes after the document).
void ReturnFreeMemoryAfterDrain();
// Called by the drain: returns the free memory if it was asked for since the last drain.
void DrainDone();
}  // namespace VORHeap
