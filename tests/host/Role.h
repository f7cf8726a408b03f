// Roles that a test program plays when it is started as a child:
//
//     const Role sleeper{"sleeper", [](const RoleArguments& arguments) { ...; return 0; }};
#pragma once

#include <string>
#include <vector>

using RoleArguments = std::vector<std::string>;

struct Role {
    using Body = int (*)(const RoleArguments&);
    Role(const char* name, Body body);

    /// Plays the role that the command line asks for and ends the program; returns where it asks for none.
    static void playIfAsked(int argc, char** argv);
};
