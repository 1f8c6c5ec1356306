#pragma once

namespace platform {

/// A date and time of day as the player's clock shows it; month and day count from 1.
struct LocalTime {
  int year, month, day, hour, minute, second;
};

/// What the machine's clock shows now.
LocalTime GetLocalTime();

/// Starts the pseudo-random sequence of NextRandom anew.
void SeedRandom(unsigned seed);

/// The next pseudo-random number, 0 or more.
int NextRandom();

}  // namespace platform
