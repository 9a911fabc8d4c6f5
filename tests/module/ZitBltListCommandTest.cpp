#include <string>
#include <vector>

#include "QELBaseScrollListZitBltRep.h"
#include "QELOutputListZitBltCmd.h"
#include "QELStatesInputLeafListZitBltCmd.h"
#include "QELStatesInputListZitBltCmd.h"
#include "QELStatesResourceListZitBltCmd.h"
#include "VORCommandHeader.h"
#include "VORSPPActivityNotification.h"
#include "ZitBltListTestSupport.h"

namespace {

// Opens the protected parts of a list command for the tests.
template <class Command>
class Probe : public Command {
 public:
  explicit Probe(VORBaseUnknown* owner) : Command(owner) {}
  using Command::GetAttributeValue;
  using Command::HandleEvent;
};

class ZitBltListCommandTest : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_NE(VORModuleLoader::LoadModule("QELZitBltModel"), nullptr);
    _live = VORBaseUnknown::LiveInstances();
    line = std::make_unique<ListTestLine>();
  }
  void TearDown() override {
    line.reset();
    VORDeferredDeletion::Drain();
    QELBaseListZitBltCmd::ForgetStatusBarConfigurationForTests();  // parsed once per process
    EXPECT_EQ(VORBaseUnknown::LiveInstances(), _live) << "leaked objects";
  }
  // A list command created by class name, as the configuration creates it.
  static VORHandle<QELBaseListZitBltCmd> Create(const char* className, VORBaseUnknown* owner) {
    auto header = VORCommandHeader_var::Adopt(new VORCommandHeader(
        className, "QELZitBltModel", className, owner, VORCommandHeader::Available));
    VORCommand* created = header->CreateCommand();
    auto* command = dynamic_cast<QELBaseListZitBltCmd*>(created);
    EXPECT_NE(command, nullptr) << className;
    return VORHandle<QELBaseListZitBltCmd>::Adopt(command);
  }
  // The list that command fills for owner: "<text>:<state>" per item.
  std::vector<std::string> Fill(const char* className, VORBaseUnknown* owner,
                                int* range = nullptr) {
    auto rep =
        VORHandle<QELBaseScrollListZitBltRep>::Adopt(new QELBaseScrollListZitBltRep(owner, 5));
    Create(className, owner)->UpdateList(rep.get());
    std::vector<std::string> lines;
    for (int i = 1; i <= rep->GetItems().Size(); ++i)
      lines.push_back(ItemText(rep->GetItems()[i]) + ":" + std::to_string(rep->GetItemState(i)));
    if (range != nullptr)
      *range = rep->GetScrollRange();
    return lines;
  }
  using Lines = std::vector<std::string>;

  std::unique_ptr<ListTestLine> line;
  long _live = 0;
};

TEST_F(ZitBltListCommandTest, OutputListsShowWhatAStationOrGroupingMakesAndHandsOn) {
  ListTestLine& l = *line;
  l.Output(l.s1, l.sub);    // consumed by S2 inside the group
  l.Output(l.s2, l.floor);  // handed on by the group
  l.Input(l.s2, l.sub);
  l.Output(l.group, l.bracket);
  int range = 0;
  EXPECT_EQ(Fill("QELOutputListZitBltCmd", l.s2, &range), (Lines{"Floor:0"}));
  EXPECT_EQ(range, 16);
  // The grouping's own output first, then what it hands on, marked.
  EXPECT_EQ(Fill("QELOutputListZitBltCmd", l.group, &range), (Lines{"Bracket:0", "Floor:1"}));
  EXPECT_EQ(range, 17);
  // A station's sub-results are not marked.
  VORBaseUnknown_var weld = l.Node(l.s3, "W", "BIWActivitySpotWelding");
  l.Output(weld, l.panel);
  EXPECT_EQ(Fill("QELOutputListZitBltCmd", l.s3), (Lines{"Panel:0"}));
  // Any other activity: an empty list that never scrolls.
  l.Output(weld, l.floor);
  EXPECT_EQ(Fill("QELOutputListZitBltCmd", weld, &range), Lines{});
  EXPECT_EQ(range, 15);
}

TEST_F(ZitBltListCommandTest, ResourceListsShowTheAssignedResourcesInOrder) {
  ListTestLine& l = *line;
  l.door().AssignResource(l.s1, l.fixture);
  l.door().AssignResource(l.s1, l.robot);
  EXPECT_EQ(Fill("QELStatesResourceListZitBltCmd", l.s1), (Lines{"Fixture:2", "Robot:2"}));
  EXPECT_EQ(Fill("QELStatesResourceListZitBltCmd", l.s2), Lines{});
}

TEST_F(ZitBltListCommandTest, LeafInputListsShowEachAssignedItemOnceThroughItsFirstInput) {
  ListTestLine& l = *line;
  VORBaseUnknown_var weld = l.Node(l.s3, "W", "BIWActivitySpotWelding");
  VORBaseUnknown_var first = l.Input(weld, l.panel);
  l.Input(weld, l.panel, false);       // the same item again
  l.Input(weld, l.bracket, false);     // an input whose item is not assigned
  l.door().AssignItem(weld, l.floor);  // an item assigned without input
  const Lines lines = Fill("QELStatesInputLeafListZitBltCmd", weld);
  EXPECT_EQ(lines, (Lines{"Panel:0"}));
  auto rep = VORHandle<QELBaseScrollListZitBltRep>::Adopt(new QELBaseScrollListZitBltRep(weld, 5));
  Create("QELStatesInputLeafListZitBltCmd", weld)->UpdateList(rep.get());
  ASSERT_EQ(rep->GetItems().Size(), 1);
  EXPECT_EQ(rep->GetItems()[1].Identity(), first.Identity()) << "the first input";
  // A refresh starts from an empty list.
  Create("QELStatesInputLeafListZitBltCmd", weld)->UpdateList(rep.get());
  EXPECT_EQ(rep->GetItems().Size(), 1);
}

TEST_F(ZitBltListCommandTest, FullInputListsAddWhatSubActivitiesTakeFromOutside) {
  ListTestLine& l = *line;
  // S1 makes Sub from Panel and Bracket; S2 makes Floor from Sub.
  l.Input(l.s1, l.panel);
  l.Input(l.s1, l.bracket);
  l.Output(l.s1, l.sub);
  l.Input(l.s2, l.sub);
  l.door().AssignItem(l.s2, l.floor);  // assigned without an input of its own
  l.Output(l.s2, l.floor);
  // The group takes Panel through an input of its own.
  l.Input(l.group, l.panel);
  EXPECT_EQ(Fill("QELStatesInputListZitBltCmd", l.group), (Lines{"Panel:1", "Bracket:0"}))
      << "Sub is made inside, Floor too, Panel is listed once";
  // A station without children: its inputs, then what it has assigned without one.
  EXPECT_EQ(Fill("QELStatesInputListZitBltCmd", l.s1), (Lines{"Panel:1", "Bracket:1"}));
  VORBaseUnknown_var clip = l.Product("Clip");
  l.door().AssignItem(l.s1, clip);
  EXPECT_EQ(Fill("QELStatesInputListZitBltCmd", l.s1), (Lines{"Panel:1", "Bracket:1", "Clip:0"}));
  // Assemblies are items too.
  VORBaseUnknown_var assembly;
  l.door().CreateMfgAssembly("Floor MA", assembly);
  l.Input(l.s3, assembly);
  EXPECT_EQ(Fill("QELStatesInputListZitBltCmd", l.s3), (Lines{"Floor MA:1"}));
}

TEST_F(ZitBltListCommandTest, EachCommandAcceptsExactlyItsKinds) {
  ListTestLine& l = *line;
  VORBaseUnknown_var assembly, input;
  l.door().CreateMfgAssembly("MA", assembly);
  input = l.Input(l.s1, l.panel);
  struct Son {
    const char* name;
    VORBaseUnknown* object;
  };
  const std::vector<Son> sons = {{"product", l.panel},  {"assembly", assembly},
                                 {"resource", l.robot}, {"input", input},
                                 {"activity", l.s2},    {"none", nullptr}};
  auto accepted = [&](auto* probe) {
    std::string text;
    for (const Son& son : sons) {
      text += std::string(text.empty() ? "" : " | ") + son.name + ":";
      for (int kind = 0; kind <= 45; ++kind) {
        if (probe->HandleEvent(static_cast<SPPModifyKind>(kind), son.object))
          text += " " + std::to_string(kind);
      }
    }
    probe->Release();
    return text;
  };
  const std::string output = " 3 17 18 29 39";
  EXPECT_EQ(accepted(new Probe<QELOutputListZitBltCmd>(l.s1)),
            "product:" + output + " | assembly:" + output + " | resource:" + output +
                " | input:" + output + " | activity:" + output + " | none:" + output);
  EXPECT_EQ(accepted(new Probe<QELStatesResourceListZitBltCmd>(l.s1)),
            "product: 15 16 | assembly: 15 16 | resource: 15 16 | input: 15 16 | activity: 15 16 "
            "| none: 15 16");
  // Resources are products ("ASMPRODUCT") too.
  EXPECT_EQ(accepted(new Probe<QELStatesInputLeafListZitBltCmd>(l.s1)),
            "product: 17 18 | assembly: | resource: 17 18 | input: | activity: | none:");
  EXPECT_EQ(accepted(new Probe<QELStatesInputListZitBltCmd>(l.s1)),
            "product: 17 18 29 | assembly: 17 18 29 | resource: 17 18 29 | input: 29 | "
            "activity: 29 | none: 29");
}

TEST_F(ZitBltListCommandTest, AttributeValuesAreWholeNumbersAndAHubZeroCountsAsNone) {
  ListTestLine& l = *line;
  auto* probe = new Probe<QELOutputListZitBltCmd>(l.s1);
  l.door().SetUserAttribute(l.s1, "Shift", VORAttributeValue::Long(0));
  l.door().SetUserAttribute(l.s1, "Rate", VORAttributeValue::Double(3.9));
  l.door().SetUserAttribute(l.s1, "Note", VORAttributeValue::String("7"));
  EXPECT_EQ(probe->GetAttributeValue("Shift"), 0) << "the activity's own zero stays";
  EXPECT_EQ(probe->GetAttributeValue("Rate"), 3);
  EXPECT_EQ(probe->GetAttributeValue("Note"), -1);
  EXPECT_EQ(probe->GetAttributeValue("Missing"), -1);
  probe->Release();

  // In a hub document the hub's attributes answer for the missing ones.
  auto hub = VORProcess_var::Adopt(VORProcess::CreateNew("Hub", "IPDDocEnv"));
  VORBaseUnknown_var station;
  hub->GetDoor().CreateNode(hub->GetRootProcess(), "BIWActivityStation", station);
  hub->GetDoor().SetHubAttribute(station, "Shift", VORAttributeValue::Long(0));
  hub->GetDoor().SetHubAttribute(station, "Invest", VORAttributeValue::Double(2.5));
  hub->GetDoor().SetHubAttribute(station, "Team", VORAttributeValue::Long(4));
  hub->GetDoor().SetUserAttribute(station, "Team", VORAttributeValue::Long(9));
  probe = new Probe<QELOutputListZitBltCmd>(station);
  EXPECT_EQ(probe->GetAttributeValue("Shift"), -1) << "a hub zero cannot be told from none";
  EXPECT_EQ(probe->GetAttributeValue("Invest"), 2);
  EXPECT_EQ(probe->GetAttributeValue("Team"), 9) << "the activity's own value first";
  EXPECT_EQ(probe->GetAttributeValue("Missing"), -1);
  probe->Release();
  station = NULL_var;
}

TEST_F(ZitBltListCommandTest, ACommandWithoutListOrWithoutInterfacesStaysQuiet) {
  ListTestLine& l = *line;
  for (const char* cls : {"QELOutputListZitBltCmd", "QELStatesResourceListZitBltCmd",
                          "QELStatesInputLeafListZitBltCmd", "QELStatesInputListZitBltCmd"}) {
    Create(cls, l.s1)->UpdateList(nullptr);
    // An owner that is no activity at all: an empty list.
    EXPECT_EQ(Fill(cls, l.panel), Lines{}) << cls;
  }
}

}  // namespace
