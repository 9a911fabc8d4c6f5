// The pick-copy story once more, as a script run by the pfv program.
#include <gtest/gtest.h>

#include "RunProgram.h"

#include <cstdio>
#include <cstdlib>
#include <string>

#include "SampleLine.h"
#include "TempDir.h"
#include "VORFileIO.h"

TEST(ScriptScenarioTest, ThePickCopyStoryAsAScriptPrintsWhatAPlannerChecks) {
  TempDir dir;
  const std::string document = dir.Path() + "/line.pprx";
  ASSERT_EQ(SaveSampleLine(document), "");
  ::setenv("SCENARIO_DOC", document.c_str(), 1);
  ::setenv("SCENARIO_DATA", SCENARIO_DATA, 1);
  ExpectScriptPrints(PFV_BINARY, SCENARIO_DATA "/pick_and_copy.pfvs",
                     SCENARIO_DATA "/pick_and_copy.expected",
                     {{document, "SCENARIO_DOC"}, {SCENARIO_DATA, "SCENARIO_DATA"}});

  const std::string bad = dir.Write("bad.pfvs", "open ${SCENARIO_DOC}\nstart NoSuchCommand\n");
  int status = 0;
  const std::string output =
      RunProgram(std::string(PFV_BINARY) + " script " + bad + " 2>&1", status);
  EXPECT_NE(output.find("line 2: error: unknown command \"NoSuchCommand\""), std::string::npos)
      << output;
  EXPECT_NE(status, 0);
}

TEST(ScriptScenarioTest, DraggingListLinesOfTheSampleLineMovesWhatIsAllowedAndUndoesIt) {
  TempDir dir;
  const char* examples = std::getenv("PFV_EXAMPLES");
  ASSERT_NE(examples, nullptr) << "ctest gives the examples folder";
  ::setenv("SCENARIO_OUT", dir.Path().c_str(), 1);
  ExpectScriptPrints(PFV_BINARY, SCENARIO_DATA "/drag_item.pfvs",
                     SCENARIO_DATA "/drag_item.expected",
                     {{examples, "PFV_EXAMPLES"}, {dir.Path(), "SCENARIO_OUT"}});
  std::string error;
  // The undone document is the one the planner started from, byte for byte.
  std::string before, undone;
  ASSERT_TRUE(VORReadFile(dir.Path() + "/before.pprx", before, error)) << error;
  ASSERT_TRUE(VORReadFile(dir.Path() + "/undone.pprx", undone, error)) << error;
  EXPECT_EQ(undone, before);
}
