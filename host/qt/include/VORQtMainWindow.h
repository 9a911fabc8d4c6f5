// The application window: menus (File, Product Flow, View, Window), the Product Flow toolbar
// filled from the workbench registry, a status bar with the running command's prompt and the
// last message, the document tree in a dock, and an MDI area holding the frame layout's
// windows. Every action goes through the headless driver or the dialog and viewer objects;
// after each step the window catches up with the layout, the selection and the dialogs.
#pragma once

#include <QMainWindow>
#include <QPointer>
#include <QStringList>
#include <cstdint>
#include <memory>

#include "VORDriver.h"

class QAction;
class QLabel;
class QMdiArea;
class QMdiSubWindow;
class QMenu;
class QToolBar;
class VORQtChangeWatch;
class VORQtCommandActions;
class VORQtDialogManager;
class VORQtMdiMirror;
class VORQtDocumentTree;
class VORQtViewerWidget;

class VORQtMainWindow : public QMainWindow {
  Q_OBJECT
 public:
  // Settings repository of the window: recent files and geometry.
  static constexpr const char* kSettings = "PfvGui";
  static constexpr int kMaxRecentFiles = 8;
  // Documents at least this large (bytes) load under a progress dialog.
  static constexpr qint64 kLargeDocument = 1 << 20;

  explicit VORQtMainWindow(QWidget* parent = nullptr);
  ~VORQtMainWindow() override;

  VORDriver& Driver() { return *_driver; }

  // Opens a document; a failure shows a message box with the file and the reason.
  bool OpenDocument(const QString& path);
  bool SaveDocument();
  bool SaveDocumentAs(const QString& path);
  // Writes the current chart window's scene as PNG, PDF or SVG (by extension, SVG otherwise).
  bool ExportChart(const QString& path, QString* error = nullptr);
  // Undoes / redoes the current document's last user command (Edit menu, Ctrl+Z, Ctrl+Shift+Z).
  bool Undo();
  bool Redo();
  // Starts a workbench command (or declared host command) by id.
  bool StartCommand(const QString& id);

  // Brings the window up to date after a step: MDI windows, tree, selection, status bar,
  // viewers, as far as the notifications since the last step say they changed. Cheap when
  // nothing changed.
  void AfterStep();

  QMdiArea* MdiArea() const { return _mdi; }
  VORQtDocumentTree* Tree() const { return _tree; }
  VORQtDialogManager* Dialogs() const { return _dialogs; }
  // The viewer widget of the active MDI window, or null.
  VORQtViewerWidget* CurrentViewerWidget() const;
  // The viewer widget of a frame window (by title or name), or null.
  VORQtViewerWidget* ViewerWidgetOf(const QString& window) const;
  // The menu and toolbar action of a command id, or null.
  QAction* CommandAction(const QString& id) const;
  QMenu* ProductFlowMenu() const { return _flowMenu; }
  QStringList RecentFiles() const;
  QString PromptText() const;
  QString LastMessage() const;
  // The status bar's summary of the activity under the pointer.
  QString HoverText() const;

 protected:
  void closeEvent(QCloseEvent* event) override;

 private:
  void BuildMenus();
  void CatchUp(std::uint32_t changes);
  void AddRecentFile(const QString& path);
  void UpdateRecentMenu();
  void UpdateWindowMenu();
  void SetMessage(const QString& text);
  void RestoreGeometry();
  void SaveGeometry();
  bool ConfirmDiscard();

  std::unique_ptr<VORDriver> _driver;
  std::unique_ptr<VORQtChangeWatch> _watch;
  std::unique_ptr<VORQtCommandActions> _commands;
  std::unique_ptr<VORQtMdiMirror> _mirror;
  QMdiArea* _mdi = nullptr;
  VORQtDocumentTree* _tree = nullptr;
  VORQtDialogManager* _dialogs = nullptr;
  QMenu* _flowMenu = nullptr;
  QMenu* _recentMenu = nullptr;
  QMenu* _windowMenu = nullptr;
  QToolBar* _flowToolBar = nullptr;
  QAction* _undo = nullptr;
  QAction* _redo = nullptr;
  QLabel* _prompt = nullptr;
  QLabel* _message = nullptr;
  QLabel* _hover = nullptr;
  VORDocument* _treeDocument = nullptr;
  int _treeBuiltAt = -1;
  bool _syncing = false;
};
