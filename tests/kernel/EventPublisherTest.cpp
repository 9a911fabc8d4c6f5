#include <gtest/gtest.h>

#include <vector>

#include "VOREventPublisher.h"
#include "VORHandle.h"

namespace {

class ActivityChanged : public VORNotification {
  VOR_DECLARE_CLASS(ActivityChanged, VORNotification)
};
class ChildAdded : public ActivityChanged {
  VOR_DECLARE_CLASS(ChildAdded, ActivityChanged)
};

struct Recorder {
  std::vector<std::string> calls;
  VORCallbackFunction Callback(const std::string& tag) {
    return [this, tag](VORBaseUnknown*, const std::string& event, VORNotification*, void*,
                       VORCallbackId) { calls.push_back(tag + ":" + event); };
  }
};

TEST(EventPublisherTest, CallbacksFireByEventNameOrNotificationKindInRegistrationOrder) {
  VORHandle<VOREventPublisher> publisher =
      VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher());
  Recorder r;
  publisher->AddCallback("ActivityChanged", r.Callback("kind"));
  publisher->AddCallback("DISPATCHER_SPP_VIEWS_CHANGE", r.Callback("views"));
  publisher->AddCallback("ChildAdded", r.Callback("exact"));

  VORHandle<ChildAdded> added = VORHandle<ChildAdded>::Adopt(new ChildAdded());
  EXPECT_EQ(publisher->Dispatch(added), 2);
  EXPECT_EQ(publisher->Dispatch("DISPATCHER_SPP_VIEWS_CHANGE", added), 3);
  VORHandle<ActivityChanged> plain = VORHandle<ActivityChanged>::Adopt(new ActivityChanged());
  EXPECT_EQ(publisher->Dispatch(plain), 1);
  EXPECT_EQ(r.calls, (std::vector<std::string>{
                         "kind:ChildAdded", "exact:ChildAdded", "kind:DISPATCHER_SPP_VIEWS_CHANGE",
                         "views:DISPATCHER_SPP_VIEWS_CHANGE", "exact:DISPATCHER_SPP_VIEWS_CHANGE",
                         "kind:ActivityChanged"}));
}

TEST(EventPublisherTest, RemovalDuringDispatchSilencesAtOnceAndAdditionsWaitForTheNextEvent) {
  VORHandle<VOREventPublisher> publisher =
      VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher());
  Recorder r;
  VORCallbackId second = 0;
  publisher->AddCallback(
      "E", [&](VORBaseUnknown*, const std::string&, VORNotification*, void*, VORCallbackId self) {
        r.calls.push_back("first");
        publisher->RemoveCallback(second);
        publisher->RemoveCallback(self);
        publisher->AddCallback("E", r.Callback("late"));
      });
  second = publisher->AddCallback("E", r.Callback("second"));
  EXPECT_EQ(publisher->Dispatch("E"), 1);
  EXPECT_EQ(r.calls, std::vector<std::string>{"first"});
  EXPECT_EQ(publisher->CallbackCount(), 1);
  publisher->Dispatch("E");
  EXPECT_EQ(r.calls.back(), "late:E");
  EXPECT_FALSE(publisher->RemoveCallback(second));
}

TEST(EventPublisherTest, SubscriberTagsRemoveAllOfOneSubscriberAndIdsAreUnique) {
  VORHandle<VOREventPublisher> a = VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher());
  VORHandle<VOREventPublisher> b = VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher());
  int me = 0, other = 0;
  Recorder r;
  VORCallbackId id1 = a->AddCallback("E", r.Callback("1"), nullptr, &me);
  VORCallbackId id2 = b->AddCallback("E", r.Callback("2"), nullptr, &me);
  a->AddCallback("E", r.Callback("3"), nullptr, &other);
  EXPECT_NE(id1, id2);
  EXPECT_NE(id1, 0u);
  EXPECT_FALSE(a->RemoveCallback(id2)) << "an id of another publisher";
  EXPECT_EQ(a->RemoveCallbacksOf(&me), 1);
  a->Dispatch("E");
  EXPECT_EQ(r.calls, std::vector<std::string>{"3:E"});
  EXPECT_EQ(a->AddCallback("E", nullptr), 0u);
}

TEST(EventPublisherTest, RemovingManyCallbacksOneByOneKeepsTheOthersInOrder) {
  auto p = VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher());
  std::vector<int> calls;
  std::vector<VORCallbackId> ids;
  for (int i = 0; i < 100; ++i)
    ids.push_back(
        p->AddCallback("E", [&calls, i](VORBaseUnknown*, const std::string&, VORNotification*,
                                        void*, VORCallbackId) { calls.push_back(i); }));
  for (int i = 1; i < 100; i += 2)
    EXPECT_TRUE(p->RemoveCallback(ids[static_cast<size_t>(i)]));
  EXPECT_FALSE(p->RemoveCallback(ids[1]));  // already gone
  EXPECT_FALSE(p->RemoveCallback(12345678));
  EXPECT_EQ(p->CallbackCount(), 50);
  EXPECT_TRUE(p->HasCallback(ids[98]));
  EXPECT_FALSE(p->HasCallback(ids[99]));
  EXPECT_EQ(p->Dispatch("E"), 50);
  ASSERT_EQ(calls.size(), 50u);
  for (size_t k = 0; k < calls.size(); ++k)
    EXPECT_EQ(calls[k], static_cast<int>(2 * k));
  // Removal after a compaction still finds the survivors.
  EXPECT_TRUE(p->RemoveCallback(ids[50]));
  EXPECT_EQ(p->CallbackCount(), 49);
}

TEST(EventPublisherTest, KeyedDispatchReachesItsKeyAndTheUnkeyedInRegistrationOrder) {
  auto p = VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher());
  Recorder r;
  int a = 0, b = 0, c = 0;
  p->AddKeyedCallback(&a, "E", r.Callback("a1"));
  p->AddCallback("E", r.Callback("all"));
  p->AddKeyedCallback(&b, "E", r.Callback("b1"));
  p->AddKeyedCallback(&a, "ActivityChanged", r.Callback("a-kind"));
  p->AddKeyedCallback(&a, "Other", r.Callback("a-other"));
  EXPECT_EQ(p->AddKeyedCallback(nullptr, "E", r.Callback("x")), 0u);
  EXPECT_EQ(p->KeyedCallbackCount(&a, "E"), 1);
  EXPECT_EQ(p->KeyedCallbackCount(&c, "E"), 0);

  VORHandle<ChildAdded> added = VORHandle<ChildAdded>::Adopt(new ChildAdded());
  EXPECT_EQ(p->DispatchKeyed(&a, "E", added), 3);
  EXPECT_EQ(p->DispatchKeyed(&c, "E", added), 1);
  EXPECT_EQ(p->Dispatch("E", added), 4);  // without key: every matching callback
  EXPECT_EQ(r.calls, (std::vector<std::string>{"a1:E", "all:E", "a-kind:E", "all:E", "a1:E",
                                               "all:E", "b1:E", "a-kind:E"}));
}

TEST(EventPublisherTest, KeyedCallbacksRemovedDuringADispatchAreNotCalled) {
  auto p = VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher());
  Recorder r;
  int a = 0, b = 0, tag = 0;
  VORCallbackId laterOfA = 0, ofB = 0;
  p->AddKeyedCallback(
      &a, "E",
      [&](VORBaseUnknown*, const std::string&, VORNotification*, void*, VORCallbackId self) {
        r.calls.push_back("first");
        EXPECT_TRUE(p->RemoveCallback(laterOfA));
        EXPECT_TRUE(p->RemoveCallback(ofB));
        EXPECT_TRUE(p->RemoveCallback(self));
        p->AddKeyedCallback(&a, "E", r.Callback("late"), nullptr, &tag);
      });
  laterOfA = p->AddKeyedCallback(&a, "E", r.Callback("second"));
  ofB = p->AddKeyedCallback(&b, "E", r.Callback("b"));
  EXPECT_EQ(p->Dispatch("E"), 1);
  EXPECT_EQ(r.calls, std::vector<std::string>{"first"});
  EXPECT_EQ(p->KeyedCallbackCount(&a, "E"), 1);
  EXPECT_EQ(p->DispatchKeyed(&b, "E"), 0);
  EXPECT_EQ(p->DispatchKeyed(&a, "E"), 1);
  EXPECT_EQ(r.calls.back(), "late:E");
  EXPECT_EQ(p->RemoveCallbacksOf(&tag), 1);
  EXPECT_EQ(p->KeyedCallbackCount(&a, "E"), 0);
  EXPECT_EQ(p->CallbackCount(), 0);
  EXPECT_EQ(p->DispatchKeyed(&a, "E"), 0);
}

TEST(EventPublisherTest, NamesAgreeingInTheirFirstBytesOrInLengthAreToldApart) {
  VORHandle<VOREventPublisher> publisher =
      VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher());
  Recorder r;
  // Long names that differ only past their first bytes, one that is a prefix of another, two
  // of one length, and the empty name.
  const std::vector<std::string> names = {"ActivityModifiedNotification",
                                          "ActivityModifiedNotificatioN",
                                          "ActivityModified",
                                          "ActivityModifiedX",
                                          "ActivityModifiedY",
                                          ""};
  for (const std::string& name : names)
    publisher->AddCallback(name, r.Callback("<" + name + ">"));
  for (const std::string& name : names)
    EXPECT_EQ(publisher->Dispatch(name, nullptr), 1) << name;
  EXPECT_EQ(publisher->Dispatch("ActivityModifiedNotificationS", nullptr), 0);
  EXPECT_EQ(publisher->Dispatch("ActivityModifie", nullptr), 0);
  std::vector<std::string> expected;
  for (const std::string& name : names)
    expected.push_back("<" + name + ">:" + name);
  EXPECT_EQ(r.calls, expected);
}

}  // namespace
