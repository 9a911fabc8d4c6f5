#include "QELProcessGroupUtils.h"

#include "QELFpaGroupingSupport.h"
#include "VORISPPAbstractActivity.h"
#include "VORISPPChildManagement.h"
#include "VORISPPFlowMgt.h"
#include "VORSPPGroupingServices.h"

VORBaseUnknown_var QELProcessGroupUtils::CreateAfterOperation(
    const VORBaseUnknown_var& anchor, const VORString& type,
    const VORListValVORBaseUnknown_var& selection) {
  if (!anchor)
    return VORBaseUnknown_var();
  VORISPPAbstractActivity_var abstract(anchor);
  VORBaseUnknown_var father;
  if (!abstract || FAILED(abstract->GetFatherActivity(father)) ||
      !VORISPPChildManagement_var(father))
    return VORBaseUnknown_var();
  VORBaseUnknown_var group;
  if (FAILED(VORSPPGroupingServices::CreateActivity(father, type.c_str(), group)) || !group)
    return VORBaseUnknown_var();
  VORISPPFlowMgt_var groupFlows(group);
  if (!groupFlows)
    return group;
  for (const VORBaseUnknown_var& next : QELFpaGrouping::Next(anchor)) {
    if (selection.Locate(next) == 0)
      continue;
    if (VORISPPFlowMgt_var anchorFlows(anchor); anchorFlows)
      anchorFlows->RemoveLink(next);
    groupFlows->AddNextActivity(next);
  }
  if (VORISPPFlowMgt_var anchorFlows(anchor); anchorFlows)
    anchorFlows->AddNextActivity(group);
  return group;
}
