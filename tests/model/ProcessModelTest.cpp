// The process side of the model, interface by interface: flows and their filters, children,
// items, resources, product IO and the notifications each change emits.
#include <functional>

#include "ModelTestSupport.h"

using List = VORListValVORBaseUnknown_var;

TEST(FlowTest, ActivityFilterSkipsControlNodesAndEmptyFilterKeepsThem) {
  SmallLine l;
  List* list = nullptr;
  VORISPPFlowMgt_var inner(l.inner);
  inner->GetPreviousActivities(list, "Activity");
  EXPECT_EQ(Ids(list), "");
  inner->GetPreviousActivities(list, "");
  EXPECT_EQ(Ids(list), IdOf(l.start));
  inner->GetNextActivities(list, nullptr);
  EXPECT_EQ(Ids(list), IdOf(l.stop));
  // Link order is kept on both ends.
  VORISPPFlowMgt_var(l.s1)->GetNextActivities(list, "Activity");
  EXPECT_EQ(Ids(list), IdOf(l.s2) + " " + IdOf(l.s3));
  VORISPPFlowMgt_var(l.s3)->GetPreviousActivities(list, "Activity");
  EXPECT_EQ(Ids(list), IdOf(l.s2) + " " + IdOf(l.s1));
  // A late-type filter keeps the kinds of that type.
  VORISPPFlowMgt_var(l.start)->GetNextActivities(list, "PhysicalActivity");
  EXPECT_EQ(Ids(list), IdOf(l.inner));
}

TEST(FlowTest, FlowsJoinDistinctSiblingsOnlyAndRemoveLinkWorksBothWays) {
  SmallLine l;
  VORISPPFlowMgt_var s1(l.s1), s3(l.s3);
  EXPECT_EQ(s1->AddNextActivity(l.load), E_INVALIDARG) << "not a sibling";
  EXPECT_EQ(s1->AddNextActivity(l.s1), E_INVALIDARG) << "itself";
  EXPECT_EQ(s1->AddNextActivity(l.s2), S_FALSE) << "exists";
  EXPECT_EQ(VORSPPLinkServices::AreAllreadyLinked(l.s1, l.s2), 0);
  EXPECT_EQ(VORSPPLinkServices::AreAllreadyLinked(l.s2, l.s1), 1);
  EXPECT_EQ(VORSPPLinkServices::AreAllreadyLinked(l.s1, l.load), 0);
  EXPECT_EQ(VORSPPLinkServices::AreAllreadyLinked(l.start, l.stop), 1);

  // Removing from the target's side removes the flow that points at it.
  EXPECT_EQ(s3->RemoveLink(l.s1), S_OK);
  EXPECT_EQ(VORSPPLinkServices::AreAllreadyLinked(l.s1, l.s3), 1);
  EXPECT_EQ(s3->RemoveLink(l.s1), S_FALSE);
  List* list = nullptr;
  s1->GetNextActivities(list, "Activity");
  EXPECT_EQ(Ids(list), IdOf(l.s2));
  std::vector<std::string> problems;
  EXPECT_TRUE(VORModelChecker::Check(l.doc.get(), problems)) << problems.front();
}

TEST(ChildManagementTest, ChildrenByFilterCreationAndRemovalWithEverythingInside) {
  SmallLine l;
  VORISPPChildManagement_var g(l.group);
  List* list = nullptr;
  g->GetChildren(list);
  EXPECT_EQ(Ids(list), IdOf(l.start) + " " + IdOf(l.inner) + " " + IdOf(l.stop));
  g->GetChildren(list, "Activity");
  EXPECT_EQ(Ids(list), IdOf(l.inner));
  g->GetChildren(list, "BIWActivityRoot");
  EXPECT_EQ(Ids(list), "");
  EXPECT_EQ(g->GetNumberOfChildren(), 3);

  VORBaseUnknown_var child;
  EXPECT_EQ(g->CreateChild("BIWActivityRoot", child), E_INVALIDARG);
  EXPECT_EQ(g->CreateChild("NoSuchType", child), E_INVALIDARG);
  EXPECT_EQ(g->CreateChild(nullptr, child), E_INVALIDARG);
  EXPECT_FALSE(child);
  // Control nodes are graph nodes, not activities.
  EXPECT_TRUE(VORIGENode_var(l.start));
  EXPECT_FALSE(VORISPPActivity_var(l.start));
  EXPECT_EQ(VORISPPFlowMgt_var(l.start)->GetProductInputs(list), E_NOTIMPL);

  // Removing S2 takes its children, its flows, its product IO and its links along.
  VORISPPChildManagement_var root(l.root);
  EXPECT_EQ(root->RemoveChild(l.load), E_INVALIDARG) << "not a direct child";
  EXPECT_EQ(root->RemoveChild(l.s2), S_OK);
  EXPECT_EQ(l.doc->FindObject(IdOf(l.load)), nullptr);
  EXPECT_EQ(l.doc->FindObject(IdOf(l.s2In)), nullptr);
  VORISPPFlowMgt_var(l.s1)->GetNextActivities(list, "Activity");
  EXPECT_EQ(Ids(list), IdOf(l.s3));
  VORILinkableObject_var(l.panel)->GetPointingObjects(list);
  EXPECT_EQ(Ids(list), "") << "neither the input nor the assignment points at the panel";
  VORILinkableObject_var(l.robot)->GetPointingObjects(list);
  EXPECT_EQ(Ids(list), "");
  // The removed object is detached, not dangling.
  VORBaseUnknown_var father;
  EXPECT_EQ(VORISPPActivity_var(l.load)->GetFatherActivity(father), S_OK);
  EXPECT_EQ(VORISpecObject_var(l.s2)->GetDocument(), nullptr);
  std::vector<std::string> problems;
  EXPECT_TRUE(VORModelChecker::Check(l.doc.get(), problems)) << problems.front();
}

TEST(ItemAndResourceTest, AssignmentsEmitTheirKindsWithFatherAndSon) {
  SmallLine l;
  ActivityRecorder rec(l.root);
  VORISPPItemMgt_var items(l.s1);
  VORISPPResourceManagement_var resources(l.s1);
  const std::string s1 = IdOf(l.s1);

  EXPECT_EQ(items->AssignItem(l.bracket), S_OK);
  EXPECT_EQ(items->AssignItem(l.bracket), S_FALSE);
  EXPECT_EQ(items->AssignItem(l.s2In), E_INVALIDARG) << "a product input is not an item";
  EXPECT_EQ(items->AssignItem(l.panel, l.s2In), E_INVALIDARG) << "input of another activity";
  EXPECT_EQ(resources->AssignResource(l.robot), S_OK);
  EXPECT_EQ(resources->AssignResource(l.panel), E_INVALIDARG) << "a product, not a resource";
  EXPECT_EQ(resources->UnassignResource(l.robot), S_OK);
  EXPECT_EQ(resources->UnassignResource(l.robot), S_FALSE);
  EXPECT_EQ(items->UnassignItem(l.bracket), S_OK);
  EXPECT_EQ(rec.Take(), (std::vector<std::string>{
                            "17 " + s1 + " " + IdOf(l.bracket), "15 " + s1 + " " + IdOf(l.robot),
                            "16 " + s1 + " " + IdOf(l.robot), "18 " + s1 + " " + IdOf(l.bracket)}));
}

TEST(ItemAndResourceTest, ItemListsFilterByTypeAndModeAndResourcesByClass) {
  SmallLine l;
  VORBaseUnknown_var ma;
  l.doc->GetDoor().CreateMfgAssembly("MA floor", ma);
  VORISPPItemMgt_var(l.weld)->AssignItem(ma);
  VORISPPItemMgt_var(l.s2)->AssignItem(l.bracket);
  List* list = nullptr;
  VORISPPItemMgt_var s2(l.s2);
  s2->GetAssignedItems(list, "Item", VORISPPItemMgt::AssignedHere);
  EXPECT_EQ(Ids(list), IdOf(l.panel) + " " + IdOf(l.bracket));
  s2->GetAssignedItems(list, "Item", VORISPPItemMgt::FirstAssigned);
  EXPECT_EQ(Ids(list), IdOf(l.panel) + " " + IdOf(l.bracket));
  s2->GetAssignedItems(list, "Item", VORISPPItemMgt::AssignedHereAndBelow);
  EXPECT_EQ(Ids(list), IdOf(l.panel) + " " + IdOf(l.bracket) + " " + IdOf(ma));
  s2->GetAssignedItems(list, "QELMfgAssy", VORISPPItemMgt::AssignedHereAndBelow);
  EXPECT_EQ(Ids(list), IdOf(ma));
  VORBaseUnknown_var via;
  EXPECT_EQ(s2->GetAssignmentInput(l.panel, via), S_OK);
  EXPECT_EQ(via, l.s2In);
  EXPECT_EQ(s2->GetAssignmentInput(l.bracket, via), S_FALSE);

  VORISPPResourceManagement_var weld(l.weld);
  weld->AssignResource(l.gun);
  weld->GetResources(list, "Resource");
  EXPECT_EQ(Ids(list), IdOf(l.robot) + " " + IdOf(l.gun));
  weld->GetResources(list, "WeldGun");
  EXPECT_EQ(Ids(list), IdOf(l.gun));
  // Resources answer VORISPPItem (their display name) like every item.
  EXPECT_EQ(Utf8(VORISPPItem_var(l.gun)->GetDisplayName()), "Gun1");
}

TEST(ItemAndResourceTest, LinksAreFoundByTheirTypeFromBothEnds) {
  SmallLine l;
  VORISPPResourceManagement_var(l.weld)->AssignResource(l.gun);
  VORILinkableObject_var weld(l.weld), s2(l.s2), gun(l.gun), panel(l.panel);
  List* list = nullptr;
  weld->GetPointedObjects(list, VORILinkableObject::ResourceLink);
  EXPECT_EQ(Ids(list), IdOf(l.robot) + " " + IdOf(l.gun));
  s2->GetPointedObjects(list, VORILinkableObject::ItemLink);
  EXPECT_EQ(Ids(list), IdOf(l.panel));
  s2->GetPointedObjects(list, VORILinkableObject::ResourceLink);
  EXPECT_EQ(Ids(list), "");
  weld->GetPointedObjects(list, "NoSuchLink");
  EXPECT_EQ(Ids(list), "");
  // A type spelt at run time, not the constant, finds the same links.
  const std::string resourceLink = std::string("Assigned") + "Resource";
  gun->GetPointingObjects(list, resourceLink.c_str());
  EXPECT_EQ(Ids(list), IdOf(l.weld));
  panel->GetPointingObjects(list, VORILinkableObject::ItemLink);
  EXPECT_EQ(Ids(list), IdOf(l.s2));
}

TEST(ProductIOTest, InputsOutputsAndTheirItemsWithKinds29And39) {
  SmallLine l;
  ActivityRecorder rec(l.root);
  VORISPPFlowMgt_var s2(l.s2);
  VORISPPProductIO_var in(l.s2In), out(l.s2Out);
  ASSERT_TRUE(in && out);
  EXPECT_TRUE(in->IsInput());
  EXPECT_FALSE(out->IsInput());
  EXPECT_EQ(VORISpecObject_var(l.s2In)->GetId().str().substr(0, 2), "IO");
  VORUnicodeString type;
  VORISpecObject_var(l.s2Out)->GetTypeName(type);
  EXPECT_EQ(Utf8(type), "ProductOutput");
  VORBaseUnknown_var item, activity;
  EXPECT_EQ(in->GetConsumedItem(item), S_OK);
  EXPECT_EQ(item, l.panel);
  EXPECT_EQ(in->GetProducedItem(item), S_FALSE);
  EXPECT_FALSE(item);
  EXPECT_EQ(out->GetProducedItem(item), S_OK);
  EXPECT_EQ(item, l.floor);
  in->GetActivity(activity);
  EXPECT_EQ(activity, l.s2);

  // An output whose item changes is kind 39, an input's kind 29.
  EXPECT_EQ(out->SetItem(l.bracket), S_OK);
  EXPECT_EQ(in->SetItem(l.bracket), S_OK);
  EXPECT_EQ(out->SetItem(l.s2), E_INVALIDARG);
  VORBaseUnknown_var added;
  EXPECT_EQ(s2->AddProductInput(l.floor, added), S_OK);
  EXPECT_EQ(s2->RemoveProductIO(added), S_OK);
  EXPECT_EQ(VORISPPFlowMgt_var(l.s1)->RemoveProductIO(l.s2In), E_INVALIDARG);
  const std::string s = IdOf(l.s2);
  EXPECT_EQ(rec.Take(), (std::vector<std::string>{
                            "39 " + s + " " + IdOf(l.s2Out), "29 " + s + " " + IdOf(l.s2In),
                            "29 " + s + " " + IdOf(added), "29 " + s + " " + IdOf(added)}));

  // Removing an input keeps the assignment made with it, without the input.
  EXPECT_EQ(s2->RemoveProductIO(l.s2In), S_OK);
  EXPECT_TRUE(VORISPPItemMgt_var(l.s2)->IsItemAssigned(l.panel));
  EXPECT_EQ(VORISPPItemMgt_var(l.s2)->GetAssignmentInput(l.panel, item), S_FALSE);
  std::vector<std::string> problems;
  EXPECT_TRUE(VORModelChecker::Check(l.doc.get(), problems)) << problems.front();
}

TEST(ActivityNotificationTest, ChildCreationIsKind3AndRemovalIs3Then8OnTheRemovedActivity) {
  SmallLine l;
  ActivityRecorder rec(l.root);
  // Subscribers of one activity's own dispatcher hear about that activity only.
  int onS2 = 0;
  VORIModelEvents_var(l.s2)->GetEventPublisher()->AddCallback(
      VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE(),
      [&](VORBaseUnknown*, const std::string&, VORNotification*, void*, VORCallbackId) { ++onS2; });
  VORBaseUnknown_var child;
  VORISPPChildManagement_var(l.s2)->CreateChild("BIWActivityStudWelding", child);
  VORISPPChildManagement_var(l.root)->RemoveChild(l.s3);
  EXPECT_EQ(rec.Take(), (std::vector<std::string>{"3 " + IdOf(l.s2) + " " + IdOf(child),
                                                  "3 " + IdOf(l.root) + " " + IdOf(l.s3),
                                                  "8 " + IdOf(l.s3) + " " + IdOf(l.s3)}));
  EXPECT_EQ(onS2, 1);
  // Attribute changes are VORModify on the object itself, never activity notifications.
  std::vector<std::string> what;
  VORIModelEvents_var(l.s1)->GetEventPublisher()->AddCallback(
      "VORModify", [&](VORBaseUnknown*, const std::string&, VORNotification* n, void*,
                       VORCallbackId) { what.push_back(static_cast<VORModify*>(n)->GetWhat()); });
  VORISPPAbstractActivity_var(l.s1)->SetLabel("S1 renamed");
  VORIGraphNodeLayout_var(l.s1)->SetPertPosition(37.5, 12.5);
  VORIGraphNodeLayout_var(l.s1)->SetPertNodeState(2);
  QELIBIWActivityStation_var(l.s1)->SetStationCycleTime(55);
  EXPECT_EQ(what, (std::vector<std::string>{"label", "position", "state", "cycletime"}));
  EXPECT_TRUE(rec.Take().empty());
  EXPECT_TRUE(l.doc->IsModified());
}

TEST(ActivityTest, TypesTimesAndTheRootInterfaces) {
  SmallLine l;
  VORISPPActivity_var s1(l.s1);
  EXPECT_EQ(s1->GetActivityType().str(), "BIWActivityStation");
  EXPECT_EQ(std::string(VORBaseUnknown_var(l.s1)->GetLateType()), "BIWActivityStation");
  EXPECT_TRUE(QELIBIWActivityStation_var(l.s1));
  EXPECT_TRUE(QELIBIWItemInfo_var(l.s1));
  EXPECT_TRUE(QELIBIWItemInfo_var(l.group));
  EXPECT_FALSE(QELIBIWActivityStation_var(l.group));
  EXPECT_FALSE(QELIBIWItemInfo_var(l.load));
  EXPECT_FALSE(VORISPPActivityRoot_var(l.s1));
  VORBaseUnknown_var root, father;
  s1->GetRootActivity(root);
  EXPECT_EQ(root, l.root);
  EXPECT_EQ(VORISPPActivity_var(l.root)->GetFatherActivity(father), S_FALSE);
  EXPECT_EQ(VORISPPActivityRoot_var(l.root)->GetProcessDocument(), l.doc.get());
  QELIUpdateManufAssly_var update(l.root);
  ASSERT_TRUE(update);
  update->SetUpdateInProgress(true);
  EXPECT_TRUE(update->IsUpdateInProgress());
  VORIGENode_var node(l.weld);
  node->GetParentNode(father);
  EXPECT_EQ(father, l.s2);

  VORIUserAttributes_var attrs(l.s1);
  VORAttributeValue v;
  EXPECT_EQ(attrs->GetAttributeValue("Shift", v), S_FALSE);
  EXPECT_EQ(v.type, VORAttributeNone);
  attrs->SetAttributeValue("Shift", VORAttributeValue::Long(2));
  attrs->SetAttributeValue("Rate", VORAttributeValue::Double(0.5));
  attrs->GetAttributeValue("Shift", v);
  EXPECT_EQ(v.type, 3);
  EXPECT_EQ(v.longValue, 2);
  attrs->GetAttributeValue("Rate", v);
  EXPECT_EQ(v.type, 6);
  attrs->SetAttributeValue("Rate", VORAttributeValue{});
  EXPECT_EQ(attrs->GetAttributeValue("Rate", v), S_FALSE);
}

TEST(BIWItemInfoTest, FirstListIsOwnOutputsSecondIsChildOutputsNotConsumedInside) {
  SmallLine l;
  VORBaseUnknown_var weldOut, loadIn, loadOut, sub;
  VORIProduct_var(l.doc->GetRootProduct())->AddChild("Sub assy", sub);
  VORISPPFlowMgt_var(l.weld)->AddProductOutput(l.floor, weldOut);
  VORISPPFlowMgt_var(l.load)->AddProductOutput(sub, loadOut);
  VORISPPFlowMgt_var(l.weld)->AddProductInput(sub, loadIn);  // the sub assy is used inside
  QELIBIWItemInfo_var info(l.s2);
  List* list = nullptr;
  info->GetFirstItemList(list);
  EXPECT_EQ(Ids(list), IdOf(l.s2Out));
  // The weld's Floor assy is the station's own output already: not handed on twice.
  info->GetSecondItemList(list);
  EXPECT_EQ(Ids(list), "");
  VORBaseUnknown_var trim, trimOut, trimOut2;
  VORIProduct_var(l.doc->GetRootProduct())->AddChild("Trim", trim);
  VORISPPFlowMgt_var(l.weld)->AddProductOutput(trim, trimOut);
  VORISPPFlowMgt_var(l.load)->AddProductOutput(trim, trimOut2);
  info->GetSecondItemList(list);
  EXPECT_EQ(Ids(list), IdOf(trimOut2)) << "one line per item: the first child's";
  info->GetActivityList(list);
  EXPECT_EQ(Ids(list), IdOf(l.load) + " " + IdOf(l.weld));
  info->GetConsumedItems(list);
  EXPECT_EQ(Ids(list), IdOf(l.panel) + " " + IdOf(sub));
  EXPECT_FALSE(info->IsListedOutput(weldOut));
  EXPECT_FALSE(info->IsListedOutput(loadOut));
  EXPECT_TRUE(info->AcceptsOutputTransfer(l.s2Out, l.s3));
  EXPECT_FALSE(info->AcceptsOutputTransfer(l.s2Out, l.weld)) << "welds do not take outputs";
  EXPECT_FALSE(info->AcceptsOutputTransfer(l.s2Out, l.s2));
  EXPECT_TRUE(info->IsInHierarchyOf(l.root));
  EXPECT_TRUE(info->IsInHierarchyOf(l.weld));
  EXPECT_FALSE(info->IsInHierarchyOf(l.s3));
  // A station without children lists itself.
  QELIBIWItemInfo_var(l.s1)->GetActivityList(list);
  EXPECT_EQ(Ids(list), IdOf(l.s1));
}

TEST(BIWItemInfoTest, CoveredItemsAreMadeInsideOrTakenThroughAnAssignedInputOfTheActivity) {
  SmallLine l;
  VORBaseUnknown_var sub, loadOut, bracketIn, unassignedIn;
  VORIProduct_var(l.doc->GetRootProduct())->AddChild("Sub assy", sub);
  VORISPPFlowMgt_var(l.load)->AddProductOutput(sub, loadOut);
  VORISPPFlowMgt_var(l.s2)->AddProductInput(l.bracket, bracketIn);
  VORISPPItemMgt_var(l.s2)->AssignItem(l.bracket, bracketIn);
  VORBaseUnknown_var trim;
  VORIProduct_var(l.doc->GetRootProduct())->AddChild("Trim", trim);
  VORISPPFlowMgt_var(l.s2)->AddProductInput(trim, unassignedIn);  // an input, not assigned
  List* list = nullptr;
  QELIBIWItemInfo_var(l.s2)->GetCoveredItems(list);
  EXPECT_EQ(Ids(list), IdOf(sub) + " " + IdOf(l.panel) + " " + IdOf(l.bracket));
  // A station without children covers what it makes itself.
  QELIBIWItemInfo_var(l.s3)->GetCoveredItems(list);
  EXPECT_EQ(Ids(list), "");
  VORBaseUnknown_var s3Out;
  VORISPPFlowMgt_var(l.s3)->AddProductOutput(trim, s3Out);
  QELIBIWItemInfo_var(l.s3)->GetCoveredItems(list);
  EXPECT_EQ(Ids(list), IdOf(trim));
}

TEST(JoiningCycleTimeTest, PointAndCurveFasteningTimesFollowTheirAttributesThroughTheDoor) {
  SmallLine l;
  VORBaseUnknown_var arc, seal;
  VORISPPChildManagement_var(l.s3)->CreateChild("BIWActivityArcWelding", arc);
  VORISPPChildManagement_var(l.s3)->CreateChild("BIWActivitySealantApplication", seal);
  QELIBIWWeldingActivity_var weld(l.weld);
  ASSERT_TRUE(weld);
  EXPECT_FALSE(QELIBIWCurveFasteningActivity_var(l.weld));
  EXPECT_FALSE(QELIBIWWeldingActivity_var(arc));
  EXPECT_FALSE(QELIBIWWeldingActivity_var(l.s2)) << "stations are no joining activities";
  auto time = [](VORBaseUnknown* a) {
    double t = -1;
    VORISPPAbstractActivity_var(a)->GetActivityTime(t);
    return t;
  };
  auto set = [&](VORBaseUnknown* a, const char* name, const VORAttributeValue& v) {
    l.doc->GetDoor().SetUserAttribute(a, name, v);
  };
  VORISPPAbstractActivity_var(l.weld)->SetActivityTime(7);
  EXPECT_EQ(weld->UpdateCycleTime(), S_FALSE) << "no joints given";
  set(l.weld, "NumberOfPoints", VORAttributeValue::Long(12));
  set(l.weld, "TimePerPoint", VORAttributeValue::String("fast"));
  EXPECT_EQ(weld->UpdateCycleTime(), S_FALSE);
  EXPECT_EQ(time(l.weld), 7.0);
  set(l.weld, "TimePerPoint", VORAttributeValue::Double(2.5));
  VORChangeLog log;
  l.doc->GetDoor().SetRecorder(&log);
  EXPECT_EQ(weld->UpdateCycleTime(), S_OK);
  EXPECT_EQ(time(l.weld), 30.0);
  EXPECT_EQ(weld->UpdateCycleTime(), S_FALSE) << "already so";
  l.doc->GetDoor().SetRecorder(nullptr);
  l.doc->GetDoor().Undo(log);
  EXPECT_EQ(time(l.weld), 7.0) << "undone as one step";

  QELIBIWCurveFasteningActivity_var curve(arc);
  ASSERT_TRUE(curve);
  ASSERT_TRUE(QELIBIWCurveFasteningActivity_var(seal));
  set(arc, "SeamLength", VORAttributeValue::Long(900));
  EXPECT_EQ(curve->UpdateCycleTime(), S_FALSE) << "no speed";
  set(arc, "SeamSpeed", VORAttributeValue::Long(0));
  EXPECT_EQ(curve->UpdateCycleTime(), S_FALSE) << "no division by zero";
  set(arc, "SeamSpeed", VORAttributeValue::Double(50));
  EXPECT_EQ(curve->UpdateCycleTime(), S_OK);
  EXPECT_EQ(time(arc), 18.0);
}

TEST(ListIntoCallerTest, AppendVariantsAddWhatTheNewListsHoldAfterTheCallersEntries) {
  SmallLine l;
  VORBaseUnknown_var loadOut, sub;
  VORIProduct_var(l.doc->GetRootProduct())->AddChild("Sub assy", sub);
  VORISPPFlowMgt_var(l.load)->AddProductOutput(sub, loadOut);
  VORISPPItemMgt_var(l.weld)->AssignItem(l.bracket);
  VORISPPResourceManagement_var(l.weld)->AssignResource(l.gun);
  using Get = std::function<void(List*&)>;
  using Add = std::function<HRESULT(List&)>;
  auto compare = [&](VORBaseUnknown* object, const Get& get, const Add& add) {
    // The caller's list already holds an entry, and a second call appends again.
    List list;
    list.Append(VORBaseUnknown_var(l.root));
    EXPECT_EQ(add(list), S_OK);
    const int once = list.Size();
    EXPECT_EQ(add(list), S_OK);
    List* fresh = nullptr;
    get(fresh);
    ASSERT_NE(fresh, nullptr);
    const std::string expected = Ids(fresh);
    auto joined = [&](int from, int to) {
      std::string text;
      for (int i = from; i <= to; ++i)
        text += (text.empty() ? "" : " ") + IdOf(list[i].get());
      return text;
    };
    EXPECT_EQ(list[1], l.root) << IdOf(object);
    EXPECT_EQ(joined(2, once), expected) << IdOf(object);
    EXPECT_EQ(joined(once + 1, list.Size()), expected) << IdOf(object);
  };
  for (VORBaseUnknown* activity : {l.s1.get(), l.s2.get(), l.weld.get()}) {
    VORISPPFlowMgt_var flow(activity);
    compare(
        activity, [&](List*& out) { flow->GetProductInputs(out); },
        [&](List& out) { return flow->AppendProductInputs(out); });
    VORISPPItemMgt_var items(activity);
    compare(
        activity,
        [&](List*& out) {
          items->GetAssignedItems(out, "Item", VORISPPItemMgt::AssignedHereAndBelow);
        },
        [&](List& out) {
          return items->AppendAssignedItems(out, "Item", VORISPPItemMgt::AssignedHereAndBelow);
        });
    VORISPPResourceManagement_var resources(activity);
    compare(
        activity, [&](List*& out) { resources->GetResources(out, "Resource"); },
        [&](List& out) { return resources->AppendResources(out, "Resource"); });
    QELIBIWItemInfo_var info(activity);
    if (!info)
      continue;
    compare(
        activity, [&](List*& out) { info->GetFirstItemList(out); },
        [&](List& out) { return info->AppendFirstItemList(out); });
    compare(
        activity, [&](List*& out) { info->GetSecondItemList(out); },
        [&](List& out) { return info->AppendSecondItemList(out); });
    compare(
        activity, [&](List*& out) { info->GetActivityList(out); },
        [&](List& out) { return info->AppendActivityList(out); });
    compare(
        activity, [&](List*& out) { info->GetCoveredItems(out); },
        [&](List& out) { return info->AppendCoveredItems(out); });
  }
  // A control node has no product inputs: the caller's list stays as it was.
  List untouched;
  EXPECT_EQ(VORISPPFlowMgt_var(l.start)->AppendProductInputs(untouched), E_NOTIMPL);
  EXPECT_TRUE(untouched.IsEmpty());
}
