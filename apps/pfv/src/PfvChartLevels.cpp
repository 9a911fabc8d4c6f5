#include "PfvChartLevels.h"

#include <memory>

#include "VORIGENode.h"
#include "VORISPPActivity.h"

namespace {
void Walk(VORBaseUnknown* object, const std::string& above, std::vector<PfvChartLevel>& out,
          int depth) {
  VORIGENode_var node{VORBaseUnknown_var(object)};
  if (!node || depth > 1000)
    return;
  VORUnicodeString label;
  node->GetLabel(label);
  const std::string path =
      above.empty() ? label.ConvertToUTF8() : above + " / " + label.ConvertToUTF8();
  VORListValVORBaseUnknown_var* children = nullptr;
  node->GetChildren(children);
  std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
  if (children == nullptr || children->Size() == 0)
    return;
  out.push_back({VORBaseUnknown_var(object), path});
  for (const VORBaseUnknown_var& child : *children) {
    if (VORISPPActivity_var(child))
      Walk(child, path, out, depth + 1);
  }
}
}  // namespace

std::vector<PfvChartLevel> PfvChartLevels(VORProcess* document) {
  std::vector<PfvChartLevel> levels;
  if (document != nullptr)
    Walk(document->GetRootProcess(), std::string(), levels, 0);
  return levels;
}
