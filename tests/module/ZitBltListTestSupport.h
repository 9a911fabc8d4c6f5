// Shared by the list tests: a small line built through the model's door, and a stand-in for
// objects that know the activity they are listed for.
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "QELIListZitBltItem.h"
#include "VORDeferredDeletion.h"
#include "VORDocument.h"
#include "VORModel.h"
#include "VORModelDoor.h"
#include "VORModuleLoader.h"

// A line of one grouping holding two stations, beside a loose station:
//   root
//   +- G (grouping)            +- S3 (station)
//      +- S1 (station) -> S2 (station)
// Products: "Panel", "Bracket", "Floor", "Sub" under the root product; resources "Robot",
// "Fixture".
struct ListTestLine {
  ListTestLine() {
    doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    root = doc->GetRootProcess();
    group = Node(root, "G", "BIWActivityGrouping");
    s1 = Node(group, "S1", "BIWActivityStation");
    s2 = Node(group, "S2", "BIWActivityStation");
    s3 = Node(root, "S3", "BIWActivityStation");
    door().AddFlow(s1, s2);
    for (auto* p : {&panel, &bracket, &floor, &sub})
      *p = Product(p == &panel     ? "Panel"
                   : p == &bracket ? "Bracket"
                   : p == &floor   ? "Floor"
                                   : "Sub");
    robot = Product("Robot");
    fixture = Product("Fixture");
    door().MakeResource(robot, "Robot", "");
    door().MakeResource(fixture, "Fixture", "");
  }
  ~ListTestLine() {
    group = s1 = s2 = s3 = root = NULL_var;
    panel = bracket = floor = sub = robot = fixture = NULL_var;
    doc = NULL_var;
    VORDeferredDeletion::Drain();
  }
  VORModelDoor& door() { return doc->GetDoor(); }
  VORBaseUnknown_var Node(VORBaseUnknown* father, const char* label, const char* type) {
    VORBaseUnknown_var node;
    EXPECT_EQ(door().CreateNode(father, type, node), S_OK) << type;
    door().SetLabel(node, VORUnicodeString(label));
    return node;
  }
  VORBaseUnknown_var Product(const char* name) {
    VORBaseUnknown_var product;
    EXPECT_EQ(door().CreateProduct(doc->GetRootProduct(), name, product), S_OK);
    return product;
  }
  VORBaseUnknown_var Input(VORBaseUnknown* activity, VORBaseUnknown* item, bool assign = true) {
    VORBaseUnknown_var io;
    EXPECT_EQ(door().AddProductIO(activity, item, true, io), S_OK);
    if (assign)
      door().AssignItem(activity, item, io);
    return io;
  }
  VORBaseUnknown_var Output(VORBaseUnknown* activity, VORBaseUnknown* item) {
    VORBaseUnknown_var io;
    EXPECT_EQ(door().AddProductIO(activity, item, false, io), S_OK);
    return io;
  }

  VORProcess_var doc;
  VORBaseUnknown_var root, group, s1, s2, s3;
  VORBaseUnknown_var panel, bracket, floor, sub, robot, fixture;
};

// The text a list shows for object, or "<code>:<name>" when GetItemName does not answer 0.
inline std::string ItemText(VORBaseUnknown* object, const char* start = "") {
  QELIListZitBltItem_var item{VORBaseUnknown_var(object)};
  if (!item)
    return "(no list item)";
  VORUnicodeString name(start);
  const HRESULT rc = item->GetItemName(name);
  return rc == 0 ? name.ConvertToUTF8() : std::to_string(rc) + ":" + name.ConvertToUTF8();
}

// An object listed for a known activity, as the visualisation's item objects are.
class ListedForActivity : public virtual QELIListZitBltItem {
 public:
  explicit ListedForActivity(VORBaseUnknown* activity) : _activity(activity) {}
  HRESULT GetActivity(VORBaseUnknown*& activity) override {
    activity = _activity.get();
    return 0;
  }
  HRESULT GetItemName(VORUnicodeString&) override { return 1; }

 private:
  VORBaseUnknown_var _activity;
};
