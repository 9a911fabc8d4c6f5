// Helpers of the model tests: a small hand-made line, a notification recorder, a structural
// dump through the public interfaces, and the shared temporary directory.
#pragma once

#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "TempDir.h"
#include "VORModel.h"

inline std::string Utf8(const VORUnicodeString& s) {
  return s.ConvertToUTF8();
}

inline std::string IdOf(VORBaseUnknown* o) {
  VORISpecObject_var s(o);
  return s ? std::string(s->GetId().c_str()) : std::string("?");
}

// Ids of the objects of a list (which it deletes), space-separated.
inline std::string Ids(VORListValVORBaseUnknown_var* list) {
  std::string text;
  if (list == nullptr)
    return "(null)";
  for (const VORBaseUnknown_var& o : *list)
    text += (text.empty() ? "" : " ") + IdOf(o.get());
  delete list;
  return text;
}

// The document read from xml, named "bad.pprx" in its messages (null with error when refused).
inline VORProcess_var LoadText(const std::string& xml, std::string& error) {
  return VORProcess_var::Adopt(VORProcess::LoadFromString(xml, "bad.pprx", error));
}

// text with the first from replaced by to (a failure when from is missing).
inline std::string Replace(std::string text, const std::string& from, const std::string& to) {
  const auto at = text.find(from);
  EXPECT_NE(at, std::string::npos) << from;
  return at == std::string::npos ? text : text.replace(at, from.size(), to);
}

// A damaged document: the text from of a valid one replaced by to, refused with a message
// holding expected.
struct LoadRefusal {
  std::string from, to, expected;
};
inline void ExpectRefusals(const std::string& valid, const std::vector<LoadRefusal>& cases) {
  for (const LoadRefusal& c : cases) {
    SCOPED_TRACE(c.to);
    std::string error;
    EXPECT_FALSE(LoadText(Replace(valid, c.from, c.to), error));
    EXPECT_NE(error.find(c.expected), std::string::npos) << error;
  }
}

// Records the activity notifications of a root process: "kind father son" per line.
class ActivityRecorder {
 public:
  explicit ActivityRecorder(VORBaseUnknown* root) {
    VORISPPActivityModificationEvents_var events(root);
    _publisher = events ? events->GetEventPublisher() : nullptr;
    if (_publisher != nullptr)
      _id = _publisher->AddCallback(
          VORSPPActivityNotificationDispatcher::DISPATCHER_SPP_VIEWS_CHANGE(),
          [this](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
            auto* a = dynamic_cast<VORSPPActivityNotification*>(n);
            if (a != nullptr)
              lines.push_back(std::to_string(a->GetKind()) + " " + IdOf(a->GetFather()) + " " +
                              IdOf(a->GetSon()));
          });
  }
  ~ActivityRecorder() {
    if (_publisher != nullptr)
      _publisher->RemoveCallback(_id);
  }
  std::vector<std::string> Take() { return std::exchange(lines, {}); }
  std::vector<std::string> lines;

 private:
  VOREventPublisher* _publisher = nullptr;
  VORCallbackId _id = 0;
};

// Everything a user of the interfaces can see of a document, one line per fact. Two documents
// with equal dumps are equal for every reader of the model.
std::string DumpDocument(VORProcess* doc);

// A small line built by hand through the interfaces:
//   root
//    ├─ S1 station ──> S2 station ──> S3 station      (S1 also ──> S3)
//    │    S2 holds: L (loading) ──> W (spot welding)
//    └─ G grouping: Start ──> I (station) ──> Stop
// Products: Underbody / { Panel, Bracket, Floor assy }; resources: Cell / { Robot1, Gun1 }.
struct SmallLine {
  SmallLine();
  VORProcess_var doc;
  VORBaseUnknown_var root, s1, s2, s3, load, weld, group, start, stop, inner;
  VORBaseUnknown_var panel, bracket, floor, cell, robot, gun;
  VORBaseUnknown_var s2In, s2Out;  // S2 consumes Panel, produces Floor assy
};
