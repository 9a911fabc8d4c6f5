// The window's command actions: one per workbench command in the Product Flow menu and
// toolbar (greyed out, with the reason, when its module is not installed), and the host
// commands that open windows. Triggering one starts the command by id.
#pragma once

#include <QObject>
#include <QString>
#include <functional>
#include <map>

class QAction;
class QMenu;
class QToolBar;

class VORQtCommandActions {
 public:
  using Starter = std::function<void(const QString& id)>;
  explicit VORQtCommandActions(Starter start) : _start(std::move(start)) {}

  // The workbench commands, in the menu and on the toolbar; the first nine get Ctrl+Shift+n.
  void FillWorkbench(QMenu* menu, QToolBar* toolBar);
  // A host command under a title (the View menu's windows).
  QAction* AddHostCommand(QMenu* menu, const QString& id, const QString& title);
  // The action of a command id, or null.
  QAction* Find(const QString& id) const;

 private:
  QAction* Connect(QAction* action, const QString& id);

  Starter _start;
  std::map<QString, QAction*> _actions;
};
