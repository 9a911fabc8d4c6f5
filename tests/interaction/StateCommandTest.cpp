#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "InteractionTestObjects.h"
#include "VORCSO.h"
#include "VORCommandEngine.h"
#include "VORDeferredDeletion.h"
#include "VORHSO.h"
#include "VORPathElementAgent.h"
#include "VORSelectionContext.h"
#include "VORStateCommand.h"

namespace {
class OKNote : public VORNotification {
  VOR_DECLARE_CLASS(OKNote, VORNotification)
};
class CancelNote : public VORNotification {
  VOR_DECLARE_CLASS(CancelNote, VORNotification)
};

// "First" takes one station of kind "station"; "More" collects further stations until the
// dialog's OK (action) or Cancel (no action).
class PickCommand : public VORStateCommand {
 public:
  PickCommand(VORCommand* dialog, std::vector<std::string>* log)
      : VORStateCommand("PickCommand"), _dialog(dialog), _log(log) {}

  void BuildGraph() override {
    _single = VORPathElementAgent_var::Adopt(new VORPathElementAgent("First"));
    _single->SetElementType<ITestStation>();
    _single->SetBehavior(VORAgentBehavior::SinglePick);
    _single->SetFilter(VORMethodFilter(this, &PickCommand::OnlyStations));
    _single->AddCSOClient(this);
    _multi = VORPathElementAgent_var::Adopt(new VORPathElementAgent("More"));
    _multi->SetElementType<ITestStation>();
    _multi->SetBehavior(8652800);
    _ok = VORDialogAgent_var::Adopt(new VORDialogAgent("OK"));
    _ok->AcceptOnNotify(_dialog, "OKNote");
    _cancel = VORDialogAgent_var::Adopt(new VORDialogAgent("Cancel"));
    _cancel->AcceptOnNotify(_dialog, "CancelNote");

    VORDialogState* first = GetInitialState("First");
    first->AddDialogAgent(_single);
    VORDialogState* more = AddDialogState("More");
    more->AddDialogAgent(_multi);
    more->AddDialogAgent(_ok);
    more->AddDialogAgent(_cancel);
    AddTransition(first, more, IsOutputSetCondition(_single), Action(this, &PickCommand::OnFirst));
    AddTransition(more, more, IsOutputSetCondition(_multi), Action(this, &PickCommand::OnMore));
    AddTransition(more, nullptr, IsOutputSetCondition(_cancel));
    AddTransition(more, nullptr, IsOutputSetCondition(_ok), Action(this, &PickCommand::OnOK));
  }

  bool OnlyStations(VORDialogAgent* agent, void*) {
    ITestStation_var station(agent->GetValue());
    return station && station->Kind() == "station";
  }
  bool OnFirst(void*) {
    _log->push_back("first");
    return true;
  }
  bool OnMore(void*) {
    std::unique_ptr<VORListValVORBaseUnknown_var> paths(_multi->GetListOfSelectedPaths());
    _log->push_back("more " + std::to_string(paths ? paths->Size() : 0));
    return refuseMore == 0 || --refuseMore < 0;
  }
  bool OnOK(void*) {
    _log->push_back("ok");
    return true;
  }
  int refuseMore = 0;

 private:
  VORCommand* _dialog;
  std::vector<std::string>* _log;
  VORPathElementAgent_var _single;
  VORPathElementAgent_var _multi;
  VORDialogAgent_var _ok;
  VORDialogAgent_var _cancel;
};

class StateCommandTest : public ::testing::Test {
 protected:
  void SetUp() override {
    VORSelectionContext::Set(cso, nullptr, hso, nullptr);
    _ends = VORCommandEngine::GetEventPublisher()->AddCallback(
        "VORCommandEndNotification",
        [this](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
          auto* end = static_cast<VORCommandEndNotification*>(n);
          ends.push_back(end->GetCommand()->GetName().str() +
                         (end->IsCancelled() ? " cancelled" : " done"));
        });
  }
  void TearDown() override {
    VORCommandEngine::CancelCurrent();
    VORCommandEngine::GetEventPublisher()->RemoveCallback(_ends);
    VORSelectionContext::Set(nullptr, nullptr, nullptr, nullptr);
    VORDeferredDeletion::Drain();
  }
  VORPathElement_var Pick(VORBaseUnknown* object) {
    auto path = Make<VORPathElement>(object);
    VORCommandEngine::OfferPath(path);
    return path;
  }
  PickCommand* StartPick() {
    auto* command = new PickCommand(dialog, &log);
    VORCommandEngine::Start(command);
    command->Release();  // the engine holds it now
    return command;
  }

  VORCSO_var cso = Make<VORCSO>();
  VORHSO_var hso = Make<VORHSO>();
  VORCommand_var dialog = Make<VORCommand>(nullptr, "dialog");
  std::vector<std::string> log;
  std::vector<std::string> ends;
  VORHandle<TestStation> s1 = Make<TestStation>("station");
  VORHandle<TestStation> s2 = Make<TestStation>("station");
  VORHandle<TestStation> loading = Make<TestStation>("loading");
  VORHandle<TestThing> thing = Make<TestThing>();

 private:
  VORCallbackId _ends = 0;
};
}  // namespace

TEST_F(StateCommandTest, TheFilteredSinglePickRefusesOtherTypesAndKindsAndTakesAStation) {
  PickCommand* command = StartPick();
  ASSERT_EQ(command->GetCurrentState()->GetName().str(), "First");
  Pick(thing);
  Pick(loading);
  EXPECT_TRUE(log.empty());
  EXPECT_TRUE(cso->IsEmpty());
  Pick(s1);
  EXPECT_EQ(log, (std::vector<std::string>{"first"}));
  EXPECT_EQ(command->GetCurrentState()->GetName().str(), "More");
  ASSERT_EQ(cso->GetSize(), 1);
  EXPECT_EQ(cso->GetElement(1)->GetLeaf(), s1.get());
}

TEST_F(StateCommandTest, RepeatedPicksJoinOneSelectionAndARepickMovesToTheEnd) {
  PickCommand* command = StartPick();
  Pick(s1);
  Pick(s2);
  Pick(s1);
  EXPECT_EQ(log, (std::vector<std::string>{"first", "more 1", "more 2"}));
  ASSERT_EQ(cso->GetSize(), 2);
  EXPECT_EQ(cso->GetElement(1)->GetLeaf(), s2.get());
  EXPECT_EQ(cso->GetElement(2)->GetLeaf(), s1.get());
  EXPECT_EQ(command->GetCurrentState()->GetName().str(), "More");
  EXPECT_EQ(hso->GetSize(), 2) << "picks are highlighted";
  command->Cancel(nullptr, nullptr);
  EXPECT_TRUE(hso->IsEmpty()) << "the highlight ends with the command";
  EXPECT_EQ(cso->GetSize(), 2) << "the selection stays";
}

TEST_F(StateCommandTest, OKRunsTheActionAndEndsCancelEndsWithoutItAndTheCommandIsReleased) {
  dialog->GetEventPublisher();
  const long before = VORBaseUnknown::LiveInstances();
  StartPick();
  Pick(s1);
  dialog->DispatchNotification(Make<OKNote>());
  cso->Empty();
  EXPECT_EQ(log, (std::vector<std::string>{"first", "ok"}));
  EXPECT_EQ(ends, (std::vector<std::string>{"PickCommand done"}));
  EXPECT_EQ(VORCommandEngine::Current(), nullptr);
  VORDeferredDeletion::Drain();
  EXPECT_EQ(VORBaseUnknown::LiveInstances(), before);

  log.clear();
  StartPick();
  Pick(s2);
  dialog->DispatchNotification(Make<CancelNote>());
  EXPECT_EQ(log, (std::vector<std::string>{"first"}));
  EXPECT_EQ(ends.back(), "PickCommand done");
}

TEST_F(StateCommandTest, DialogNotificationsOutsideTheAgentsStateFireNothing) {
  PickCommand* command = StartPick();
  dialog->DispatchNotification(Make<OKNote>());
  EXPECT_TRUE(ends.empty());
  Pick(s1);
  EXPECT_EQ(command->GetCurrentState()->GetName().str(), "More");
  EXPECT_TRUE(ends.empty()) << "the early OK must not be remembered";
}

TEST_F(StateCommandTest, ARefusingActionKeepsTheCommandInItsState) {
  PickCommand* command = StartPick();
  command->refuseMore = 1;
  Pick(s1);
  Pick(s2);
  Pick(s2);
  EXPECT_EQ(log, (std::vector<std::string>{"first", "more 1", "more 1"}));
  EXPECT_EQ(command->GetCurrentState()->GetName().str(), "More");
}

TEST_F(StateCommandTest, ACSOClientTakesWhatIsSelectedWhenTheCommandStarts) {
  cso->AddElement(loading.get());
  cso->AddElement(s2.get());
  PickCommand* command = StartPick();
  EXPECT_EQ(log, (std::vector<std::string>{"first"}));
  EXPECT_EQ(command->GetCurrentState()->GetName().str(), "More");
  EXPECT_EQ(cso->GetSize(), 2) << "taking the selection does not change it";
}

TEST_F(StateCommandTest, StartingAnotherCommandCancelsTheRunningOne) {
  StartPick();
  PickCommand* second = StartPick();
  EXPECT_EQ(ends, (std::vector<std::string>{"PickCommand cancelled"}));
  EXPECT_EQ(VORCommandEngine::Current(), second);
}

namespace {
// One state left at once, like a command that needs no input; counts its runs.
class OneShot : public VORStateCommand {
 public:
  OneShot(bool repeat, int* runs) : VORStateCommand("OneShot"), _repeat(repeat), _runs(runs) {}
  void BuildGraph() override {
    _agent = VORPathElementAgent_var::Adopt(new VORPathElementAgent("Any"));
    VORDialogState* st = GetInitialState("Default");
    if (_repeat) {
      st->AddDialogAgent(_agent);
      AddTransition(st, nullptr, IsOutputSetCondition(_agent), Action(this, &OneShot::Run));
    } else {
      AddTransition(st, nullptr, VORCondition{}, Action(this, &OneShot::Run));
    }
    SetRepeatMode(_repeat);
  }
  bool Run(void*) {
    ++*_runs;
    return true;
  }

 private:
  bool _repeat;
  int* _runs;
  VORPathElementAgent_var _agent;
};
}  // namespace

TEST_F(StateCommandTest, AnUnconditionalTransitionEndsTheCommandDuringActivation) {
  int runs = 0;
  auto* command = new OneShot(false, &runs);
  VORCommandEngine::Start(command);
  command->Release();
  EXPECT_EQ(runs, 1);
  EXPECT_EQ(ends, (std::vector<std::string>{"OneShot done"}));
}

TEST_F(StateCommandTest, RepeatModeStartsOverAfterTheFinalState) {
  int runs = 0;
  auto* command = new OneShot(true, &runs);
  VORCommandEngine::Start(command);
  command->Release();
  Pick(thing);
  Pick(s1);
  EXPECT_EQ(runs, 2);
  EXPECT_TRUE(ends.empty());
  EXPECT_EQ(command->GetCurrentState()->GetName().str(), "Default");
}

namespace {
// Like a command whose dialog has nothing to show: the action accepts the close agent of the
// next state itself, so the command ends as soon as it gets there.
class AcceptAhead : public VORStateCommand {
 public:
  explicit AcceptAhead(bool acceptAhead) : VORStateCommand("AcceptAhead"), _ahead(acceptAhead) {}
  void BuildGraph() override {
    _pick = VORPathElementAgent_var::Adopt(new VORPathElementAgent("Pick"));
    _close = VORDialogAgent_var::Adopt(new VORDialogAgent("Close"));
    VORDialogState* first = GetInitialState("initialState");
    first->AddDialogAgent(_pick);
    VORDialogState* close = AddDialogState("Close");
    close->AddDialogAgent(_close);
    AddTransition(first, close, IsOutputSetCondition(_pick), Action(this, &AcceptAhead::Show));
    AddTransition(close, nullptr, IsOutputSetCondition(_close));
  }
  bool Show(void*) {
    if (_ahead)
      _close->Accept();
    return true;
  }

 private:
  bool _ahead;
  VORPathElementAgent_var _pick;
  VORDialogAgent_var _close;
};
}  // namespace

TEST_F(StateCommandTest, AnAgentAcceptedBeforeItsStateIsCurrentFiresWhenTheStateIsEntered) {
  auto* command = new AcceptAhead(true);
  VORCommandEngine::Start(command);
  command->Release();
  Pick(thing);
  EXPECT_EQ(ends, (std::vector<std::string>{"AcceptAhead done"}));

  auto* waiting = new AcceptAhead(false);
  VORCommandEngine::Start(waiting);
  waiting->Release();
  Pick(thing);
  EXPECT_TRUE(waiting->IsRunning());
  EXPECT_EQ(waiting->GetCurrentState()->GetName().str(), "Close");
}

namespace {
// Collects stations with one repeated agent that takes the selection when it starts, like the
// grouping command of the viewer.
class CollectStations : public VORStateCommand {
 public:
  CollectStations() : VORStateCommand("CollectStations") {}
  void BuildGraph() override {
    _collect = VORPathElementAgent_var::Adopt(new VORPathElementAgent("Collect"));
    _collect->SetElementType<ITestStation>();
    _collect->SetBehavior(8652800);
    _collect->SetFilter(VORMethodFilter(this, &CollectStations::OnlyStations));
    _collect->AddCSOClient(this);
    VORDialogState* state = GetInitialState("Collect");
    state->AddDialogAgent(_collect);
    AddTransition(state, state, IsOutputSetCondition(_collect),
                  Action(this, &CollectStations::Again));
  }
  bool OnlyStations(VORDialogAgent* agent, void*) {
    ITestStation_var station(agent->GetValue());
    return station && station->Kind() == "station";
  }
  bool Again(void*) {
    _collect->Reset();
    return true;
  }

 private:
  VORPathElementAgent_var _collect;
};
}  // namespace

TEST_F(StateCommandTest, RepeatedPicksStartANewSelectionOnlyWhenTheAgentTookNoneOfTheOldOne) {
  auto leaves = [this] {
    std::vector<VORBaseUnknown*> list;
    for (int i = 1; i <= cso->GetSize(); ++i)
      list.push_back(cso->GetElement(i)->GetLeaf());
    return list;
  };
  auto start = [] {
    auto* command = new CollectStations();
    VORCommandEngine::Start(command);
    command->Release();
  };
  // Left selected by an earlier command, refused by this one: the first pick replaces it.
  cso->AddElement(loading.get());
  cso->AddElement(thing.get());
  start();
  EXPECT_EQ(cso->GetSize(), 2) << "starting changes nothing";
  Pick(s1);
  EXPECT_EQ(leaves(), (std::vector<VORBaseUnknown*>{s1.get()}));
  Pick(s2);
  EXPECT_EQ(leaves(), (std::vector<VORBaseUnknown*>{s1.get(), s2.get()}));
  VORCommandEngine::CancelCurrent();

  // Taken when the command starts: the picks join it.
  cso->Empty();
  cso->AddElement(s1.get());
  start();
  Pick(s2);
  EXPECT_EQ(leaves(), (std::vector<VORBaseUnknown*>{s1.get(), s2.get()}));
  VORCommandEngine::CancelCurrent();

  // A refused pick keeps the old selection until a pick is taken.
  cso->Empty();
  cso->AddElement(loading.get());
  start();
  Pick(thing);
  EXPECT_EQ(leaves(), (std::vector<VORBaseUnknown*>{loading.get()}));
  Pick(s2);
  EXPECT_EQ(leaves(), (std::vector<VORBaseUnknown*>{s2.get()}));
}
