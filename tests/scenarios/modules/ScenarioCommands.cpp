// A test module with a state command shaped like the module's grouping commands: pick a target
// station (filtered single pick, taking the current selection), then pick source activities
// (repeated picks, a second pick of one removes it) while a dialog with OK/Cancel is shown; OK
// copies or moves the sources into the target through the copy/cut/paste actor and reports
// with a notification.
#include <memory>

#include "VORApplicationFrame.h"
#include "VORCCP_Actor.h"
#include "VORCommandHeader.h"
#include "VORDlgCheckButton.h"
#include "VORDlgCombo.h"
#include "VORDlgDialog.h"
#include "VORDlgEditor.h"
#include "VORDlgFrame.h"
#include "VORDlgNotify.h"
#include "VORFrmWindowKinds.h"
#include "VORISPPActivity.h"
#include "VORMsgCatalog.h"
#include "VORPathElementAgent.h"
#include "VORStateCommand.h"

namespace {
class ScenarioPickDlg : public VORDlgDialog {
 public:
  ScenarioPickDlg()
      : VORDlgDialog(VORApplicationFrame::GetApplicationFrame()->GetMainWindow(), "ScenarioPickDlg",
                     265217) {}
  void Build() override {
    auto* frame = new VORDlgFrame(this, "FramePick", 0x80001);
    frame->SetGridConstraints(0, 0, 1, 1, VORDlgAttach4Sides);
    (new VORDlgLabel(frame, "EnterName"))->SetGridConstraints(0, 0, 1, 1, 30);
    name = new VORDlgEditor(frame, "EditorName");
    name->SetGridConstraints(0, 1, 1, 1, 30);
    (new VORDlgLabel(frame, "SelectAction"))->SetGridConstraints(1, 0, 1, 1, 30);
    action = new VORDlgCombo(frame, "ComboAction", VORDlgCmbDropDown);
    action->SetGridConstraints(1, 1, 1, 1, 30);
    action->SetLine("copy");
    action->SetLine("move");
    confirm = new VORDlgCheckButton(frame, "Confirm");
    confirm->SetTitle("Confirm");
    confirm->SetGridConstraints(2, 0, 1, 2, 30);
    confirm->SetState(VORDlgCheck);
  }
  VORDlgEditor* name = nullptr;
  VORDlgCombo* action = nullptr;
  VORDlgCheckButton* confirm = nullptr;
};

class ScenarioPickCmd : public VORStateCommand {
 public:
  explicit ScenarioPickCmd(VORBaseUnknown*) : VORStateCommand("ScenarioPickCmd", 64, 0) {}

  void BuildGraph() override {
    _first = VORPathElementAgent_var::Adopt(new VORPathElementAgent("Target"));
    _first->SetElementType<VORISPPActivity>();
    _first->SetBehavior(VORAgentBehavior::SinglePick);
    _first->SetFilter(VORMethodFilter(this, &ScenarioPickCmd::IsStation));
    _first->AddCSOClient(this);
    _more = VORPathElementAgent_var::Adopt(new VORPathElementAgent("Sources"));
    _more->SetElementType<VORISPPActivity>();
    _more->SetBehavior(8652800);
    _ok = VORDialogAgent_var::Adopt(new VORDialogAgent("OK"));
    _cancel = VORDialogAgent_var::Adopt(new VORDialogAgent("Cancel"));

    VORDialogState* target = GetInitialState("SelectTarget");
    target->AddDialogAgent(_first);
    VORDialogState* sources = AddDialogState("SelectSources");
    sources->AddDialogAgent(_cancel);
    sources->AddDialogAgent(_ok);
    sources->AddDialogAgent(_more);
    AddTransition(target, sources, IsOutputSetCondition(_first),
                  Action(this, &ScenarioPickCmd::ShowDialog));
    AddTransition(sources, sources, IsOutputSetCondition(_more),
                  Action(this, &ScenarioPickCmd::AddSource));
    AddTransition(sources, nullptr, IsOutputSetCondition(_cancel));
    AddTransition(sources, nullptr, IsOutputSetCondition(_ok),
                  Action(this, &ScenarioPickCmd::Apply));
  }

  bool IsStation(VORDialogAgent* agent, void*) {
    VORISPPActivity_var activity(agent->GetValue());
    return activity && activity->GetActivityType() == VORString("BIWActivityStation");
  }

  bool ShowDialog(void*) {
    _target = _first->GetValue();
    if (!_dialog) {
      _dialog = VORHandle<ScenarioPickDlg>::Adopt(new ScenarioPickDlg());
      _dialog->Build();
      _ok->AcceptOnNotify(_dialog, VORDlgDialog::GetDiaOKNotification());
      _cancel->AcceptOnNotify(_dialog, VORDlgDialog::GetDiaCANCELNotification());
      _cancel->AcceptOnNotify(_dialog, VORDlgDialog::GetWindCloseNotification());
      AddCallback(_dialog->name->GetEventPublisher(), VORDlgEditor::GetEditModifyNotification(),
                  [this](VORBaseUnknown*, VORNotification*, void*) { UpdateOK(); });
    }
    _dialog->name->SetText(VORFrmObjectLabel(_target));
    _dialog->SetVisibility(true);
    UpdateOK();
    _more->Reset();
    return true;
  }

  bool AddSource(void*) {
    VORBaseUnknown_var picked = _more->GetValue();
    VORCSO* cso = _more->GetCSO();
    if (picked == _target) {
      // The target stays selected as it was.
      Notify("Error", "ErrorTarget", "The target cannot be a source.");
      return false;
    }
    if (_sources.Locate(picked) != 0) {
      _sources.RemoveValue(picked);
      if (cso != nullptr)
        cso->RemoveElement(_more->GetValuePath());
    } else {
      _sources.Append(picked);
    }
    UpdateOK();
    return true;
  }

  bool Apply(void*) {
    if (!_dialog->confirm->IsChecked()) {
      Notify("Warning", "NotConfirmed", "Nothing done: not confirmed.");
      return true;
    }
    const bool move = _dialog->action->GetSelectedLine() == VORUnicodeString("move");
    VORCSO* cso = _more->GetCSO();
    auto actor = VORCCP_Actor_var::Adopt(new VORCCP_Actor());
    if (cso == nullptr || !actor->Initialize())
      return true;
    cso->Empty();
    cso->AddElements(_sources);
    actor->SetType(VORCCP_Actor::CopyType);
    actor->ReadCSO();
    bool done = actor->CanCopy() && actor->Copy();
    VORListValVORBaseUnknown_var targets;
    targets.Append(_target);
    actor->SetType(VORCCP_Actor::PasteIntoType);
    done = done && actor->CanPaste(targets) && actor->Paste(targets);
    if (done && move) {
      VORListValVORBaseUnknown_var copies;
      for (int i = 1; i <= cso->GetSize(); ++i)
        copies.Append(VORBaseUnknown_var(cso->GetElement(i)->GetLeaf()));
      cso->Empty();
      cso->AddElements(_sources);
      actor->SetType(VORCCP_Actor::CopyType);
      actor->ReadCSO();
      done = actor->CanCut() && actor->Cut();
      cso->AddElements(copies);
    }
    VORCCP_Actor::CloseClipboard();
    VORCCP_Actor::OpenClipboard();
    VORCCP_Actor::CloseClipboard();
    if (!done) {
      Notify("Error", "Refused", "The activities cannot be pasted there.");
      return true;
    }
    VORListValVORUnicodeString parameters;
    parameters.Append(VORUnicodeString(std::to_string(_sources.Size())));
    parameters.Append(_dialog->name->GetText());
    Notify("Done", move ? "Moved" : "Copied",
           move ? "/p1 activities moved into /p2" : "/p1 activities copied into /p2", &parameters);
    return true;
  }

 protected:
  ~ScenarioPickCmd() override = default;

 private:
  void UpdateOK() {
    _dialog->SetOKSensitivity(!_sources.IsEmpty() && !_dialog->name->GetText().IsEmpty());
  }
  void Notify(const char* title, const char* key, const char* text,
              const VORListValVORUnicodeString* parameters = nullptr) {
    auto* notify = new VORDlgNotify(VORApplicationFrame::GetApplicationFrame()->GetMainWindow(),
                                    key, 0x10000200);
    notify->DisplayBlocked(VORMsgCatalog::BuildMessage("ScenarioPickCmd", key, text, parameters),
                           VORMsgCatalog::BuildMessage("ScenarioPickCmd", "title", title));
    notify->RequestDelayedDestruction();
  }

  VORPathElementAgent_var _first;
  VORPathElementAgent_var _more;
  VORDialogAgent_var _ok;
  VORDialogAgent_var _cancel;
  VORHandle<ScenarioPickDlg> _dialog;
  VORBaseUnknown_var _target;
  VORListValVORBaseUnknown_var _sources;
};
}  // namespace

VOR_EXPORT_COMMAND_FACTORY(ScenarioPickCmd)
