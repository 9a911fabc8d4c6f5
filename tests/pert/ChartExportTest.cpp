#include <cstdlib>
#include <regex>

#include "PertTestSupport.h"
#include "QELPertChart.h"
#include "QELPertViewer.h"
#include "VORIGENode.h"
#include "VORISPPFlowMgt.h"
#include "VORSVGWriter.h"

namespace {

int Count(const std::string& text, const std::string& pattern) {
  const std::regex re(pattern);
  return static_cast<int>(
      std::distance(std::sregex_iterator(text.begin(), text.end(), re), std::sregex_iterator()));
}

TEST(ChartExportTest, TheExampleLineBecomesOneBoxPerChildAndOneArrowPerFlowBetweenThem) {
  const long live = VORBaseUnknown::LiveInstances();
  {
    const char* examples = std::getenv("PFV_EXAMPLES");
    ASSERT_NE(examples, nullptr);
    std::string error;
    auto doc =
        VORProcess_var::Adopt(VORProcess::Load(std::string(examples) + "/underbody.pprx", error));
    ASSERT_TRUE(doc) << error;
    VORBaseUnknown_var root = doc->GetRootProcess();
    // What the chart must show, counted from the model directly.
    VORListValVORBaseUnknown_var* children = nullptr;
    ASSERT_EQ(VORIGENode_var(root)->GetChildren(children), S_OK);
    int flows = 0;
    for (const VORBaseUnknown_var& child : *children) {
      VORListValVORBaseUnknown_var* next = nullptr;
      VORISPPFlowMgt_var(child)->GetNextActivities(next, "");
      for (const VORBaseUnknown_var& n : *next)
        flows += children->Locate(n) != 0;
      delete next;
    }
    const int nodes = children->Size();
    delete children;
    ASSERT_GT(nodes, 3);

    auto viewer = VORHandle<QELPertViewer>::Adopt(new QELPertViewer(nullptr, "e", 0, 800, 500, 0));
    auto controller = VORHandle<QELPertController>::Adopt(QELPertBuildChart(root, viewer));
    ASSERT_TRUE(controller);
    EXPECT_EQ(controller->GetNodeCount(), nodes);
    EXPECT_EQ(controller->GetLinkCount(), flows);
    const std::string svg = VORSVGWriter::ToString(*viewer);
    EXPECT_EQ(Count(svg, "<text class=\"PertLabel\""), nodes);
    EXPECT_EQ(Count(svg, "<polyline class=\"PertLink\""), 2 * flows);
    EXPECT_EQ(Count(svg, "PertGrid"), 0);  // the plain chart has no grid
    // A product is no chart root.
    EXPECT_FALSE(
        VORHandle<QELPertController>::Adopt(QELPertBuildChart(doc->GetRootProduct(), viewer)));
    controller->RemoveAllPertNodes();
  }
  VORDeferredDeletion::Drain();
  EXPECT_EQ(VORBaseUnknown::LiveInstances(), live);
}

}  // namespace
