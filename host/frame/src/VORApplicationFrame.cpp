#include "VORApplicationFrame.h"

#include <filesystem>

#include "VORCommandEngine.h"
#include "VORDeferredDeletion.h"
#include "VORDocument.h"
#include "VORExtensionRegistry.h"
#include "VORFrameInit.h"
#include "VORFrmEditor.h"
#include "VORFrmLayout.h"
#include "VORFrmWindowKinds.h"

VORApplicationFrame::VORApplicationFrame()
    : _mainWindow(VORHandle<VORFrmMainWindow>::Adopt(new VORFrmMainWindow())),
      _layout(VORFrmLayout_var::Adopt(new VORFrmLayout())),
      _publisher(VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher(this))) {
  VORInitFrame();
  // Modules extend model objects on demand: the dictionary names the module of each extension.
  VORExtensionRegistry::LoadDictionaryFromStartupPath();
}

VORApplicationFrame::~VORApplicationFrame() = default;

VORApplicationFrame* VORApplicationFrame::GetApplicationFrame() {
  // Never destroyed: windows and editors may still be queued for deletion at exit.
  static VORApplicationFrame* frame = new VORApplicationFrame();
  return frame;
}

VORFrmEditor* VORApplicationFrame::OpenDocument(const std::string& path, std::string& error) {
  VORProcess_var document = VORProcess_var::Adopt(VORProcess::Load(path, error));
  if (!document)
    return nullptr;
  return OpenDocument(document);
}

VORFrmEditor* VORApplicationFrame::OpenDocument(VORDocument* document) {
  if (document == nullptr)
    return nullptr;
  _editors.push_back(VORFrmEditor_var::Adopt(new VORFrmEditor(document)));
  VORFrmEditor* editor = _editors.back().get();
  VORFrmEditor::SetCurrentEditor(editor);
  std::string name = std::filesystem::path(document->GetStorageName()).filename().string();
  if (name.empty())
    name = "Process";
  new VORFrmTreeWindow(name, editor);  // the layout holds it
  return editor;
}

void VORApplicationFrame::CloseEditor(VORFrmEditor* editor) {
  VORFrmEditor_var keep(editor);
  for (VORFrmWindow* w : _layout->GetWindowList()) {
    if (w->GetEditor() == editor)
      w->DeleteWindow();
  }
  std::erase_if(_editors, [editor](const VORFrmEditor_var& e) { return e.get() == editor; });
  if (VORFrmEditor::GetCurrentEditor() == editor)
    VORFrmEditor::SetCurrentEditor(_editors.empty() ? nullptr : _editors.back().get());
}

void VORApplicationFrame::CloseAll() {
  VORCommandEngine::CancelCurrent();
  for (VORFrmWindow* w : _layout->GetWindowList())
    w->DeleteWindow();
  VORFrmEditor::SetCurrentEditor(nullptr);
  _editors.clear();
  _layout->SetMDIState(VORFrmLayout::MDIMaximized);
  VORDeferredDeletion::Drain();
}
