// A wish of the user's to end: ^C.
#pragma once

/// From the first call of arm() on, ^C no longer ends the process but is noted; loops look at it between their steps,
/// so that nothing is left half done. A second ^C ends the process.
class Interruption {
public:
    Interruption() = delete;

    static void arm();
    static bool isWanted();
};
