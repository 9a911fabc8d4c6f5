// Products, resources, manufacturing assemblies, containers and the planning hub.
#include "ModelTestSupport.h"

#include "VORModelGenerator.h"

using List = VORListValVORBaseUnknown_var;

TEST(ProductTest, TreeOperationsAndShowNotificationsUpTheTree) {
  SmallLine l;
  VORIProduct_var root(l.doc->GetRootProduct());
  VORBaseUnknown_var child, father;
  VORIProduct_var(l.floor)->AddChild("Floor reinforcement", child);
  VORIProduct_var(child)->GetFatherProduct(father);
  EXPECT_EQ(father, l.floor);
  EXPECT_EQ(root->GetFatherProduct(father), S_FALSE);
  List* list = nullptr;
  root->GetChildren(list, "VORIProduct");
  EXPECT_EQ(Ids(list), IdOf(l.panel) + " " + IdOf(l.bracket) + " " + IdOf(l.floor));
  VORIProduct_var(l.cell)->GetChildren(list, "Resource");
  EXPECT_EQ(Ids(list), IdOf(l.robot));

  std::vector<std::string> shows;
  auto record = [&](VORBaseUnknown* publisher, const std::string&, VORNotification* n, void*,
                    VORCallbackId) {
    auto* s = dynamic_cast<VORShowNotif*>(n);
    shows.push_back(IdOf(publisher) + ":" + IdOf(s->GetObject()) + (s->IsShown() ? "+" : "-"));
  };
  VORIModelEvents_var(l.doc->GetRootProduct())
      ->GetEventPublisher()
      ->AddCallback("VORShowNotif", record);
  VORIModelEvents_var(child)->GetEventPublisher()->AddCallback("VORShowNotif", record);
  VORIVisProperties_var vis(child);
  EXPECT_EQ(vis->SetShown(false), S_OK);
  EXPECT_EQ(vis->SetShown(false), S_FALSE);
  EXPECT_FALSE(vis->IsShown());
  const std::string c = IdOf(child);
  EXPECT_EQ(shows, (std::vector<std::string>{c + ":" + c + "-",
                                             IdOf(l.doc->GetRootProduct()) + ":" + c + "-"}));

  // Removing a product removes what refers to it: inputs (29), assignments (18) first.
  ActivityRecorder rec(l.root);
  EXPECT_EQ(root->RemoveChild(l.s2), E_INVALIDARG);
  EXPECT_EQ(VORIProduct_var(l.floor)->RemoveChild(l.panel), E_INVALIDARG) << "not its child";
  EXPECT_EQ(root->RemoveChild(l.panel), S_OK);
  EXPECT_EQ(rec.Take(), (std::vector<std::string>{"29 " + IdOf(l.s2) + " " + IdOf(l.s2In),
                                                  "18 " + IdOf(l.s2) + " " + IdOf(l.panel)}));
  VORISPPFlowMgt_var(l.s2)->GetProductInputs(list);
  EXPECT_EQ(Ids(list), "");
  std::vector<std::string> problems;
  EXPECT_TRUE(VORModelChecker::Check(l.doc.get(), problems)) << problems.front();
}

TEST(ResourceTest, FactoryReparentingAndRemovalFromProcessAndTree) {
  SmallLine l;
  VORBaseUnknown_var product, description, ppr, group;
  VORIProduct_var(l.cell)->AddChild("Group resource", product);
  EXPECT_FALSE(VORIResource_var(product)) << "a product is no resource until one is attached";
  VORIPDServices::GetPPRContainer(l.doc.get(), ppr);
  VORIResourceFactory_var factory(ppr);
  ASSERT_TRUE(factory);
  EXPECT_FALSE(VORIResourceFactory_var(l.doc->GetRootProcess()));
  factory->CreateResource("Station", product, "Group", description);
  EXPECT_FALSE(VORIResource_var(product)) << "the description alone changes nothing";
  EXPECT_EQ(factory->AttachResource(product, description), S_OK);
  EXPECT_EQ(factory->AttachResource(product, description), S_FALSE);
  VORIResource_var resource(product);
  ASSERT_TRUE(resource);
  resource->SetName("Respot group");
  VORUnicodeString text;
  resource->GetResourceClass(text);
  EXPECT_EQ(Utf8(text), "Station");
  VORIProduct_var(product)->GetPartNumber(text);
  EXPECT_EQ(Utf8(text), "Respot group");

  // Reparenting keeps the activity assignments of the moved resource.
  List* path = VORSPPReparentService::GetPathOf(product);
  EXPECT_EQ(path->Size(), 3);
  EXPECT_EQ(VORSPPReparentService::ReparentResource(l.robot, product, path, nullptr), S_OK);
  EXPECT_EQ(VORSPPReparentService::ReparentResource(product, l.gun, nullptr, nullptr), E_INVALIDARG)
      << "a product cannot go inside itself";
  EXPECT_EQ(VORSPPReparentService::ReparentResource(l.robot, l.cell, path, nullptr), E_INVALIDARG)
      << "the path must end at the new father";
  delete path;
  VORBaseUnknown_var father;
  VORIProduct_var(l.robot)->GetFatherProduct(father);
  EXPECT_EQ(father, product);
  List* list = nullptr;
  VORISPPResourceManagement_var(l.weld)->GetResources(list, "Resource");
  EXPECT_EQ(Ids(list), IdOf(l.robot));

  // Removing from the process unassigns the resource and those below it; the tree keeps them.
  VORISPPResourceManagement_var(l.s1)->AssignResource(l.gun);
  VORBaseUnknown_var container, init;
  l.doc->GetInitObject(init);
  VORIDocInit_var(init)->GetRootContainer(container);
  VORISPPProcessContainer_var processes(container);
  ASSERT_TRUE(processes);
  processes->GetListOfProcesses(list);
  EXPECT_EQ(Ids(list), IdOf(l.root));
  EXPECT_EQ(processes->RemoveResource(l.robot), S_OK);
  VORISPPResourceManagement_var(l.weld)->GetResources(list, "Resource");
  EXPECT_EQ(Ids(list), "");
  VORISPPResourceManagement_var(l.s1)->GetResources(list, "Resource");
  EXPECT_EQ(Ids(list), "");
  EXPECT_EQ(processes->RemoveResource(l.robot), S_FALSE);
  EXPECT_EQ(VORIProduct_var(product)->RemoveChild(l.robot), S_OK);
  EXPECT_EQ(l.doc->FindObject(IdOf(l.gun)), nullptr) << "the subtree went too";
  std::vector<std::string> problems;
  EXPECT_TRUE(VORModelChecker::Check(l.doc.get(), problems)) << problems.front();
}

TEST(MfgAssemblyTest, DeletingSendsMADeletingWhileStillLinkedThenCleansUp) {
  SmallLine l;
  VORModelDoor& door = l.doc->GetDoor();
  VORBaseUnknown_var ma, sub, bom, input;
  door.CreateMfgAssembly("MA floor", ma);
  door.CreateMfgAssembly("MA sub", sub);
  QELIMfgAssembly_var assembly(ma);
  EXPECT_EQ(assembly->AddComponent(l.panel), S_OK);
  EXPECT_EQ(assembly->AddComponent(sub), S_OK);
  EXPECT_EQ(QELIMfgAssembly_var(sub)->AddComponent(ma), E_INVALIDARG) << "a cycle";
  EXPECT_EQ(assembly->AddComponent(l.s1), E_INVALIDARG) << "activities are no components";
  VORISPPItemMgt_var(l.s1)->AssignItem(ma);
  VORISPPFlowMgt_var(l.s3)->AddProductInput(ma, input);

  l.doc->GetContainer("QELMBomNodesCont", bom);
  QELIMfgAssemblyModificationEvents_var events(bom);
  ASSERT_TRUE(events);
  std::vector<std::string> seen;
  events->GetEventPublisher()->AddCallback(
      QELMfgNotificationDispatcher::GetMfgModified(),
      [&](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        auto* u = dynamic_cast<QELMfgUpdateNotification*>(n);
        ASSERT_NE(u, nullptr);
        List* linked = nullptr;
        VORILinkableObject_var(u->GetModifiedAssembly())->GetPointingObjects(linked);
        seen.push_back(u->GetEvent().str() + " " + Ids(linked));
      });
  List* members = nullptr;
  VORIContainer_var(bom)->ListMembers(QELIMfgAssembly::IID(), members);
  EXPECT_EQ(Ids(members), IdOf(ma) + " " + IdOf(sub));
  ActivityRecorder rec(l.root);
  EXPECT_EQ(l.doc->GetDoor().DeleteMfgAssembly(ma), S_OK);
  ASSERT_EQ(seen.size(), 1u);
  EXPECT_EQ(seen[0], "MADeleting " + IdOf(l.s1) + " " + IdOf(input));
  EXPECT_EQ(rec.Take(), (std::vector<std::string>{"18 " + IdOf(l.s1) + " " + IdOf(ma),
                                                  "29 " + IdOf(l.s3) + " " + IdOf(input)}));
  List* linked = nullptr;
  VORILinkableObject_var(sub)->GetPointingObjects(linked);
  EXPECT_EQ(Ids(linked), "");
  std::vector<std::string> problems;
  EXPECT_TRUE(VORModelChecker::Check(l.doc.get(), problems)) << problems.front();
}

TEST(ContainerTest, DocumentContainersAndTheRootProductAlias) {
  SmallLine l;
  VORBaseUnknown_var ppr, none;
  EXPECT_EQ(l.doc->GetContainer("VORSPPPPRCont", ppr), S_OK);
  EXPECT_EQ(l.doc->GetContainer("NoSuchCont", none), E_FAIL);
  List* list = nullptr;
  VORIContainer_var(ppr)->ListMembers(VORIProduct::IID(), list);
  ASSERT_EQ(list->Size(), 2);
  VORUnicodeString alias;
  VORIAlias_var((*list)[1])->GetAlias(alias);
  EXPECT_EQ(Utf8(alias), "PPRProduct");
  delete list;
  EXPECT_TRUE(l.doc->IsAKindOf("VORProcess"));
  EXPECT_TRUE(l.doc->IsAKindOf("VORDocument"));
  EXPECT_FALSE(l.doc->IsHubMode());
  EXPECT_FALSE(VORIIPDAdapter_var(VORBaseUnknown_var(static_cast<VORIDocInit*>(l.doc.get()))));
}

namespace {
struct Hub {
  Hub() {
    VORModelGeneratorOptions o;
    o.activities = 40;
    o.hub = true;
    doc = VORProcess_var::Adopt(VORModelGenerator::Generate(o));
    VORBaseUnknown_var self(static_cast<VORIDocInit*>(doc.get()));
    adapter = self;
    attributes = self;
    data = self;
  }
  VORUnicodeString Attr(VORBaseUnknown* t, const char* name, const char* key = "") {
    VORUnicodeString v;
    attributes->GetAttribute(t, name, key, v);
    return v;
  }
  VORProcess_var doc;
  VORIIPDAdapter_var adapter;
  VORIIPDAttributeMgt_var attributes;
  VORIIPDDataMgt_var data;
};
}  // namespace

TEST(HubTest, PlanTypesAttributesAndTheChildRelation) {
  Hub h;
  ASSERT_TRUE(h.doc->IsHubMode());
  ASSERT_TRUE(h.adapter && h.attributes && h.data);
  VORBaseUnknown_var station, line, missing;
  EXPECT_EQ(VORIPDServices::GetPlanTypeUnknowObject("Station", 0, h.adapter, station), S_OK);
  EXPECT_EQ(VORIPDServices::GetPlanTypeObject("Line", 0, h.adapter, line), S_OK);
  EXPECT_EQ(VORIPDServices::GetPlanTypeUnknowObject("Nope", 0, h.adapter, missing), S_FALSE);
  EXPECT_EQ(VORIPDServices::GetPlanTypeUnknowObject("Station", 0, nullptr, missing), E_FAIL);
  EXPECT_EQ(Utf8(h.Attr(station, "compclass")), "lumocompplantstation");
  EXPECT_EQ(Utf8(h.Attr(station, "plantype_name", "type")), "Station");
  EXPECT_EQ(Utf8(h.Attr(station, "plantype_name")), "") << "the type name lives under 'type'";
  List* children = nullptr;
  h.attributes->GetRelatedObjects(line, "lumoplantypechild", "recursiv", children);
  std::vector<std::string> names;
  for (const VORBaseUnknown_var& c : *children)
    names.push_back(Utf8(h.Attr(c, "name")));
  delete children;
  EXPECT_EQ(names, (std::vector<std::string>{"Station", "Group", "Transport", "Buffer", "Worker"}));

  // A plan type based on another inherits its attributes and, with "recursiv", its relations.
  VORModelDoor& door = h.doc->GetDoor();
  VORBaseUnknown_var cell;
  door.DefinePlanType("Weld cell", cell);
  door.SetPlanTypeBase(cell, station);
  EXPECT_EQ(Utf8(h.Attr(cell, "compclass")), "lumocompplantstation");
  EXPECT_EQ(Utf8(h.Attr(cell, "name")), "Weld cell");
  h.attributes->GetRelatedObjects(cell, "lumoplantypechild", nullptr, children);
  EXPECT_EQ(children->Size(), 0);
  delete children;
  h.attributes->GetRelatedObjects(cell, "lumoplantypechild", "recursiv", children);
  EXPECT_EQ(children->Size(), 3);
  delete children;
  EXPECT_EQ(door.SetPlanTypeBase(station, cell), E_INVALIDARG) << "a base cycle";
}

TEST(HubTest, ResourcesPlanTypesAndHubRecords) {
  Hub h;
  VORIProduct_var resources(h.doc->GetResourceRoot());
  List* list = nullptr;
  resources->GetChildren(list, "Resource");
  ASSERT_EQ(list->Size(), 1);
  VORBaseUnknown_var cell = (*list)[1];
  delete list;
  VORIProduct_var(cell)->GetChildren(list, "Resource");
  VORBaseUnknown_var station = (*list)[1];
  delete list;
  VORBaseUnknown_var planType;
  EXPECT_EQ(h.adapter->GetPlanType(station, planType), S_OK);
  EXPECT_EQ(Utf8(h.Attr(planType, "name")), "Station");
  EXPECT_EQ(h.adapter->GetPlanType(h.doc->GetRootProduct(), planType), S_FALSE);

  VORAttributeValue v;
  EXPECT_EQ(h.attributes->GetUserDefinedAttribute(station, "Invest", v), S_OK);
  EXPECT_EQ(v.type, VORAttributeDouble);
  EXPECT_EQ(h.attributes->GetUserDefinedAttribute(station, "Nothing", v), S_FALSE);
  EXPECT_EQ(v.type, VORAttributeNone);
  VORBaseUnknown_var record;
  ASSERT_EQ(h.data->GetHubObject(station, record), S_OK);
  EXPECT_EQ(h.adapter->DeleteHubObject(record), S_OK);
  EXPECT_EQ(h.data->GetHubObject(station, record), S_FALSE);
  EXPECT_EQ(h.attributes->GetUserDefinedAttribute(station, "Invest", v), S_FALSE);
  EXPECT_EQ(h.data->SetUserDefinedAttribute(station, "Invest", VORAttributeValue::Long(7)), S_OK);
  h.attributes->GetUserDefinedAttribute(station, "Invest", v);
  EXPECT_EQ(v.longValue, 7);

  // Leaving hub mode hides the planning interfaces.
  h.doc->GetDoor().SetEnvironmentName("");
  EXPECT_FALSE(VORIIPDAdapter_var(VORBaseUnknown_var(static_cast<VORIDocInit*>(h.doc.get()))));
}
