// Roles that a test program plays when it is started as a child:
//
//     const Role sleeper{"sleeper", [](const RoleArguments& arguments) { ...; return 0; }};
#pragma once

#include <chrono>
#include <cstdlib>
#include <cstring>
#include <map>
#include <string>
#include <thread>
#include <vector>

using RoleArguments = std::vector<std::string>;

class Role {
public:
    using Body = int (*)(const RoleArguments&);
    Role(const char* name, Body body) { all()[name] = body; }

    /// Plays the role that the command line asks for, for a minute at most, and ends the program; returns where it asks
    /// for none.
    static void playIfAsked(int argc, char** argv) {
        if (argc > 2 && std::strcmp(argv[1], "--role") == 0) {
            std::thread(&endInAMinute).detach();
            const auto found = all().find(argv[2]);
            std::exit(found != all().end() ? found->second({argv + 3, argv + argc}) : 2);
        }
    }

private:
    static void endInAMinute() {
        std::this_thread::sleep_for(std::chrono::minutes(1));
        std::_Exit(3);
    }
    static std::map<std::string, Body>& all() {
        static std::map<std::string, Body> roles;
        return roles;
    }
};
