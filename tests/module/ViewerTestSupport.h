// Shared by the module tests that work on an open Product Flow Viewer through the headless
// driver: building a level through the model's door, opening it in the viewer, running script
// steps, and finding the viewer and a node's scroll lists.
#pragma once

#include <gtest/gtest.h>

#include <sstream>
#include <string>

#include "QELBaseScrollListZitBltRep.h"
#include "QELFpaProductFlowViewer.h"
#include "QELIZitBltMgr.h"
#include "QELZitBltRep.h"
#include "VORDocument.h"
#include "VORDriver.h"
#include "VORFrmLayout.h"
#include "VORModelDoor.h"
#include "VORScript.h"

// A labelled activity of type under father.
inline VORBaseUnknown_var AddActivity(VORModelDoor& door, VORBaseUnknown* father, const char* label,
                                      const char* type = "BIWActivityStation") {
  VORBaseUnknown_var node;
  EXPECT_EQ(door.CreateNode(father, type, node, 0, label), S_OK) << label;
  door.SetLabel(node, VORUnicodeString(label));
  return node;
}

// Saves doc as file, opens it and shows its root level ("Line") in the viewer.
inline void OpenInViewer(VORDriver& driver, VORProcess* doc, const std::string& file) {
  std::string error;
  ASSERT_TRUE(doc->SaveAs(file, error)) << error;
  ASSERT_TRUE(driver.OpenDocument(file)) << driver.LastError();
  ASSERT_TRUE(driver.PickObject("Line") && driver.StartCommand("QELFpaProductFlowViewerCmd"))
      << driver.LastError();
  driver.TakeEvents();
}

// Runs the script steps, expecting them to succeed (or fail); the output of the last step only.
inline std::string RunSteps(VORDriver& driver, const std::string& steps, bool ok = true) {
  std::ostringstream out;
  VORScript script(driver, out);
  EXPECT_EQ(script.Run(steps), ok) << out.str();
  const std::string text = "\n" + out.str();
  const size_t last = text.rfind("\n> ");
  return text.substr(text.find('\n', last + 1) + 1);
}

// The scroll list of the ZitBlt name on the activity labelled label (null when none).
inline QELBaseScrollListZitBltRep* ScrollList(const VORDriver& driver, const char* label,
                                              const char* name) {
  QELIZitBltMgr_var manager{VORBaseUnknown_var(driver.FindObject(label))};
  QELZitBltRep* rep = nullptr;
  if (manager)
    manager->GetZitBlt(name, &rep);
  return rep != nullptr ? rep->GetScrollListRep() : nullptr;
}

// The first Product Flow Viewer of the layout (null when none is open).
inline QELFpaProductFlowViewer* FindViewer() {
  for (VORFrmWindow* w : VORFrmLayout::GetCurrentLayout()->GetWindowList()) {
    if (w->IsAKindOf(QELFpaProductFlowViewer::ClassName()))
      return static_cast<QELFpaProductFlowViewer*>(w);
  }
  return nullptr;
}
