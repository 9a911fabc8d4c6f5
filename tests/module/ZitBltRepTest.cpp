#include "QELZitBltRep.h"

#include "VOR2DImagePixelRep.h"
#include "VOR2DManipulator.h"
#include "VORDocument.h"
#include "VORFrmEditor.h"
#include "ZitBltTestSupport.h"

namespace {

class ZitBltRepTest : public ::testing::Test {
 protected:
  void SetUp() override {
    _live = VORBaseUnknown::LiveInstances();
    // A 16 x 8 pixel icon: a 4 x 2 button.
    startup.WriteIcon("I_Test", 16, 8);
  }
  void TearDown() override {
    for (QELZitBltRep* rep : reps)
      rep->RequestDelayedDestruction();
    reps.clear();
    VORDeferredDeletion::Drain();
    QELZitBltRep::ForgetIcons();
    EXPECT_EQ(VORBaseUnknown::LiveInstances(), _live) << "leaked objects";
  }
  QELZitBltRep* Make(const char* location, const char* icon = "I_Test") {
    auto* rep = new QELZitBltRep();
    rep->SetName("Test");
    rep->SetLocation(location);
    rep->SetIcon(icon);
    rep->BuildRep(nullptr);
    reps.push_back(rep);
    return rep;
  }
  static VOR2DImagePixelRep* Icon(QELZitBltRep* rep) {
    return dynamic_cast<VOR2DImagePixelRep*>(rep->GetZitBltBtn()->GetChild(1));
  }
  static double X(QELZitBltRep* rep) {
    double x = 0.0, y = 0.0;
    rep->GetPoDPosition(x, y);
    return x;
  }
  static double Y(QELZitBltRep* rep) {
    double x = 0.0, y = 0.0;
    rep->GetPoDPosition(x, y);
    return y;
  }

  ZitBltStartupDir startup;
  std::vector<QELZitBltRep*> reps;
  long _live = 0;
};

TEST_F(ZitBltRepTest, IconOffsetFollowsTheLocationKeywordSideBySide) {
  // Icon 4 x 2 units: half sizes 2 and 1, then the provisional anchor (-2, -2).
  struct Case {
    const char* location;
    float x, y;
  } cases[] = {
      {"lefttop", -4, -3},    {"leftbottom", -4, -3}, {"bottomright", -4, -3},
      {"leftmiddle", -4, -2}, {"righttop", 0, -3},    {"rightbottom", 0, -3},
      {"bottomleft", 0, -3},  {"rightmiddle", 0, -2}, {"topleft", 0, -1},
      {"topmiddle", -2, -1},  {"topright", -4, -1},   {"bottommiddle", -2, -3},
      {"", -2, -2},           {"LeftTop", -2, -2},
  };
  for (const Case& c : cases) {
    QELZitBltRep* rep = Make(c.location);
    ASSERT_EQ(rep->GetZitBltBtn()->GetSize(), 1) << c.location;
    EXPECT_EQ(Icon(rep)->GetPoint(), VORMathPoint2Df(c.x, c.y)) << c.location;
  }
}

TEST_F(ZitBltRepTest, TheButtonManipulatorIsMadeByTheFirstPickAndDroppedByARebuild) {
  QELZitBltRep* rep = Make("topmiddle");
  VOR2DBagRep_var first = rep->GetZitBltBtn();
  EXPECT_EQ(first->GetManipulator(), nullptr) << "an untouched button carries none";
  VORManipulator* picked = first->PickManipulator();
  ASSERT_NE(picked, nullptr);
  EXPECT_EQ(picked, rep->GetManipulator());
  EXPECT_EQ(first->GetManipulator(), picked) << "the manipulator acts on the button bag";
  EXPECT_EQ(first->PickManipulator(), picked) << "made once";

  rep->BuildRep(nullptr);
  EXPECT_EQ(first->PickManipulator(), nullptr) << "the old bag no longer reaches the ZitBlt";
  EXPECT_NE(rep->GetZitBltBtn()->PickManipulator(), nullptr);
}

TEST_F(ZitBltRepTest, TopAndBottomSlideAlongXAndEveryOtherKeywordAlongY) {
  for (const char* horizontal :
       {"topleft", "topmiddle", "topright", "bottomleft", "bottommiddle", "bottomright"}) {
    QELZitBltRep* rep = Make(horizontal);
    EXPECT_TRUE(rep->IsHorizontalLimitOn() && !rep->IsVerticalLimitOn()) << horizontal;
    EXPECT_EQ(rep->GetManipulator()->GetDirection().x, 1.0f) << horizontal;
  }
  for (const char* vertical : {"lefttop", "rightmiddle", "", "middle"}) {
    QELZitBltRep* rep = Make(vertical);
    EXPECT_TRUE(rep->IsVerticalLimitOn() && !rep->IsHorizontalLimitOn()) << vertical;
    EXPECT_EQ(rep->GetManipulator()->GetDirection().y, 1.0f) << vertical;
    EXPECT_EQ(rep->GetManipulator()->GetName(), VORString("ActivManip"));
  }
}

TEST_F(ZitBltRepTest, LimitsWidenByHalfTheButtonExceptTheMinimumX) {
  QELZitBltRep* rep = Make("");
  rep->SetPositioningLimits(0, 0, 10, 10);
  double a = 0, b = 0, c = 0, d = 0;
  rep->GetPositioningLimits(a, b, c, d);
  EXPECT_EQ(a, -2.0);
  EXPECT_EQ(b, 1.0);
  EXPECT_EQ(c, 12.0);
  EXPECT_EQ(d, 11.0);
  // Without a button nothing is stored.
  auto* unbuilt = new QELZitBltRep();
  reps.push_back(unbuilt);
  unbuilt->SetPositioningLimits(0, 0, 10, 10);
  unbuilt->GetPositioningLimits(a, b, c, d);
  EXPECT_EQ(a, 0.0);
  EXPECT_EQ(d, 0.0);
}

TEST_F(ZitBltRepTest, DragPastTheLimitIsRefusedAndTheNextStepCarriesTheRefusedDistance) {
  QELZitBltRep* rep = Make("topmiddle");
  auto counter = VORHandle<NotificationCounter>::Adopt(new NotificationCounter());
  rep->SetFather(counter);
  rep->SetPoDPosition(0, 5);
  rep->SetPositioningLimits(-10, -5, 10, 5);  // x within [-12, 12]
  VORManipulator* m = rep->GetManipulator();
  m->PointerPress(nullptr, {0, 5}, 0, rep->GetZitBltBtn());
  m->PointerDrag({1, 7}, 0);  // first event: only records the point (the y step is projected out)
  EXPECT_EQ(X(rep), 0.0);
  m->PointerDrag({4, 5}, 0);
  EXPECT_EQ(X(rep), 3.0);
  m->PointerDrag({14, 5}, 0);  // 13 > 12: refused, the drag point stays at 4
  EXPECT_EQ(X(rep), 3.0);
  m->PointerDrag({12, 5}, 0);  // 8 from the older point: 11
  EXPECT_EQ(X(rep), 11.0);
  EXPECT_EQ(Y(rep), 5.0);
  m->PointerRelease({12, 5}, 0);
  // The refused step was not sent on; the record-only one was.
  EXPECT_EQ(
      std::count(counter->events.begin(), counter->events.end(), VORManipulator::kVORManipulate),
      3);
  // The drag point survives the gesture: a new drag measures from the last accepted point.
  m->PointerPress(nullptr, {12, 5}, 0, rep->GetZitBltBtn());
  m->PointerDrag({11, 5}, 0);  // manipulator position 11, last point 12: one back
  EXPECT_EQ(X(rep), 10.0);
  rep->SetFather(nullptr);
}

TEST_F(ZitBltRepTest, LeftEdgeRefusesVerticalStepsOutsideTheNodeOnly) {
  QELZitBltRep* rep = Make("leftmiddle");
  rep->SetPoDPosition(-10, 0);
  rep->SetPositioningLimits(-10, -5, 10, 5);  // y within [-4, 6]
  VORManipulator* m = rep->GetManipulator();
  m->PointerPress(nullptr, {-10, 0}, 0, rep->GetZitBltBtn());
  m->PointerDrag({-10, 1}, 0);
  m->PointerDrag({-10, -5}, 0);  // -6 < -4: refused
  EXPECT_EQ(Y(rep), 0.0);
  m->PointerDrag({-10, 6}, 0);  // +5: accepted
  EXPECT_EQ(Y(rep), 5.0);
  EXPECT_EQ(X(rep), -10.0);
}

TEST_F(ZitBltRepTest, ClickTogglesAndDirectExpandLeavesTheButtonState) {
  QELZitBltRep* rep = Make("righttop");
  auto counter = VORHandle<NotificationCounter>::Adopt(new NotificationCounter());
  rep->SetFather(counter);
  EXPECT_TRUE(rep->IsButtonCollapse());
  EXPECT_FALSE(rep->GetZitBltExpanded()->IsShown());
  VORManipulator* m = rep->GetManipulator();
  auto click = [&] {
    m->PointerPress(nullptr, {1, 1}, 0, rep->GetZitBltBtn());
    m->PointerRelease({1, 1}, 0);
  };
  click();
  EXPECT_FALSE(rep->IsButtonCollapse());
  EXPECT_TRUE(rep->GetZitBltExpanded()->IsShown());
  click();
  EXPECT_TRUE(rep->IsButtonCollapse());
  EXPECT_FALSE(rep->GetZitBltExpanded()->IsShown());
  EXPECT_EQ(counter->events,
            (std::vector<std::string>{VORManipulator::kVORActivate, VORManipulator::kVORActivate}));
  // Expanding directly sets only the collapsed flag: the next click opens it again.
  rep->ExpandZitBlt();
  click();
  EXPECT_FALSE(rep->IsButtonCollapse());
  EXPECT_EQ(rep->GetButtonState(), 1);
  rep->SetFather(nullptr);
}

TEST_F(ZitBltRepTest, StatusShowsOrHidesBothBagsAndKeepsOtherValuesOnly) {
  QELZitBltRep* rep = Make("lefttop");
  rep->SetStatus(1);  // collapsed, yet the expanded bag is shown too
  EXPECT_TRUE(rep->GetZitBltExpanded()->IsShown());
  rep->SetStatus(0);
  EXPECT_FALSE(rep->GetZitBltBtn()->IsShown());
  EXPECT_FALSE(rep->GetZitBltExpanded()->IsShown());
  rep->SetStatus(2);
  EXPECT_EQ(rep->GetStatus(), 2);
  EXPECT_FALSE(rep->GetZitBltBtn()->IsShown());
}

TEST_F(ZitBltRepTest, GreyIconAndMissingIconFile) {
  QELZitBltRep* rep = Make("lefttop");
  VORPixelImage* colour = Icon(rep)->GetPixelImage();
  ASSERT_EQ(colour->GetFormat(), VORPixelImage::RGBA);
  EXPECT_EQ(colour->GetPixels()[0], 200);  // red
  EXPECT_EQ(Icon(rep)->GetAlphaMode(), 1);
  rep->SetZitbltButtonGrey(1);
  ASSERT_EQ(rep->GetZitBltBtn()->GetSize(), 1);  // the old icon was replaced
  const auto& grey = Icon(rep)->GetPixelImage()->GetPixels();
  EXPECT_EQ(grey[0], grey[1]);
  EXPECT_EQ(grey[1], grey[2]);
  EXPECT_EQ(grey[3], 255);  // opaque

  QELZitBltRep* missing = Make("lefttop", "I_NoSuchIcon");
  EXPECT_EQ(missing->GetZitBltBtn()->GetSize(), 0);
  missing->SetIcon("I_NoSuchIcon");
  rep->SetIcon("I_NoSuchIcon");
  rep->SetZitbltButtonGrey(0);  // keeps what it had
  EXPECT_EQ(rep->GetZitBltBtn()->GetSize(), 1);
  EXPECT_EQ(rep->EmptyExpandedBagRep(), E_FAIL);
}

TEST_F(ZitBltRepTest, IconsDecodedOnceEqualTheFileReadDirectlyAndAreNotShared) {
  QELZitBltRep* first = Make("lefttop");
  QELZitBltRep* second = Make("righttop");
  VORUnicodeString path;
  ASSERT_EQ(VORGetImagePathName("I_Test.bmp", path), S_OK);
  auto direct = VORPixelImage_var::Adopt(VORPixelImage::CreateFromFile(path, 0));
  ASSERT_TRUE(direct);
  direct->Convert(VORPixelImage::RGBA);
  direct->SetTransparency(0);
  EXPECT_EQ(Icon(first)->GetPixelImage()->GetPixels(), direct->GetPixels());
  EXPECT_EQ(Icon(second)->GetPixelImage()->GetPixels(), direct->GetPixels());
  EXPECT_EQ(Icon(second)->GetPixelImage()->GetWidth(), direct->GetWidth());
  first->SetZitbltButtonGrey(1);  // converts its own copy only
  EXPECT_EQ(Icon(second)->GetPixelImage()->GetPixels(), direct->GetPixels());
  EXPECT_NE(Icon(first)->GetPixelImage()->GetPixels(), direct->GetPixels());
}

TEST_F(ZitBltRepTest, BagsJoinTheCurrentEditorsInteractiveSetUntilTheRepGoes) {
  auto doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
  auto editor = VORFrmEditor_var::Adopt(new VORFrmEditor(doc));
  VORFrmEditor::SetCurrentEditor(editor);
  QELZitBltRep* rep = Make("lefttop");
  QELZitBltRep* next = Make("righttop");
  const VORListValVORBaseUnknown_var& models = editor->GetISO()->GetElements();
  ASSERT_EQ(models.Size(), 4);
  auto repOf = [&](int position) { return VORModelForRep2D_var(models[position])->GetRep(); };
  // A closed ZitBlt has no expanded bag yet, but its model already holds the bag's place: the
  // bag made when it opens is drawn and picked where it always was, before the next ZitBlt.
  EXPECT_EQ(repOf(1), rep->GetZitBltBtn());
  EXPECT_EQ(repOf(2), nullptr);
  rep->SetPoDPosition(7.0, 3.0);
  rep->ChangeBtnState();
  VOR2DBagRep* expanded = rep->GetZitBltExpanded();
  EXPECT_TRUE(expanded->IsShown());
  EXPECT_EQ(repOf(2), expanded);
  EXPECT_EQ(repOf(3), next->GetZitBltBtn());
  double x = 0.0, y = 0.0;
  expanded->GetMatrix()->GetTranslation(x, y);
  EXPECT_EQ(x, 7.0);
  EXPECT_EQ(y, 3.0);
  next->RequestDelayedDestruction();
  reps.pop_back();
  VORDeferredDeletion::Drain();
  EXPECT_EQ(editor->GetISO()->GetElements().Size(), 2);
  rep->BuildRep(nullptr);  // a rebuild replaces the models
  EXPECT_EQ(editor->GetISO()->GetElements().Size(), 2);
  rep->RequestDelayedDestruction();
  reps.clear();
  VORDeferredDeletion::Drain();
  EXPECT_EQ(editor->GetISO()->GetElements().Size(), 0);
  VORFrmEditor::SetCurrentEditor(nullptr);
}

TEST(ZitBltSharedTextTest, EqualTextsShareOneCopyWhateverCopyIsPassed) {
  // Copies of one text, texts made anew, and texts that die and leave their place to others.
  std::vector<VORUnicodeString> kept;
  for (int round = 0; round < 3; ++round) {
    for (int i = 0; i < 200; ++i) {
      const VORUnicodeString fresh("location" + std::to_string(i % 70));
      kept.push_back(fresh);
      const VORUnicodeString& shared = QELSharedText(fresh);
      EXPECT_EQ(shared, fresh);
      EXPECT_EQ(&shared, &QELSharedText(kept[static_cast<size_t>(i % 70)]));
      EXPECT_EQ(&shared, &QELSharedText(VORUnicodeString(fresh.ConvertToUTF8())));
    }
    kept.resize(70);
  }
  EXPECT_NE(&QELSharedText("ab"), &QELSharedText("abc"));
}

}  // namespace
