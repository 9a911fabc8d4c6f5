// A helper that answers the next message box as a user would.
#pragma once

#include <QAbstractButton>
#include <QApplication>
#include <QMessageBox>
#include <QTimer>

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
