// Dialog layer objects on screen: message boxes for the notification presenter, and Qt dialogs
// generated from the introspectable dialog objects. Widgets only show the objects' state and call
// their "User..." entry points, the same ones the headless driver calls.
#pragma once

#include <QDialog>
#include <QMessageBox>
#include <QObject>
#include <QPointer>
#include <functional>
#include <map>
#include <memory>

#include "VORDlgDialog.h"
#include "VORDlgNotify.h"

class QGridLayout;

// Shows "display blocked" notifications as modal message boxes with the notification's title,
// text and icon style. Each is also recorded by the dialog layer's recorder first, so the
// driver's event log and the status bar see it.
class VORQtNotifyPresenter : public VORDlgNotifyPresenter {
 public:
  explicit VORQtNotifyPresenter(QWidget* parent = nullptr) : _parent(parent) {}
  int Present(const VORDlgNotify& notify) override;
  void SetParent(QWidget* parent) { _parent = parent; }
  // Called with each record before the box opens.
  std::function<void(const VORDlgNotifyRecord&)> onPresent;

  static QMessageBox::Icon IconFor(int style);

 private:
  QPointer<QWidget> _parent;
};

// A Qt dialog built from a dialog object: frames as group boxes on grids, labels, line edits,
// read-only combos, check buttons, selector lists, OK / Cancel and the window close button.
// Dialogs with an OK or a Cancel button are modal to their parent window, others modeless.
class VORQtDialogWidget : public QDialog {
  Q_OBJECT
 public:
  VORQtDialogWidget(VORDlgDialog* dialog, QWidget* parent);
  VORDlgDialog* GetDialog() const { return _dialog; }
  // The widget showing a control (by name), or null.
  QWidget* WidgetFor(const std::string& controlName) const;
  // Shows a control's current state (its title, value, sensitivity); rebuilds when it is a
  // control this widget has not seen.
  void Refresh(VORDlgControl* control);
  // Forgets the dialog object (it is going away).
  void Detach() { _dialog = nullptr; }

 protected:
  void closeEvent(QCloseEvent* event) override;
  void reject() override;

 private:
  void Build();
  void BuildControls(VORDlgControl* parent, QGridLayout* grid);
  QWidget* MakeWidget(VORDlgControl* control);
  void RefreshWidget(VORDlgControl* control, QWidget* widget);
  void ScheduleRebuild();

  VORDlgDialog* _dialog;  // not held: the dialog's creator releases it
  std::map<VORDlgControl*, QWidget*> _widgets;
  class QDialogButtonBox* _buttons = nullptr;
  bool _rebuildPending = false;
};

// Follows the dialog layer: a shown dialog object gets its widget, a hidden one is hidden, a
// destroyed one loses it. Installs the message-box presenter while it lives.
class VORQtDialogManager : public QObject {
  Q_OBJECT
 public:
  explicit VORQtDialogManager(QWidget* mainWindow);
  ~VORQtDialogManager() override;

  VORQtDialogWidget* WidgetOf(VORDlgDialog* dialog) const;
  VORQtNotifyPresenter& Presenter() { return *_presenter; }

 private:
  void OnChanged(VORDlgControl* control);
  void Reconcile();

  QPointer<QWidget> _mainWindow;
  std::shared_ptr<VORQtNotifyPresenter> _presenter;
  std::map<VORDlgDialog*, QPointer<VORQtDialogWidget>> _widgets;
};
