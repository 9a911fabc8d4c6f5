#include <gtest/gtest.h>

#include "InteractionTestObjects.h"
#include "VORCommandEngine.h"
#include "VORCommandHeader.h"
#include "VORDeferredDeletion.h"
#include "VORWorkbench.h"
#include "TempDir.h"

TEST(CommandHeaderTest, LoadsACommandClassFromAModuleWithItsArgument) {
  auto argument = Make<TestThing>();
  auto header = Make<VORCommandHeader>("Mod", "InteractionTestModule", "ModuleCommand", argument);
  const unsigned long refsBefore = argument->RefCount();
  VORCommand_var command = VORCommand_var::Adopt(header->CreateCommand());
  ASSERT_TRUE(command) << header->LastError();
  EXPECT_TRUE(command->IsAKindOf("ModuleCommand"));
  EXPECT_EQ(argument->RefCount(), refsBefore + 1) << "the command keeps its argument";
}

TEST(CommandHeaderTest, UnknownModulesClassesAndNonCommandsGiveNull) {
  struct Case {
    const char* module;
    const char* className;
  } cases[] = {{"NoSuchModule", "ModuleCommand"},
               {"InteractionTestModule", "NoSuchClass"},
               {"InteractionTestModule", "NotACommand"},
               {"InteractionTestModule", ""},
               {"../escape", "ModuleCommand"}};
  const long before = VORBaseUnknown::LiveInstances();
  for (const Case& c : cases) {
    auto header = Make<VORCommandHeader>("x", c.module, c.className);
    EXPECT_EQ(header->CreateCommand(), nullptr) << c.module << "/" << c.className;
    EXPECT_FALSE(header->LastError().empty());
  }
  EXPECT_EQ(VORBaseUnknown::LiveInstances(), before) << "a refused object must not leak";
}

TEST(CommandHeaderTest, HostCommandsAreFoundByIdAndRespectAvailability) {
  int activations = 0;
  class Counting : public VORCommand {
   public:
    explicit Counting(int* n) : _n(n) {}
    VORStatusChangeRC Activate(VORCommand*, VORNotification*) override {
      ++*_n;
      return VORStatusChangeRCCompleted;
    }
    int* _n;
  };
  VORCommandHeader::RegisterHostClass("CountingCmd",
                                      [&](VORBaseUnknown*) { return new Counting(&activations); });
  auto header = Make<VORCommandHeader>("TestTile", "", "CountingCmd");
  VORCommandHeader::Declare(header);
  ASSERT_EQ(VORCommandHeader::Find("TestTile"), header.get());
  EXPECT_EQ(VORCommandHeader::Find("NoSuchHeader"), nullptr);

  EXPECT_NE(VORCommandHeader::Find("TestTile")->StartCommand(), nullptr);
  EXPECT_EQ(activations, 1);
  EXPECT_EQ(VORCommandEngine::Current(), nullptr) << "a plain command ends after Activate";
  header->BecomeUnavailable();
  EXPECT_EQ(header->StartCommand(), nullptr);
  EXPECT_EQ(activations, 1);
  VORCommandHeader::Undeclare("TestTile");
  VORDeferredDeletion::Drain();
}

TEST(WorkbenchTest, ReadsCommandsFromAFileAndRefusesAMalformedOneWhole) {
  TempDir dir;
  VORWorkbench::Clear();
  const std::string good = dir.Write("good.txt",
                                     "# id | title | icon | module | class\n"
                                     "Mod | Module command | I_Mod | InteractionTestModule | "
                                     "ModuleCommand\n"
                                     "\n"
                                     "Other|Other||Somewhere|OtherCmd\n");
  std::string error;
  ASSERT_TRUE(VORWorkbench::LoadFile(good, &error)) << error;
  ASSERT_EQ(VORWorkbench::Commands().size(), 2u);
  EXPECT_EQ(VORWorkbench::Find("Mod")->title, "Module command");
  EXPECT_EQ(VORWorkbench::Find("Other")->icon, "");
  // Only commands whose module exports their factory count as installed.
  EXPECT_TRUE(VORWorkbench::IsInstalled(*VORWorkbench::Find("Mod")));
  EXPECT_FALSE(VORWorkbench::IsInstalled(*VORWorkbench::Find("Other")));
  EXPECT_FALSE(VORWorkbench::IsInstalled(
      VORWorkbenchCommand{"X", "", "", "InteractionTestModule", "NoSuchCommand"}));

  const std::string bad = dir.Write("bad.txt", "New | t | i | m | c\nBroken | only three | x\n");
  EXPECT_FALSE(VORWorkbench::LoadFile(bad, &error));
  EXPECT_NE(error.find(":2:"), std::string::npos) << error;
  EXPECT_EQ(VORWorkbench::Find("New"), nullptr);

  VORHandle<VORCommandHeader> header =
      VORHandle<VORCommandHeader>::Adopt(VORWorkbench::CreateHeader("Mod"));
  ASSERT_TRUE(header);
  VORCommand_var command = VORCommand_var::Adopt(header->CreateCommand());
  EXPECT_TRUE(command);
  EXPECT_EQ(VORWorkbench::CreateHeader("Nope"), nullptr);
  VORWorkbench::Clear();
}
