#include <gtest/gtest.h>

#include <vector>

#include "VORAssert.h"
#include "VORDeferredDeletion.h"
#include "VORHandle.h"
#include "VORTrace.h"

namespace {

struct Captured {
  std::vector<std::string> lines;
  Captured() {
    VORTrace::SetSink([this](const std::string& channel, const std::string& line) {
      lines.push_back(channel + "|" + line);
    });
  }
  ~Captured() {
    VORTrace::SetSink({});
    VORTrace::SetEnabledChannels("");
  }
};

TEST(TraceTest, ChannelsAreOffUntilNamedAndKeepTheExactText) {
  Captured captured;
  VORTrace viewer("QELProductFlowViewerTrace", 0, "STDERR", 1024);
  VORTrace cmds("QELFpaViewerCmdsTrace", 0, "STDERR", 1024);
  VORTrace::SetEnabledChannels("none");
  viewer.TraPrint("QELFpaProductFlowViewer::DeleteWindow -->");
  EXPECT_TRUE(captured.lines.empty());
  VORTrace::SetEnabledChannels("QELFpaViewerCmdsTrace,Other");
  cmds.TraPrint(" \n  QELFpaProductFlowViewerCmd::BuildGraph -->");
  viewer.TraPrint("not shown");
  VORTrace::SetEnabledChannels("all");
  viewer.TraPrint("QELFpaProductFlowViewer::DeleteWindow <--");
  ASSERT_EQ(captured.lines.size(), 2u);
  EXPECT_EQ(captured.lines[0],
            "QELFpaViewerCmdsTrace| \n  QELFpaProductFlowViewerCmd::BuildGraph -->");
  EXPECT_EQ(captured.lines[1],
            "QELProductFlowViewerTrace|QELFpaProductFlowViewer::DeleteWindow <--");
}

std::vector<std::string> destroyed;

class Command : public VORBaseUnknown {
  VOR_DECLARE_CLASS(Command, VORBaseUnknown)
 public:
  Command(std::string name, Command* child = nullptr) : _name(std::move(name)), _child(child) {}
  ~Command() override {
    destroyed.push_back(_name);
    // A command releases what it owns through the same queue.
    VORCommandDeletion(_child);
  }

 private:
  std::string _name;
  Command* _child;
};

TEST(DeferredDeletionTest, ObjectsDieOnlyWhenTheQueueIsDrainedIncludingWhatTheyQueue) {
  destroyed.clear();
  auto* agent = new Command("agent");
  auto* command = new Command("command", agent);
  VORCommandDeletion(command);
  VORCommandDeletion(nullptr);
  EXPECT_TRUE(destroyed.empty());
  EXPECT_EQ(VORDeferredDeletion::Pending(), 1);
  EXPECT_EQ(VORDeferredDeletion::Drain(), 2);
  EXPECT_EQ(destroyed, (std::vector<std::string>{"command", "agent"}));
  EXPECT_EQ(VORDeferredDeletion::Pending(), 0);
}

TEST(DeferredDeletionTest, AHandleStillHeldKeepsTheObjectAlive) {
  destroyed.clear();
  auto* command = new Command("held");
  VORBaseUnknown_var holder(command);
  VORCommandDeletion(command);
  VORDeferredDeletion::Drain();
  EXPECT_TRUE(destroyed.empty());
  holder = NULL_var;
  EXPECT_EQ(destroyed, std::vector<std::string>{"held"});
}

TEST(AssertDeathTest, ReportsConditionModuleAndLine) {
  EXPECT_DEATH(
      VOR_ASSERT_AT(1 + 1 == 3, "QELFpaViewerCmds.m/src/QELFpaProductFlowViewerCmd", 269),
      "AssertionFailed:1 \\+ 1 == 3\nQELFpaViewerCmds.m/src/QELFpaProductFlowViewerCmd, line 269");
}

}  // namespace
