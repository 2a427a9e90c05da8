// Keeps consecutive angles from turning through a whole revolution.
#pragma once

// The angle shifted by whole turns until it lies less than half a turn from the previous one (both in
// radians; a difference of exactly half a turn is shifted too). Takes the same time for any number of turns.
// An angle that is not finite, or so large that a turn no longer changes it, stays as it is.
double UnwrapAngle(double angle, double previous);
