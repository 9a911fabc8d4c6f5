// The script step "zitblts <node id or label>": one line per ZitBlt of the node's activity with
// its name, location keyword, translation, status and whether it is open.
#include "QELZitBltScriptStep.h"

#include <cstdio>

#include "QELIZitBltMgr.h"
#include "QELZitBltRep.h"
#include "VORDriver.h"
#include "VORScript.h"

namespace {
std::string Number(double v) {
  char buffer[32];
  std::snprintf(buffer, sizeof buffer, "%g", v);
  return buffer;
}
}  // namespace

std::string QELDescribeZitBlts(VORBaseUnknown* node) {
  QELIZitBltMgr_var manager{VORBaseUnknown_var(node)};
  if (!manager)
    return "no ZitBlts\n";
  VORListValVORUnicodeString* names = nullptr;
  manager->GetZitBltNames(names);
  std::string text;
  for (const VORUnicodeString& name : *names) {
    QELZitBltRep* rep = nullptr;
    if (FAILED(manager->GetZitBlt(name, &rep)) || rep == nullptr)
      continue;
    text += "ZitBlt \"" + name.ConvertToUTF8() + "\": location \"" +
            rep->GetLocation().ConvertToUTF8() + "\", ";
    if (rep->GetZitBltBtn() != nullptr && rep->GetZitBltBtn()->GetMatrix() != nullptr) {
      double x = 0.0;
      double y = 0.0;
      rep->GetPoDPosition(x, y);
      text += "translation (" + Number(x) + ", " + Number(y) + "), ";
    } else {
      text += "not placed, ";
    }
    text += "status " + std::to_string(rep->GetStatus()) + ", " +
            (rep->IsButtonCollapse() ? "closed" : "open") + "\n";
  }
  if (names->IsEmpty())
    text = "no ZitBlts\n";
  delete names;
  return text;
}

void QELRegisterZitBltScriptStep() {
  VORScript::RegisterStep("zitblts", [](VORDriver& driver, const std::vector<std::string>& words,
                                        std::ostream& out, std::string& error) {
    if (words.size() != 2) {
      error = "usage: zitblts <node id or label>";
      return false;
    }
    VORBaseUnknown* node = driver.FindObject(words[1]);
    if (node == nullptr) {
      error = "no object \"" + words[1] + "\"";
      return false;
    }
    out << QELDescribeZitBlts(node);
    return true;
  });
}
