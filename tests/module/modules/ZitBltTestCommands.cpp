// A list update command for the ZitBlt tests: it records every refresh as "<owner label>/<ZitBlt
// name>/<list or none>" in a log that the tests read through QELTestListZitBltLog.
#include <string>
#include <vector>

#include "QELBaseListZitBltCmd.h"
#include "QELBaseScrollListZitBltRep.h"
#include "VORCommandHeader.h"
#include "VORIGENode.h"
#include "VORISPPFlowMgt.h"

namespace {
std::vector<std::string> refreshLog;
}

extern "C" std::vector<std::string>* QELTestListZitBltLog() {
  return &refreshLog;
}

class QELTestListZitBltCmd : public QELBaseListZitBltCmd {
 public:
  explicit QELTestListZitBltCmd(VORBaseUnknown* owner) : QELBaseListZitBltCmd(owner) {}
  void UpdateList(QELBaseScrollListZitBltRep* rep) override {
    VORUnicodeString label;
    if (VORIGENode_var node(GetOwner()); node)
      node->GetLabel(label);
    refreshLog.push_back(label.ConvertToUTF8() + "/" + GetPODName().ConvertToUTF8() + "/" +
                         (rep != nullptr ? "list" : "none"));
  }
  // Whether the status-bar configuration reached the command.
  bool HasStatusBarDocument() { return static_cast<bool>(GetUserDefinedAttributeDOMDoc()); }
};

VOR_EXPORT_COMMAND_FACTORY(QELTestListZitBltCmd)

// Fills its list with the owner's product inputs, in order, with state 0 (what an input list
// shows, without the covering rules of the module's own commands).
class QELTestInputListZitBltCmd : public QELBaseListZitBltCmd {
 public:
  explicit QELTestInputListZitBltCmd(VORBaseUnknown* owner) : QELBaseListZitBltCmd(owner) {}
  void UpdateList(QELBaseScrollListZitBltRep* rep) override {
    if (rep == nullptr)
      return;
    rep->RemoveAllItems(1);
    VORListValVORBaseUnknown_var* inputs = nullptr;
    if (VORISPPFlowMgt_var flows(GetOwner()); flows && SUCCEEDED(flows->GetProductInputs(inputs)))
      for (const VORBaseUnknown_var& input : *inputs)
        rep->AppendItem(input, 0);
    delete inputs;
    rep->DrawScrollList();
  }
};

VOR_EXPORT_COMMAND_FACTORY(QELTestInputListZitBltCmd)
