// The node organiser's computation on plain indexes: levels from the precedence flows (with the
// organiser's deliberate "met again through a longer path" cycle report), the exchange-sort order
// within levels, the level lists reordered by the previous level, and the chart's square side.
// Results are identical to the organiser's list-based steps; only the data structures differ
// (index arrays, an explicit stack instead of recursion, a segment tree for the exchange sort).
#pragma once

#include <vector>

namespace QELPFVLayoutCore {

// successors[i]: indexes (0-based, into the child list) of the children that node i's flows lead
// to, in the order the model returns them; successors outside the child list are left out.
using Successors = std::vector<std::vector<int>>;

struct Levels {
  std::vector<int> level;  // per child index
  bool cyclic = false;
  int cyclicIndex = -1;  // child index named by the warning: the first one met again
};

// Longest-path levels by the organiser's walk: every node starts on level 0; each node in child
// order raises its successors and walks on from them. Visited flags are never reset, so a node
// reached again through a longer path is reported cyclic. Iterative: deep chains are fine.
Levels ComputeLevels(const Successors& successors);

// The exchange sort "for i, for j > i: if level[i] > level[j] swap i and j" as a permutation:
// order[p] is the child index at 0-based position p afterwards.
std::vector<int> ExchangeSortOrder(const std::vector<int>& level);

// Children by level, each level in child order (a counting sort). The organiser's results only
// depend on the order this gives to the lowest level, and there it equals the exchange sort's:
// the exchange sort moves an element of the smallest value only to put it in its final place,
// always the first one left, so that value keeps child order. Every later level list is rebuilt
// from the previous one's successors (LevelLists), whatever order the sort left it in.
std::vector<int> StableLevelOrder(const std::vector<int>& level);

// Level lists after the sort (list v holds level v in sorted order), each list but the first then
// replaced by the first-occurrence order of the previous list's successors that it holds.
std::vector<std::vector<int>> LevelLists(const Successors& successors,
                                         const std::vector<int>& level,
                                         const std::vector<int>& order);

// Side of the square chart area: 50 x max(highest level, most nodes on one level); 300 when
// there are no nodes (the callers' width preset wins then).
float ChartSide(const std::vector<int>& level);

}  // namespace QELPFVLayoutCore
