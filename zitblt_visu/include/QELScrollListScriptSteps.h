// The script steps of the ZitBlt lists ("expand", "collapse", "print list", "scroll",
// "context-zitblt", "balloon", "pick-item", "slide"), registered once by the ZitBlt model
// module's initialisation.
#pragma once

void QELRegisterScrollListScriptSteps();
