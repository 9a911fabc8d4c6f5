// The organiser's index-based computation against a literal transcription of its list steps
// (recursive walk, quadratic exchange sort, list intersection) on many generated graphs.
#include <gtest/gtest.h>

#include <algorithm>
#include <random>

#include "QELPFVLayoutCore.h"

namespace {

using QELPFVLayoutCore::Successors;

// The organiser's steps as written, on 0-based vectors.
struct Literal {
  const Successors& succ;
  std::vector<int> level, visited;
  bool cyclic = false;
  int cyclicIndex = -1;

  explicit Literal(const Successors& s) : succ(s), level(s.size(), 0), visited(s.size(), 0) {}

  void Recurse(int node, int l) {
    for (int t : succ[static_cast<size_t>(node)]) {
      if (level[static_cast<size_t>(t)] >= l + 1)
        continue;
      if (visited[static_cast<size_t>(t)] != 0) {
        if (!cyclic)
          cyclicIndex = t;
        cyclic = true;
        continue;
      }
      visited[static_cast<size_t>(t)] = 1;
      level[static_cast<size_t>(t)] = l + 1;
      Recurse(t, l + 1);
    }
  }
  void Levels() {
    for (size_t i = 0; i < succ.size(); ++i) {
      for (int s : succ[i]) {
        if (level[static_cast<size_t>(s)] < level[i] + 1) {
          level[static_cast<size_t>(s)] = level[i] + 1;
          Recurse(s, level[i] + 1);
        }
      }
    }
  }
  std::vector<int> Sort() const {
    std::vector<int> l = level, order(level.size());
    for (size_t i = 0; i < order.size(); ++i)
      order[i] = static_cast<int>(i);
    for (size_t i = 0; i < l.size(); ++i) {
      for (size_t j = i + 1; j < l.size(); ++j) {
        if (l[i] > l[j]) {
          std::swap(l[i], l[j]);
          std::swap(order[i], order[j]);
        }
      }
    }
    return order;
  }
  std::vector<std::vector<int>> Lists(const std::vector<int>& order) const {
    std::vector<std::vector<int>> lists;
    if (order.empty())
      return lists;
    size_t p = 0;
    for (int v = 0; v <= level[static_cast<size_t>(order.back())]; ++v) {
      std::vector<int> list;
      while (p < order.size() && level[static_cast<size_t>(order[p])] == v)
        list.push_back(order[p++]);
      lists.push_back(list);
    }
    for (size_t k = 0; k + 1 < lists.size(); ++k) {
      std::vector<int> n;
      for (int node : lists[k]) {
        for (int s : succ[static_cast<size_t>(node)]) {
          if (std::find(lists[k + 1].begin(), lists[k + 1].end(), s) != lists[k + 1].end())
            n.push_back(s);
        }
      }
      std::vector<int> unique;
      for (int x : n) {
        if (std::find(unique.begin(), unique.end(), x) == unique.end())
          unique.push_back(x);
      }
      lists[k + 1] = unique;
    }
    return lists;
  }
};

Successors Graph(std::initializer_list<std::vector<int>> rows) {
  return Successors(rows);
}

TEST(LayoutCoreTest, ChainAndIndependentNodesGetTheirLevelsAndSquare) {
  auto chain = QELPFVLayoutCore::ComputeLevels(Graph({{1}, {2}, {}}));
  EXPECT_EQ(chain.level, (std::vector<int>{0, 1, 2}));
  EXPECT_FALSE(chain.cyclic);
  EXPECT_FLOAT_EQ(QELPFVLayoutCore::ChartSide(chain.level), 100.0f);
  auto three = QELPFVLayoutCore::ComputeLevels(Graph({{}, {}, {}}));
  EXPECT_EQ(three.level, (std::vector<int>{0, 0, 0}));
  EXPECT_FLOAT_EQ(QELPFVLayoutCore::ChartSide(three.level), 150.0f);
}

TEST(LayoutCoreTest, CyclesAndUnequalBranchesThatMeetAgainAreReportedAtTheNodeMetAgain) {
  // A->B->D and A->C->E->D (A=0, B=1, C=2, D=3, E=4).
  auto diamond = QELPFVLayoutCore::ComputeLevels(Graph({{1, 2}, {3}, {4}, {}, {3}}));
  EXPECT_TRUE(diamond.cyclic);
  EXPECT_EQ(diamond.cyclicIndex, 3);
  // Equal branches meeting again are fine.
  auto even = QELPFVLayoutCore::ComputeLevels(Graph({{1, 2}, {3}, {3}, {}}));
  EXPECT_FALSE(even.cyclic);
  EXPECT_EQ(even.level, (std::vector<int>{0, 1, 1, 2}));
  // A true cycle names the node met again.
  auto cycle = QELPFVLayoutCore::ComputeLevels(Graph({{1}, {0}}));
  EXPECT_TRUE(cycle.cyclic);
  EXPECT_EQ(cycle.cyclicIndex, 0);
}

TEST(LayoutCoreTest, AChainStoredDownstreamFirstIsReportedCyclicLikeTheOrganiserDoes) {
  // C, B, A with A->B->C: B is raised twice through walks of growing length.
  auto reversed = QELPFVLayoutCore::ComputeLevels(Graph({{}, {0}, {1}}));
  EXPECT_FALSE(reversed.cyclic);
  auto longer = QELPFVLayoutCore::ComputeLevels(Graph({{}, {0}, {1}, {2}}));
  EXPECT_TRUE(longer.cyclic);
  EXPECT_EQ(longer.cyclicIndex, 0);
}

TEST(LayoutCoreTest, LevelsAreOrderedByThePreviousLevelNotByTheChildList) {
  // 0 -> 3, 1 -> 2: level 1 holds 2 and 3 in child order, but 0 comes first on level 0.
  Successors g = Graph({{3}, {2}, {}, {}});
  auto levels = QELPFVLayoutCore::ComputeLevels(g);
  auto order = QELPFVLayoutCore::ExchangeSortOrder(levels.level);
  auto lists = QELPFVLayoutCore::LevelLists(g, levels.level, order);
  ASSERT_EQ(lists.size(), 2u);
  EXPECT_EQ(lists[0], (std::vector<int>{0, 1}));
  EXPECT_EQ(lists[1], (std::vector<int>{3, 2}));
}

TEST(LayoutCoreTest, ExchangeSortIsNotStableAndTheFastOrderMatchesIt) {
  // Levels 1, 1, 0: the first 1 is carried over the second one.
  std::vector<int> level{1, 1, 0};
  EXPECT_EQ(QELPFVLayoutCore::ExchangeSortOrder(level), (std::vector<int>{2, 1, 0}));
  std::mt19937 rng(7);
  for (int round = 0; round < 2000; ++round) {
    std::vector<int> l(static_cast<size_t>(rng() % 40));
    const int spread = 1 + static_cast<int>(rng() % 8);
    for (int& v : l)
      v = static_cast<int>(rng() % static_cast<unsigned>(spread));
    Successors none(l.size());
    Literal literal(none);
    literal.level = l;
    ASSERT_EQ(QELPFVLayoutCore::ExchangeSortOrder(l), literal.Sort()) << "round " << round;
  }
}

// Random graphs shaped like lines (mostly forward flows, some branches) plus arbitrary ones
// (backward edges, cycles, duplicates), with shuffled child order.
Successors RandomGraph(std::mt19937& rng, int n, bool arbitrary) {
  Successors g(static_cast<size_t>(n));
  for (int i = 0; i < n; ++i) {
    int out = static_cast<int>(rng() % 3);
    for (int k = 0; k < out; ++k) {
      int t = arbitrary ? static_cast<int>(rng() % static_cast<unsigned>(n))
                        : i + 1 + static_cast<int>(rng() % 3);
      if (t < n && (arbitrary || t != i))
        g[static_cast<size_t>(i)].push_back(t);
    }
  }
  // Shuffle the child order, keeping the graph.
  std::vector<int> perm(static_cast<size_t>(n));
  for (int i = 0; i < n; ++i)
    perm[static_cast<size_t>(i)] = i;
  std::shuffle(perm.begin(), perm.end(), rng);
  Successors shuffled(static_cast<size_t>(n));
  for (int i = 0; i < n; ++i) {
    for (int t : g[static_cast<size_t>(i)])
      shuffled[static_cast<size_t>(perm[static_cast<size_t>(i)])].push_back(
          perm[static_cast<size_t>(t)]);
  }
  return shuffled;
}

TEST(LayoutCoreTest, MatchesTheLiteralStepsOnThousandsOfRandomGraphs) {
  std::mt19937 rng(2024);
  int cyclicSeen = 0, acyclicSeen = 0;
  for (int round = 0; round < 3000; ++round) {
    const int n = 1 + static_cast<int>(rng() % 30);
    Successors g = RandomGraph(rng, n, round % 3 == 0);
    Literal literal(g);
    literal.Levels();
    auto fast = QELPFVLayoutCore::ComputeLevels(g);
    ASSERT_EQ(fast.level, literal.level) << "round " << round;
    ASSERT_EQ(fast.cyclic, literal.cyclic) << "round " << round;
    ASSERT_EQ(fast.cyclicIndex, literal.cyclicIndex) << "round " << round;
    (fast.cyclic ? cyclicSeen : acyclicSeen)++;
    auto order = QELPFVLayoutCore::ExchangeSortOrder(fast.level);
    ASSERT_EQ(order, literal.Sort()) << "round " << round;
    ASSERT_EQ(QELPFVLayoutCore::LevelLists(g, fast.level, order), literal.Lists(order))
        << "round " << round;
  }
  // Both kinds were really exercised.
  EXPECT_GT(cyclicSeen, 100);
  EXPECT_GT(acyclicSeen, 100);
}

TEST(LayoutCoreTest, AChainOfAHundredThousandDoesNotOverflowTheStack) {
  const int n = 100000;
  Successors g(static_cast<size_t>(n));
  // Stored upstream first: the walk from the first node goes the whole way down in one go.
  for (int i = 0; i + 1 < n; ++i)
    g[static_cast<size_t>(i)].push_back(i + 1);
  auto levels = QELPFVLayoutCore::ComputeLevels(g);
  ASSERT_FALSE(levels.cyclic);
  for (int i = 0; i < n; ++i)
    ASSERT_EQ(levels.level[static_cast<size_t>(i)], i);
  EXPECT_FLOAT_EQ(QELPFVLayoutCore::ChartSide(levels.level), 50.0f * (n - 1));
}

TEST(LayoutCoreTest, TheLevelListsDoNotDependOnTheExchangeSortBeyondTheLowestLevel) {
  // The organiser sorts by level with a counting sort; the level lists must come out as the
  // literal exchange sort's do, on line-like and arbitrary graphs alike.
  std::mt19937 rng(77);
  int differentOrders = 0;
  for (int round = 0; round < 3000; ++round) {
    const int n = 1 + static_cast<int>(rng() % 40);
    Successors g = RandomGraph(rng, n, round % 3 == 0);
    Literal literal(g);
    literal.Levels();
    const std::vector<int> exchange = literal.Sort();
    const std::vector<int> stable = QELPFVLayoutCore::StableLevelOrder(literal.level);
    differentOrders += exchange != stable;
    ASSERT_EQ(QELPFVLayoutCore::LevelLists(g, literal.level, stable), literal.Lists(exchange))
        << "round " << round;
  }
  EXPECT_GT(differentOrders, 500) << "the two sorts really disagree on higher levels";
}

TEST(LayoutCoreTest, ALineStoredLaneByLaneGetsTheSameLevelListsFromBothSorts) {
  // Four lanes of 300 stations, stored lane after lane, exchanging parts every tenth station:
  // the case where the exchange sort's own order takes a quadratic number of swaps.
  const int lanes = 4;
  const int length = 300;
  Successors g(static_cast<size_t>(lanes * length));
  for (int lane = 0; lane < lanes; ++lane) {
    for (int step = 0; step + 1 < length; ++step) {
      auto& s = g[static_cast<size_t>(lane * length + step)];
      s.push_back(lane * length + step + 1);
      if (step % 10 == 9)
        s.push_back(((lane + 1) % lanes) * length + step + 1);
    }
  }
  const auto levels = QELPFVLayoutCore::ComputeLevels(g);
  ASSERT_FALSE(levels.cyclic);
  const auto exchange = QELPFVLayoutCore::ExchangeSortOrder(levels.level);
  const auto stable = QELPFVLayoutCore::StableLevelOrder(levels.level);
  EXPECT_NE(exchange, stable);
  EXPECT_EQ(QELPFVLayoutCore::LevelLists(g, levels.level, stable),
            QELPFVLayoutCore::LevelLists(g, levels.level, exchange));
}

}  // namespace
