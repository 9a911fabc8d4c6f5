#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "InteractionTestObjects.h"
#include "VORCommand.h"
#include "VORDeferredDeletion.h"

namespace {
class Ping : public VORNotification {
  VOR_DECLARE_CLASS(Ping, VORNotification)
};
class LoudPing : public Ping {
  VOR_DECLARE_CLASS(LoudPing, Ping)
};

// Records what reaches it and answers with a fixed propagation mode.
class Listener : public VORCommand {
 public:
  Listener(VORCommand* father, const char* name, VORNotifPropagation answer,
           std::vector<std::string>* log)
      : VORCommand(father, name), _answer(answer), _log(log) {}
  VORNotifPropagation AnalyseNotification(VORCommand* from, VORNotification*) override {
    _log->push_back(GetName().str() + "<-" + from->GetName().str());
    return _answer;
  }

 private:
  VORNotifPropagation _answer;
  std::vector<std::string>* _log;
};
}  // namespace

TEST(CommandTreeTest, NotificationsClimbTheFatherChainUntilAReceiverStopsThem) {
  std::vector<std::string> log;
  auto root = Make<Listener>(nullptr, "root", VORNotifPropagate, &log);
  auto middle = Make<Listener>(root.get(), "middle", VORNotifDontPropagate, &log);
  auto leaf = Make<Listener>(middle.get(), "leaf", VORNotifPropagate, &log);
  auto sender = Make<Listener>(nullptr, "sender", VORNotifPropagate, &log);
  auto ping = Make<Ping>();

  sender->SendNotification(leaf.get(), ping);
  EXPECT_EQ(log, (std::vector<std::string>{"leaf<-sender", "middle<-sender"}));

  log.clear();
  sender->SendNotification(root.get(), ping);
  EXPECT_EQ(log, (std::vector<std::string>{"root<-sender"}));
}

TEST(CommandTreeTest, AFatherThatDiesDetachesItsChildren) {
  std::vector<std::string> log;
  auto child = Make<Listener>(nullptr, "child", VORNotifPropagate, &log);
  {
    auto father = Make<Listener>(nullptr, "father", VORNotifPropagate, &log);
    child->SetFather(father.get());
    ASSERT_EQ(father->GetChildren().size(), 1u);
  }
  EXPECT_EQ(child->GetFather(), nullptr);
  auto ping = Make<Ping>();
  child->SendNotification(child.get(), ping);
  EXPECT_EQ(log, (std::vector<std::string>{"child<-child"}));
}

TEST(CommandTreeTest, SubscribersReceiveKindsOfTheNotificationAndCanUnsubscribeByHandle) {
  auto publisherCommand = Make<VORCommand>(nullptr, "dialog");
  auto subscriber = Make<VORCommand>(nullptr, "cmd");
  std::vector<std::string> seen;
  VORCallbackId id = subscriber->AddCallback(
      publisherCommand->GetEventPublisher(), "Ping",
      [&](VORBaseUnknown* owner, VORNotification* n, void* data) {
        EXPECT_EQ(owner, publisherCommand.get());
        seen.push_back(std::string(n->IsA()) + (data ? "+data" : ""));
      },
      &seen);
  ASSERT_NE(id, 0u);
  publisherCommand->DispatchNotification(Make<LoudPing>());
  publisherCommand->DispatchNotification(Make<VORNotification>());
  EXPECT_EQ(seen, (std::vector<std::string>{"LoudPing+data"}));

  EXPECT_TRUE(subscriber->RemoveCallback(id));
  EXPECT_FALSE(subscriber->RemoveCallback(id));
  publisherCommand->DispatchNotification(Make<Ping>());
  EXPECT_EQ(seen.size(), 1u);
}

TEST(CommandTreeTest, ADyingSubscriberLeavesNoCallbackBehind) {
  auto publisherCommand = Make<VORCommand>(nullptr, "dialog");
  int calls = 0;
  {
    auto subscriber = Make<VORCommand>(nullptr, "cmd");
    subscriber->AddCallback(publisherCommand->GetEventPublisher(), "Ping",
                            [&](VORBaseUnknown*, VORNotification*, void*) { ++calls; });
    EXPECT_EQ(publisherCommand->GetEventPublisher()->CallbackCount(), 1);
  }
  EXPECT_EQ(publisherCommand->GetEventPublisher()->CallbackCount(), 0);
  publisherCommand->DispatchNotification(Make<Ping>());
  EXPECT_EQ(calls, 0);
}

TEST(CommandTreeTest, DelayedDestructionReleasesOnlyWhenTheQueueIsDrained) {
  const long before = VORBaseUnknown::LiveInstances();
  auto* command = new VORCommand(nullptr, "late");
  command->RequestDelayedDestruction();
  EXPECT_EQ(VORBaseUnknown::LiveInstances(), before + 1);
  VORDeferredDeletion::Drain();
  EXPECT_EQ(VORBaseUnknown::LiveInstances(), before);
}
