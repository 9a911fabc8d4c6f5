#include "VORDriver.h"

#include <cstdio>
#include <memory>

#include "VORCommandEngine.h"
#include "VORDeferredDeletion.h"
#include "VORDlgCheckButton.h"
#include "VORDlgCombo.h"
#include "VORDlgContextualMenu.h"
#include "VORDlgEditor.h"
#include "VORDlgSelectorList.h"
#include "VORFrmMessageNotification.h"
#include "VORFrmPick.h"
#include "VORFrmWindowKinds.h"
#include "VORIGENode.h"
#include "VORIGraphNodeLayout.h"
#include "VORIProduct.h"
#include "VORSVGWriter.h"
#include "VORStateCommand.h"
#include "VORWorkbench.h"

namespace {
VORApplicationFrame* Frame() {
  return VORApplicationFrame::GetApplicationFrame();
}

// The object with its graph-node (or product) fathers, root first.
VORPathElement_var PathWithFathers(VORBaseUnknown* object) {
  VORListValVORBaseUnknown_var chain;
  VORBaseUnknown_var current(object);
  for (int guard = 0; current && guard < 10000; ++guard) {
    chain.InsertAt(1, current);
    VORBaseUnknown_var father;
    if (VORIGENode_var node(current); node)
      node->GetParentNode(father);
    else if (VORIProduct_var product(current); product)
      product->GetFatherProduct(father);
    current = father;
  }
  return VORPathElement_var::Adopt(new VORPathElement(chain));
}

VORBaseUnknown* FindByLabel(VORBaseUnknown* root, const VORUnicodeString& label, int depth) {
  if (root == nullptr || depth > 1000)
    return nullptr;
  if (VORFrmObjectLabel(root) == label)
    return root;
  VORListValVORBaseUnknown_var* children = nullptr;
  if (VORIGENode_var node{VORBaseUnknown_var(root)}; node)
    node->GetChildren(children);
  else if (VORIProduct_var product{VORBaseUnknown_var(root)}; product)
    product->GetChildren(children, "VORIProduct");
  std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
  if (children != nullptr) {
    for (const VORBaseUnknown_var& child : *children) {
      if (VORBaseUnknown* found = FindByLabel(child, label, depth + 1))
        return found;
    }
  }
  return nullptr;
}

std::string Format(double v) {
  char buffer[32];
  std::snprintf(buffer, sizeof buffer, "%g", v);
  return buffer;
}
}  // namespace

VORDriver::VORDriver() {
  Frame()->CloseAll();
  _notificationsSeen = VORDlgNotify::Recorder().Records().size();
  _pickCallback = Frame()->GetEventPublisher()->AddCallback(
      "VORFrmPickNotification",
      [this](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        auto* pick = static_cast<VORFrmPickNotification*>(n);
        if (pick->GetResult() == VORFrmPickNotification::RefusedByCommand)
          _events.push_back("pick of \"" +
                            VORFrmObjectLabel(pick->GetPath()->GetLeaf()).ConvertToUTF8() +
                            "\" refused");
        else if (pick->GetResult() == VORFrmPickNotification::Background)
          _events.push_back("click on the background");
      });
  _messageCallback = Frame()->GetEventPublisher()->AddCallback(
      VORFrmMessageNotification::ClassName(),
      [this](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        _events.push_back(static_cast<VORFrmMessageNotification*>(n)->GetText());
      });
  _engineCallback = VORCommandEngine::GetEventPublisher()->AddCallback(
      "VORCommandEndNotification",
      [this](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        auto* end = static_cast<VORCommandEndNotification*>(n);
        EndUndoStep();           // what the command changed is one step
        CollectNotifications();  // what the command showed comes first
        _events.push_back("command " + end->GetCommand()->GetName().str() +
                          (end->IsCancelled() ? " cancelled" : " ended"));
      });
}

VORDriver::~VORDriver() {
  _menu = NULL_var;
  Frame()->CloseAll();
  VORCommandEngine::GetEventPublisher()->RemoveCallback(_engineCallback);
  Frame()->GetEventPublisher()->RemoveCallback(_pickCallback);
  Frame()->GetEventPublisher()->RemoveCallback(_messageCallback);
  VORDeferredDeletion::Drain();
}

bool VORDriver::Fail(const std::string& why) {
  _error = why;
  DrainDeferred();
  return false;
}

bool VORDriver::Step(bool ok) {
  if (ok)
    _error.clear();
  EndUndoStep();
  DrainDeferred();
  return ok;
}

void VORDriver::CollectNotifications() {
  const auto& records = VORDlgNotify::Recorder().Records();
  for (; _notificationsSeen < records.size(); ++_notificationsSeen) {
    const VORDlgNotifyRecord& r = records[_notificationsSeen];
    _events.push_back("notification \"" + r.title + "\": " + r.text);
  }
}

int VORDriver::DrainDeferred() {
  CollectNotifications();
  return VORDeferredDeletion::Drain();
}

std::vector<std::string> VORDriver::TakeEvents() {
  CollectNotifications();
  std::vector<std::string> events;
  events.swap(_events);
  return events;
}

const std::vector<VORDlgNotifyRecord>& VORDriver::Notifications() const {
  return VORDlgNotify::Recorder().Records();
}

bool VORDriver::OpenDocument(const std::string& path) {
  std::string error;
  if (Frame()->OpenDocument(path, error) == nullptr)
    return Fail(error);
  return Step(true);
}

VORFrmEditor* VORDriver::GetEditor() const {
  return VORFrmEditor::GetCurrentEditor();
}

VORProcess* VORDriver::GetDocument() const {
  VORFrmEditor* editor = GetEditor();
  return editor ? dynamic_cast<VORProcess*>(editor->GetDocument()) : nullptr;
}

bool VORDriver::SaveDocument(const std::string& path) {
  VORProcess* document = GetDocument();
  if (document == nullptr)
    return Fail("no document is open");
  std::string error;
  if (!document->SaveAs(path, error))
    return Fail(error);
  return Step(true);
}

bool VORDriver::ExportWindow(const std::string& window, const std::string& path) {
  VORFrmWindow* w = FindWindow(window);
  if (w == nullptr)
    return Fail("no window \"" + window + "\"");
  VORViewer* viewer = w->GetViewer();
  if (viewer == nullptr)
    return Fail("\"" + w->GetTitle().ConvertToUTF8() + "\" has no viewer to export");
  std::string error;
  if (!VORSVGWriter::WriteFile(*viewer, path, error))
    return Fail(error);
  return Step(true);
}

bool VORDriver::StartCommand(const std::string& id) {
  VORCommandHeader_var header = VORCommandHeader_var::Adopt(VORWorkbench::CreateHeader(id));
  if (!header)
    header = VORCommandHeader::Find(id);
  if (!header)
    return Fail("unknown command \"" + id + "\"");
  VORCommand_var command = VORCommand_var::Adopt(header->CreateCommand());
  if (!command)
    return Fail("cannot create command \"" + id + "\": " + header->LastError());
  _events.push_back("command " + command->GetName().str() + " started");
  VORCommandEngine::Start(command);
  return Step(true);
}

bool VORDriver::CancelCommand() {
  if (VORCommandEngine::Current() == nullptr)
    return Fail("no command is running");
  VORCommandEngine::CancelCurrent();
  return Step(true);
}

VORCommand* VORDriver::GetRunningCommand() const {
  return VORCommandEngine::Current();
}

void VORDriver::EndUndoStep() {
  if (VORFrmEditor* editor = GetEditor();
      editor != nullptr && VORCommandEngine::Current() == nullptr)
    editor->GetUndoStack().EndStep();
}

bool VORDriver::Undo() {
  VORFrmEditor* editor = GetEditor();
  if (editor == nullptr)
    return Fail("no document is open");
  // An undo ends the running command first, as any other command would.
  if (VORCommandEngine::Current() != nullptr)
    VORCommandEngine::CancelCurrent();
  if (!editor->GetUndoStack().Undo())
    return Fail("nothing to undo");
  return Step(true);
}

bool VORDriver::Redo() {
  VORFrmEditor* editor = GetEditor();
  if (editor == nullptr)
    return Fail("no document is open");
  if (VORCommandEngine::Current() != nullptr)
    VORCommandEngine::CancelCurrent();
  if (!editor->GetUndoStack().Redo())
    return Fail("nothing to redo");
  return Step(true);
}

VORBaseUnknown* VORDriver::FindObject(const std::string& idOrLabel) const {
  VORProcess* document = GetDocument();
  if (document == nullptr)
    return nullptr;
  if (VORBaseUnknown* byId = document->FindObject(idOrLabel))
    return byId;
  const VORUnicodeString label(idOrLabel);
  if (VORBaseUnknown* found = FindByLabel(document->GetRootProcess(), label, 0))
    return found;
  if (VORBaseUnknown* found = FindByLabel(document->GetRootProduct(), label, 0))
    return found;
  return FindByLabel(document->GetResourceRoot(), label, 0);
}

VORPathElement_var VORDriver::PathOf(const std::string& idOrLabel) {
  VORBaseUnknown* object = FindObject(idOrLabel);
  return object ? PathWithFathers(object) : VORPathElement_var();
}

bool VORDriver::OfferPick(VORPathElement* path) {
  VORFrmDispatchPick(GetEditor(), {VORPathElement_var(path)});
  return Step(true);
}

bool VORDriver::PickObject(const std::string& idOrLabel) {
  VORPathElement_var path = PathOf(idOrLabel);
  if (!path)
    return Fail("no object \"" + idOrLabel + "\"");
  return OfferPick(path);
}

bool VORDriver::SelectObjects(const std::vector<std::string>& idsOrLabels) {
  VORFrmEditor* editor = GetEditor();
  if (editor == nullptr)
    return Fail("no document is open");
  VORListValVORBaseUnknown_var paths;
  for (const std::string& name : idsOrLabels) {
    VORPathElement_var path = PathOf(name);
    if (!path)
      return Fail("no object \"" + name + "\"");
    paths.Append(VORBaseUnknown_var(path.get()));
  }
  editor->GetCSO()->Empty();
  editor->GetCSO()->AddElements(paths);
  return Step(true);
}

bool VORDriver::PickInChart(const std::string& window, double x, double y) {
  VORFrmWindow* w = FindWindow(window);
  if (w == nullptr)
    return Fail("no window \"" + window + "\"");
  if (VORViewer* viewer = w->GetViewer()) {
    const VORMathPoint2D p = viewer->GetMain2DViewpoint()->ModelToPixel(x, y);
    viewer->OnMouseMove(p.x, p.y);
    viewer->OnMousePress(p.x, p.y, VORMouseLeft);
    viewer->OnMouseRelease(p.x, p.y, VORMouseLeft);
    return Step(true);
  }
  auto* chart = dynamic_cast<QELFpaPertChartWindow*>(w);
  if (chart == nullptr)
    return Fail("\"" + w->GetTitle().ConvertToUTF8() + "\" shows no chart");
  VORBaseUnknown_var node = chart->PickNode(x, y);
  std::vector<VORPathElement_var> paths;
  if (node)
    paths.push_back(PathWithFathers(node));
  VORFrmDispatchPick(w->GetEditor(), paths);
  return Step(true);
}

VORDlgDialog* VORDriver::FindDialog(const std::string& name) const {
  return VORDlgDialog::FindShown(name);
}

bool VORDriver::PressOK(const std::string& dialog) {
  VORDlgDialog* d = FindDialog(dialog);
  if (d == nullptr)
    return Fail("no dialog \"" + dialog + "\" is shown");
  if (!d->UserPressOK())
    return Fail("OK is not available in \"" + d->GetName().str() + "\"");
  return Step(true);
}

bool VORDriver::PressCancel(const std::string& dialog) {
  VORDlgDialog* d = FindDialog(dialog);
  if (d == nullptr)
    return Fail("no dialog \"" + dialog + "\" is shown");
  if (!d->UserPressCancel())
    return Fail("Cancel is not available in \"" + d->GetName().str() + "\"");
  return Step(true);
}

bool VORDriver::CloseDialog(const std::string& dialog) {
  VORDlgDialog* d = FindDialog(dialog);
  if (d == nullptr)
    return Fail("no dialog \"" + dialog + "\" is shown");
  d->UserCloseWindow();
  return Step(true);
}

VORDlgControl* VORDriver::FindControl(const std::string& dialog, const std::string& control) {
  VORDlgDialog* d = FindDialog(dialog);
  if (d == nullptr) {
    Fail("no dialog \"" + dialog + "\" is shown");
    return nullptr;
  }
  VORDlgControl* c = d->FindControl(control);
  if (c == nullptr)
    Fail("no control \"" + control + "\" in \"" + d->GetName().str() + "\"");
  return c;
}

bool VORDriver::TypeText(const std::string& dialog, const std::string& editor,
                         const std::string& text) {
  auto* e = dynamic_cast<VORDlgEditor*>(FindControl(dialog, editor));
  if (e == nullptr)
    return _error.empty() ? Fail("\"" + editor + "\" is not an editor") : false;
  if (!e->UserSetText(text))
    return Fail("\"" + editor + "\" is insensitive");
  return Step(true);
}

bool VORDriver::ChooseComboLine(const std::string& dialog, const std::string& combo,
                                const std::string& line) {
  _error.clear();
  VORDlgControl* control = FindControl(dialog, combo);
  if (auto* list = dynamic_cast<VORDlgSelectorList*>(control)) {
    for (int i = 0; i < list->GetLineCount(); ++i) {
      if (list->GetLine(i) == VORUnicodeString(line))
        return list->UserSelect({i}) ? Step(true) : Fail("\"" + combo + "\" is insensitive");
    }
    return Fail("\"" + combo + "\" has no line \"" + line + "\"");
  }
  auto* c = dynamic_cast<VORDlgCombo*>(control);
  if (c == nullptr)
    return _error.empty() ? Fail("\"" + combo + "\" is not a combo") : false;
  if (!c->UserSelect(VORUnicodeString(line)))
    return Fail("\"" + combo + "\" has no line \"" + line + "\" or is insensitive");
  return Step(true);
}

namespace {
// The first check button at any depth below control whose title is title, or null.
VORDlgCheckButton* CheckButtonTitled(const VORDlgControl* control, const std::string& title) {
  for (VORDlgControl* child : control->GetControls()) {
    auto* button = dynamic_cast<VORDlgCheckButton*>(child);
    if (button != nullptr && button->GetTitle().ConvertToUTF8() == title)
      return button;
    if (VORDlgCheckButton* below = CheckButtonTitled(child, title))
      return below;
  }
  return nullptr;
}
}  // namespace

bool VORDriver::ToggleCheckButton(const std::string& dialog, const std::string& button) {
  _error.clear();
  VORDlgDialog* d = FindDialog(dialog);
  if (d == nullptr)
    return Fail("no dialog \"" + dialog + "\" is shown");
  // By name first; buttons that have only a title (one per ZitBlt name, say) by their title.
  VORDlgControl* named = d->FindControl(button);
  auto* b = dynamic_cast<VORDlgCheckButton*>(named);
  if (b == nullptr)
    b = CheckButtonTitled(d, button);
  if (b == nullptr)
    return Fail(named != nullptr
                    ? "\"" + button + "\" is not a check button"
                    : "no check button \"" + button + "\" in \"" + d->GetName().str() + "\"");
  if (!b->UserToggle())
    return Fail("\"" + button + "\" is insensitive");
  return Step(true);
}

bool VORDriver::OpenContextMenu(const std::string& window, double x, double y) {
  VORFrmWindow* w = FindWindow(window);
  if (w == nullptr)
    return Fail("no window \"" + window + "\"");
  _menu = NULL_var;
  VORHandle<VORContext> context;
  if (VORViewer* viewer = w->GetViewer()) {
    auto catcher = VORCommand_var::Adopt(new VORCommand());
    catcher->AddCallback(viewer->GetEventPublisher(), "VORContext",
                         [&context](VORBaseUnknown*, VORNotification* n, void*) {
                           context = dynamic_cast<VORContext*>(n);
                         });
    const VORMathPoint2D p = viewer->GetMain2DViewpoint()->ModelToPixel(x, y);
    viewer->OnMouseMove(p.x, p.y);
    viewer->OnContextMenu(p.x, p.y);
  } else {
    context = VORHandle<VORContext>::Adopt(new VORContext(w, x, y));
    w->DispatchNotification(context);
  }
  auto* menu = context ? dynamic_cast<VORDlgControl*>(context->GetContextualMenu()) : nullptr;
  if (menu == nullptr || menu->GetControls().empty())
    return Fail("no context menu at (" + Format(x) + ", " + Format(y) + ")");
  _menu = menu;
  return Step(true);
}

bool VORDriver::ChooseMenuItem(const std::string& item) {
  if (!_menu)
    return Fail("no context menu is open");
  for (VORDlgControl* c : _menu->GetControls()) {
    auto* push = dynamic_cast<VORDlgPushItem*>(c);
    if (push != nullptr &&
        (c->GetName().str() == item || c->GetTitle() == VORUnicodeString(item))) {
      VORHandle<VORDlgControl> menu = std::move(_menu);
      if (!push->UserActivate())
        return Fail("menu item \"" + item + "\" is insensitive");
      return Step(true);
    }
  }
  return Fail("no menu item \"" + item + "\"");
}

bool VORDriver::Drag(const std::string& window, double x0, double y0, double x1, double y1) {
  VORFrmWindow* w = FindWindow(window);
  if (w == nullptr)
    return Fail("no window \"" + window + "\"");
  if (VORViewer* viewer = w->GetViewer()) {
    const VORMathPoint2D from = viewer->GetMain2DViewpoint()->ModelToPixel(x0, y0);
    const VORMathPoint2D to = viewer->GetMain2DViewpoint()->ModelToPixel(x1, y1);
    if (viewer->ManipulatorAt(from.x, from.y) == nullptr)
      return Fail("nothing to drag at (" + Format(x0) + ", " + Format(y0) + ")");
    viewer->OnMouseMove(from.x, from.y);
    viewer->OnMousePress(from.x, from.y, VORMouseLeft);
    constexpr int kSteps = 4;  // a few intermediate moves, as a hand would make
    for (int i = 1; i <= kSteps; ++i)
      viewer->OnMouseMove(from.x + (to.x - from.x) * i / kSteps,
                          from.y + (to.y - from.y) * i / kSteps);
    viewer->OnMouseRelease(to.x, to.y, VORMouseLeft);
    return Step(true);
  }
  auto* chart = dynamic_cast<QELFpaPertChartWindow*>(w);
  if (chart == nullptr)
    return Fail("\"" + w->GetTitle().ConvertToUTF8() + "\" shows no chart");
  VORIGraphNodeLayout_var layout(chart->PickNode(x0, y0));
  if (!layout)
    return Fail("nothing to drag at (" + Format(x0) + ", " + Format(y0) + ")");
  double x = 0, y = 0;
  layout->GetPertPosition(x, y);
  layout->SetPertPosition(x + (x1 - x0), y + (y1 - y0));
  return Step(true);
}

VORFrmWindow* VORDriver::FindWindow(const std::string& titleOrName) const {
  VORFrmLayout* layout = VORFrmLayout::GetCurrentLayout();
  if (titleOrName.empty())
    return layout->GetCurrentWindow();
  for (VORFrmWindow* w : layout->GetWindowList()) {
    if (w->GetTitle() == VORUnicodeString(titleOrName))
      return w;
  }
  for (VORFrmWindow* w : layout->GetWindowList()) {
    if (w->GetName().str() == titleOrName)
      return w;
  }
  return nullptr;
}

bool VORDriver::ActivateWindow(const std::string& titleOrName) {
  VORFrmWindow* w = FindWindow(titleOrName);
  if (w == nullptr)
    return Fail("no window \"" + titleOrName + "\"");
  VORFrmLayout::GetCurrentLayout()->SetCurrentWindow(w);
  return Step(true);
}

bool VORDriver::CloseWindow(const std::string& titleOrName) {
  VORFrmWindow* w = FindWindow(titleOrName);
  if (w == nullptr)
    return Fail("no window \"" + titleOrName + "\"");
  w->DeleteWindow();
  return Step(true);
}

std::string VORDriver::DescribeWindows() const {
  std::string text;
  VORFrmLayout* layout = VORFrmLayout::GetCurrentLayout();
  int i = 0;
  for (VORFrmWindow* w : layout->GetWindowList()) {
    text += "window " + std::to_string(++i) + ": " + w->IsA() + " \"" +
            w->GetTitle().ConvertToUTF8() + "\"";
    if (w == layout->GetCurrentWindow())
      text += " [current]";
    text += "\n";
  }
  return text.empty() ? "no windows\n" : text;
}

std::string VORDriver::DescribeWindow(const std::string& titleOrName) const {
  VORFrmWindow* w = FindWindow(titleOrName);
  if (w == nullptr)
    return "no window \"" + titleOrName + "\"\n";
  return std::string(w->IsA()) + " \"" + w->GetTitle().ConvertToUTF8() + "\"\n" +
         w->DescribeContents();
}

std::string VORDriver::DescribeCSO() const {
  std::string text = "cso:";
  if (VORFrmEditor* editor = GetEditor()) {
    VORCSO* cso = editor->GetCSO();
    for (int i = 1; i <= cso->GetSize(); ++i)
      text +=
          (i == 1 ? " " : ", ") + VORFrmObjectLabel(cso->GetElement(i)->GetLeaf()).ConvertToUTF8();
  }
  return text + "\n";
}

std::string VORDriver::DescribeDialog(const std::string& name) const {
  VORDlgDialog* d = FindDialog(name);
  return d ? VORDlg::Describe(d) : "no dialog \"" + name + "\" is shown\n";
}

std::string VORDriver::DescribeMenu() const {
  return _menu ? VORDlg::Describe(_menu) : "no context menu\n";
}
