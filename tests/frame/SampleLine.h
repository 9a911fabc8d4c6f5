// A small line for frame and scenario tests, built through the model's interfaces:
// root "Line" with stations S1 -> S2 -> S3, a loading L1 -> S2, products "Side panel" (input of
// S1) and "Roof" (output of S2) under "Body", and chart positions on the 25-unit grid.
#pragma once

#include <string>

#include "VORDocument.h"
#include "VORIGraphNodeLayout.h"
#include "VORIProduct.h"
#include "VORISPPAbstractActivity.h"
#include "VORISPPChildManagement.h"
#include "VORISPPFlowMgt.h"

inline VORBaseUnknown_var SampleChild(VORISPPChildManagement* parent, const char* type,
                                      const char* label, double x, double y) {
  VORBaseUnknown_var child;
  parent->CreateChild(type, child);
  VORISPPAbstractActivity_var(child)->SetLabel(label);
  VORIGraphNodeLayout_var(child)->SetPertPosition(x, y);
  return child;
}

inline VORProcess_var MakeSampleLine() {
  VORProcess_var document = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
  VORISPPChildManagement_var root(document->GetRootProcess());
  VORBaseUnknown_var s1 = SampleChild(root, "BIWActivityStation", "S1", 12.5, 12.5);
  VORBaseUnknown_var s2 = SampleChild(root, "BIWActivityStation", "S2", 62.5, 12.5);
  VORBaseUnknown_var s3 = SampleChild(root, "BIWActivityStation", "S3", 112.5, 12.5);
  VORBaseUnknown_var l1 = SampleChild(root, "BIWActivityLoading", "L1", 12.5, 62.5);
  VORISPPFlowMgt_var(s1)->AddNextActivity(s2);
  VORISPPFlowMgt_var(s2)->AddNextActivity(s3);
  VORISPPFlowMgt_var(l1)->AddNextActivity(s2);

  VORIProduct_var body(document->GetRootProduct());
  VORBaseUnknown_var side, roof, io;
  body->AddChild("Side panel", side);
  body->AddChild("Roof", roof);
  VORISPPFlowMgt_var(s1)->AddProductInput(side, io);
  VORISPPFlowMgt_var(s2)->AddProductOutput(roof, io);
  return document;
}

// Saves the sample line to path; empty on success, else the reason.
inline std::string SaveSampleLine(const std::string& path) {
  std::string error;
  MakeSampleLine()->SaveAs(path, error);
  return error;
}
