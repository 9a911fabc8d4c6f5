#include "VORQtApplication.h"

#include <QEvent>
#include <QGuiApplication>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdio>

#include "VORDeferredDeletion.h"
#include "VORQtInit.h"

namespace {
bool IsUserEvent(QEvent::Type type) {
  switch (type) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove:
    case QEvent::KeyPress:
    case QEvent::KeyRelease:
    case QEvent::Wheel:
    case QEvent::ContextMenu:
    case QEvent::Shortcut:
    case QEvent::Close:
    case QEvent::MetaCall:
    case QEvent::Timer:
      return true;
    default:
      return false;
  }
}
}  // namespace

VORQtApplication::VORQtApplication(int& argc, char** argv) : QApplication(argc, argv) {
  VORInitQt();
  setApplicationName(QStringLiteral("pfv"));
  setApplicationDisplayName(QStringLiteral("Product Flow Viewer"));
  setOrganizationName(QStringLiteral("pfv"));
}

VORQtApplication::~VORQtApplication() {
  _hooks.clear();
  VORDeferredDeletion::Drain();
}

VORQtApplication* VORQtApplication::Instance() {
  return dynamic_cast<VORQtApplication*>(QCoreApplication::instance());
}

bool VORQtApplication::notify(QObject* receiver, QEvent* event) {
  const bool user = _depth == 0 && IsUserEvent(event->type());
  ++_depth;
  const bool result = QApplication::notify(receiver, event);
  --_depth;
  if (user)
    AfterEvent();
  return result;
}

void VORQtApplication::AddAfterEventHook(QObject* owner, std::function<void()> hook) {
  _hooks.push_back(Hook{owner, std::move(hook)});
}

void VORQtApplication::RemoveAfterEventHooks(QObject* owner) {
  for (Hook& hook : _hooks) {
    if (hook.owner == owner)
      hook.owner = nullptr;
  }
}

void VORQtApplication::AfterEvent() {
  VORDeferredDeletion::Drain();
  if (_inHooks)
    return;
  _inHooks = true;
  std::erase_if(_hooks, [](const Hook& h) { return h.owner.isNull(); });
  for (size_t i = 0; i < _hooks.size(); ++i) {
    if (!_hooks[i].owner.isNull())
      _hooks[i].run();
  }
  _inHooks = false;
  VORDeferredDeletion::Drain();
}

bool VORQtCanOpenDisplay() {
  std::fflush(nullptr);
  const pid_t child = fork();
  if (child < 0)
    return false;
  if (child == 0) {
    // Quiet: the platform's complaint is the parent's answer.
    std::freopen("/dev/null", "w", stderr);
    int argc = 1;
    char name[] = "pfv";
    char* argv[] = {name, nullptr};
    { QGuiApplication probe(argc, argv); }
    _exit(0);
  }
  int status = 0;
  if (waitpid(child, &status, 0) != child)
    return false;
  return WIFEXITED(status) && WEXITSTATUS(status) == 0;
}
