// Synthetic body-shop lines shaped like real ones: stations in parallel branches that merge,
// each with loading and joining activities, parts and sub-assemblies flowing between them,
// robots, guns, fixtures, workers, transports and buffers.
#pragma once

#include <cstdint>

class VORProcess;

struct VORModelGeneratorOptions {
  int activities = 200;      // approximate number of activities below the root
  bool hub = false;          // planning data and "IPDDocEnv"
  bool withGrouping = true;  // one grouping with Start/Stop around two stations
  std::uint32_t seed = 1;    // same seed, same document
  const char* lineName = "Underbody";
};

namespace VORModelGenerator {
// A new document (one reference, the caller's).
VORProcess* Generate(const VORModelGeneratorOptions& options);
// A flat level as large lines are kept: `stations` stations (a multiple of four) right under the
// root process named lineName, in four lanes stored lane after lane; each leads to the next
// station of its lane and, every tenth, also to the next station of the neighbouring lane. With
// parts, every station consumes one assigned part, produces one assembly and has one station
// resource. A new document (one reference, the caller's).
VORProcess* GenerateFlatLevel(int stations, bool withParts, const char* lineName = "Line");
}  // namespace VORModelGenerator
