// A small process document with one level to chart, and a recorder of the chart notifications.
#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "QELPertNotifications.h"
#include "VORDeferredDeletion.h"
#include "VORDocument.h"
#include "VORIModelEvents.h"
#include "VORModelDoor.h"

struct ChartNotifications {
  struct Entry {
    std::string kind;
    VORBaseUnknown* node;
    int remove;
    double x;
    double y;
  };
  std::vector<Entry> entries;
  VORCallbackId positionId = 0;
  VORCallbackId infoId = 0;
  VOREventPublisher* publisher = nullptr;

  void Listen(VORBaseUnknown* root) {
    VORIModelEvents_var events(root);
    publisher = events->GetEventPublisher();
    positionId = publisher->AddCallback(
        "QELPertPositionNotify",
        [this](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
          auto* p = static_cast<QELPertPositionNotify*>(n);
          double x = 0.0;
          double y = 0.0;
          p->GetPosition(x, y);
          entries.push_back({"position", p->GetNode().Identity(), 0, x, y});
        });
    infoId = publisher->AddCallback(
        "QELPertAppInfoNotify",
        [this](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
          auto* p = static_cast<QELPertAppInfoNotify*>(n);
          entries.push_back({"info", p->GetNode().Identity(), p->GetRemoveRep(), 0.0, 0.0});
        });
  }
  void Stop() {
    if (publisher != nullptr) {
      publisher->RemoveCallback(positionId);
      publisher->RemoveCallback(infoId);
    }
  }
  int Count(const std::string& kind, int remove = -1) const {
    int n = 0;
    for (const Entry& e : entries)
      n += e.kind == kind && (remove < 0 || e.remove == remove);
    return n;
  }
};

class PertTest : public ::testing::Test {
 protected:
  void SetUp() override {
    _live = VORBaseUnknown::LiveInstances();
    doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    root = doc->GetRootProcess();
  }
  void TearDown() override {
    root = NULL_var;
    doc = NULL_var;
    VORDeferredDeletion::Drain();
    EXPECT_EQ(VORBaseUnknown::LiveInstances(), _live) << "leaked objects";
  }
  VORBaseUnknown_var Node(VORBaseUnknown* father, const char* label, double x, double y,
                          const char* type = "BIWActivityStation") {
    VORBaseUnknown_var node;
    EXPECT_EQ(doc->GetDoor().CreateNode(father, type, node), S_OK);
    doc->GetDoor().SetLabel(node, VORUnicodeString(label));
    doc->GetDoor().SetPertPosition(node, true, x, y);
    return node;
  }
  VORProcess_var doc;
  VORBaseUnknown_var root;
  long _live = 0;
};
