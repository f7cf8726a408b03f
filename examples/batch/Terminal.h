// What standard output leads to.
#pragma once

struct Terminal {
    int width = 0;            ///< columns of a line; 0 where it is no terminal that a line can be drawn anew on
    bool hasColours = false;  ///< takes escape sequences
};

Terminal standardOutput();
