// An editor: one open document with its selection sets (CSO, PSO, HSO, ISO). The current
// editor's sets are the ones the interaction layer's agents work with.
#pragma once

#include <memory>
#include <string>

#include "VORCSO.h"
#include "VORCommand.h"
#include "VORDocument.h"
#include "VORFrmUndoStack.h"
#include "VORHSO.h"
#include "VORISO.h"
#include "VORPSO.h"

class VORFrmEditor : public VORCommand {
  VOR_DECLARE_CLASS(VORFrmEditor, VORCommand)
 public:
  // The editor holds the document.
  explicit VORFrmEditor(VORDocument* document);

  // The editor of the current window, or the editor made current last; null when none.
  static VORFrmEditor* GetCurrentEditor();
  // Makes editor current (null: none) and hands its sets to the interaction layer.
  static void SetCurrentEditor(VORFrmEditor* editor);

  VORDocument* GetDocument() const { return _document.get(); }
  // The document's storage name (empty for a new document).
  std::string StorageName() const;
  // The document environment's name ("IPDDocEnv" in hub mode).
  VORUnicodeString GetEnvironmentName() const;

  VORCSO* GetCSO() const { return _cso.get(); }
  VORPSO* GetPSO() const { return _pso.get(); }
  VORHSO* GetHSO() const { return _hso.get(); }
  VORISO* GetISO() const { return _iso.get(); }
  // The document's undo and redo history (records nothing for a document that is no process).
  VORFrmUndoStack& GetUndoStack() { return *_undo; }

 protected:
  ~VORFrmEditor() override;

 private:
  VORDocument_var _document;
  VORCSO_var _cso;
  VORPSO_var _pso;
  VORHSO_var _hso;
  VORISO_var _iso;
  std::unique_ptr<VORFrmUndoStack> _undo;  // after the document: stops recording first
};

VOR_DECLARE_HANDLE(VORFrmEditor);
