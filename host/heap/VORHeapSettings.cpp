// The settings of the programs' heap (jemalloc), read by the allocator before main runs.
//
// Opening a chart allocates some ten kilobytes of small objects per node; on a level of
// thousands of stations most of the opening time went to the first touch of that memory, page by
// page. Transparent huge pages, for the allocator's own metadata too, make that touch a few
// hundred faults instead of tens of thousands, and keep the level's objects within the reach of
// the processor's address cache: on 4 KiB pages, opening a 100,000-station level takes about half
// as long again.
//
// Memory freed by closing a chart or leaving a level stays with the process (no decay), so that
// the next chart reuses it as it is. Giving it back by decay, piece by piece, broke the huge pages
// apart: every later chart of the process ran on small pages, each one slower than the last.
// The whole free memory goes back when a document closes (VORHeap::ReturnFreeMemory). Large free
// ranges may be cut for small objects (lg_extent_max_active_fit), or the next level would map
// fresh memory beside the free range instead of reusing it.
// MALLOC_CONF still overrides these at run time.
extern "C" {
extern const char* malloc_conf;
const char* malloc_conf =
    "thp:always,metadata_thp:always,dirty_decay_ms:-1,muzzy_decay_ms:-1,"
    "lg_extent_max_active_fit:30";
}
