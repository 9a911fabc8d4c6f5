// The Qt application of the GUI: after each top-level user event it drains the deferred
// destruction queue (commands, reps and dialogs released during the event) and runs the
// after-event hooks that bring the windows up to date.
#pragma once

#include <QApplication>
#include <QPointer>
#include <functional>
#include <vector>

class VORQtApplication : public QApplication {
 public:
  VORQtApplication(int& argc, char** argv);
  ~VORQtApplication() override;

  bool notify(QObject* receiver, QEvent* event) override;

  // hook runs after each user event while owner lives.
  void AddAfterEventHook(QObject* owner, std::function<void()> hook);
  // Drops owner's hooks (an owner going away calls it before it is half destroyed).
  void RemoveAfterEventHooks(QObject* owner);
  // Drains deferred destruction and runs the hooks now (tests, and after programmatic steps).
  void AfterEvent();

  static VORQtApplication* Instance();

 private:
  struct Hook {
    QPointer<QObject> owner;
    std::function<void()> run;
  };
  std::vector<Hook> _hooks;
  int _depth = 0;
  bool _inHooks = false;
};

// True when a window can be shown: a Qt platform (the display of DISPLAY / WAYLAND_DISPLAY, or
// the one QT_QPA_PLATFORM names) opens. Tried in a child process, as a platform that cannot
// connect ends the process.
bool VORQtCanOpenDisplay();
