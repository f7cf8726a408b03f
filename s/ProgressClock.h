// The clock of the progress filter.
#pragma once

/// Milliseconds of wall-clock time since the process started, in 32 bits; they wrap after 24 days.
using ProgressClock = int (*)();

/// Replaces the clock; null restores the real one. For tests.
void setProgressClock(ProgressClock clock);
