// A fixture for the grouping commands: a level built through the model's door, saved and opened
// through the headless driver, with helpers that read the result through the interfaces.
#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "TempDir.h"
#include "VORDlgNotify.h"
#include "VORDocument.h"
#include "VORDriver.h"
#include "VORIGraphNodeLayout.h"
#include "VORIProduct.h"
#include "VORISPPAbstractActivity.h"
#include "VORISPPChildManagement.h"
#include "VORISPPFlowMgt.h"
#include "VORISPPResourceManagement.h"
#include "VORIGENode.h"
#include "VORModelDoor.h"

class GroupingTest : public ::testing::Test {
 protected:
  void SetUp() override {
    doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line", hub ? "IPDDocEnv" : ""));
    root = doc->GetRootProcess();
  }

  VORModelDoor& Door() { return doc->GetDoor(); }

  VORBaseUnknown_var Node(VORBaseUnknown* father, const char* label,
                          const char* type = "BIWActivityStation", double x = 0, double y = 0) {
    VORBaseUnknown_var node;
    EXPECT_EQ(Door().CreateNode(father, type, node), S_OK);
    Door().SetLabel(node, VORUnicodeString(label));
    Door().SetPertPosition(node, true, x, y);
    return node;
  }
  void Flow(const VORBaseUnknown_var& from, const VORBaseUnknown_var& to) {
    EXPECT_EQ(Door().AddFlow(from, to), S_OK);
  }
  VORBaseUnknown_var Product(VORBaseUnknown* father, const char* name) {
    VORBaseUnknown_var product;
    EXPECT_EQ(Door().CreateProduct(father, VORUnicodeString(name), product), S_OK);
    return product;
  }
  VORBaseUnknown_var Resource(VORBaseUnknown* father, const char* name, const char* planType = "") {
    VORBaseUnknown_var r = Product(father, name);
    EXPECT_EQ(Door().MakeResource(r, VORUnicodeString("Resource"), VORUnicodeString(planType)),
              S_OK);
    return r;
  }
  // A hub plant type named name (of the component class when given), and a parent-child rule.
  VORBaseUnknown_var PlanType(const char* name, const char* compclass = nullptr) {
    VORBaseUnknown_var t;
    EXPECT_EQ(Door().DefinePlanType(VORUnicodeString(name), t), S_OK);
    Door().SetPlanTypeAttribute(t, VORUnicodeString("type"), VORUnicodeString("plantype_name"),
                                VORUnicodeString(name));
    if (compclass != nullptr)
      Door().SetPlanTypeAttribute(t, VORUnicodeString(""), VORUnicodeString("compclass"),
                                  VORUnicodeString(compclass));
    return t;
  }
  void Child(const VORBaseUnknown_var& parent, const VORBaseUnknown_var& child) {
    Door().AddPlanTypeRelation(parent, VORUnicodeString("lumoplantypechild"), child);
  }
  // Saves the document built so far and opens it through the driver.
  void Open() {
    std::string error;
    const std::string file = dir.Path() + "/line.pprx";
    ASSERT_TRUE(doc->SaveAs(file, error)) << error;
    ASSERT_TRUE(driver.OpenDocument(file)) << driver.LastError();
    doc = driver.GetDocument();
    root = doc->GetRootProcess();
    driver.TakeEvents();
    ForgetMessages();
  }
  VORBaseUnknown* Find(const char* label) const { return driver.FindObject(label); }

  // Starts the command and picks the labels in the tree, in order.
  void StartAndPick(const char* command, const std::vector<const char*>& labels) {
    ASSERT_TRUE(driver.StartCommand(command)) << driver.LastError();
    for (const char* label : labels)
      driver.PickObject(label);
  }

  static std::string Label(VORBaseUnknown* node) {
    VORUnicodeString label;
    if (VORIGENode_var n(node); n)
      n->GetLabel(label);
    return label.ConvertToUTF8();
  }
  // The labels (or, for products, part numbers) of what object lists through Var's getter.
  template <typename Var, typename Interface>
  static std::string Listed(VORBaseUnknown* object,
                            HRESULT (Interface::*getter)(VORListValVORBaseUnknown_var*&,
                                                         const char*),
                            const char* filter, std::string (*name)(VORBaseUnknown*) = Label) {
    VORListValVORBaseUnknown_var* list = nullptr;
    (Var(object).get()->*getter)(list, filter);
    std::string text;
    for (int i = 1; list != nullptr && i <= list->Size(); ++i)
      text += (text.empty() ? "" : " ") + name((*list)[i]);
    delete list;
    return text;
  }
  // Every child of an activity, control nodes too, in order.
  static std::string Children(VORBaseUnknown* activity) {
    return Listed<VORISPPChildManagement_var>(activity, &VORISPPChildManagement::GetChildren,
                                              nullptr);
  }
  // Next and previous nodes of node, control nodes too.
  static std::string Next(VORBaseUnknown* node) {
    return Listed<VORISPPFlowMgt_var>(node, &VORISPPFlowMgt::GetNextActivities, "");
  }
  static std::string Previous(VORBaseUnknown* node) {
    return Listed<VORISPPFlowMgt_var>(node, &VORISPPFlowMgt::GetPreviousActivities, "");
  }
  static std::string ProductName(VORBaseUnknown* product) {
    VORUnicodeString name;
    if (VORIProduct_var p(product); p)
      p->GetPartNumber(name);
    return name.ConvertToUTF8();
  }
  static std::string ChildProducts(VORBaseUnknown* product) {
    return Listed<VORIProduct_var>(product, &VORIProduct::GetChildren, "VORIProduct", ProductName);
  }
  static std::string ResourceNames(VORBaseUnknown* activity) {
    return Listed<VORISPPResourceManagement_var>(activity, &VORISPPResourceManagement::GetResources,
                                                 "Resource", ProductName);
  }
  // The child of an activity with that label (null when none).
  static VORBaseUnknown_var ChildNamed(VORBaseUnknown* activity, const std::string& label) {
    VORListValVORBaseUnknown_var* list = nullptr;
    VORISPPChildManagement_var(activity)->GetChildren(list);
    VORBaseUnknown_var found;
    for (const VORBaseUnknown_var& c : *list) {
      if (Label(c) == label)
        found = c;
    }
    delete list;
    return found;
  }
  // Texts of the notifications shown since the last call.
  std::vector<std::string> Messages() {
    std::vector<std::string> texts;
    const auto& records = VORDlgNotify::Recorder().Records();
    for (size_t i = _seen; i < records.size(); ++i)
      texts.push_back(records[i].title + ": " + records[i].text);
    _seen = records.size();
    return texts;
  }
  void ForgetMessages() { Messages(); }
  // The last driver event since the previous call ("" when none).
  std::string LastEvent() {
    const std::vector<std::string> events = driver.TakeEvents();
    return events.empty() ? std::string() : events.back();
  }

  bool hub = false;
  TempDir dir;
  VORDriver driver;
  VORProcess_var doc;
  VORBaseUnknown_var root;

 private:
  size_t _seen = 0;
};
