#include "VORFrmEditor.h"

#include "VORSelectionContext.h"

namespace {
VORFrmEditor_var& Current() {
  static auto* current = new VORFrmEditor_var();  // never destroyed
  return *current;
}
}  // namespace

VORFrmEditor::VORFrmEditor(VORDocument* document)
    : VORCommand(nullptr, "Editor"),
      _document(document),
      _cso(VORCSO_var::Adopt(new VORCSO())),
      _pso(VORPSO_var::Adopt(new VORPSO())),
      _hso(VORHSO_var::Adopt(new VORHSO())),
      _iso(VORISO_var::Adopt(new VORISO())),
      _undo(std::make_unique<VORFrmUndoStack>(dynamic_cast<VORProcess*>(document))) {}

VORFrmEditor::~VORFrmEditor() = default;

VORFrmEditor* VORFrmEditor::GetCurrentEditor() {
  return Current().get();
}

void VORFrmEditor::SetCurrentEditor(VORFrmEditor* editor) {
  if (Current().get() == editor)
    return;
  Current() = editor;
  if (editor != nullptr)
    VORSelectionContext::Set(editor->GetCSO(), editor->GetPSO(), editor->GetHSO(),
                             editor->GetISO());
  else
    VORSelectionContext::Set(nullptr, nullptr, nullptr, nullptr);
}

std::string VORFrmEditor::StorageName() const {
  return _document ? _document->GetStorageName() : std::string();
}

VORUnicodeString VORFrmEditor::GetEnvironmentName() const {
  VORUnicodeString name;
  if (_document)
    _document->GetEnvironmentName(name);
  return name;
}
