#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "InteractionTestObjects.h"
#include "VORCSO.h"
#include "VORCommand.h"
#include "VORISO.h"
#include "VORPathElement.h"

namespace {
// "+a +b" / "-a": one entry per notification, leaves named by the test.
class CSORecorder {
 public:
  explicit CSORecorder(VORCSO* cso) : _subscriber(Make<VORCommand>()) {
    _subscriber->AddCallback(cso->GetEventPublisher(), "VORCSOChangeNotification",
                             [this](VORBaseUnknown*, VORNotification* n, void*) { Record(n); });
  }
  void Name(VORBaseUnknown* object, const std::string& name) { _names.emplace_back(object, name); }
  std::vector<std::string> log;

 private:
  std::string NameOf(VORBaseUnknown* path) const {
    VORBaseUnknown* leaf = static_cast<VORPathElement*>(path)->GetLeaf();
    for (const auto& [object, name] : _names) {
      if (object == leaf)
        return name;
    }
    return "?";
  }
  void Record(VORNotification* n) {
    auto* change = dynamic_cast<VORCSOChangeNotification*>(n);
    ASSERT_NE(change, nullptr);
    std::string entry;
    for (const auto& p : change->GetAddedElements())
      entry += (entry.empty() ? "+" : " +") + NameOf(p);
    for (const auto& p : change->GetRemovedElements())
      entry += (entry.empty() ? "-" : " -") + NameOf(p);
    log.push_back(entry);
  }
  VORHandle<VORCommand> _subscriber;
  std::vector<std::pair<VORBaseUnknown*, std::string>> _names;
};
}  // namespace

TEST(PathElementTest, WalksFromTheLeafToTheRootAndFindsTheNearestElementOfAType) {
  auto level = Make<TestStation>("grouping");
  auto station = Make<TestStation>("station");
  auto rep = Make<TestThing>();
  VORListValVORBaseUnknown_var chain;
  chain.Append(VORBaseUnknown_var(level.get()));
  chain.Append(VORBaseUnknown_var(station.get()));
  chain.Append(VORBaseUnknown_var(rep.get()));
  auto path = Make<VORPathElement>(chain);

  path->InitToLeafElement();
  EXPECT_EQ(path->NextFatherElement(), rep.get());
  EXPECT_EQ(path->NextFatherElement(), station.get());
  EXPECT_EQ(path->NextFatherElement(), level.get());
  EXPECT_EQ(path->NextFatherElement(), nullptr);

  ITestStation_var found = path->SearchElement<ITestStation>();
  EXPECT_TRUE(found == station);
  auto bare = Make<VORPathElement>(rep.get());
  EXPECT_FALSE(bare->SearchElement<ITestStation>());
}

TEST(CSOTest, EveryChangeSendsOneNotificationWithTheAddedAndRemovedPathsInOrder) {
  auto cso = Make<VORCSO>();
  CSORecorder recorder(cso);
  auto a = Make<TestStation>("station");
  auto b = Make<TestStation>("station");
  recorder.Name(a.get(), "a");
  recorder.Name(b.get(), "b");

  EXPECT_TRUE(cso->AddElement(a.get()));
  EXPECT_FALSE(cso->AddElement(Make<VORPathElement>(a.get()).get()));  // an equal path
  VORListValVORBaseUnknown_var both;
  both.Append(VORBaseUnknown_var(b.get()));
  both.Append(VORBaseUnknown_var(a.get()));
  EXPECT_EQ(cso->AddElements(both), 1);
  EXPECT_EQ(cso->Locate(b.get()), 2);
  EXPECT_TRUE(cso->RemoveElement(a.get()));
  EXPECT_FALSE(cso->RemoveElement(a.get()));
  cso->Empty();
  cso->Empty();  // already empty: silent
  cso->AddElement(a.get());
  cso->Empty(0);  // asked to be silent

  EXPECT_EQ(recorder.log, (std::vector<std::string>{"+a", "+b", "-a", "-b", "+a"}));
  EXPECT_TRUE(cso->IsEmpty());
}

TEST(CSOTest, IterationAndLeavesFollowTheOrderOfSelection) {
  auto cso = Make<VORCSO>();
  auto a = Make<TestThing>();
  auto b = Make<TestThing>();
  cso->AddElement(b.get());
  cso->AddElement(a.get());
  cso->InitElementList();
  EXPECT_EQ(cso->NextElement()->GetLeaf(), b.get());
  EXPECT_EQ(cso->NextElement()->GetLeaf(), a.get());
  EXPECT_EQ(cso->NextElement(), nullptr);
  std::unique_ptr<VORListValVORBaseUnknown_var> leaves(cso->GetLeaves());
  ASSERT_EQ(leaves->Size(), 2);
  EXPECT_TRUE((*leaves)[1] == b);
}

TEST(ISOTest, HoldsEachModelOnceAndForgetsViewersOnRequest) {
  auto iso = Make<VORISO>();
  auto model = Make<TestThing>();
  auto viewer = Make<TestThing>();
  EXPECT_TRUE(iso->AddElement(model.get()));
  EXPECT_FALSE(iso->AddElement(model.get()));
  iso->AddViewer(viewer.get());
  iso->AddViewer(viewer.get());
  EXPECT_EQ(iso->GetViewers().size(), 1u);
  iso->RemoveViewer(viewer.get());
  EXPECT_TRUE(iso->GetViewers().empty());
  EXPECT_TRUE(iso->RemoveElement(model.get()));
  EXPECT_FALSE(iso->IsPresent(model.get()));
}

TEST(ISOTest, TwoSetsKeepTheOrderOfPlainListsOverManyRandomChangesAndHoldNoRemovedModel) {
  // Reference: each set's models in the order they were added, with removal by a linear scan.
  // Half the models keep their place themselves (they can do so in one set at a time), so a
  // model moves between the two ways of being filed as the sets take and drop it.
  VORISO_var sets[2] = {Make<VORISO>(), Make<VORISO>()};
  std::vector<VORBaseUnknown_var> objects;
  for (int i = 0; i < 40; ++i) {
    if (i % 2 == 0)
      objects.emplace_back(Make<TestThing>());
    else
      objects.emplace_back(Make<VORISOElement>());
  }
  std::vector<VORBaseUnknown*> reference[2];
  unsigned state = 4711;
  auto next = [&](unsigned n) {
    state = state * 1103515245u + 12345u;
    return (state >> 8) % n;
  };
  for (int step = 0; step < 6000; ++step) {
    const unsigned s = next(2);
    VORISO* iso = sets[s].get();
    std::vector<VORBaseUnknown*>& listed = reference[s];
    VORBaseUnknown* model = objects[next(40)].get();
    const auto at = std::find(listed.begin(), listed.end(), model);
    switch (next(7)) {
      case 0:
      case 1:
      case 2:
        EXPECT_EQ(iso->AddElement(model), at == listed.end());
        if (at == listed.end())
          listed.push_back(model);
        break;
      case 3:
      case 4:
      case 5:
        EXPECT_EQ(iso->RemoveElement(model), at != listed.end());
        if (at != listed.end())
          listed.erase(at);
        break;
      default:
        if (next(30) == 0) {
          iso->Empty();
          listed.clear();
        }
    }
    for (int t = 0; t < 2; ++t) {
      ASSERT_EQ(sets[t]->IsPresent(model),
                std::count(reference[t].begin(), reference[t].end(), model) == 1)
          << "step " << step;
    }
    if (next(4) != 0)
      continue;
    std::vector<VORBaseUnknown*> elements;
    for (const VORBaseUnknown_var& m : iso->GetElements())
      elements.push_back(m.get());
    ASSERT_EQ(elements, listed) << "step " << step;
  }
  // Held by the test, and by a set only while listed, even after the listing was read.
  (void)sets[0]->GetElements();
  for (const auto& object : objects) {
    for (VORISO_var& set : sets)
      set->RemoveElement(object.get());
    EXPECT_EQ(object->RefCount(), 1u);
  }
  EXPECT_EQ(sets[0]->GetElements().Size(), 0);
}

TEST(ISOTest, AModelOutlivesTheSetThatKeptItsPlace) {
  // The second set is likely made where the first was: it must not find the model listed.
  auto element = Make<VORISOElement>();
  {
    auto first = Make<VORISO>();
    EXPECT_TRUE(first->AddElement(element.get()));
  }
  auto second = Make<VORISO>();
  EXPECT_TRUE(second->AddElement(element.get()));
  EXPECT_FALSE(second->AddElement(element.get()));
  EXPECT_TRUE(second->IsPresent(element.get()));
}

TEST(CSOTest, TheLeafIndexAnswersLikeAPlainScanOverManyRandomChanges) {
  // Reference: the set's paths in order, compared by a linear scan.
  auto cso = Make<VORCSO>();
  std::vector<VORHandle<TestThing>> objects;
  for (int i = 0; i < 12; ++i)
    objects.push_back(Make<TestThing>());
  std::vector<std::pair<VORBaseUnknown*, VORBaseUnknown*>> reference;  // (father, leaf)
  auto referenceLocate = [&](VORBaseUnknown* father, VORBaseUnknown* leaf) {
    for (size_t i = 0; i < reference.size(); ++i) {
      if (reference[i].first == father && reference[i].second == leaf)
        return static_cast<int>(i) + 1;
    }
    return 0;
  };
  unsigned state = 12345;
  auto next = [&](unsigned n) {
    state = state * 1103515245u + 12345u;
    return (state >> 8) % n;
  };
  for (int step = 0; step < 3000; ++step) {
    VORBaseUnknown* father = objects[next(3)].get();
    VORBaseUnknown* leaf = objects[3 + next(9)].get();
    VORListValVORBaseUnknown_var chain;
    chain.Append(VORBaseUnknown_var(father));
    chain.Append(VORBaseUnknown_var(leaf));
    auto path = Make<VORPathElement>(chain);
    switch (next(5)) {
      case 0:
      case 1: {
        const bool added = cso->AddElement(path);
        EXPECT_EQ(added, referenceLocate(father, leaf) == 0);
        if (added)
          reference.emplace_back(father, leaf);
        break;
      }
      case 2: {
        const bool removed = cso->RemoveElement(path);
        const int at = referenceLocate(father, leaf);
        EXPECT_EQ(removed, at != 0);
        if (at != 0)
          reference.erase(reference.begin() + (at - 1));
        break;
      }
      case 3: {
        bool any = false;
        for (auto it = reference.begin(); it != reference.end();) {
          if (it->second == leaf) {
            it = reference.erase(it);
            any = true;
          } else {
            ++it;
          }
        }
        EXPECT_EQ(cso->RemoveElement(leaf), any);
        break;
      }
      default:
        if (next(20) == 0) {
          cso->Empty();
          reference.clear();
        }
    }
    ASSERT_EQ(cso->Locate(path), referenceLocate(father, leaf)) << "step " << step;
    int firstWithLeaf = 0;
    for (size_t i = 0; i < reference.size() && firstWithLeaf == 0; ++i) {
      if (reference[i].second == leaf)
        firstWithLeaf = static_cast<int>(i) + 1;
    }
    ASSERT_EQ(cso->Locate(leaf), firstWithLeaf) << "step " << step;
    ASSERT_EQ(cso->GetSize(), static_cast<int>(reference.size()));
  }
}
