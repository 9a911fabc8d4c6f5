// Creates the ZitBlt reps and list update commands the configuration names by class and module,
// as a command header does, but with the module's factory looked up once per definition: a level
// of thousands of activities builds no header and no symbol name per ZitBlt.
#pragma once

#include "QELZitBltConfiguration.h"
#include "VORCommand.h"

namespace QELZitBltCommandFactory {

// The rep of d (class "Type" of module "LoadModule") for activity; null when nothing is created
// (the creator's reference otherwise, or null and released when it is no command).
VORCommand* CreateRep(const QELZitBltDefinition& d, VORBaseUnknown* activity);

// The update command of d (class "CmdName" of the "UpdateData" module), as CreateRep.
VORCommand* CreateUpdateCommand(const QELZitBltDefinition& d, VORBaseUnknown* activity);

}  // namespace QELZitBltCommandFactory
