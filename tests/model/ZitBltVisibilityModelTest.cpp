// The ZitBlt visibility an activity keeps with its document: a door change that is notified,
// undone and redone; saved, loaded and copied with the activity; bad values refuse the load.
#include "ModelTestSupport.h"

namespace {

void RecordModify(VORBaseUnknown* object, std::vector<std::string>& whats, VORCallbackId& id) {
  VOREventPublisher* publisher = VORIModelEvents_var(object)->GetEventPublisher();
  id = publisher->AddCallback(
      VORModify::ClassName(),
      [&whats](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        whats.push_back(static_cast<VORModify*>(n)->GetWhat());
      });
}

// "name=shown" for every recorded ZitBlt of the activity, in name order.
std::string Visibility(VORBaseUnknown* activity) {
  VORIZitBltVisibility_var zitBlts(activity);
  VORListValVORUnicodeString names;
  zitBlts->GetZitBltShownNames(names);
  std::string text;
  for (const VORUnicodeString& name : names) {
    bool shown = false;
    zitBlts->GetZitBltShown(name, shown);
    text += (text.empty() ? "" : " ") + Utf8(name) + "=" + (shown ? "1" : "0");
  }
  return text;
}

}  // namespace

TEST(ZitBltVisibilityModelTest, ChangesAreNotifiedCountedAndUndoneToNothingRecorded) {
  SmallLine l;
  VORModelDoor& door = l.doc->GetDoor();
  VORIZitBltVisibility_var s1(l.s1);
  bool shown = true;
  EXPECT_EQ(s1->GetZitBltShown("ResourceList", shown), S_FALSE);
  EXPECT_TRUE(shown) << "untouched when nothing is recorded";

  std::vector<std::string> whats;
  VORCallbackId id = 0;
  RecordModify(l.s1, whats, id);
  const long before = door.ChangeCount();
  VORChangeLog log;
  VORChangeLog* outer = door.SetRecorder(&log);
  EXPECT_EQ(s1->SetZitBltShown("ResourceList", false), S_OK);
  EXPECT_EQ(s1->SetZitBltShown("ResourceList", false), S_OK);  // unchanged: no change at all
  EXPECT_EQ(s1->SetZitBltShown("All", true), S_OK);
  door.SetRecorder(outer);
  EXPECT_EQ(door.ChangeCount(), before + 2);
  EXPECT_EQ(whats, (std::vector<std::string>{"zitblt", "zitblt"}));
  EXPECT_EQ(Visibility(l.s1), "All=1 ResourceList=0");
  EXPECT_EQ(Visibility(l.s2), "") << "another activity is not touched";
  EXPECT_TRUE(l.doc->IsModified());

  VORChangeLog redo;
  door.Undo(log, &redo);
  EXPECT_EQ(Visibility(l.s1), "") << "undo forgets what was first recorded";
  EXPECT_EQ(whats.size(), 4u) << "the undo is notified too";
  door.Undo(redo);
  EXPECT_EQ(Visibility(l.s1), "All=1 ResourceList=0");

  EXPECT_EQ(s1->ForgetZitBltShown("All"), S_OK);
  EXPECT_EQ(Visibility(l.s1), "ResourceList=0");
  EXPECT_EQ(s1->SetZitBltShown("", true), E_INVALIDARG);
  VORIModelEvents_var(l.s1)->GetEventPublisher()->RemoveCallback(id);
}

TEST(ZitBltVisibilityModelTest, SavedLoadedAndCopiedWithTheActivity) {
  SmallLine l;
  VORIZitBltVisibility_var(l.s2)->SetZitBltShown("ProductInput", false);
  VORIZitBltVisibility_var(l.s2)->SetZitBltShown("Ressourcen <&> \"ä\"", true);
  std::string error;
  VORProcess_var again =
      VORProcess_var::Adopt(VORProcess::LoadFromString(l.doc->SaveToString(), "v.pprx", error));
  ASSERT_TRUE(again) << error;
  EXPECT_EQ(DumpDocument(again.get()), DumpDocument(l.doc.get()));
  EXPECT_EQ(Visibility(again->FindObject(IdOf(l.s2))), "ProductInput=0 Ressourcen <&> \"ä\"=1");
  EXPECT_EQ(again->SaveToString(), l.doc->SaveToString());

  VORListValVORBaseUnknown_var sources, copies;
  sources.Append(l.s2);
  ASSERT_EQ(VORSPPCopyServices::CopyActivities(sources, l.group, copies), S_OK);
  ASSERT_EQ(copies.Size(), 1);
  EXPECT_EQ(Visibility(copies[1].get()), Visibility(l.s2.get()));
}

TEST(ZitBltVisibilityModelTest, BadEntriesFailTheLoadNamingTheActivity) {
  const std::string head = R"(<?xml version="1.0" encoding="UTF-8"?>
<pprDocument version="1">
  <process>
    <activity id="A1" type="BIWActivityRoot" label="Line">
      <activity id="A2" type="BIWActivityStation" label="S1">)";
  const std::string tail = R"(
      </activity>
    </activity>
  </process>
</pprDocument>
)";
  struct Case {
    std::string body, expected;
  };
  const std::vector<Case> cases = {
      {R"(<zitblt name="X" shown="2"/>)", "'A2': ZitBlt 'X' shown is not 0 or 1"},
      {R"(<zitblt name="X" shown="no"/>)", "'A2': attribute 'shown' is not an integer"},
      {R"(<zitblt name="X"/><zitblt name="X" shown="0"/>)",
       "'A2': ZitBlt 'X' empty or given twice"},
      {R"(<zitblt shown="0"/>)", "without the attribute 'name'"},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.body);
    std::string error;
    EXPECT_FALSE(
        VORProcess_var::Adopt(VORProcess::LoadFromString(head + c.body + tail, "bad.pprx", error)));
    EXPECT_NE(error.find(c.expected), std::string::npos) << error;
    EXPECT_NE(error.find("bad.pprx:"), std::string::npos) << error;
  }
  std::string error;
  VORProcess_var ok = VORProcess_var::Adopt(
      VORProcess::LoadFromString(head + R"(<zitblt name="X"/>)" + tail, "ok.pprx", error));
  ASSERT_TRUE(ok) << error;
  EXPECT_EQ(Visibility(ok->FindObject("A2")), "X=1") << "shown defaults to 1";
}
