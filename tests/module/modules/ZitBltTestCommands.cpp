// A list update command for the ZitBlt tests: it records every refresh as "<owner label>/<ZitBlt
// name>/<list or none>" in a log that the tests read through QELTestListZitBltLog.
#include <string>
#include <vector>

#include "QELBaseListZitBltCmd.h"
#include "VORCommandHeader.h"
#include "VORIGENode.h"

namespace {
std::vector<std::string> log;
}

extern "C" std::vector<std::string>* QELTestListZitBltLog() {
  return &log;
}

class QELTestListZitBltCmd : public QELBaseListZitBltCmd {
 public:
  explicit QELTestListZitBltCmd(VORBaseUnknown* owner) : QELBaseListZitBltCmd(owner) {}
  void UpdateList(QELBaseScrollListZitBltRep* rep) override {
    VORUnicodeString label;
    if (VORIGENode_var node(GetOwner()); node)
      node->GetLabel(label);
    log.push_back(label.ConvertToUTF8() + "/" + GetPODName().ConvertToUTF8() + "/" +
                  (rep != nullptr ? "list" : "none"));
  }
  // Whether the status-bar configuration reached the command.
  bool HasStatusBarDocument() { return static_cast<bool>(GetUserDefinedAttributeDOMDoc()); }
};

VOR_EXPORT_COMMAND_FACTORY(QELTestListZitBltCmd)
