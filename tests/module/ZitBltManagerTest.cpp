#include <map>

#include "QELBaseListZitBltCmd.h"
#include "QELEZitBltCBSubscriber.h"
#include "QELIUpdateManufAssly.h"
#include "QELIPertNode.h"
#include "QELIZitBltCBSubscriber.h"
#include "QELIZitBltMgr.h"
#include "QELZitBltRep.h"
#include "VORDocument.h"
#include "VORIModelEvents.h"
#include "VORISPPActivityModificationEvents.h"
#include "VORModelDoor.h"
#include "VORModify.h"
#include "VORModuleLoader.h"
#include "VORSPPActivityNotification.h"
#include "VORViewer.h"
#include "ZitBltTestSupport.h"

namespace {

const char* const kLocations[] = {"lefttop",     "leftmiddle",  "leftbottom",   "righttop",
                                  "rightmiddle", "rightbottom", "topleft",      "topmiddle",
                                  "topright",    "bottomleft",  "bottommiddle", "bottomright"};

std::string Config() {
  auto zitblt = [](const std::string& name, const std::string& location,
                   const std::string& update = "", const std::string& type = "QELZitBltRep") {
    std::string s = "<ZitBlt Name=\"" + name + "\" Type=\"" + type +
                    "\" LoadModule=\"QELZitBltVisu\" Location=\"" + location +
                    "\" IconFile=\"I_Test\">";
    if (!update.empty())
      s += "<UpdateData CmdName=\"" + update + "\" LoadModule=\"QELZitBltTestCmds\"/>";
    return s + "</ZitBlt>\n";
  };
  const std::string cmd = "QELTestListZitBltCmd";
  std::string xml = "<Config><ActivityZitBlt ActivityType=\"BIWActivityStation\">\n";
  for (const char* location : kLocations)
    xml += zitblt(std::string("at-") + location, location);
  xml += zitblt("centre", "Centre");
  xml += zitblt("Missing", "lefttop", "", "QELNoSuchRep");
  xml += zitblt("BIWStationStatusBars", "topmiddle", cmd);
  xml += zitblt("ProductOutput", "righttop");
  xml += "</ActivityZitBlt>\n<ActivityZitBlt ActivityType=\"BIWActivityGrouping\">\n";
  xml += zitblt("BIWStationStatusBars", "topmiddle", cmd);
  xml += zitblt("BIWGroupingStatusBars", "topright", cmd);
  xml += zitblt("ProductInput", "lefttop", cmd);
  xml += "</ActivityZitBlt>\n<ActivityZitBlt ActivityType=\"BIWActivityLoading\">\n";
  xml += zitblt("BIWStationStatusBars", "topmiddle");
  return xml + "</ActivityZitBlt></Config>\n";
}

class ZitBltManagerTest : public ::testing::Test {
 protected:
  void SetUp() override {
    _live = VORBaseUnknown::LiveInstances();
    ASSERT_NE(VORModuleLoader::LoadModule("QELZitBltModel"), nullptr);
    startup.WriteIcon("I_Test", 16, 8);
    startup.WriteConfig(Config());
    doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    root = doc->GetRootProcess();
    grouping = Node(root, "G", "BIWActivityGrouping", 0, 100);
    station = Node(grouping, "S", "BIWActivityStation", 0, 0);
    loading = Node(grouping, "L", "BIWActivityLoading", 50, 0);
    QELIPertNode_var(station)->SetSize(100, 40);
    viewer = VORHandle<VORViewer>::Adopt(new VORViewer(nullptr, "v", 0, 800, 500, 0));
    log = reinterpret_cast<std::vector<std::string>* (*)()>(
        VORModuleLoader::FindSymbol("QELZitBltTestCmds", "QELTestListZitBltLog"))();
    log->clear();
  }
  void TearDown() override {
    for (VORBaseUnknown_var* node : {&grouping, &station, &loading})
      Manager(*node)->RemoveZitBlts();
    grouping = station = loading = root = NULL_var;
    doc = NULL_var;
    viewer = NULL_var;
    VORDeferredDeletion::Drain();
    QELZitBltConfiguration::ForgetForTests();
    QELBaseListZitBltCmd::ForgetStatusBarConfigurationForTests();
    QELZitBltRep::ForgetIcons();
    EXPECT_EQ(VORBaseUnknown::LiveInstances(), _live) << "leaked objects";
  }
  VORBaseUnknown_var Node(VORBaseUnknown* father, const char* label, const char* type, double x,
                          double y) {
    VORBaseUnknown_var node;
    EXPECT_EQ(doc->GetDoor().CreateNode(father, type, node), S_OK);
    doc->GetDoor().SetLabel(node, VORUnicodeString(label));
    doc->GetDoor().SetPertPosition(node, true, x, y);
    return node;
  }
  static QELIZitBltMgr_var Manager(const VORBaseUnknown_var& node) {
    QELIZitBltMgr_var manager(node);
    EXPECT_TRUE(manager);
    return manager;
  }
  static std::vector<std::string> Names(const VORBaseUnknown_var& node) {
    VORListValVORUnicodeString* names = nullptr;
    Manager(node)->GetZitBltNames(names);
    std::vector<std::string> out;
    for (const VORUnicodeString& n : *names)
      out.push_back(n.ConvertToUTF8());
    delete names;
    return out;
  }
  static QELZitBltRep* Rep(const VORBaseUnknown_var& node, const std::string& name) {
    QELZitBltRep* rep = nullptr;
    Manager(node)->GetZitBlt(VORUnicodeString(name), &rep);
    return rep;
  }
  static VORMathPoint2D At(const VORBaseUnknown_var& node, const std::string& name) {
    VORMathPoint2D p{1e9, 1e9};
    if (QELZitBltRep* rep = Rep(node, name))
      rep->GetPoDPosition(p.x, p.y);
    return p;
  }
  // The grouping's and the station's ZitBlts, with the log of their builds forgotten.
  void BuildGroupingAndStation() {
    Manager(grouping)->BuildZitBltReps(viewer);
    Manager(station)->BuildZitBltReps(viewer);
    log->clear();
  }
  // A change of father's children (about the loading) broadcast on the root, as the model does.
  void Dispatch(VORBaseUnknown* father, SPPModifyKind kind) {
    auto n = VORHandle<VORSPPActivityNotification>::Adopt(
        new VORSPPActivityNotification(father, loading, kind));
    VORISPPActivityModificationEvents_var(root)->GetEventPublisher()->Dispatch(
        VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE(), n);
  }
  static void Move(const VORBaseUnknown_var& node, double x, double y) {
    QELIPertNode_var(node)->SetPosition(x, y);
  }

  ZitBltStartupDir startup;
  VORProcess_var doc;
  VORBaseUnknown_var root, grouping, station, loading;
  VORHandle<VORViewer> viewer;
  std::vector<std::string>* log = nullptr;
  long _live = 0;
};

TEST_F(ZitBltManagerTest, ZitBltsSitOnTheCornerOrEdgeMidpointNamedByTheirLocation) {
  ASSERT_EQ(Manager(station)->BuildZitBltReps(viewer), 1);
  // Configuration order; the class that cannot be loaded is left out.
  std::vector<std::string> expected;
  for (const char* location : kLocations)
    expected.push_back(std::string("at-") + location);
  expected.insert(expected.end(), {"centre", "BIWStationStatusBars", "ProductOutput"});
  EXPECT_EQ(Names(station), expected);

  // 100 x 40 node centred at (0, 0).
  const std::map<std::string, VORMathPoint2D> table = {
      {"lefttop", {-50, 20}},     {"topleft", {-50, 20}},     {"leftmiddle", {-50, 0}},
      {"leftbottom", {-50, -20}}, {"bottomleft", {-50, -20}}, {"righttop", {50, 20}},
      {"topright", {50, 20}},     {"rightmiddle", {50, 0}},   {"rightbottom", {50, -20}},
      {"bottomright", {50, -20}}, {"topmiddle", {0, 20}},     {"bottommiddle", {0, -20}},
  };
  for (const auto& [location, p] : table) {
    EXPECT_EQ(At(station, "at-" + location).x, p.x) << location;
    EXPECT_EQ(At(station, "at-" + location).y, p.y) << location;
    // Both bags carry the translation.
    double tx = 0, ty = 0;
    Rep(station, "at-" + location)->GetZitBltExpanded()->GetMatrix()->GetTranslation(tx, ty);
    EXPECT_EQ(tx, p.x);
    EXPECT_EQ(ty, p.y);
  }
  EXPECT_EQ(At(station, "centre").x, 0.0);
  EXPECT_EQ(At(station, "centre").y, 0.0);
}

TEST_F(ZitBltManagerTest, OffsetsAreHalfSizesInSinglePrecision) {
  Move(station, 0.1, 0.2);
  QELIPertNode_var(station)->SetSize(0.3, 0.7);
  Manager(station)->BuildZitBltReps(viewer);
  const VORMathPoint2D p = At(station, "at-righttop");
  EXPECT_EQ(p.x, 0.1 + static_cast<double>(static_cast<float>(0.15)));
  EXPECT_EQ(p.y, 0.2 + static_cast<double>(static_cast<float>(0.35)));
  EXPECT_NE(p.x, 0.1 + 0.15);
}

TEST_F(ZitBltManagerTest, StatusesAndAllOneWhenFreshZeroAfterRemoval) {
  QELIZitBltMgr_var manager = Manager(station);
  unsigned char status = 7;
  ASSERT_EQ(manager->GetZitBltStatus("All", status), S_OK);
  EXPECT_EQ(status, 1);
  manager->BuildZitBltReps(viewer);

  int announcements = 0;
  VOREventPublisher* publisher = VORIModelEvents_var(station)->GetEventPublisher();
  std::vector<VORCallbackId> ids;
  for (const char* kind : {"VORModify", "QELPertAppInfoNotify"})
    ids.push_back(publisher->AddCallback(
        kind, [&](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
          // The document's own note of the recorded visibility is not the manager's announcement.
          auto* modify = dynamic_cast<VORModify*>(n);
          if (modify == nullptr || modify->GetWhat() != "zitblt")
            ++announcements;
        }));
  EXPECT_EQ(manager->SetZitBltStatus("at-lefttop", 0), S_OK);
  EXPECT_FALSE(Rep(station, "at-lefttop")->GetZitBltBtn()->IsShown());
  EXPECT_EQ(manager->GetZitBltStatus("at-lefttop", status), S_OK);
  EXPECT_EQ(status, 0);
  // An unknown name fails but is still announced, and leaves the output alone.
  EXPECT_EQ(manager->SetZitBltStatus("nothing", 0), E_FAIL);
  EXPECT_EQ(announcements, 4);
  status = 7;
  EXPECT_EQ(manager->GetZitBltStatus("nothing", status), E_FAIL);
  EXPECT_EQ(status, 7);
  EXPECT_EQ(manager->SetZitBltStatus("All", 0), S_OK);
  manager->GetZitBltStatus("All", status);
  EXPECT_EQ(status, 0);
  EXPECT_TRUE(Rep(station, "at-righttop")->GetZitBltBtn()->IsShown())
      << "All is the overall status only: each ZitBlt keeps its own";
  manager->SetZitBltStatus("All", 1);
  EXPECT_FALSE(Rep(station, "at-lefttop")->GetZitBltBtn()->IsShown());
  for (VORCallbackId id : ids)
    publisher->RemoveCallback(id);

  // A hidden ZitBlt stays hidden when its reps are rebuilt.
  manager->BuildZitBltReps(viewer);
  EXPECT_FALSE(Rep(station, "at-lefttop")->GetZitBltBtn()->IsShown());

  EXPECT_EQ(manager->RemoveZitBlts(), S_OK);
  manager->GetZitBltStatus("All", status);
  EXPECT_EQ(status, 0);
  QELZitBltRep* rep = Rep(station, "at-lefttop");
  EXPECT_EQ(rep, nullptr);
  EXPECT_EQ(manager->GetZitBlt("at-lefttop", nullptr), E_FAIL);
  EXPECT_FALSE(QELIZitBltCBSubscriber_var(station)->IsSubscribed());
  // A later build comes back from the cached configuration, with the visibility that the
  // document keeps.
  manager->BuildZitBltReps(viewer);
  EXPECT_EQ(Names(station).size(), 15u);
  EXPECT_FALSE(Rep(station, "at-lefttop")->GetZitBltBtn()->IsShown());
  EXPECT_TRUE(Rep(station, "at-righttop")->GetZitBltBtn()->IsShown());
}

TEST_F(ZitBltManagerTest, ZitBltsFollowNodeMovesAndKeepTheirRelativePlaceOnResize) {
  QELIZitBltMgr_var manager = Manager(station);
  manager->BuildZitBltReps(viewer);  // at (0, 0): counts as never placed
  Move(station, 30, 5);
  manager->UpdateZitBltPositions();  // only records the geometry
  EXPECT_EQ(At(station, "at-bottommiddle").x, 0.0);
  EXPECT_EQ(At(station, "at-bottommiddle").y, -20.0);
  manager->RemoveZitBlts();
  Move(station, 10, 0);
  manager->BuildZitBltReps(viewer);
  Move(station, 40, 8);
  manager->UpdateZitBltPositions();
  EXPECT_EQ(At(station, "at-bottommiddle").x, 40.0);
  EXPECT_EQ(At(station, "at-bottommiddle").y, -12.0);
  // On the left edge (-10 = 40 - 50) before the resize, on the new left edge after it.
  EXPECT_EQ(At(station, "at-lefttop").x, -10.0);
  QELIPertNode_var(station)->SetSize(200, 40);
  manager->UpdateZitBltPositions();
  EXPECT_DOUBLE_EQ(At(station, "at-lefttop").x, -60.0);
  EXPECT_DOUBLE_EQ(At(station, "at-lefttop").y, 28.0);
  EXPECT_DOUBLE_EQ(At(station, "at-rightmiddle").x, 140.0);
  // The limits follow the node: its rectangle widened by half the 4 x 2 button (min x narrowed).
  double a = 0, b = 0, c = 0, d = 0;
  Rep(station, "at-lefttop")->GetPositioningLimits(a, b, c, d);
  EXPECT_EQ(a, -62.0);
  EXPECT_EQ(c, 142.0);
}

TEST_F(ZitBltManagerTest, StatusBarRefreshClimbsToTheParentOnlyWithAnUpdateCommand) {
  Manager(grouping)->BuildZitBltReps(viewer);
  Manager(station)->BuildZitBltReps(viewer);
  Manager(loading)->BuildZitBltReps(viewer);
  // Each command was handed its rep once, at the build (the reps here show no list).
  EXPECT_EQ(*log,
            (std::vector<std::string>{"G/BIWStationStatusBars/none", "G/BIWGroupingStatusBars/none",
                                      "G/ProductInput/none", "S/BIWStationStatusBars/none"}));
  log->clear();
  Manager(station)->UpdateZitBlt("BIWStationStatusBars");
  EXPECT_EQ(*log,
            (std::vector<std::string>{"S/BIWStationStatusBars/none", "G/BIWStationStatusBars/none",
                                      "G/BIWGroupingStatusBars/none"}));
  log->clear();
  Manager(station)->UpdateZitBlt("ProductOutput");         // no update command
  Manager(loading)->UpdateZitBlt("BIWStationStatusBars");  // a status bar without command
  EXPECT_TRUE(log->empty());
  Manager(grouping)->UpdateZitBlt("ProductInput");  // not a status bar: stays here
  EXPECT_EQ(*log, std::vector<std::string>{"G/ProductInput/none"});
  log->clear();
  Manager(grouping)->UpdateAllZitBlts();
  EXPECT_EQ(*log,
            (std::vector<std::string>{"G/BIWStationStatusBars/none", "G/BIWGroupingStatusBars/none",
                                      "G/ProductInput/none"}));
}

TEST_F(ZitBltManagerTest, SubscriberPassesOnlyItsOwnActivitysChangesUnlessMuted) {
  BuildGroupingAndStation();
  Dispatch(station, SPPResourceAssigned);  // a kind the base command does not handle
  EXPECT_TRUE(log->empty());
  Dispatch(station, SPPItemAssigned);  // the station's one command refreshes it and its parents
  EXPECT_EQ(*log, (std::vector<std::string>{
                      "S/BIWStationStatusBars/none", "G/BIWStationStatusBars/none",
                      "G/BIWGroupingStatusBars/none", "G/BIWStationStatusBars/none"}));
  log->clear();
  QELIZitBltCBSubscriber_var subscriber(station);
  subscriber->SetCallbacksSuspended(true);
  Dispatch(station, SPPItemAssigned);
  EXPECT_TRUE(log->empty());
  subscriber->SetCallbacksSuspended(false);
  QELBaseListZitBltCmd* command = nullptr;
  EXPECT_EQ(subscriber->GetUpdateCommand("ProductOutput", &command), E_FAIL);
  EXPECT_EQ(subscriber->GetUpdateCommand("BIWStationStatusBars", nullptr), E_FAIL);
}

TEST_F(ZitBltManagerTest, UnassignmentsRefreshTwiceAndADeletedOwnerEndsItsCommands) {
  BuildGroupingAndStation();
  const std::vector<std::string> once = {
      "S/BIWStationStatusBars/none", "G/BIWStationStatusBars/none", "G/BIWGroupingStatusBars/none",
      "G/BIWStationStatusBars/none"};
  Dispatch(station, SPPItemUnassigned);
  std::vector<std::string> twice = once;
  twice.insert(twice.end(), once.begin(), once.end());
  EXPECT_EQ(*log, twice);
  log->clear();

  // The station's deletion (kinds 3 on the grouping, then 8 on the station) ends the station's
  // command; the subscriber forgets it and nobody releases it twice.
  QELIZitBltCBSubscriber_var subscriber(station);
  QELBaseListZitBltCmd* command = nullptr;
  ASSERT_EQ(subscriber->GetUpdateCommand("BIWStationStatusBars", &command), S_OK);
  VORHandle<QELBaseListZitBltCmd> held(command);
  ASSERT_EQ(doc->GetDoor().RemoveNode(station), S_OK);
  EXPECT_EQ(subscriber->GetUpdateCommand("BIWStationStatusBars", &command), E_FAIL);
  log->clear();
  held->OnActivityCallback(
      "", nullptr,
      VORHandle<VORSPPActivityNotification>::Adopt(
          new VORSPPActivityNotification(station, station, SPPActivityDeleted)),
      nullptr, 0);  // a second end changes nothing
  held = NULL_var;
  VORDeferredDeletion::Drain();
  Manager(station)->UpdateZitBlt("BIWStationStatusBars");
  EXPECT_TRUE(log->empty());
  EXPECT_EQ(subscriber->Unsubscribe(), S_OK);
}

TEST_F(ZitBltManagerTest, AnAssemblyUpdateRefreshesWhileMutedAndLeavesTheFlagClearedElsewhere) {
  BuildGroupingAndStation();
  QELIZitBltCBSubscriber_var subscriber(station);
  QELIUpdateManufAssly_var update(root);
  subscriber->SetCallbacksSuspended(true);
  update->SetUpdateInProgress(true);
  // Only the loading's change: no command cares, yet the station's subscriber heard of another
  // activity during the update and leaves the flag cleared.
  Dispatch(loading, SPPItemAssigned);
  EXPECT_TRUE(log->empty());
  EXPECT_FALSE(subscriber->AreCallbacksSuspended());
  // Its own change refreshes, and the flag it found is put back.
  subscriber->SetCallbacksSuspended(true);
  QELBaseListZitBltCmd* command = nullptr;
  ASSERT_EQ(subscriber->GetUpdateCommand("BIWStationStatusBars", &command), S_OK);
  VORHandle<VORSPPActivityNotification> own = VORHandle<VORSPPActivityNotification>::Adopt(
      new VORSPPActivityNotification(station, loading, SPPItemAssigned));
  dynamic_cast<QELEZitBltCBSubscriber*>(subscriber.get())
      ->OnViewsChange(VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE(), own,
                      nullptr, 0);
  EXPECT_EQ(log->size(), 4u);
  EXPECT_TRUE(subscriber->AreCallbacksSuspended());
  // Without an update, muted means muted.
  update->SetUpdateInProgress(false);
  log->clear();
  Dispatch(station, SPPItemAssigned);
  EXPECT_TRUE(log->empty());
  subscriber->SetCallbacksSuspended(false);
}

TEST_F(ZitBltManagerTest, MissingConfigurationGivesNoZitBltsUntilTheFileAppears) {
  std::filesystem::remove(startup.Path() / "zitbltcfg.xml");
  QELZitBltConfiguration::ForgetForTests();
  // The bundled resources are on the path too: hide them for this test.
  setenv("VORStartupPath", startup.Path().c_str(), 1);
  EXPECT_TRUE(Names(station).empty());
  Manager(station)->RemoveZitBlts();
  startup.WriteConfig(Config());
  Manager(station)->BuildZitBltReps(viewer);
  EXPECT_EQ(Names(station).size(), 15u);
}

// Changes are dispatched on the root keyed by the activity whose children changed; every
// subscriber also hears a dispatch without key. Both must leave the same trace.
TEST_F(ZitBltManagerTest, KeyedChangesReachOneSubscriberAndMuteAsABroadcastWould) {
  const char* views = VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE();
  VOREventPublisher* publisher = VORISPPActivityModificationEvents_var(root)->GetEventPublisher();
  QELIZitBltCBSubscriber_var subscriber(station);
  QELIUpdateManufAssly_var update(root);
  struct Trace {
    std::vector<std::string> log;
    bool suspended;
    bool operator==(const Trace&) const = default;
  };
  auto run = [&](bool keyed, VORBaseUnknown* father, bool muted, bool assemblyUpdate) {
    log->clear();
    subscriber->SetCallbacksSuspended(muted);
    update->SetUpdateInProgress(assemblyUpdate);
    auto n = VORHandle<VORSPPActivityNotification>::Adopt(
        new VORSPPActivityNotification(father, loading, SPPItemAssigned));
    if (keyed)
      publisher->DispatchKeyed(VORBaseUnknown_var(father).Identity(), views, n);
    else
      publisher->Dispatch(views, n);
    Trace t{*log, subscriber->AreCallbacksSuspended()};
    update->SetUpdateInProgress(false);
    subscriber->SetCallbacksSuspended(false);
    return t;
  };
  auto compareAll = [&](const char* setting) {
    for (VORBaseUnknown* father : {station.get(), grouping.get(), loading.get(), root.get()})
      for (bool muted : {false, true})
        for (bool assemblyUpdate : {false, true})
          EXPECT_EQ(run(true, father, muted, assemblyUpdate),
                    run(false, father, muted, assemblyUpdate))
              << setting << ", muted " << muted << ", assembly update " << assemblyUpdate;
  };

  Manager(station)->BuildZitBltReps(viewer);
  compareAll("the station alone");
  // Alone on the level, the station's subscriber restores the mute after its own change...
  EXPECT_EQ(run(true, station, true, true).suspended, true);
  EXPECT_FALSE(run(true, station, true, true).log.empty());
  // ...but the station's subscriber, which a change of another activity no longer reaches, would
  // have left it cleared: so is it.
  EXPECT_FALSE(run(true, grouping, true, true).suspended);
  EXPECT_TRUE(run(true, grouping, true, false).suspended);

  Manager(grouping)->BuildZitBltReps(viewer);
  Manager(loading)->BuildZitBltReps(viewer);
  compareAll("three activities");
  EXPECT_EQ(publisher->KeyedCallbackCount(station.Identity(), views), 1);
  // The other subscribers heard of another activity's change: the mute is left cleared.
  Trace t = run(true, station, true, true);
  EXPECT_FALSE(t.suspended);
  EXPECT_EQ(t.log.front(), "S/BIWStationStatusBars/none");
  EXPECT_FALSE(run(true, root, true, true).suspended);
  EXPECT_TRUE(run(true, root, true, false).suspended);

  Manager(grouping)->RemoveZitBlts();
  Manager(loading)->RemoveZitBlts();
  compareAll("the station alone again");
  EXPECT_TRUE(run(true, station, true, true).suspended);
  Manager(station)->RemoveZitBlts();
  EXPECT_EQ(publisher->CallbackCount(), 0) << "the level's callbacks go with its last subscriber";
}

TEST_F(ZitBltManagerTest, AModelChangeCostsTheSameCallbacksHoweverManyActivitiesListen) {
  VORModelDoor& door = doc->GetDoor();
  VORBaseUnknown_var first, second;
  ASSERT_EQ(door.CreateProduct(doc->GetRootProduct(), "Floor", first), S_OK);
  ASSERT_EQ(door.CreateProduct(doc->GetRootProduct(), "Roof", second), S_OK);
  Manager(station)->BuildZitBltReps(viewer);
  auto assign = [&](VORBaseUnknown* item) {
    log->clear();
    const unsigned long long before = VOREventPublisher::CallbacksRun();
    EXPECT_EQ(door.AssignItem(station, item), S_OK);
    return VOREventPublisher::CallbacksRun() - before;
  };
  const unsigned long long alone = assign(first);
  EXPECT_EQ(log->front(), "S/BIWStationStatusBars/none");
  Manager(grouping)->BuildZitBltReps(viewer);
  Manager(loading)->BuildZitBltReps(viewer);
  EXPECT_EQ(assign(second), alone);

  // A list command's own callback is filed under its owner as well.
  QELBaseListZitBltCmd* command = nullptr;
  ASSERT_EQ(QELIZitBltCBSubscriber_var(grouping)->GetUpdateCommand("ProductInput", &command), S_OK);
  command->AddCallBacks();
  const char* views = VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE();
  VOREventPublisher* publisher = VORISPPActivityModificationEvents_var(root)->GetEventPublisher();
  EXPECT_EQ(publisher->KeyedCallbackCount(grouping.Identity(), views), 2);
  EXPECT_EQ(door.UnassignItem(station, second), S_OK);
  EXPECT_FALSE(log->empty());
  for (const std::string& line : *log)
    EXPECT_NE(line, "G/ProductInput/none") << "the grouping's command heard the station's change";
  EXPECT_TRUE(command->RemoveCallbacks());
  EXPECT_FALSE(command->RemoveCallbacks());
  EXPECT_EQ(publisher->KeyedCallbackCount(grouping.Identity(), views), 1);
}

}  // namespace
