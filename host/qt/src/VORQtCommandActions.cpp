#include "VORQtCommandActions.h"

#include <QAction>
#include <QIcon>
#include <QMenu>
#include <QPainter>
#include <QPixmap>
#include <QToolBar>

#include "VOREnv.h"
#include "VORPixelImage.h"
#include "VORQtStrings.h"
#include "VORWorkbench.h"

namespace {

// An icon for a command without an icon file: its initials on a tile.
QIcon LetterIcon(const QString& title) {
  QString letters;
  for (const QString& word : title.split(' ', Qt::SkipEmptyParts)) {
    if (letters.size() < 2 && word[0].isLetterOrNumber())
      letters += word[0].toUpper();
  }
  QPixmap pixmap(32, 32);
  pixmap.fill(Qt::transparent);
  QPainter p(&pixmap);
  p.setRenderHint(QPainter::Antialiasing);
  p.setBrush(QColor(70, 90, 120));
  p.setPen(Qt::NoPen);
  p.drawRoundedRect(QRectF(1, 1, 30, 30), 6, 6);
  p.setPen(Qt::white);
  QFont font = p.font();
  font.setBold(true);
  font.setPixelSize(letters.size() > 1 ? 13 : 17);
  p.setFont(font);
  p.drawText(QRectF(0, 0, 32, 32), Qt::AlignCenter, letters.isEmpty() ? "?" : letters);
  p.end();
  return QIcon(pixmap);
}

QIcon CommandIcon(const VORWorkbenchCommand& command) {
  // The configured name as it stands, else with the usual image extensions.
  for (const char* extension : {"", ".png", ".svg", ".bmp"}) {
    if (command.icon.empty())
      break;
    VORUnicodeString path;
    if (FAILED(VORGetImagePathName(VORUnicodeString(command.icon + extension), path)))
      continue;
    QIcon icon(VORQtString(path));
    if (!icon.isNull() && !icon.availableSizes().isEmpty())
      return icon;
  }
  return LetterIcon(VORQtString(command.title.empty() ? command.id : command.title));
}

}  // namespace

QAction* VORQtCommandActions::Connect(QAction* action, const QString& id) {
  action->setObjectName(id);
  QObject::connect(action, &QAction::triggered, action, [this, id]() { _start(id); });
  _actions[id] = action;
  return action;
}

void VORQtCommandActions::FillWorkbench(QMenu* menu, QToolBar* toolBar) {
  int n = 0;
  for (const VORWorkbenchCommand& command : VORWorkbench::Commands()) {
    const QString id = VORQtString(command.id);
    const QString title = VORQtString(command.title.empty() ? command.id : command.title);
    QAction* action = Connect(menu->addAction(CommandIcon(command), title), id);
    action->setToolTip(title + " (" + id + ")");
    action->setStatusTip(title);
    if (++n <= 9)
      action->setShortcut(QKeySequence(Qt::CTRL | Qt::SHIFT | static_cast<Qt::Key>(Qt::Key_0 + n)));
    if (!VORWorkbench::IsInstalled(command)) {
      // Listed but not installed in this build: shown, greyed, with the reason.
      action->setEnabled(false);
      action->setToolTip(title + QObject::tr(" (not installed: ") + VORQtString(command.module) +
                         ")");
    }
    toolBar->addAction(action);
  }
  if (n == 0) {
    QAction* none = menu->addAction(QObject::tr("(no commands registered)"));
    none->setEnabled(false);
  }
}

QAction* VORQtCommandActions::AddHostCommand(QMenu* menu, const QString& id, const QString& title) {
  return Connect(menu->addAction(title), id);
}

QAction* VORQtCommandActions::Find(const QString& id) const {
  auto it = _actions.find(id);
  return it == _actions.end() ? nullptr : it->second;
}
