// The one initialisation of the interaction layer. Nothing of its own to register yet.
//
// Layers register their extensions and late types here, never from static initialisers. The
// program and every test program call the initialisation of the highest layer they use first
// thing; each one initialises the layers it uses before its own registrations, so the order is
// always kernel, model, interaction, visu, dialog, frame, pert, qt. Idempotent.
#pragma once

void VORInitInteraction();
