#include "VORQtMainWindow.h"

#include <QAction>
#include <QActionGroup>
#include <QApplication>
#include <QCloseEvent>
#include <QDockWidget>
#include <QFileDialog>
#include <QFileInfo>
#include <QLabel>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QMenu>
#include <QMenuBar>
#include <QMessageBox>
#include <QProgressDialog>
#include <QStatusBar>
#include <QToolBar>

#include "VORDocument.h"
#include "VORFrmWindowKinds.h"
#include "VORQtApplication.h"
#include "VORQtChangeWatch.h"
#include "VORQtCommandActions.h"
#include "VORQtDialogs.h"
#include "VORQtDocumentTree.h"
#include "VORQtImageExport.h"
#include "VORQtMdiMirror.h"
#include "VORQtPdfBook.h"
#include "VORQtStrings.h"
#include "VORQtViewerWidget.h"
#include "VORSVGWriter.h"
#include "VORSettingRepository.h"
#include "VORStateCommand.h"
#include "VORViewer.h"
#include "VORWorkbench.h"

VORQtMainWindow::VORQtMainWindow(QWidget* parent)
    : QMainWindow(parent),
      _driver(std::make_unique<VORDriver>()),
      _watch(std::make_unique<VORQtChangeWatch>(*_driver)),
      _commands(
          std::make_unique<VORQtCommandActions>([this](const QString& id) { StartCommand(id); })) {
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
  _mirror = std::make_unique<VORQtMdiMirror>(_mdi);
  connect(_mdi, &QMdiArea::subWindowActivated, this, [this](QMdiSubWindow* sub) {
    VORFrmWindow* window = VORQtMdiMirror::WindowOf(sub);
    if (_syncing || window == nullptr)
      return;
    VORFrmLayout::GetCurrentLayout()->SetCurrentWindow(window);
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
  _hover = new QLabel(this);
  _hover->setObjectName(QStringLiteral("Hovered"));
  statusBar()->addPermanentWidget(_hover);
  _mirror->onNewChart = [this](VORQtViewerWidget& chart) {
    connect(&chart, &VORQtViewerWidget::hoveredActivity, _hover, &QLabel::setText);
  };

  BuildMenus();
  _commands->FillWorkbench(_flowMenu, _flowToolBar);
  dock->toggleViewAction()->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_T));
  if (QMenu* view = menuBar()->findChild<QMenu*>(QStringLiteral("ViewMenu")))
    view->addAction(dock->toggleViewAction());
  RestoreGeometry();

  if (VORQtApplication* app = VORQtApplication::Instance())
    app->AddAfterEventHook(this, [this]() { AfterStep(); });
  AfterStep();
}

VORQtMainWindow::~VORQtMainWindow() {
  if (VORQtApplication* app = VORQtApplication::Instance())
    app->RemoveAfterEventHooks(this);
  // Signals of children dying below must not reach this half-destroyed window.
  _mdi->disconnect(this);
  _tree->disconnect(this);
  // Widgets showing viewers go before the driver closes the windows that hold them.
  _syncing = true;
  _mirror->Clear();
  delete _dialogs;
  _dialogs = nullptr;
  _watch.reset();
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
        this, tr("Export chart"), QString(),
        tr("PNG image (*.png);;SVG image (*.svg);;PDF document (*.pdf)"), &filter);
    if (path.isEmpty())
      return;
    if (QFileInfo(path).suffix().isEmpty())
      path += filter.contains("png") ? ".png" : filter.contains("pdf") ? ".pdf" : ".svg";
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

  QMenu* edit = menuBar()->addMenu(tr("&Edit"));
  edit->setObjectName(QStringLiteral("EditMenu"));
  _undo = edit->addAction(tr("&Undo"), this, [this]() { Undo(); });
  _undo->setShortcut(QKeySequence(Qt::CTRL | Qt::Key_Z));
  _undo->setObjectName(QStringLiteral("Undo"));
  _redo = edit->addAction(tr("&Redo"), this, [this]() { Redo(); });
  _redo->setShortcut(QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_Z));
  _redo->setObjectName(QStringLiteral("Redo"));

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
  for (const auto& [id, title] : hostWindows)
    _commands->AddHostCommand(view, QString(id), title);
  view->addSeparator();

  _windowMenu = menuBar()->addMenu(tr("&Window"));
  _windowMenu->setObjectName(QStringLiteral("WindowMenu"));
  connect(_windowMenu, &QMenu::aboutToShow, this, [this]() { UpdateWindowMenu(); });
  UpdateWindowMenu();
  UpdateRecentMenu();
}

QAction* VORQtMainWindow::CommandAction(const QString& id) const {
  return _commands->Find(id);
}

bool VORQtMainWindow::Undo() {
  const bool ok = _driver->Undo();
  SetMessage(ok ? tr("Undone") : VORQtString(_driver->LastError()));
  _watch->Mark(VORQtChangeWatch::Document);
  AfterStep();
  return ok;
}

bool VORQtMainWindow::Redo() {
  const bool ok = _driver->Redo();
  SetMessage(ok ? tr("Redone") : VORQtString(_driver->LastError()));
  _watch->Mark(VORQtChangeWatch::Document);
  AfterStep();
  return ok;
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

QString VORQtMainWindow::HoverText() const {
  return _hover->text();
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
  _mirror->ForEachViewerWidget([](VORQtViewerWidget& viewer) { viewer.FitAll(); });
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
  const QString suffix = QFileInfo(path).suffix().toLower();
  VORViewer& viewer = *widget->GetViewer();
  const std::string file = path.toStdString();
  bool ok = false;
  if (suffix == "png")
    ok = VORQtImageExport::WritePNG(viewer, file, reason);
  else if (suffix == "pdf")
    ok = VORQtPdfBook::WriteChart(
        viewer, _mdi->activeSubWindow() ? _mdi->activeSubWindow()->windowTitle().toStdString() : "",
        file, reason);
  else
    ok = VORSVGWriter::WriteFile(viewer, file, reason);
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

void VORQtMainWindow::AfterStep() {
  if (_syncing || _driver == nullptr)
    return;
  _syncing = true;
  // A drag is one step: it ends when the last button is let go.
  if (QApplication::mouseButtons() == Qt::NoButton)
    _driver->EndUndoStep();
  const std::vector<std::string> events = _driver->TakeEvents();
  if (!events.empty())
    SetMessage(VORQtString(events.back()));
  std::uint32_t changes = _watch->Take();
  if (!events.empty())
    changes |= VORQtChangeWatch::Layout | VORQtChangeWatch::Command;
  if (changes != 0)
    CatchUp(changes);
  _syncing = false;
}

void VORQtMainWindow::CatchUp(std::uint32_t changes) {
  if ((changes &
       (VORQtChangeWatch::Layout | VORQtChangeWatch::Selection | VORQtChangeWatch::Command)) != 0)
    _mirror->Sync();
  VORProcess* document = _driver->GetDocument();
  if (document != _treeDocument || _watch->CommandsEnded() != _treeBuiltAt) {
    _tree->Rebuild(document);
    _treeDocument = document;
    _treeBuiltAt = _watch->CommandsEnded();
  } else if ((changes & VORQtChangeWatch::Selection) != 0) {
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
  VORFrmEditor* editor = _driver->GetEditor();
  _undo->setEnabled(editor != nullptr && editor->GetUndoStack().CanUndo());
  _redo->setEnabled(editor != nullptr && editor->GetUndoStack().CanRedo());
  _mirror->ForEachViewerWidget([](VORQtViewerWidget& viewer) { viewer.Sync(); });
}

VORQtViewerWidget* VORQtMainWindow::CurrentViewerWidget() const {
  return _mirror->CurrentViewerWidget();
}

VORQtViewerWidget* VORQtMainWindow::ViewerWidgetOf(const QString& window) const {
  return _mirror->ViewerWidgetOf(_driver->FindWindow(window.toStdString()));
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
