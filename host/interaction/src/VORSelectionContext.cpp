#include "VORSelectionContext.h"

#include "VORCSO.h"
#include "VORHSO.h"
#include "VORISO.h"
#include "VORPSO.h"

namespace {
struct Sets {
  VORCSO_var cso;
  VORPSO_var pso;
  VORHSO_var hso;
  VORISO_var iso;
};
Sets& Current() {
  static auto* sets = new Sets();  // never destroyed: editors may go after it at exit
  return *sets;
}
}  // namespace

namespace VORSelectionContext {
void Set(VORCSO* cso, VORPSO* pso, VORHSO* hso, VORISO* iso) {
  Current() = Sets{VORCSO_var(cso), VORPSO_var(pso), VORHSO_var(hso), VORISO_var(iso)};
}
VORCSO* CSO() {
  return Current().cso.get();
}
VORPSO* PSO() {
  return Current().pso.get();
}
VORHSO* HSO() {
  return Current().hso.get();
}
VORISO* ISO() {
  return Current().iso.get();
}
}  // namespace VORSelectionContext
