#include "VORQtMainWindow.h"

#include <QAction>
#include <QActionGroup>
#include <QApplication>
#include <QCloseEvent>
#include <QMoveEvent>
#include <QResizeEvent>
#include <QDockWidget>
#include <QFileDialog>
#include <QFileInfo>
#include <QIcon>
#include <QLabel>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QMenu>
#include <QMenuBar>
#include <QMessageBox>
#include <QPainter>
#include <QPlainTextEdit>
#include <QProgressDialog>
#include <QStatusBar>
#include <QTimer>
#include <QToolBar>

#include "VORCommandEngine.h"
#include "VORCommandHeader.h"
#include "VOREnv.h"
#include "VORFrmWindowKinds.h"
#include "VORPixelImage.h"
#include "VORQtApplication.h"
#include "VORQtDialogs.h"
#include "VORQtImageExport.h"
#include "VORQtDocumentTree.h"
#include "VORQtStrings.h"
#include "VORQtViewerWidget.h"
#include "VORSVGWriter.h"
#include "VORSettingRepository.h"
#include "VORStateCommand.h"
#include "VORViewer.h"
#include "VORDocument.h"
#include "VORWorkbench.h"

#if __has_include("QELPertChart.h")
#include "QELPertChart.h"
#include "QELPertViewer.h"
#define PFV_QT_WITH_PERT 1
#endif

namespace {

// An MDI window showing one frame window; closing it deletes the frame window.
class VORQtMdiWindow : public QMdiSubWindow {
 public:
  explicit VORQtMdiWindow(VORFrmWindow* window) : _window(window) {
    setAttribute(Qt::WA_DeleteOnClose);
    setObjectName(VORQtString(window->GetName()));
  }
  VORFrmWindow* Window() const { return _window.get(); }
  bool hasViewer = false;

 protected:
  void closeEvent(QCloseEvent* event) override {
    if (_window && !_window->IsDeleted())
      _window->DeleteWindow();
    QMdiSubWindow::closeEvent(event);
  }
  // The frame window knows its place (its title is shortened to its width).
  void resizeEvent(QResizeEvent* event) override {
    QMdiSubWindow::resizeEvent(event);
    TellRectangle();
  }
  void moveEvent(QMoveEvent* event) override {
    QMdiSubWindow::moveEvent(event);
    TellRectangle();
  }
  void TellRectangle() {
    if (_window && !_window->IsDeleted())
      _window->SetRectangle(VORRectangle{x(), y(), width(), height()});
  }

 private:
  VORFrmWindow_var _window;
};

VORViewer* ViewerOf(VORFrmWindow* window) {
  return window ? dynamic_cast<VORViewer*>(window->GetViewer()) : nullptr;
}

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

VORQtMainWindow::VORQtMainWindow(QWidget* parent)
    : QMainWindow(parent), _driver(std::make_unique<VORDriver>()) {
  setObjectName(QStringLiteral("MainWindow"));
  setWindowTitle(tr("Product Flow Viewer"));
  _dialogs = new VORQtDialogManager(this);
  _dialogs->Presenter().onPresent = [this](const VORDlgNotifyRecord& r) {
    SetMessage(VORQtString(r.title) + ": " + VORQtString(r.text));
  };

  _mdi = new QMdiArea(this);
  _mdi->setObjectName(QStringLiteral("MdiArea"));
  _mdi->setHorizontalScrollBarPolicy(Qt::ScrollBarAsNeeded);
  _mdi->setVerticalScrollBarPolicy(Qt::ScrollBarAsNeeded);
  setCentralWidget(_mdi);
  connect(_mdi, &QMdiArea::subWindowActivated, this, [this](QMdiSubWindow* sub) {
    auto* mdi = dynamic_cast<VORQtMdiWindow*>(sub);
    if (_syncing || mdi == nullptr || mdi->Window()->IsDeleted())
      return;
    VORFrmLayout::GetCurrentLayout()->SetCurrentWindow(mdi->Window());
    AfterStep();
  });

  _tree = new VORQtDocumentTree(*_driver, this);
  auto* dock = new QDockWidget(tr("Document Tree"), this);
  dock->setObjectName(QStringLiteral("DocumentTreeDock"));
  dock->setWidget(_tree);
  addDockWidget(Qt::LeftDockWidgetArea, dock);
  connect(_tree, &VORQtDocumentTree::picked, this, [this]() { AfterStep(); });

  _prompt = new QLabel(this);
  _prompt->setObjectName(QStringLiteral("Prompt"));
  _message = new QLabel(this);
  _message->setObjectName(QStringLiteral("LastMessage"));
  statusBar()->addWidget(_prompt);
  statusBar()->addWidget(_message, 1);

  BuildMenus();
  FillCommands();
  dock->toggleViewAction()->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_T));
  if (QMenu* view = menuBar()->findChild<QMenu*>(QStringLiteral("ViewMenu")))
    view->addAction(dock->toggleViewAction());
  RestoreGeometry();

  VORCommandEngine::GetEventPublisher()->AddCallback(
      "VORCommandEndNotification",
      [this](VORBaseUnknown*, const std::string&, VORNotification*, void*, VORCallbackId) {
        ++_commandsEnded;
      },
      nullptr, this);
  if (VORQtApplication* app = VORQtApplication::Instance())
    app->AddAfterEventHook(this, [this]() { AfterStep(); });
  AfterStep();
}

VORQtMainWindow::~VORQtMainWindow() {
  VORCommandEngine::GetEventPublisher()->RemoveCallbacksOf(this);
  if (VORQtApplication* app = VORQtApplication::Instance())
    app->RemoveAfterEventHooks(this);
  // Signals of children dying below must not reach this half-destroyed window.
  _mdi->disconnect(this);
  _tree->disconnect(this);
  // Widgets showing viewers go before the driver closes the windows that hold them.
  _syncing = true;
  for (auto& [window, entry] : _windows) {
    if (entry.sub)
      delete entry.sub;
    if (entry.cleanup)
      entry.cleanup();
  }
  _windows.clear();
  delete _dialogs;
  _dialogs = nullptr;
  _driver.reset();
}

void VORQtMainWindow::BuildMenus() {
  QMenu* file = menuBar()->addMenu(tr("&File"));
  file->setObjectName(QStringLiteral("FileMenu"));
  QAction* open = file->addAction(tr("&Open..."), this, [this]() {
    const QString path =
        QFileDialog::getOpenFileName(this, tr("Open process document"), QString(),
                                     tr("Process documents (*.pprx);;All files (*)"));
    if (!path.isEmpty())
      OpenDocument(path);
  });
  open->setShortcut(QKeySequence::Open);
  open->setObjectName(QStringLiteral("Open"));
  QAction* save = file->addAction(tr("&Save"), this, [this]() { SaveDocument(); });
  save->setShortcut(QKeySequence::Save);
  save->setObjectName(QStringLiteral("Save"));
  QAction* saveAs = file->addAction(tr("Save &As..."), this, [this]() {
    const QString path = QFileDialog::getSaveFileName(this, tr("Save process document"), QString(),
                                                      tr("Process documents (*.pprx)"));
    if (!path.isEmpty())
      SaveDocumentAs(path);
  });
  saveAs->setShortcut(QKeySequence::SaveAs);
  saveAs->setObjectName(QStringLiteral("SaveAs"));
  _recentMenu = file->addMenu(tr("Recent &Files"));
  _recentMenu->setObjectName(QStringLiteral("RecentMenu"));
  file->addSeparator();
  QAction* exportChart = file->addAction(tr("&Export Chart..."), this, [this]() {
    QString filter;
    QString path = QFileDialog::getSaveFileName(
        this, tr("Export chart"), QString(), tr("SVG image (*.svg);;PNG image (*.png)"), &filter);
    if (path.isEmpty())
      return;
    if (QFileInfo(path).suffix().isEmpty())
      path += filter.contains("png") ? ".png" : ".svg";
    QString error;
    if (!ExportChart(path, &error))
      QMessageBox::critical(this, tr("Export failed"), error);
  });
  exportChart->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_E));
  exportChart->setObjectName(QStringLiteral("ExportChart"));
  file->addSeparator();
  QAction* quit = file->addAction(tr("&Quit"), this, [this]() { close(); });
  quit->setShortcut(QKeySequence::Quit);
  quit->setObjectName(QStringLiteral("Quit"));

  _flowMenu = menuBar()->addMenu(tr("&Product Flow"));
  _flowMenu->setObjectName(QStringLiteral("ProductFlowMenu"));
  _flowToolBar = addToolBar(tr("Product Flow"));
  _flowToolBar->setObjectName(QStringLiteral("ProductFlowToolBar"));

  QMenu* view = menuBar()->addMenu(tr("&View"));
  view->setObjectName(QStringLiteral("ViewMenu"));
  QAction* fit = view->addAction(tr("&Fit All"), this, [this]() {
    if (VORQtViewerWidget* w = CurrentViewerWidget())
      w->FitAll();
  });
  fit->setShortcut(QKeySequence(Qt::Key_Home));
  fit->setObjectName(QStringLiteral("FitAll"));
  QAction* cancel = view->addAction(tr("&Cancel Command"), this, [this]() {
    if (_driver->GetRunningCommand() != nullptr)
      _driver->CancelCommand();
    AfterStep();
  });
  cancel->setShortcut(QKeySequence(Qt::Key_Escape));
  cancel->setObjectName(QStringLiteral("CancelCommand"));
  view->addSeparator();
  const std::pair<const char*, QString> hostWindows[] = {
      {VORFrmHostCommands::PertChart, tr("Classic PERT Chart")},
      {VORFrmHostCommands::ProductSpace, tr("Product Space")}};
  for (const auto& [id, title] : hostWindows) {
    QAction* action =
        view->addAction(title, this, [this, id = QString(id)]() { StartCommand(id); });
    action->setObjectName(QString(id));
    _commandActions[QString(id)] = action;
  }
  view->addSeparator();

  _windowMenu = menuBar()->addMenu(tr("&Window"));
  _windowMenu->setObjectName(QStringLiteral("WindowMenu"));
  connect(_windowMenu, &QMenu::aboutToShow, this, [this]() { UpdateWindowMenu(); });
  UpdateWindowMenu();
  UpdateRecentMenu();
}

void VORQtMainWindow::FillCommands() {
  int n = 0;
  for (const VORWorkbenchCommand& command : VORWorkbench::Commands()) {
    const QString id = VORQtString(command.id);
    const QString title = VORQtString(command.title.empty() ? command.id : command.title);
    QAction* action = _flowMenu->addAction(CommandIcon(command), title);
    action->setObjectName(id);
    action->setToolTip(title + " (" + id + ")");
    action->setStatusTip(title);
    if (++n <= 9)
      action->setShortcut(QKeySequence(Qt::CTRL | Qt::SHIFT | static_cast<Qt::Key>(Qt::Key_0 + n)));
    if (!VORWorkbench::IsInstalled(command)) {
      // Listed but not installed in this build: shown, greyed, with the reason.
      action->setEnabled(false);
      action->setToolTip(title + tr(" (not installed: ") + VORQtString(command.module) + ")");
    }
    connect(action, &QAction::triggered, this, [this, id]() { StartCommand(id); });
    _flowToolBar->addAction(action);
    _commandActions[id] = action;
  }
  if (n == 0) {
    QAction* none = _flowMenu->addAction(tr("(no commands registered)"));
    none->setEnabled(false);
  }
}

QAction* VORQtMainWindow::CommandAction(const QString& id) const {
  auto it = _commandActions.find(id);
  return it == _commandActions.end() ? nullptr : it->second;
}

bool VORQtMainWindow::StartCommand(const QString& id) {
  const bool ok = _driver->StartCommand(id.toStdString());
  if (!ok)
    SetMessage(VORQtString(_driver->LastError()));
  AfterStep();
  return ok;
}

void VORQtMainWindow::SetMessage(const QString& text) {
  _message->setText(text);
}

QString VORQtMainWindow::LastMessage() const {
  return _message->text();
}

QString VORQtMainWindow::PromptText() const {
  return _prompt->text();
}

bool VORQtMainWindow::OpenDocument(const QString& path) {
  std::unique_ptr<QProgressDialog> progress;
  if (QFileInfo(path).size() >= kLargeDocument) {
    progress = std::make_unique<QProgressDialog>(
        tr("Loading %1...").arg(QFileInfo(path).fileName()), QString(), 0, 100, this);
    progress->setObjectName(QStringLiteral("LoadProgress"));
    progress->setWindowModality(Qt::WindowModal);
    progress->setMinimumDuration(0);
    progress->setValue(0);
    progress->show();
    QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
    // The load runs in this thread: each report repaints the dialog, user input waits.
    VORProcess::SetLoadProgress([dialog = progress.get()](int percent) {
      if (percent != dialog->value()) {
        dialog->setValue(percent);
        QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
      }
    });
  }
  QApplication::setOverrideCursor(Qt::WaitCursor);
  const bool ok = _driver->OpenDocument(path.toStdString());
  QApplication::restoreOverrideCursor();
  VORProcess::SetLoadProgress({});
  progress.reset();
  if (!ok) {
    const QString reason = VORQtString(_driver->LastError());
    SetMessage(tr("Cannot open %1").arg(path));
    QMessageBox box(QMessageBox::Critical, tr("Cannot open document"),
                    tr("The document %1 cannot be opened.").arg(path), QMessageBox::Ok, this);
    box.setObjectName(QStringLiteral("OpenError"));
    box.setInformativeText(reason);
    box.exec();
    AfterStep();
    return false;
  }
  AddRecentFile(QFileInfo(path).absoluteFilePath());
  SetMessage(tr("Opened %1").arg(QFileInfo(path).fileName()));
  AfterStep();
  // A chart opened with the document is framed once it has its size.
  for (auto& [window, entry] : _windows) {
    if (entry.sub)
      if (auto* viewer = qobject_cast<VORQtViewerWidget*>(entry.sub->widget()))
        viewer->FitAll();
  }
  return true;
}

bool VORQtMainWindow::SaveDocument() {
  VORProcess* document = _driver->GetDocument();
  if (document == nullptr)
    return false;
  if (document->GetStorageName().empty()) {
    const QString path = QFileDialog::getSaveFileName(this, tr("Save process document"), QString(),
                                                      tr("Process documents (*.pprx)"));
    return !path.isEmpty() && SaveDocumentAs(path);
  }
  std::string error;
  if (!document->Save(error)) {
    QMessageBox::critical(this, tr("Cannot save document"),
                          tr("The document %1 cannot be saved.\n\n%2")
                              .arg(VORQtString(document->GetStorageName()), VORQtString(error)));
    return false;
  }
  SetMessage(tr("Saved %1").arg(VORQtString(document->GetStorageName())));
  AfterStep();
  return true;
}

bool VORQtMainWindow::SaveDocumentAs(const QString& path) {
  if (!_driver->SaveDocument(path.toStdString())) {
    QMessageBox::critical(
        this, tr("Cannot save document"),
        tr("The document %1 cannot be saved.\n\n%2").arg(path, VORQtString(_driver->LastError())));
    return false;
  }
  AddRecentFile(QFileInfo(path).absoluteFilePath());
  SetMessage(tr("Saved %1").arg(path));
  AfterStep();
  return true;
}

bool VORQtMainWindow::ExportChart(const QString& path, QString* error) {
  VORQtViewerWidget* widget = CurrentViewerWidget();
  if (widget == nullptr) {
    if (error != nullptr)
      *error = tr("The current window shows no chart.");
    return false;
  }
  std::string reason;
  const bool png = QFileInfo(path).suffix().compare("png", Qt::CaseInsensitive) == 0;
  const bool ok = png ? VORQtImageExport::WritePNG(*widget->GetViewer(), path.toStdString(), reason)
                      : VORSVGWriter::WriteFile(*widget->GetViewer(), path.toStdString(), reason);
  if (!ok && error != nullptr)
    *error = VORQtString(reason);
  if (ok)
    SetMessage(tr("Chart written to %1").arg(path));
  return ok;
}

QStringList VORQtMainWindow::RecentFiles() const {
  QStringList files;
  VORSettingRepository* settings = VORSettingRepository::GetRepository(kSettings);
  for (int i = 1; i <= kMaxRecentFiles; ++i) {
    VORUnicodeString value;
    if (SUCCEEDED(settings->ReadSetting(("RecentFile" + std::to_string(i)).c_str(), value)) &&
        !value.IsEmpty())
      files << VORQtString(value);
  }
  return files;
}

void VORQtMainWindow::AddRecentFile(const QString& path) {
  QStringList files = RecentFiles();
  files.removeAll(path);
  files.prepend(path);
  VORSettingRepository* settings = VORSettingRepository::GetRepository(kSettings);
  for (int i = 1; i <= kMaxRecentFiles; ++i) {
    const std::string key = "RecentFile" + std::to_string(i);
    if (i <= files.size())
      settings->WriteSetting(key.c_str(), VORQtUnicode(files[i - 1]));
    else
      settings->RemoveSetting(key.c_str());
  }
  settings->SaveRepository();
  UpdateRecentMenu();
}

void VORQtMainWindow::UpdateRecentMenu() {
  _recentMenu->clear();
  const QStringList files = RecentFiles();
  int n = 0;
  for (const QString& file : files) {
    QAction* action = _recentMenu->addAction(QStringLiteral("&%1 %2").arg(++n).arg(file));
    connect(action, &QAction::triggered, this, [this, file]() { OpenDocument(file); });
  }
  _recentMenu->setEnabled(!files.isEmpty());
}

void VORQtMainWindow::UpdateWindowMenu() {
  _windowMenu->clear();
  QAction* tile = _windowMenu->addAction(tr("&Tile"), this, [this]() {
    _mdi->tileSubWindows();
    VORFrmLayout::GetCurrentLayout()->SetMDIState(VORFrmLayout::MDITiled);
  });
  tile->setObjectName(QStringLiteral("Tile"));
  QAction* cascade = _windowMenu->addAction(tr("&Cascade"), this, [this]() {
    _mdi->cascadeSubWindows();
    VORFrmLayout::GetCurrentLayout()->SetMDIState(VORFrmLayout::MDINormal);
  });
  cascade->setObjectName(QStringLiteral("Cascade"));
  _windowMenu->addSeparator();
  auto* group = new QActionGroup(_windowMenu);
  int n = 0;
  for (QMdiSubWindow* sub : _mdi->subWindowList()) {
    QAction* action =
        _windowMenu->addAction(QStringLiteral("&%1 %2").arg(++n).arg(sub->windowTitle()));
    action->setCheckable(true);
    action->setChecked(sub == _mdi->activeSubWindow());
    group->addAction(action);
    connect(action, &QAction::triggered, this, [this, sub]() { _mdi->setActiveSubWindow(sub); });
  }
}

QWidget* VORQtMainWindow::MakeWindowWidget(VORFrmWindow* window) {
#ifdef PFV_QT_WITH_PERT
  // The classic chart window keeps no viewer of its own: it gets the graph editor's chart of
  // its level, drawn as the export draws it, so that it can be seen and picked in.
  if (auto* chart = dynamic_cast<QELFpaPertChartWindow*>(window);
      chart != nullptr && ViewerOf(window) == nullptr) {
    auto viewer = VORHandle<QELPertViewer>::Adopt(new QELPertViewer(
        window->GetViewerFrame(), "PERT Chart", QELPertParameters::PERT_VIEWER_STYLE, 800, 500,
        QELPertParameters::PERT_VIEWER_FLAGS));
    auto controller = VORHandle<QELPertController>::Adopt(
        QELPertBuildChart(chart->GetChartRoot(), viewer, PertModeEditable));
    if (controller) {
      viewer->SetViewerSelectable(true);
      window->SetViewer(viewer);
      _windows[window].cleanup = [controller]() { controller->RemoveAllPertNodes(); };
    }
  }
#endif
  if (VORViewer* viewer = ViewerOf(window)) {
    auto* widget = new VORQtViewerWidget(viewer);
    widget->setObjectName(VORQtString(window->GetName()) + "Viewer");
    return widget;
  }
  // A window without a 2D viewer shows what it describes to a planner.
  auto* text = new QPlainTextEdit();
  text->setReadOnly(true);
  text->setPlainText(VORQtString(window->DescribeContents()));
  return text;
}

void VORQtMainWindow::SyncWindows() {
  VORFrmLayout* layout = VORFrmLayout::GetCurrentLayout();
  const QRect client = _mdi->viewport()->rect();
  layout->SetClientArea(VORRectangle{0, 0, client.width(), client.height()});
  const std::vector<VORFrmWindow*> windows = layout->GetWindowList();
  for (auto it = _windows.begin(); it != _windows.end();) {
    VORFrmWindow* window = it->first;
    const bool present = std::find(windows.begin(), windows.end(), window) != windows.end();
    if (present && !window->IsDeleted()) {
      ++it;
      continue;
    }
    if (it->second.sub)
      delete it->second.sub;
    if (it->second.cleanup)
      it->second.cleanup();
    it = _windows.erase(it);
  }
  for (VORFrmWindow* window : windows) {
    if (dynamic_cast<VORFrmTreeWindow*>(window) != nullptr || window->IsDeleted())
      continue;
    MdiEntry& entry = _windows[window];
    auto* sub = static_cast<VORQtMdiWindow*>(entry.sub.data());
    const bool hasViewer = ViewerOf(window) != nullptr;
    if (sub == nullptr) {
      entry.window = window;
      sub = new VORQtMdiWindow(window);
      sub->setWidget(MakeWindowWidget(window));
      sub->hasViewer = ViewerOf(window) != nullptr;
      _mdi->addSubWindow(sub);
      sub->resize(std::max(400, _mdi->width() * 3 / 4), std::max(300, _mdi->height() * 3 / 4));
      // The layout's MDI state says how a new window is placed.
      if (layout->GetMDIState() == VORFrmLayout::MDIMaximized) {
        sub->showMaximized();
      } else {
        sub->show();
        if (layout->GetMDIState() == VORFrmLayout::MDITiled)
          _mdi->tileSubWindows();
      }
      entry.sub = sub;
      // A chart opens framed on its whole scene (again once the window has its final size).
      if (auto* viewer = qobject_cast<VORQtViewerWidget*>(sub->widget())) {
        viewer->FitAll();
        QTimer::singleShot(0, viewer, [viewer]() { viewer->FitAll(); });
      }
    } else if (sub->hasViewer != hasViewer) {
      sub->setWidget(MakeWindowWidget(window));
      sub->hasViewer = hasViewer;
    } else if (auto* text = qobject_cast<QPlainTextEdit*>(sub->widget())) {
      const QString contents = VORQtString(window->DescribeContents());
      if (text->toPlainText() != contents)
        text->setPlainText(contents);
    }
    sub->setWindowTitle(VORQtString(window->GetTitle()));
  }
  if (auto it = _windows.find(layout->GetCurrentWindow()); it != _windows.end() && it->second.sub) {
    if (_mdi->activeSubWindow() != it->second.sub)
      _mdi->setActiveSubWindow(it->second.sub);
  }
}

QString VORQtMainWindow::StateSignature() const {
  QString s;
  VORFrmLayout* layout = VORFrmLayout::GetCurrentLayout();
  for (VORFrmWindow* w : layout->GetWindowList())
    s += QString::number(reinterpret_cast<quintptr>(w), 16) + (w->IsDeleted() ? "d" : "") +
         (ViewerOf(w) ? "v" : "") + VORQtString(w->GetTitle()) + ",";
  s += "|" + QString::number(reinterpret_cast<quintptr>(layout->GetCurrentWindow()), 16);
  VORFrmEditor* editor = _driver->GetEditor();
  s += "|" + QString::number(reinterpret_cast<quintptr>(editor), 16);
  if (editor != nullptr) {
    for (VORSelectionSet* set : {static_cast<VORSelectionSet*>(editor->GetCSO()),
                                 static_cast<VORSelectionSet*>(editor->GetHSO())}) {
      s += "|" + QString::number(set->GetSize());
      for (int i = 1; i <= std::min(set->GetSize(), 32); ++i)
        s += ":" + QString::number(reinterpret_cast<quintptr>(set->GetElement(i)->GetLeaf()), 16);
    }
    if (VORProcess* document = _driver->GetDocument())
      s += document->IsModified() ? "|m" : "|u";
  }
  VORCommand* running = _driver->GetRunningCommand();
  s += "|" + QString::number(reinterpret_cast<quintptr>(running), 16);
  if (auto* state = dynamic_cast<VORStateCommand*>(running))
    s += ":" + QString::number(reinterpret_cast<quintptr>(state->GetCurrentState()), 16);
  s += "|" + QString::number(VORDlgNotify::Recorder().Records().size()) + "|" +
       QString::number(_commandsEnded);
  return s;
}

void VORQtMainWindow::AfterStep() {
  if (_syncing || _driver == nullptr)
    return;
  _syncing = true;
  const std::vector<std::string> events = _driver->TakeEvents();
  if (!events.empty())
    SetMessage(VORQtString(events.back()));
  const QString signature = StateSignature();
  if (signature != _signature || !events.empty()) {
    _signature = signature;
    SyncWindows();
    VORProcess* document = _driver->GetDocument();
    if (document != _treeDocument || _commandsEnded != _treeBuiltAt) {
      _tree->Rebuild(document);
      _treeDocument = document;
      _treeBuiltAt = _commandsEnded;
    } else {
      _tree->ShowSelection();
    }
    VORCommand* running = _driver->GetRunningCommand();
    QString prompt = tr("Ready");
    if (running != nullptr) {
      const std::string name = running->GetName().str();
      const VORWorkbenchCommand* known = VORWorkbench::Find(name);
      prompt = VORQtString(known && !known->title.empty() ? known->title : name);
      if (auto* state = dynamic_cast<VORStateCommand*>(running);
          state != nullptr && state->GetCurrentState() != nullptr)
        prompt += ": " + VORQtString(state->GetCurrentState()->GetName());
    }
    _prompt->setText(prompt);
    QString title = tr("Product Flow Viewer");
    if (document != nullptr) {
      title = QFileInfo(VORQtString(document->GetStorageName())).fileName() + "[*] - " + title;
      setWindowModified(document->IsModified());
    }
    setWindowTitle(title);
    for (auto& [window, entry] : _windows) {
      if (entry.sub)
        if (auto* viewer = qobject_cast<VORQtViewerWidget*>(entry.sub->widget()))
          viewer->Sync();
    }
  }
  _syncing = false;
}

VORQtViewerWidget* VORQtMainWindow::CurrentViewerWidget() const {
  QMdiSubWindow* sub = _mdi->activeSubWindow();
  if (sub == nullptr && !_mdi->subWindowList().isEmpty())
    sub = _mdi->subWindowList().constLast();
  return sub ? qobject_cast<VORQtViewerWidget*>(sub->widget()) : nullptr;
}

VORQtViewerWidget* VORQtMainWindow::ViewerWidgetOf(const QString& window) const {
  VORFrmWindow* w = _driver->FindWindow(window.toStdString());
  auto it = _windows.find(w);
  if (it == _windows.end() || !it->second.sub)
    return nullptr;
  return qobject_cast<VORQtViewerWidget*>(it->second.sub->widget());
}

void VORQtMainWindow::RestoreGeometry() {
  VORSettingRepository* settings = VORSettingRepository::GetRepository(kSettings);
  VORUnicodeString geometry;
  VORUnicodeString state;
  if (SUCCEEDED(settings->ReadSetting("Geometry", geometry)))
    restoreGeometry(QByteArray::fromBase64(VORQtString(geometry).toLatin1()));
  else
    resize(1400, 880);
  if (SUCCEEDED(settings->ReadSetting("WindowState", state)))
    restoreState(QByteArray::fromBase64(VORQtString(state).toLatin1()));
}

void VORQtMainWindow::SaveGeometry() {
  VORSettingRepository* settings = VORSettingRepository::GetRepository(kSettings);
  settings->WriteSetting("Geometry", VORUnicodeString(saveGeometry().toBase64().toStdString()));
  settings->WriteSetting("WindowState", VORUnicodeString(saveState().toBase64().toStdString()));
  settings->SaveRepository();
}

bool VORQtMainWindow::ConfirmDiscard() {
  VORProcess* document = _driver->GetDocument();
  if (document == nullptr || !document->IsModified())
    return true;
  const auto answer =
      QMessageBox::question(this, tr("Unsaved changes"),
                            tr("%1 has unsaved changes. Save them?")
                                .arg(QFileInfo(VORQtString(document->GetStorageName())).fileName()),
                            QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel);
  if (answer == QMessageBox::Cancel)
    return false;
  return answer == QMessageBox::Discard || SaveDocument();
}

void VORQtMainWindow::closeEvent(QCloseEvent* event) {
  if (!ConfirmDiscard()) {
    event->ignore();
    return;
  }
  SaveGeometry();
  event->accept();
}
