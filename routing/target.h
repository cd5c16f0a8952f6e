// Which application gets a button: the frontmost, else the one that plays, else the last chosen, else the
// first that runs.
#pragma once

#include "daemon/kvd.h"

/// The answer for the event in progress; App::Nval until it is asked for. The dispatcher resets it at every
/// new event, repeats of a held button reuse it.
extern AppCode sTargetApplication;

/// The application that the event in progress goes to, App::None when no application applies. Worked out at
/// the first question of an event.
AppCode targetApplication();

/// The code of the frontmost application, App::None if it is none of the seven.
AppCode FrontApplication();
/// The first application that runs and plays; the disc player also counts when it shows a disc menu.
AppCode activeApplication();
/// The application that was last found in front or playing, if it is one of the four players and still runs;
/// else the memory is cleared.
AppCode lastActiveApplication();
/// The first running player.
AppCode prioritizedApplication();
