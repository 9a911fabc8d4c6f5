#include "VORQtDialogs.h"

#include <QCheckBox>
#include <QFontMetrics>
#include <QCloseEvent>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QSignalBlocker>
#include <QStyle>
#include <QTimer>
#include <QVBoxLayout>
#include <algorithm>

#include "VORDlgCheckButton.h"
#include "VORDlgCombo.h"
#include "VORDlgEditor.h"
#include "VORDlgFrame.h"
#include "VORDlgSelectorList.h"
#include "VORQtStrings.h"
#include "VORQtViewerWidget.h"
#include "VORViewer.h"

// ---------------------------------------------------------------------------------------------
// Notifications

QMessageBox::Icon VORQtNotifyPresenter::IconFor(int style) {
  if (style & VORDlgNfyError)
    return QMessageBox::Critical;
  if (style & VORDlgNfyWarning)
    return QMessageBox::Warning;
  if (style & VORDlgNfyInformation)
    return QMessageBox::Information;
  return QMessageBox::NoIcon;
}

int VORQtNotifyPresenter::Present(const VORDlgNotify& notify) {
  VORDlgNotify::Recorder().Present(notify);
  if (onPresent && !VORDlgNotify::Recorder().Records().empty())
    onPresent(VORDlgNotify::Recorder().Records().back());
  QMessageBox box(IconFor(notify.GetStyle()), VORQtString(notify.GetTitle()),
                  VORQtString(notify.GetText()), QMessageBox::Ok, _parent);
  box.setObjectName(VORQtString(notify.GetName()));
  box.exec();
  return VORDlgNotifyOK;
}

// ---------------------------------------------------------------------------------------------
// Dialog widgets

VORQtDialogWidget::VORQtDialogWidget(VORDlgDialog* dialog, QWidget* parent)
    : QDialog(parent), _dialog(dialog) {
  setObjectName(VORQtString(dialog->GetName()));
  if (dialog->HasOKButton() || dialog->HasCancelButton())
    setWindowModality(Qt::ApplicationModal);
  Build();
}

QWidget* VORQtDialogWidget::WidgetFor(const std::string& controlName) const {
  for (const auto& [control, widget] : _widgets) {
    if (control->GetName().str() == controlName)
      return widget;
  }
  return nullptr;
}

void VORQtDialogWidget::Build() {
  _rebuildPending = false;
  _widgets.clear();
  _buttons = nullptr;
  for (QObject* child : children()) {
    if (child->isWidgetType())
      delete child;
  }
  delete layout();
  if (_dialog == nullptr)
    return;
  auto* column = new QVBoxLayout(this);
  auto* grid = new QGridLayout();
  column->addLayout(grid, 1);
  BuildControls(_dialog, grid);
  QDialogButtonBox::StandardButtons which;
  if (_dialog->HasOKButton())
    which |= QDialogButtonBox::Ok;
  if (_dialog->HasCancelButton())
    which |= QDialogButtonBox::Cancel;
  if (which) {
    _buttons = new QDialogButtonBox(which, this);
    column->addWidget(_buttons);
    connect(_buttons, &QDialogButtonBox::accepted, this, [this]() {
      if (_dialog != nullptr)
        _dialog->UserPressOK();
    });
    connect(_buttons, &QDialogButtonBox::rejected, this, [this]() {
      if (_dialog != nullptr)
        _dialog->UserPressCancel();
    });
  }
  Refresh(_dialog);
}

void VORQtDialogWidget::BuildControls(VORDlgControl* parent, QGridLayout* grid) {
  int nextRow = 0;
  for (VORDlgControl* control : parent->GetControls()) {
    QWidget* widget = MakeWidget(control);
    if (widget == nullptr)
      continue;
    _widgets[control] = widget;
    const VORDlgGridConstraints& c = control->GetGridConstraints();
    const int row = std::max(c.row, 0);
    grid->addWidget(widget, row, std::max(c.column, 0), std::max(c.rowSpan, 1),
                    std::max(c.columnSpan, 1));
    nextRow = std::max(nextRow, row + std::max(c.rowSpan, 1));
    RefreshWidget(control, widget);
  }
  // A viewer attached to a frame fills the rows below the frame's controls.
  for (VORCommand* child : parent->GetChildren()) {
    if (auto* viewer = dynamic_cast<VORViewer*>(child))
      grid->addWidget(new VORQtViewerWidget(viewer), nextRow++, 0, 1,
                      std::max(1, grid->columnCount()));
  }
}

QWidget* VORQtDialogWidget::MakeWidget(VORDlgControl* control) {
  const std::string kind = control->GetKind();
  QWidget* widget = nullptr;
  if (kind == "Frame") {
    auto* box = new QGroupBox();
    auto* grid = new QGridLayout(box);
    BuildControls(control, grid);
    widget = box;
  } else if (kind == "Label") {
    widget = new QLabel();
  } else if (kind == "Editor") {
    auto* edit = new QLineEdit();
    auto* editor = static_cast<VORDlgEditor*>(control);
    connect(edit, &QLineEdit::textEdited, this,
            [editor](const QString& text) { editor->UserSetText(VORQtUnicode(text)); });
    widget = edit;
  } else if (kind == "Combo") {
    auto* combo = new QComboBox();
    combo->setEditable(false);
    auto* model = static_cast<VORDlgCombo*>(control);
    connect(combo, &QComboBox::activated, this, [model](int index) { model->UserSelect(index); });
    widget = combo;
  } else if (kind == "CheckButton") {
    auto* check = new QCheckBox();
    auto* button = static_cast<VORDlgCheckButton*>(control);
    connect(check, &QCheckBox::clicked, this, [this, button]() {
      button->UserToggle();
      Refresh(button);
    });
    widget = check;
  } else if (kind == "SelectorList") {
    auto* list = new QListWidget();
    auto* selector = static_cast<VORDlgSelectorList*>(control);
    list->setSelectionMode((selector->GetStyle() & VORDlgLstSingleSelection) != 0
                               ? QAbstractItemView::SingleSelection
                               : QAbstractItemView::ExtendedSelection);
    // The size the dialog asks for, in characters and lines of the list's font.
    const QFontMetrics metrics = list->fontMetrics();
    const int frame = 2 * list->frameWidth();
    if (selector->GetVisibleColumns() > 0)
      list->setMinimumWidth(metrics.averageCharWidth() * selector->GetVisibleColumns() + frame +
                            list->style()->pixelMetric(QStyle::PM_ScrollBarExtent));
    if (selector->GetVisibleLines() > 0)
      list->setFixedHeight((metrics.lineSpacing() + 2) * selector->GetVisibleLines() + frame);
    connect(list, &QListWidget::itemSelectionChanged, this, [list, selector]() {
      std::vector<int> rows;
      for (QListWidgetItem* item : list->selectedItems())
        rows.push_back(list->row(item));
      std::sort(rows.begin(), rows.end());
      selector->UserSelect(rows);
    });
    widget = list;
  } else {
    return nullptr;
  }
  widget->setObjectName(VORQtString(control->GetName()));
  return widget;
}

void VORQtDialogWidget::RefreshWidget(VORDlgControl* control, QWidget* widget) {
  QSignalBlocker block(widget);
  widget->setEnabled(control->IsEffectivelySensitive());
  widget->setVisible(control->GetVisibility());
  const QString title = VORQtString(control->GetTitle());
  const std::string kind = control->GetKind();
  if (kind == "Frame") {
    static_cast<QGroupBox*>(widget)->setTitle(title);
  } else if (kind == "Label") {
    static_cast<QLabel*>(widget)->setText(title);
  } else if (kind == "Editor") {
    auto* edit = static_cast<QLineEdit*>(widget);
    const QString text = VORQtString(static_cast<VORDlgEditor*>(control)->GetText());
    if (edit->text() != text)
      edit->setText(text);
  } else if (kind == "Combo") {
    auto* combo = static_cast<QComboBox*>(widget);
    auto* model = static_cast<VORDlgCombo*>(control);
    QStringList lines;
    for (int i = 0; i < model->GetLineCount(); ++i)
      lines << VORQtString(model->GetLine(i));
    QStringList shown;
    for (int i = 0; i < combo->count(); ++i)
      shown << combo->itemText(i);
    if (lines != shown) {
      combo->clear();
      combo->addItems(lines);
    }
    combo->setCurrentIndex(model->GetSelect());
  } else if (kind == "CheckButton") {
    auto* check = static_cast<QCheckBox*>(widget);
    check->setText(title);
    check->setChecked(static_cast<VORDlgCheckButton*>(control)->IsChecked());
  } else if (kind == "SelectorList") {
    auto* list = static_cast<QListWidget*>(widget);
    auto* model = static_cast<VORDlgSelectorList*>(control);
    QStringList lines;
    for (int i = 0; i < model->GetLineCount(); ++i)
      lines << VORQtString(model->GetLine(i));
    bool same = list->count() == lines.size();
    for (int i = 0; same && i < list->count(); ++i)
      same = list->item(i)->text() == lines[i];
    if (!same) {
      list->clear();
      list->addItems(lines);
    }
    const std::vector<int>& selected = model->GetSelect();
    for (int i = 0; i < list->count(); ++i)
      list->item(i)->setSelected(std::binary_search(selected.begin(), selected.end(), i));
  }
}

void VORQtDialogWidget::Refresh(VORDlgControl* control) {
  if (_dialog == nullptr || _rebuildPending)
    return;
  if (control == _dialog || dynamic_cast<VORDlgFrame*>(control) != nullptr) {
    // Sensitivity and visibility of a frame or the dialog reach every control below.
    setWindowTitle(VORQtString(_dialog->GetTitle().IsEmpty() ? _dialog->GetName().ToUnicode()
                                                             : _dialog->GetTitle()));
    if (_buttons != nullptr) {
      if (QPushButton* ok = _buttons->button(QDialogButtonBox::Ok))
        ok->setEnabled(_dialog->GetOKSensitivity() && _dialog->IsEffectivelySensitive());
    }
    if (control != _dialog && _widgets.find(control) == _widgets.end()) {
      ScheduleRebuild();
      return;
    }
    for (const auto& [c, w] : _widgets)
      RefreshWidget(c, w);
    return;
  }
  auto it = _widgets.find(control);
  if (it == _widgets.end()) {
    ScheduleRebuild();
    return;
  }
  RefreshWidget(control, it->second);
}

void VORQtDialogWidget::ScheduleRebuild() {
  // Not at once: the change may come from inside a signal of a widget that a rebuild deletes.
  if (_rebuildPending)
    return;
  _rebuildPending = true;
  QTimer::singleShot(0, this, [this]() { Build(); });
}

void VORQtDialogWidget::closeEvent(QCloseEvent* event) {
  // The dialog object decides: it hides itself (and so this window) when it accepts.
  if (_dialog != nullptr && _dialog->GetVisibility()) {
    _dialog->UserCloseWindow();
    event->ignore();
    return;
  }
  QDialog::closeEvent(event);
}

void VORQtDialogWidget::reject() {
  if (_dialog == nullptr || !_dialog->GetVisibility()) {
    QDialog::reject();
    return;
  }
  if (_dialog->HasCancelButton())
    _dialog->UserPressCancel();
  else
    _dialog->UserCloseWindow();
}

// ---------------------------------------------------------------------------------------------
// Manager

VORQtDialogManager::VORQtDialogManager(QWidget* mainWindow)
    : QObject(mainWindow),
      _mainWindow(mainWindow),
      _presenter(std::make_shared<VORQtNotifyPresenter>(mainWindow)) {
  VORDlgNotify::SetPresenter(_presenter);
  VOREventPublisher* publisher = VORDlg::GetGlobalPublisher();
  publisher->AddCallback(
      "VORDlgChangedNotification",
      [this](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        if (auto* changed = dynamic_cast<VORDlgNotification*>(n))
          OnChanged(changed->GetControl());
      },
      nullptr, this);
  publisher->AddCallback(
      "VORDlgDialogDestroyed",
      [this](VORBaseUnknown*, const std::string&, VORNotification*, void*, VORCallbackId) {
        Reconcile();
      },
      nullptr, this);
  for (VORDlgDialog* dialog : VORDlgDialog::GetDialogs()) {
    if (dialog->GetVisibility())
      OnChanged(dialog);
  }
}

VORQtDialogManager::~VORQtDialogManager() {
  VORDlg::GetGlobalPublisher()->RemoveCallbacksOf(this);
  if (&VORDlgNotify::GetPresenter() == _presenter.get())
    VORDlgNotify::SetPresenter(nullptr);
  for (auto& [dialog, widget] : _widgets) {
    if (widget)
      widget->Detach();
  }
}

VORQtDialogWidget* VORQtDialogManager::WidgetOf(VORDlgDialog* dialog) const {
  auto it = _widgets.find(dialog);
  return it == _widgets.end() ? nullptr : it->second.data();
}

void VORQtDialogManager::OnChanged(VORDlgControl* control) {
  VORDlgDialog* dialog = nullptr;
  for (VORCommand* c = control; c != nullptr && dialog == nullptr; c = c->GetFather())
    dialog = dynamic_cast<VORDlgDialog*>(c);
  if (dialog == nullptr)
    return;
  const auto alive = VORDlgDialog::GetDialogs();
  if (std::find(alive.begin(), alive.end(), dialog) == alive.end())
    return;  // still being built or already going away
  auto it = _widgets.find(dialog);
  VORQtDialogWidget* widget = it == _widgets.end() ? nullptr : it->second.data();
  if (!dialog->GetVisibility()) {
    if (widget != nullptr)
      widget->hide();
    return;
  }
  if (widget == nullptr) {
    widget = new VORQtDialogWidget(dialog, _mainWindow);
    _widgets[dialog] = widget;
    widget->show();
    return;
  }
  if (!widget->isVisible())
    widget->show();
  widget->Refresh(control);
}

void VORQtDialogManager::Reconcile() {
  const auto alive = VORDlgDialog::GetDialogs();
  for (auto it = _widgets.begin(); it != _widgets.end();) {
    if (std::find(alive.begin(), alive.end(), it->first) != alive.end()) {
      ++it;
      continue;
    }
    if (it->second) {
      it->second->Detach();
      it->second->hide();
      it->second->deleteLater();
    }
    it = _widgets.erase(it);
  }
}
