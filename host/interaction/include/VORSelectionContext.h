// The selection sets of the current editor, for the interaction layer which knows no editors:
// the frame sets them whenever the current editor changes. Null when there is no editor.
#pragma once

class VORCSO;
class VORPSO;
class VORHSO;
class VORISO;

namespace VORSelectionContext {
void Set(VORCSO* cso, VORPSO* pso, VORHSO* hso, VORISO* iso);
VORCSO* CSO();
VORPSO* PSO();
VORHSO* HSO();
VORISO* ISO();
}  // namespace VORSelectionContext
