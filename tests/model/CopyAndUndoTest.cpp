// Deep copy and removal for copy/cut/paste, and the door's undo/redo of whole command stories.
#include "ModelTestSupport.h"

#include <random>

#include "VORModelGenerator.h"

using List = VORListValVORBaseUnknown_var;

namespace {
void ExpectConsistent(VORProcess* doc) {
  std::vector<std::string> problems;
  EXPECT_TRUE(VORModelChecker::Check(doc, problems)) << problems.front();
}
}  // namespace

TEST(DeepCopyTest, GroupingStoryCopiesStationsWithEverythingThenCutsTheOriginals) {
  SmallLine l;
  VORISPPResourceManagement_var(l.s2)->AssignResource(l.gun);
  VORIUserAttributes_var(l.s2)->SetAttributeValue("Shift", VORAttributeValue::Long(3));
  VORIGraphNodeLayout_var(l.s2)->SetPertPosition(62.5, 12.5);
  List selection;
  selection.Append(l.s2);
  selection.Append(l.s3);
  EXPECT_FALSE(VORSPPCopyServices::CanPasteInto(selection, l.s2)) << "into itself";
  EXPECT_FALSE(VORSPPCopyServices::CanPasteInto(selection, l.weld)) << "inside a source";
  List refused;
  EXPECT_EQ(VORSPPCopyServices::CopyActivities(selection, l.weld, refused), E_INVALIDARG);
  EXPECT_TRUE(refused.IsEmpty());

  List copies;
  ASSERT_EQ(VORSPPCopyServices::CopyActivities(selection, l.group, copies), S_OK);
  ASSERT_EQ(copies.Size(), 2);
  VORBaseUnknown_var s2c = copies[1], s3c = copies[2];
  EXPECT_NE(IdOf(s2c), IdOf(l.s2));
  // The flow between the two copied stations is copied; S1 -> S2 (outside) is not.
  List* list = nullptr;
  VORISPPFlowMgt_var(s2c)->GetNextActivities(list, "Activity");
  EXPECT_EQ(Ids(list), IdOf(s3c));
  VORISPPFlowMgt_var(s2c)->GetPreviousActivities(list, "Activity");
  EXPECT_EQ(Ids(list), "");
  // Inside: children with their inner flow, product IO, assignments (through the copied
  // input), resources, attributes and chart data; items and resources are shared.
  VORISPPChildManagement_var(s2c)->GetChildren(list);
  ASSERT_EQ(list->Size(), 2);
  VORBaseUnknown_var loadCopy = (*list)[1], weldCopy = (*list)[2];
  delete list;
  VORISPPFlowMgt_var(loadCopy)->GetNextActivities(list, "Activity");
  EXPECT_EQ(Ids(list), IdOf(weldCopy));
  VORISPPResourceManagement_var(weldCopy)->GetResources(list, "Resource");
  EXPECT_EQ(Ids(list), IdOf(l.robot));
  VORISPPResourceManagement_var(s2c)->GetResources(list, "Resource");
  EXPECT_EQ(Ids(list), IdOf(l.gun));
  VORISPPFlowMgt_var(s2c)->GetProductInputs(list);
  ASSERT_EQ(list->Size(), 1);
  VORBaseUnknown_var inCopy = (*list)[1], item, via;
  delete list;
  EXPECT_NE(inCopy, l.s2In);
  VORISPPProductIO_var(inCopy)->GetItem(item);
  EXPECT_EQ(item, l.panel);
  VORISPPItemMgt_var(s2c)->GetAssignmentInput(l.panel, via);
  EXPECT_EQ(via, inCopy);
  VORAttributeValue v;
  VORIUserAttributes_var(s2c)->GetAttributeValue("Shift", v);
  EXPECT_EQ(v.longValue, 3);
  double x = 0, y = 0;
  VORIGraphNodeLayout_var(s2c)->GetPertPosition(x, y);
  EXPECT_EQ(x, 62.5);
  ExpectConsistent(l.doc.get());

  // Cut: the originals go with their inner flows; the copies stay intact.
  ASSERT_EQ(VORSPPCopyServices::RemoveActivities(selection), S_OK);
  EXPECT_EQ(l.doc->FindObject(IdOf(l.s2)), nullptr);
  EXPECT_EQ(l.doc->FindObject(IdOf(l.weld)), nullptr);
  VORISPPFlowMgt_var(l.s1)->GetNextActivities(list, "Activity");
  EXPECT_EQ(Ids(list), "");
  VORILinkableObject_var(l.panel)->GetPointingObjects(list);
  EXPECT_EQ(Ids(list), IdOf(inCopy) + " " + IdOf(s2c)) << "only the copies use the panel";
  ExpectConsistent(l.doc.get());
}

TEST(UndoTest, AWholeCommandUndoesToTheSameDocumentAndRedoesToTheResult) {
  SmallLine l;
  const std::string before = l.doc->SaveToString();
  const std::string beforeDump = DumpDocument(l.doc.get());
  VORModelDoor& door = l.doc->GetDoor();
  VORChangeLog log;
  door.SetRecorder(&log);
  // A grouping-like story through the interfaces only.
  VORBaseUnknown_var g;
  VORISPPChildManagement_var(l.root)->CreateChild("BIWActivityGrouping", g);
  List selection, copies;
  selection.Append(l.s2);
  VORSPPCopyServices::CopyActivities(selection, g, copies);
  VORISPPFlowMgt_var(l.s1)->RemoveLink(l.s2);
  VORISPPFlowMgt_var(l.s1)->AddNextActivity(g);
  VORISPPFlowMgt_var(g)->AddNextActivity(l.s3);
  VORSPPCopyServices::RemoveActivities(selection);
  VORIProduct_var(l.doc->GetRootProduct())->RemoveChild(l.bracket);
  VORISPPAbstractActivity_var(g)->SetLabel("Group");
  VORIGraphNodeLayout_var(g)->SetPertPosition(100, 50);
  VORBaseUnknown_var ma;
  door.CreateMfgAssembly("MA", ma);
  QELIMfgAssembly_var(ma)->AddComponent(l.floor);
  door.DeleteMfgAssembly(ma);
  VORIProduct_var(l.cell)->RemoveChild(l.robot);
  door.SetRecorder(nullptr);
  ExpectConsistent(l.doc.get());
  const std::string after = l.doc->SaveToString();
  ASSERT_NE(after, before);
  EXPECT_GT(log.Size(), 10);

  VORChangeLog redo;
  door.Undo(log, &redo);
  EXPECT_TRUE(log.IsEmpty());
  EXPECT_EQ(l.doc->SaveToString(), before);
  EXPECT_EQ(DumpDocument(l.doc.get()), beforeDump) << "flow order at both ends restored too";
  ExpectConsistent(l.doc.get());
  // The handles of the removed objects are the live objects again.
  EXPECT_EQ(VORISpecObject_var(l.s2)->GetDocument(), l.doc.get());

  VORChangeLog again;
  door.Undo(redo, &again);
  EXPECT_EQ(l.doc->SaveToString(), after);
  ExpectConsistent(l.doc.get());
  door.Undo(again);
  EXPECT_EQ(l.doc->SaveToString(), before);
}

// Random sequences of edits on a generated line: after each step the invariants hold, and
// undoing everything gives back the first document.
TEST(UndoTest, RandomEditSequencesKeepInvariantsAndUndoCompletely) {
  VORModelGeneratorOptions o;
  o.activities = 60;
  VORProcess_var doc = VORProcess_var::Adopt(VORModelGenerator::Generate(o));
  const std::string before = doc->SaveToString();
  VORModelDoor& door = doc->GetDoor();
  std::mt19937 rnd(7);
  for (int round = 0; round < 3; ++round) {
    VORChangeLog log;
    door.SetRecorder(&log);
    for (int step = 0; step < 40; ++step) {
      List* stations = nullptr;
      VORISPPChildManagement_var(doc->GetRootProcess())->GetChildren(stations, "Activity");
      if (stations->Size() < 3) {
        delete stations;
        break;
      }
      auto pick = [&] { return (*stations)[1 + static_cast<int>(rnd() % stations->Size())]; };
      VORBaseUnknown_var a = pick(), b = pick();
      switch (rnd() % 6) {
        case 0:
          VORISPPFlowMgt_var(a)->AddNextActivity(b);
          break;
        case 1:
          VORISPPFlowMgt_var(a)->RemoveLink(b);
          break;
        case 2: {
          List one, copies;
          one.Append(a);
          VORSPPCopyServices::CopyActivities(one, b, copies);
          break;
        }
        case 3:
          VORISPPChildManagement_var(doc->GetRootProcess())->RemoveChild(a);
          break;
        case 4: {
          List* items = nullptr;
          VORISPPItemMgt_var(a)->GetAssignedItems(items);
          if (items->Size() > 0)
            VORISPPItemMgt_var(b)->AssignItem((*items)[1]);
          delete items;
          break;
        }
        default:
          VORIGraphNodeLayout_var(a)->SetPertPosition(rnd() % 500, rnd() % 500);
      }
      delete stations;
      std::vector<std::string> problems;
      ASSERT_TRUE(VORModelChecker::Check(doc.get(), problems))
          << "round " << round << " step " << step << ": " << problems.front();
    }
    door.SetRecorder(nullptr);
    door.Undo(log);
    ASSERT_EQ(doc->SaveToString(), before) << "round " << round;
  }
}
