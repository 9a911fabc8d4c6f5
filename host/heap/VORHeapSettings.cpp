// The settings of the programs' heap (jemalloc), read by the allocator before main runs.
//
// Opening a chart allocates some ten kilobytes of small objects per node; on a level of
// thousands of stations most of the opening time went to the first touch of that memory, page by
// page. Transparent huge pages, for the allocator's own metadata too, make that touch a few
// hundred faults instead of tens of thousands. Memory freed by closing a chart or leaving a
// level stays with the process for 30 s before it goes back to the system, so that the next
// chart (reopening, drilling into another level) reuses it instead of touching fresh pages.
// MALLOC_CONF still overrides these at run time.
extern "C" {
extern const char* malloc_conf;
const char* malloc_conf =
    "thp:always,metadata_thp:always,dirty_decay_ms:30000,muzzy_decay_ms:30000";
}
