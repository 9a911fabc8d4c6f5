// Helpers of the window tests: the bundled sample, opening it in the Product Flow Viewer as a
// planner does, and answering the next message box as a user would.
#pragma once

#include <QAbstractButton>
#include <QAction>
#include <QApplication>
#include <QMessageBox>
#include <QTest>
#include <QTimer>
#include <cstdlib>
#include <memory>
#include <string>

#include "VORQtDocumentTree.h"
#include "VORQtMainWindow.h"
#include "VORQtViewerWidget.h"

// A main window at the size the window tests' coordinates assume, shown and settled.
inline std::unique_ptr<VORQtMainWindow> ShowMainWindow() {
  auto window = std::make_unique<VORQtMainWindow>();
  window->resize(1400, 880);
  window->show();
  QApplication::processEvents();
  return window;
}

inline std::string SamplePath() {
  const char* dir = std::getenv("PFV_EXAMPLES");
  return std::string(dir ? dir : "examples") + "/underbody.pprx";
}

// Clicks the tree item labelled label (false when there is not exactly one).
inline bool ClickTreeItem(VORQtMainWindow& window, const char* label) {
  const auto items = window.Tree()->findItems(label, Qt::MatchRecursive);
  if (items.size() != 1)
    return false;
  QTest::mouseClick(window.Tree()->viewport(), Qt::LeftButton, Qt::NoModifier,
                    window.Tree()->visualItemRect(items.front()).center());
  return true;
}

// Opens the sample and the Product Flow Viewer on its line, from the menu and the tree; the
// viewer's widget, null when any step fails.
inline VORQtViewerWidget* OpenSampleInViewer(VORQtMainWindow& window) {
  if (!window.OpenDocument(QString::fromStdString(SamplePath())))
    return nullptr;
  QAction* open = window.CommandAction("QELFpaProductFlowViewerCmd");
  if (open == nullptr)
    return nullptr;
  open->trigger();
  if (!ClickTreeItem(window, "Underbody line"))
    return nullptr;
  QApplication::processEvents();  // the fit once the window has its size
  return window.CurrentViewerWidget();
}

// While it lives, waits for a modal message box, records what it showed and presses OK.
class MessageBoxAnswerer {
 public:
  MessageBoxAnswerer() {
    _timer.setInterval(10);
    QObject::connect(&_timer, &QTimer::timeout, [this]() {
      auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
      if (box == nullptr)
        return;
      seen = true;
      title = box->windowTitle();
      text = box->text();
      informative = box->informativeText();
      icon = box->icon();
      objectName = box->objectName();
      _timer.stop();
      box->button(QMessageBox::Ok)->click();
    });
    _timer.start();
  }

  bool seen = false;
  QString title;
  QString text;
  QString informative;
  QMessageBox::Icon icon = QMessageBox::NoIcon;
  QString objectName;

 private:
  QTimer _timer;
};
