// The viewer module's initialisation: registers the window's extensions once. The module loader
// calls it (through VORInitModule) when the library is loaded by name; the commands module,
// which links this library, calls it from its own initialisation.
#pragma once

void QELInitProductFlowViewer();
