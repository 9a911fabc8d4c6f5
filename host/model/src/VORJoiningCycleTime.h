// The cycle-time interfaces of the joining activities (QELIBIWWeldingActivity,
// QELIBIWCurveFasteningActivity), registered on their late types by VORInitModel.
#pragma once

void VORRegisterJoiningCycleTimes();
