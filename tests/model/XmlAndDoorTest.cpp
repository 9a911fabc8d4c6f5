// The hardened parser used by every XML reader, and the door's promise that a refused change
// changes nothing.
#include "ModelTestSupport.h"

#include <sys/stat.h>

#include <cmath>

#include <xercesc/dom/DOM.hpp>

#include "VORXercesPlatform.h"

using List = VORListValVORBaseUnknown_var;

TEST(XercesPlatformTest, PositionsOfElementsAndErrorsAreLineAndColumn) {
  std::string error;
  const std::string text = "<a>\n  <b/>\n\t<c x='1'>\n  </c></a>";
  VORXercesPlatform::Document doc = VORXercesPlatform::ParseMemory(text, "t.xml", error);
  ASSERT_TRUE(doc) << error;
  xercesc::DOMElement* b = doc.get()->getDocumentElement()->getFirstElementChild();
  xercesc::DOMElement* c = b->getNextElementSibling();
  long line = 0, column = 0;
  ASSERT_TRUE(doc.ElementPosition(b, line, column));
  EXPECT_EQ(line, 2);
  EXPECT_EQ(column, 3);
  ASSERT_TRUE(doc.ElementPosition(c, line, column));
  EXPECT_EQ(line, 3);
  EXPECT_EQ(column, 2);
  EXPECT_EQ(VORXercesPlatform::ToUTF8(c->getAttribute(reinterpret_cast<const XMLCh*>(u"x"))), "1");

  EXPECT_FALSE(VORXercesPlatform::ParseMemory("<a>\n<b></a>", "u.xml", error));
  EXPECT_EQ(error.rfind("u.xml:2:", 0), 0u) << error;
  EXPECT_FALSE(VORXercesPlatform::ParseMemory("", "empty.xml", error));
  EXPECT_EQ(error.rfind("empty.xml", 0), 0u) << error;
}

TEST(XercesPlatformTest, LimitsOnSizeMemoryAndFilesThatAreNoFiles) {
  std::string big = "<a>";
  for (int i = 0; i < 20000; ++i)
    big += "<b name='some text to fill memory'/>";
  big += "</a>";
  std::string error;
  VORXercesPlatform::ParseLimits tight;
  tight.maxMemoryBytes = 512 * 1024;
  EXPECT_FALSE(VORXercesPlatform::ParseMemory(big, "big.xml", error, tight));
  EXPECT_NE(error.find("MiB"), std::string::npos) << error;
  EXPECT_TRUE(VORXercesPlatform::ParseMemory(big, "big.xml", error)) << error;
  tight = {};
  tight.maxFileBytes = 100;
  EXPECT_FALSE(VORXercesPlatform::ParseMemory(big, "big.xml", error, tight));

  TempDir dir;
  const std::string fifo = dir.File("pipe.xml");
  ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
  EXPECT_FALSE(VORXercesPlatform::ParseFile(fifo, error)) << "must not block on a FIFO";
  EXPECT_NE(error.find(fifo), std::string::npos);
  EXPECT_FALSE(VORXercesPlatform::ParseFile(dir.Path(), error)) << "a directory";

  // Text outside the Basic Multilingual Plane survives the conversions.
  const std::string word = "G\xC3\xBCte \xF0\x9F\x94\xA7";
  EXPECT_EQ(VORXercesPlatform::ToUTF8(
                reinterpret_cast<const XMLCh*>(VORXercesPlatform::FromUTF8(word).c_str())),
            word);
}

TEST(DoorTest, RefusedChangesLeaveTheDocumentAndItsListenersUntouched) {
  SmallLine l;
  SmallLine other;
  const std::string before = l.doc->SaveToString();
  VORModelDoor& door = l.doc->GetDoor();
  const long changes = door.ChangeCount();
  ActivityRecorder rec(l.root);
  VORChangeLog log;
  door.SetRecorder(&log);
  VORBaseUnknown_var out;
  // Objects of another document, removed objects, wrong kinds, bad values.
  EXPECT_EQ(door.AddFlow(l.s1, other.s2), E_INVALIDARG);
  EXPECT_EQ(door.AssignItem(l.s1, other.panel), E_INVALIDARG);
  EXPECT_EQ(door.AssignResource(l.s1, other.robot), E_INVALIDARG);
  EXPECT_EQ(door.CreateNode(other.s1, "BIWActivityStation", out), E_INVALIDARG);
  EXPECT_EQ(door.CreateNode(l.s1, "BIWActivityStation", out, 0, IdOf(l.s2).c_str()), E_INVALIDARG)
      << "a taken id";
  EXPECT_EQ(door.RemoveNode(l.root), E_INVALIDARG) << "the root stays";
  EXPECT_EQ(door.AddProductIO(l.s1, l.s2, true, out), E_INVALIDARG) << "an activity is no item";
  EXPECT_EQ(door.SetPertNodeState(l.s1, 3), E_INVALIDARG);
  EXPECT_EQ(door.SetPertNodeSize(l.s1, -1, 2), E_INVALIDARG);
  EXPECT_EQ(door.ReparentProduct(l.cell, l.gun), E_INVALIDARG) << "into its own subtree";
  EXPECT_EQ(door.SetReferenceProduct(l.floor, other.panel), E_INVALIDARG);
  EXPECT_EQ(door.SetUserAttribute(l.s1, "", VORAttributeValue::Long(1)), E_INVALIDARG);
  EXPECT_EQ(door.DefinePlanType("", out), E_INVALIDARG);
  EXPECT_EQ(door.SetResourcePlanType(l.panel, "Robot"), E_INVALIDARG) << "not a resource";
  VORISPPChildManagement_var(other.root)->RemoveChild(other.s3);
  EXPECT_EQ(VORISPPFlowMgt_var(other.s3)->AddNextActivity(other.s1), E_FAIL) << "removed";
  EXPECT_EQ(VORISPPItemMgt_var(other.s3)->AssignItem(other.panel), E_FAIL);
  door.SetRecorder(nullptr);

  EXPECT_EQ(door.ChangeCount(), changes);
  EXPECT_TRUE(log.IsEmpty());
  EXPECT_TRUE(rec.Take().empty());
  EXPECT_FALSE(l.doc->IsModified());
  EXPECT_EQ(l.doc->SaveToString(), before);
}

TEST(DoorTest, NonFiniteNumbersAreRefusedAsTheReaderRefusesThem) {
  SmallLine l;
  VORModelDoor& door = l.doc->GetDoor();
  door.SetPertPosition(l.s1, true, 12.5, 37.5);
  door.SetUserAttribute(l.s1, "Cost", VORAttributeValue::Double(2.5));
  const std::string before = l.doc->SaveToString();
  const long changes = door.ChangeCount();
  VORChangeLog log;
  door.SetRecorder(&log);
  for (const double bad : {std::nan(""), HUGE_VAL, -HUGE_VAL}) {
    SCOPED_TRACE(bad);
    EXPECT_EQ(door.SetActivityTime(l.s1, bad), E_INVALIDARG);
    EXPECT_EQ(door.SetStationCycleTime(l.s1, bad), E_INVALIDARG);
    EXPECT_EQ(door.SetPertPosition(l.s1, true, bad, 1), E_INVALIDARG);
    EXPECT_EQ(door.SetPertPosition(l.s1, true, 1, bad), E_INVALIDARG);
    EXPECT_EQ(door.SetPertNodeSize(l.s1, bad, 1), E_INVALIDARG);
    EXPECT_EQ(door.SetPertNodeSize(l.s1, 1, bad), E_INVALIDARG);
    EXPECT_EQ(door.SetUserAttribute(l.s1, "Cost", VORAttributeValue::Double(bad)), E_INVALIDARG);
    EXPECT_EQ(door.SetHubAttribute(l.s1, "weight", VORAttributeValue::Double(bad)), E_INVALIDARG);
    // The same through the interfaces that planners' commands use.
    EXPECT_EQ(VORISPPAbstractActivity_var(l.s2)->SetActivityTime(bad), E_INVALIDARG);
    VORIGraphNodeLayout_var(l.s2)->SetPertPosition(bad, 0);
  }
  door.SetRecorder(nullptr);
  EXPECT_EQ(door.ChangeCount(), changes);
  EXPECT_TRUE(log.IsEmpty());
  EXPECT_EQ(l.doc->SaveToString(), before);
  std::string error;
  EXPECT_TRUE(VORProcess_var::Adopt(VORProcess::LoadFromString(before, "again.pprx", error)))
      << error;
  // Forgetting a position takes no coordinates: whatever they hold is not stored.
  EXPECT_EQ(door.SetPertPosition(l.s1, false, std::nan(""), HUGE_VAL), S_OK);
  EXPECT_NE(l.doc->SaveToString(), before);
}

TEST(DoorTest, HandlesOutliveTheirDocumentWithoutDanglingReferences) {
  VORBaseUnknown_var s2, panel, io;
  {
    SmallLine l;
    s2 = l.s2;
    panel = l.panel;
    io = l.s2In;
  }
  // The document is gone: the objects answer as detached ones.
  List* list = nullptr;
  VORISPPFlowMgt_var(s2)->GetPreviousActivities(list, "");
  EXPECT_EQ(Ids(list), "");
  VORILinkableObject_var(panel)->GetPointingObjects(list);
  EXPECT_EQ(Ids(list), "");
  VORBaseUnknown_var activity;
  EXPECT_EQ(VORISPPProductIO_var(io)->GetActivity(activity), S_FALSE);
  EXPECT_EQ(VORISPPAbstractActivity_var(s2)->SetLabel("x"), E_FAIL);
  EXPECT_EQ(VORISpecObject_var(s2)->GetDocument(), nullptr);
}
