#include "QELPFVLayoutCore.h"

#include <algorithm>
#include <climits>
#include <cstddef>

namespace QELPFVLayoutCore {

namespace {

// Minimum segment tree over positions, answering "first position after p whose value is below v"
// in O(log n): the exchange sort's next swap partner.
class MinTree {
 public:
  explicit MinTree(const std::vector<int>& values) : _n(values.size()) {
    _size = 1;
    while (_size < _n)
      _size <<= 1;
    _tree.assign(2 * _size, INT_MAX);
    for (size_t i = 0; i < _n; ++i)
      _tree[_size + i] = values[i];
    for (size_t i = _size - 1; i >= 1; --i)
      _tree[i] = std::min(_tree[2 * i], _tree[2 * i + 1]);
  }
  void Set(size_t position, int value) {
    size_t i = _size + position;
    _tree[i] = value;
    for (i >>= 1; i >= 1; i >>= 1)
      _tree[i] = std::min(_tree[2 * i], _tree[2 * i + 1]);
  }
  // First position q > p with value(q) < v, or npos.
  size_t FirstBelowAfter(size_t p, int v) const { return Descend(1, 0, _size, p + 1, v); }
  static constexpr size_t npos = static_cast<size_t>(-1);

 private:
  size_t Descend(size_t node, size_t lo, size_t hi, size_t from, int v) const {
    if (hi <= from || _tree[node] >= v)
      return npos;
    if (hi - lo == 1)
      return lo < _n ? lo : npos;
    size_t mid = (lo + hi) / 2;
    size_t left = Descend(2 * node, lo, mid, from, v);
    return left != npos ? left : Descend(2 * node + 1, mid, hi, from, v);
  }
  size_t _n;
  size_t _size;
  std::vector<int> _tree;
};

}  // namespace

Levels ComputeLevels(const Successors& successors) {
  const int n = static_cast<int>(successors.size());
  Levels out;
  out.level.assign(static_cast<size_t>(n), 0);
  std::vector<char> visited(static_cast<size_t>(n), 0);
  std::vector<int>& level = out.level;

  struct Frame {
    int node;
    int walkLevel;  // the L of the walk from this node
    size_t next;    // next successor to look at
  };
  std::vector<Frame> stack;
  // The walk from node s at level L: each successor t not yet above L + 1 is either reported
  // (already visited) or visited, raised to L + 1 and walked from in turn.
  auto walk = [&](int start, int startLevel) {
    stack.push_back(Frame{start, startLevel, 0});
    while (!stack.empty()) {
      Frame& f = stack.back();
      const auto& succ = successors[static_cast<size_t>(f.node)];
      if (f.next >= succ.size()) {
        stack.pop_back();
        continue;
      }
      const int t = succ[f.next++];
      const int raised = f.walkLevel + 1;
      if (level[static_cast<size_t>(t)] >= raised)
        continue;
      if (visited[static_cast<size_t>(t)] != 0) {
        // The warning names the first node met again; later meetings are consequences of it.
        if (!out.cyclic)
          out.cyclicIndex = t;
        out.cyclic = true;
        continue;
      }
      visited[static_cast<size_t>(t)] = 1;
      level[static_cast<size_t>(t)] = raised;
      stack.push_back(Frame{t, raised, 0});  // invalidates f: nothing of it is used below
    }
  };

  for (int i = 0; i < n; ++i) {
    for (int s : successors[static_cast<size_t>(i)]) {
      const int raised = level[static_cast<size_t>(i)] + 1;
      if (level[static_cast<size_t>(s)] < raised) {
        level[static_cast<size_t>(s)] = raised;
        // Read again: a flow from a node to itself has just raised the node's own level.
        walk(s, level[static_cast<size_t>(i)] + 1);
      }
    }
  }
  return out;
}

std::vector<int> ExchangeSortOrder(const std::vector<int>& level) {
  const size_t n = level.size();
  std::vector<int> order(n);
  for (size_t i = 0; i < n; ++i)
    order[i] = static_cast<int>(i);
  if (std::is_sorted(level.begin(), level.end()))
    return order;  // no pass swaps anything

  // Pass i carries the element at i forward: at every later position holding a smaller level
  // the carried element is dropped there and the smaller one picked up; what is carried at the
  // end lands at i. Only those record positions change, and the tree finds each in O(log n).
  std::vector<int> value = level;
  MinTree tree(value);
  for (size_t i = 0; i + 1 < n; ++i) {
    int carriedNode = order[i];
    int carriedLevel = value[i];
    size_t p = i;
    for (size_t q = tree.FirstBelowAfter(p, carriedLevel); q != MinTree::npos;
         q = tree.FirstBelowAfter(p, carriedLevel)) {
      std::swap(carriedNode, order[q]);
      std::swap(carriedLevel, value[q]);
      tree.Set(q, value[q]);
      p = q;
    }
    // Searches always start after i, so position i needs no update in the tree.
    order[i] = carriedNode;
    value[i] = carriedLevel;
  }
  return order;
}

std::vector<int> StableLevelOrder(const std::vector<int>& level) {
  if (level.empty())
    return {};
  const int highest = *std::max_element(level.begin(), level.end());
  const int lowest = *std::min_element(level.begin(), level.end());
  std::vector<size_t> start(static_cast<size_t>(highest - lowest) + 2, 0);
  for (int l : level)
    ++start[static_cast<size_t>(l - lowest) + 1];
  for (size_t v = 1; v < start.size(); ++v)
    start[v] += start[v - 1];
  std::vector<int> order(level.size());
  for (size_t i = 0; i < level.size(); ++i)
    order[start[static_cast<size_t>(level[i] - lowest)]++] = static_cast<int>(i);
  return order;
}

std::vector<std::vector<int>> LevelLists(const Successors& successors,
                                         const std::vector<int>& level,
                                         const std::vector<int>& order) {
  std::vector<std::vector<int>> lists;
  if (order.empty())
    return lists;
  const int highest = level[static_cast<size_t>(order.back())];
  lists.resize(static_cast<size_t>(highest) + 1);
  // Each list holds at most the nodes of its level: sized once.
  std::vector<int> count(lists.size(), 0);
  for (int l : level)
    ++count[static_cast<size_t>(l)];
  for (size_t v = 0; v < lists.size(); ++v)
    lists[v].reserve(static_cast<size_t>(count[v]));
  // Only the first list keeps the sorted order: every later one is rebuilt below.
  for (int node : order) {
    if (level[static_cast<size_t>(node)] == 0)
      lists[0].push_back(node);
  }

  // Membership of the list being rebuilt is its content before the rebuild: all nodes of that
  // level. Stamps drop duplicates (first occurrence kept) without clearing a set per level.
  std::vector<size_t> stamp(level.size(), 0);
  for (size_t k = 0; k + 1 < lists.size(); ++k) {
    std::vector<int>& next = lists[k + 1];
    for (int node : lists[k]) {
      for (int s : successors[static_cast<size_t>(node)]) {
        if (level[static_cast<size_t>(s)] == static_cast<int>(k) + 1 &&
            stamp[static_cast<size_t>(s)] != k + 1) {
          stamp[static_cast<size_t>(s)] = k + 1;
          next.push_back(s);
        }
      }
    }
  }
  return lists;
}

float ChartSide(const std::vector<int>& level) {
  if (level.empty())
    return 300.0f;
  const int highest = *std::max_element(level.begin(), level.end());
  std::vector<int> count(static_cast<size_t>(highest) + 1, 0);
  for (int l : level)
    ++count[static_cast<size_t>(l)];
  const int widest = *std::max_element(count.begin(), count.end());
  const float width = static_cast<float>(highest * 50);
  const float height = static_cast<float>(widest * 50);
  return width >= height ? width : height;
}

}  // namespace QELPFVLayoutCore
